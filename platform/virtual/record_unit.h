// The records of a HID device of the virtual host, as its driver's plug-in reaches them.
#pragma once

#include <cstdint>
#include <optional>
#include <vector>

#include "platform/return_code.h"
#include "platform/virtual/machine_clock.h"

namespace platform::simulated {

class record_unit {
public:
    record_unit() = default;
    record_unit(const record_unit&) = delete;
    record_unit& operator=(const record_unit&) = delete;
    record_unit(record_unit&&) = delete;
    record_unit& operator=(record_unit&&) = delete;
    virtual ~record_unit() = default;

    // Sets the mode of a service; 0 is off.
    virtual return_code set_mode(std::int32_t service_id, std::uint32_t mode) = 0;

    // When the next record comes; none: never, as it is while the mode is off.
    [[nodiscard]] virtual std::optional<machine_clock::time> next_due() const = 0;

    // That record; its time has come.
    virtual std::vector<std::uint8_t> take_record() = 0;
};

}  // namespace platform::simulated
