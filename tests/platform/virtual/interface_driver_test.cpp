#include "platform/virtual/interface_driver.h"

#include <vector>

#include <gtest/gtest.h>

#include "platform/virtual/return_codes.h"

namespace {

using platform::bad_argument;
using platform::return_code;
using platform::success;
using platform::unsupported;
using platform::simulated::byte_list;
using platform::simulated::no_room;

using scalar_list = std::vector<std::uint64_t>;

const byte_list gain{'g', 'a', 'i', 'n', 0};
const byte_list gain_and_value{'g', 'a', 'i', 'n', 0, 7, 9};

struct refused_call {
    return_code code;
    std::uint32_t selector;
    scalar_list scalars;
    byte_list structure = {};
    std::size_t room = 0;
    std::size_t results = 0;
};

// Knows the report 0xd0, the command 0x20, and the named property "gain".
class interface_service : public ::testing::Test {
protected:
    interface_service() {
        driver.set_report(0xd0, {1, 2, 3});
        driver.set_command(0x20, [&](platform::byte_view payload, byte_list& answer) {
            answer = {5, 6};
            return payload.empty() ? success : platform::no_memory;
        });
        driver.set_named_property("gain", {1, 2, 3});
    }

    // What a good call answers.
    byte_list call(std::uint32_t selector, const scalar_list& scalars, const byte_list& structure,
                   std::size_t room = 0) {
        byte_list bytes_out(room);
        platform::call_outputs outputs{{}, bytes_out};
        EXPECT_EQ(driver.call(selector, {.scalars = scalars, .structure = structure}, outputs),
                  success);
        return {outputs.structure.begin(), outputs.structure.end()};
    }

    void expect_refusals(const std::vector<refused_call>& calls) {
        for (const auto& [code, selector, scalars, structure, room, results] : calls) {
            scalar_list scalars_out(results);
            byte_list bytes_out(room);
            platform::call_outputs outputs{scalars_out, bytes_out};
            EXPECT_EQ(driver.call(selector, {.scalars = scalars, .structure = structure}, outputs),
                      code)
                << "selector " << selector << ", " << scalars.size() << " scalars, "
                << structure.size() << " bytes, room " << room << ", " << results << " results";
            EXPECT_EQ(outputs.structure.size(), room);
        }
    }

    platform::simulated::interface_driver driver;
};

TEST_F(interface_service, reads_back_what_was_written_and_carries_out_commands) {
    EXPECT_EQ(driver.open(0), success);
    EXPECT_EQ(driver.open(1), unsupported);
    EXPECT_EQ(call(2, {0xd0}, {}, 3), (byte_list{1, 2, 3}));
    EXPECT_EQ(call(1, {0xd0}, {9, 8, 7, 6}), byte_list());
    EXPECT_EQ(call(2, {0xd0}, {}, 4096), (byte_list{9, 8, 7, 6}));
    EXPECT_EQ(call(3, {0x20}, {}, 2), (byte_list{5, 6}));
    EXPECT_EQ(call(5, {}, gain, 8), (byte_list{1, 2, 3}));
    EXPECT_EQ(call(4, {5}, gain_and_value), byte_list());
    EXPECT_EQ(call(5, {}, gain, 8), (byte_list{7, 9}));
    EXPECT_EQ(call(4, {3}, {'n', 'o', 0}), byte_list());
    EXPECT_EQ(call(5, {}, {'n', 'o', 0}, 8), byte_list());
    scalar_list received;
    driver.set_scalar_method([&](std::span<const std::uint64_t> scalars) {
        received.assign(scalars.begin(), scalars.end());
        return scalars.empty() ? platform::no_memory : success;
    });
    call(0, {1, 0x1'0000'0002}, {});
    EXPECT_EQ(received, (scalar_list{1, 0x1'0000'0002}));
    expect_refusals({{platform::no_memory, 0, {}},
                     {bad_argument, 0, {1}, {1}},
                     {bad_argument, 0, {1}, {}, 8},
                     {bad_argument, 0, {1}, {}, 0, 1}});
}

TEST_F(interface_service, refuses_what_it_does_not_have_and_arguments_of_another_shape) {
    expect_refusals({
        {unsupported, 0, {1}},
        {unsupported, 6, {}},
        {unsupported, 2, {0xd1}, {}, 16},
        {unsupported, 2, {0x1'0000'00d0}, {}, 16},
        {unsupported, 1, {0xd1}, {1}},
        {unsupported, 3, {0x21}, {}, 8},
        {unsupported, 3, {0x1'0000'0020}, {}, 8},
        {platform::not_found, 5, {}, {'g', 'a', 0}, 8},
        {platform::no_memory, 3, {0x20}, {1}, 2},
        {no_room, 2, {0xd0}, {}, 2},
        {no_room, 3, {0x20}, {}, 1},
        {no_room, 5, {}, gain, 1},
        {bad_argument, 1, {0xd0}, {}},
        {bad_argument, 1, {0xd0}, {1}, 1},
        {bad_argument, 2, {}, {}, 8},
        {bad_argument, 2, {0xd0, 0}, {}, 8},
        {bad_argument, 2, {0xd0}, {1}, 8},
        {bad_argument, 2, {0xd0}, {}, 0},
        {bad_argument, 2, {0xd0}, {}, 8, 1},
        {bad_argument, 4, {5}, {}},
        {bad_argument, 5, {5}, gain, 8},
        {bad_argument, 5, {}, gain, 0},
        {bad_argument, 5, {}, {'g', 0, 'n', 0}, 8},
        {bad_argument, 5, {}, {'g', 'a', 'i', 'n'}, 8},
    });
    for (const std::uint64_t size : {0ULL, 3ULL, 4ULL, 6ULL, 8ULL, 0x1'0000'0005ULL})
        expect_refusals({{bad_argument, 4, {size}, gain_and_value}});
}

}  // namespace
