// One entry of the virtual host's driver registry.
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "platform/property.h"
#include "platform/virtual/driver.h"
#include "platform/virtual/hid_unit.h"
#include "platform/virtual/record_unit.h"

namespace platform::simulated {

struct entry {
    std::string name;                                   // registry name
    std::vector<std::string> classes = {};              // its class, then the bases of that class
    dictionary properties = {};                         // ids, locations, usages
    std::function<void(dictionary&)> refresh = {};      // brings them up to date for a reader
    std::shared_ptr<driver> unit = nullptr;             // null: nothing to open here
    std::shared_ptr<hid_unit> hid = nullptr;            // null: no HID device
    std::shared_ptr<record_unit> records = nullptr;     // null: its driver brings no plug-in
    std::vector<std::shared_ptr<entry>> children = {};  // in the service plane
    bool present = true;                                // false once the service is gone
};

using entry_ref = std::shared_ptr<entry>;

// An entry in the words of the call log.
inline std::string name_of(const entry_ref& one) {
    return one ? one->name : "nothing";
}

}  // namespace platform::simulated
