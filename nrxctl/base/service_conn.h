// A named service with a connection kept open on it.
#pragma once

#include <string>
#include <utility>

#include "nrxctl/base/failure_report.h"
#include "platform/connection.h"
#include "platform/registry.h"

namespace nrx {

// Owns a service, its first child and a connection that is opened on the child. What open() found
// stays in the object, even if it failed. Destruction closes the connection, then releases the
// child, then the service.
class service_conn {
public:
    explicit service_conn(std::string name) : name_(std::move(name)) {}
    virtual ~service_conn() = default;
    service_conn(const service_conn&) = delete;
    service_conn& operator=(const service_conn&) = delete;
    service_conn(service_conn&&) = delete;
    service_conn& operator=(service_conn&&) = delete;

    // Finds the service by its registry name, whatever its class, and opens a connection of type 0
    // on its first child. Returns true on success; otherwise the failed check is reported, except
    // that a missing service is reported or not as on_missing says.
    bool open(on_failure on_missing = on_failure::report);

    // The connection; empty before a successful open.
    [[nodiscard]] const platform::connection& connection() const { return connection_; }

protected:
    // Members are released from the last to the first.
    std::string name_;
    platform::service service_;
    platform::service child_;
    platform::connection connection_;
};

}  // namespace nrx
