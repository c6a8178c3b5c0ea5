#include "tests/base/base_host.h"

namespace tests {

namespace {

// Opens with the HID driver's type alone.
class mirror_driver final : public platform::simulated::driver {
public:
    platform::return_code open(std::uint32_t type) override {
        return type == 0x7a756d6f ? platform::success : platform::unsupported;
    }
    platform::return_code call(std::uint32_t /*selector*/, const platform::call_inputs& inputs,
                               platform::call_outputs& outputs) override {
        byte_list reply(inputs.structure.rbegin(), inputs.structure.rend());
        reply.push_back(0xff);
        return platform::simulated::copy_reply(reply, outputs);
    }
};

}  // namespace

void add_base_services(machine& host) {
    auto& accel = add_service(host, "accel", 31);
    accel.set_report(0xd0, {1, 2, 3});
    accel.set_command(0x20, [](platform::byte_view, byte_list& reply) {
        reply = {9, 8};
        return platform::success;
    });
    accel.set_named_property("gain", {4, 5, 6});
    accel.set_scalar_method([](std::span<const std::uint64_t>) { return platform::success; });
    auto& mca = add_service(host, "mca", 33);
    for (const std::uint32_t command : {0x20U, 0x22U})
        mca.set_command(command, [](platform::byte_view, byte_list&) { return platform::success; });
    mca.set_report(0x16, {});
    mca.set_report(0xd8, {});
    host.add({.name = "KeltoNRXHIDDriver",
              .properties = {{"LocationID", 1234}},
              .driver = std::make_shared<mirror_driver>()});
}

}  // namespace tests
