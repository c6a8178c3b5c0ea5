#include "platform/virtual/interface_driver.h"

#include <vector>

#include <gtest/gtest.h>

#include "platform/virtual/return_codes.h"

namespace {

using platform::bad_argument;
using platform::no_memory;
using platform::return_code;
using platform::success;
using platform::unsupported;
using platform::simulated::byte_list;
using platform::simulated::no_room;

using scalar_list = std::vector<std::uint64_t>;

const byte_list gain{'g', 'a', 'i', 'n', 0};
const byte_list gain_and_value{'g', 'a', 'i', 'n', 0, 7, 9};

struct driver_call {
    return_code code;
    std::uint32_t selector;
    scalar_list scalars;
    byte_list structure = {};
    std::size_t room = 0;
    byte_list reply = {};
};

// Makes calls on a driver that knows the report 0xd0, the command 0x20, the named property "gain",
// and the scalar method.
TEST(interface_service, reads_back_what_was_written_and_refuses_what_is_none_or_misshapen) {
    platform::simulated::interface_driver driver;
    driver.set_report(0xd0, {1, 2, 3});
    driver.set_command(0x20, [](platform::byte_view payload, byte_list& answer) {
        answer = {5, 6};
        return payload.empty() ? success : no_memory;
    });
    driver.set_named_property("gain", {1, 2, 3});
    driver.set_scalar_method([](std::span<const std::uint64_t> scalars) {
        return scalars.size() == 2 && scalars[1] == 0x1'0000'0002 ? success : no_memory;
    });
    EXPECT_EQ(driver.open(0), success);
    EXPECT_EQ(driver.open(1), unsupported);
    std::vector<driver_call> calls{
        {success, 2, {0xd0}, {}, 3, {1, 2, 3}},
        {success, 1, {0xd0}, {9, 8, 7, 6}},
        {success, 2, {0xd0}, {}, 4096, {9, 8, 7, 6}},
        {success, 3, {0x20}, {}, 2, {5, 6}},
        {success, 5, {}, gain, 8, {1, 2, 3}},
        {success, 4, {5}, gain_and_value},
        {success, 5, {}, gain, 8, {7, 9}},
        {success, 4, {3}, {'n', 'o', 0}},
        {success, 5, {}, {'n', 'o', 0}, 8},
        {success, 0, {1, 0x1'0000'0002}},
        {no_memory, 0, {}},
        {no_memory, 3, {0x20}, {1}, 2},
        {unsupported, 6, {}},
        {unsupported, 2, {0xd1}, {}, 16},
        {unsupported, 2, {0x1'0000'00d0}, {}, 16},
        {unsupported, 1, {0xd1}, {1}},
        {unsupported, 3, {0x21}, {}, 8},
        {platform::not_found, 5, {}, {'g', 'a', 0}, 8},
        {no_room, 2, {0xd0}, {}, 2},
        {no_room, 3, {0x20}, {}, 1},
        {no_room, 5, {}, gain, 1},
        {bad_argument, 0, {1}, {1}},
        {bad_argument, 0, {1}, {}, 8},
        {bad_argument, 1, {0xd0}, {}},
        {bad_argument, 1, {0xd0}, {1}, 1},
        {bad_argument, 2, {}, {}, 8},
        {bad_argument, 2, {0xd0}, {1}, 8},
        {bad_argument, 2, {0xd0}, {}, 0},
        {bad_argument, 4, {5}, {}},
        {bad_argument, 5, {5}, gain, 8},
        {bad_argument, 5, {}, gain, 0},
        {bad_argument, 5, {}, {'g', 0, 'n', 0}, 8},
        {bad_argument, 5, {}, {'g', 'a', 'i', 'n'}, 8},
    };
    for (const std::uint64_t size : {0ULL, 3ULL, 4ULL, 6ULL, 8ULL, 0x1'0000'0005ULL})
        calls.push_back({bad_argument, 4, {size}, gain_and_value});
    for (const auto& [code, selector, scalars, structure, room, reply] : calls) {
        byte_list bytes(room);
        platform::call_outputs outputs{{}, bytes};
        EXPECT_EQ(driver.call(selector, {.scalars = scalars, .structure = structure}, outputs),
                  code)
            << "selector " << selector << ", " << scalars.size() << " scalars, " << structure.size()
            << " bytes, room " << room;
        EXPECT_EQ(byte_list(outputs.structure.begin(), outputs.structure.end()),
                  code == success ? reply : byte_list(room));
    }
}

}  // namespace
