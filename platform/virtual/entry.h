// An entry of the virtual host's driver registry.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "platform/property.h"
#include "platform/virtual/driver.h"
#include "platform/virtual/hid_sources.h"

namespace platform::simulated {

struct entry {
    std::string name;                                     // registry name
    std::vector<std::string> classes = {};                // its class, then the base classes
    dictionary properties = {};                           // ids, locations, usages
    std::function<void(dictionary&)> refresh = {};        // updates the properties before a read
    std::shared_ptr<simulated::driver> driver = nullptr;  // null: cannot be opened
    std::shared_ptr<virtual_hid_device> hid = nullptr;    // null: not a HID device
    std::shared_ptr<record_source> records = nullptr;     // null: the driver has no plug-in
    std::vector<std::shared_ptr<entry>> children = {};    // in the service plane
    bool present = true;                                  // false once the service is gone
};

using entry_ref = std::shared_ptr<entry>;

// The name of an entry in the call log.
inline std::string log_name(const entry_ref& provider) {
    return provider ? provider->name : "nothing";
}

}  // namespace platform::simulated
