// A named service with a connection kept open on it.
#pragma once

#include <string>
#include <utility>

#include "nrxctl/base/failure_report.h"
#include "platform/connection.h"
#include "platform/registry.h"

namespace nrx {

// Owns the service, its first child and the connection that is opened on the child. What was found
// stays in the object, after a failed open too; destruction closes the connection, then releases
// the child, then the service.
class service_conn {
public:
    explicit service_conn(std::string name) : name_(std::move(name)) {}
    virtual ~service_conn() = default;
    service_conn(const service_conn&) = delete;
    service_conn& operator=(const service_conn&) = delete;
    service_conn(service_conn&&) = delete;
    service_conn& operator=(service_conn&&) = delete;

    // Finds the service by its bare registry name, of whatever class, takes its first child and
    // opens a connection of type 0 on that. Whether the connection is open; if not, the check that
    // failed is reported, but for a missing service if that is to be silent.
    bool open(expected_failure missing = expected_failure::is_reported);

    // The connection; none before a successful open.
    [[nodiscard]] const platform::connection& connection() const { return connection_; }

protected:
    // Members are given back from the last to the first.
    std::string name_;
    platform::service service_;
    platform::service child_;
    platform::connection connection_;
};

}  // namespace nrx
