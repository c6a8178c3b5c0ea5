// The driver of all HID devices. A request is two 32-bit words: what is asked, and about which
// location. A reply is the request, and a 64-bit answer.

#include <algorithm>
#include <array>
#include <memory>
#include <string>

#include "platform/registry.h"
#include "platform/virtual/little_endian.h"
#include "platform/virtual/wrist/parts.h"

namespace platform::simulated {

namespace {

constexpr const char* device_class = "KeltoNRXHIDDevice";
constexpr std::int32_t location = 1234;
constexpr std::uint32_t client_type = 0x7a756d6f;  // "zumo"
constexpr std::size_t request_size = 8;
constexpr std::size_t reply_size = 16;

constexpr std::uint64_t driver_version = 0x00'03'01'0c;

class hid_driver final : public driver {
public:
    // The machine owns the driver.
    explicit hid_driver(const machine& device) : device_(device) {}

    return_code open(std::uint32_t type) override {
        return type == client_type ? success : unsupported;
    }

    return_code call(std::uint32_t selector, const call_inputs& inputs,
                     call_outputs& outputs) override {
        if (selector != 0) return unsupported;
        const return_code fitting =
            check_shape({0, presence::required, 0, presence::required}, inputs, outputs);
        if (fitting != success) return fitting;
        if (inputs.structure.size() != request_size) return bad_argument;
        std::uint64_t value = 0;
        const return_code found = answer_to(get_u32(inputs.structure, 0),
                                            get_u32(inputs.structure, sizeof(value) / 2), value);
        if (found != success) return found;
        std::array<std::uint8_t, reply_size> reply{};
        std::copy(inputs.structure.begin(), inputs.structure.end(), reply.begin());
        put_le(reply, request_size, sizeof(value), value);
        return answer(reply, outputs);
    }

private:
    // The driver's version, how many HID devices there are, how many usages one of them has.
    [[nodiscard]] return_code answer_to(std::uint32_t request, std::uint32_t about,
                                        std::uint64_t& value) const {
        switch (request) {
            case 0:
                value = driver_version;
                return success;
            case 1:
                value = count_devices();
                return success;
            case 2:
                return usages_at(about, value);
            default:
                return unsupported;
        }
    }

    [[nodiscard]] std::uint64_t count_devices() const {
        const auto& devices = device_.entries_of_class(device_class);
        const auto is_there = [](const entry_ref& one) { return one->present; };
        return static_cast<std::uint64_t>(std::count_if(devices.begin(), devices.end(), is_there));
    }

    [[nodiscard]] return_code usages_at(std::uint32_t at, std::uint64_t& value) const {
        const property wanted(static_cast<std::int32_t>(at));
        for (const entry_ref& one : device_.entries_of_class(device_class)) {
            if (!one->present || !same_value(*one->properties.find(location_id_key), wanted))
                continue;
            value = one->properties.find(usage_pairs_key)->items()->size();
            return success;
        }
        return not_found;
    }

    const machine& device_;
};

}  // namespace

void add_hid_driver(machine& device) {
    device.add({.name = "KeltoNRXHIDDriver",
                .classes = {"KeltoNRXHIDDriver"},
                .properties = {{std::string(location_id_key), location}},
                .unit = std::make_shared<hid_driver>(device)});
}

}  // namespace platform::simulated
