#include "platform/virtual/interface_driver.h"

#include <array>
#include <vector>

#include <gtest/gtest.h>

#include "platform/virtual/return_codes.h"

namespace {

using platform::bad_argument;
using platform::call_outputs;
using platform::return_code;
using platform::success;
using platform::unsupported;
using platform::simulated::byte_list;
using platform::simulated::interface_driver;
using platform::simulated::no_room;

using scalar_list = std::vector<std::uint64_t>;

const byte_list gain{'g', 'a', 'i', 'n', 0};
const byte_list gain_and_value{'g', 'a', 'i', 'n', 0, 7, 9};

struct reply {
    return_code code;
    byte_list bytes;

    bool operator==(const reply&) const = default;
};

class interface_service : public ::testing::Test {
protected:
    reply call(std::uint32_t selector, const scalar_list& scalars, const byte_list& structure,
               std::size_t room, std::size_t results = 0) {
        std::vector<std::uint64_t> scalars_out(results);
        byte_list bytes_out(room);
        call_outputs outputs{scalars_out, bytes_out};
        const return_code code =
            driver.call(selector, {.scalars = scalars, .structure = structure}, outputs);
        if (code == success) return {code, {outputs.structure.begin(), outputs.structure.end()}};
        EXPECT_EQ(outputs.scalars.size(), results);
        EXPECT_EQ(outputs.structure.size(), room);
        return {code, {}};
    }

    return_code code_of(std::uint32_t selector, const scalar_list& scalars,
                        const byte_list& structure, std::size_t room, std::size_t results = 0) {
        return call(selector, scalars, structure, room, results).code;
    }

    interface_driver driver;
};

TEST_F(interface_service, opens_type_0_alone_and_knows_five_selectors) {
    EXPECT_EQ(driver.open(0), success);
    EXPECT_EQ(driver.open(1), unsupported);
    for (const std::uint32_t selector : {0U, 6U, 8U, 0xffffffffU})
        EXPECT_EQ(code_of(selector, {}, {}, 0), unsupported) << selector;
}

TEST_F(interface_service, reads_back_the_report_that_was_written_and_refuses_any_other) {
    driver.set_report(0xd0, {1, 2, 3});
    EXPECT_EQ(call(2, {0xd0}, {}, 3), (reply{success, {1, 2, 3}}));
    EXPECT_EQ(code_of(2, {0xd0}, {}, 2), no_room);
    EXPECT_EQ(call(1, {0xd0}, {9, 8, 7, 6}, 0), (reply{success, {}}));
    EXPECT_EQ(call(2, {0xd0}, {}, 4096), (reply{success, {9, 8, 7, 6}}));
    for (const std::uint64_t other : {0xd1ULL, 0x1'0000'00d0ULL}) {
        EXPECT_EQ(code_of(2, {other}, {}, 16), unsupported);
        EXPECT_EQ(code_of(1, {other}, {1}, 0), unsupported);
    }
    EXPECT_EQ(*driver.report(0xd0), (byte_list{9, 8, 7, 6}));
    driver.drop_report(0xd0);
    EXPECT_EQ(code_of(2, {0xd0}, {}, 16), unsupported);
}

TEST_F(interface_service, refuses_arguments_of_another_shape) {
    driver.set_report(0xd0, {1});
    driver.set_command(0x20, [](platform::byte_view, byte_list&) { return success; });
    driver.set_named_property("gain", {1});
    struct misshapen {
        std::uint32_t selector;
        scalar_list scalars;
        byte_list structure;
        std::size_t room;
        std::size_t results;
    };
    for (const auto& [selector, scalars, structure, room, results] : {
             misshapen{1, {}, {1}, 0, 0},       misshapen{1, {0xd0, 0}, {1}, 0, 0},
             misshapen{1, {0xd0}, {}, 0, 0},    misshapen{1, {0xd0}, {1}, 1, 0},
             misshapen{1, {0xd0}, {1}, 0, 1},   misshapen{2, {}, {}, 8, 0},
             misshapen{2, {0xd0, 0}, {}, 8, 0}, misshapen{2, {0xd0}, {1}, 8, 0},
             misshapen{2, {0xd0}, {}, 0, 0},    misshapen{2, {0xd0}, {}, 8, 1},
             misshapen{3, {}, {1}, 8, 0},       misshapen{3, {0x20, 0}, {1}, 8, 0},
             misshapen{3, {0x20}, {1}, 8, 1},   misshapen{4, {}, gain, 0, 0},
             misshapen{4, {5}, {}, 0, 0},       misshapen{4, {5}, gain, 1, 0},
             misshapen{5, {5}, gain, 8, 0},     misshapen{5, {}, {}, 8, 0},
             misshapen{5, {}, gain, 0, 0},
         }) {
        EXPECT_EQ(code_of(selector, scalars, structure, room, results), bad_argument)
            << "selector " << selector << ", " << scalars.size() << " scalars, " << structure.size()
            << " bytes, room " << room << ", " << results << " results";
    }
}

TEST_F(interface_service, carries_out_a_command_and_passes_on_its_code) {
    driver.set_command(0x20, [&](platform::byte_view payload, byte_list& answer) {
        answer = {5, 6};
        return payload.empty() ? success : platform::no_memory;
    });
    EXPECT_EQ(call(3, {0x20}, {}, 2), (reply{success, {5, 6}}));
    EXPECT_EQ(code_of(3, {0x20}, {1}, 2), platform::no_memory);
    EXPECT_EQ(code_of(3, {0x20}, {}, 1), no_room);
    for (const std::uint64_t other : {0x21ULL, 0x1'0000'0020ULL})
        EXPECT_EQ(code_of(3, {other}, {}, 8), unsupported);
}

TEST_F(interface_service, hands_any_count_of_scalars_to_its_scalar_call_and_nothing_else) {
    EXPECT_EQ(code_of(0, {1}, {}, 0), unsupported);
    std::vector<std::uint64_t> received;
    driver.set_scalar_method([&](std::span<const std::uint64_t> scalars) {
        received.assign(scalars.begin(), scalars.end());
        return scalars.empty() ? platform::no_memory : success;
    });
    EXPECT_EQ(code_of(0, {1, 0x1'0000'0002}, {}, 0), success);
    EXPECT_EQ(received, (std::vector<std::uint64_t>{1, 0x1'0000'0002}));
    EXPECT_EQ(code_of(0, {}, {}, 0), platform::no_memory);
    EXPECT_EQ(code_of(0, {1}, {1}, 0), bad_argument);
    EXPECT_EQ(code_of(0, {1}, {}, 8), bad_argument);
    EXPECT_EQ(code_of(0, {1}, {}, 0, 1), bad_argument);
}

TEST_F(interface_service, reads_back_the_named_property_that_was_written) {
    EXPECT_EQ(code_of(4, {5}, gain_and_value, 0), unsupported);
    EXPECT_EQ(code_of(5, {}, gain, 8), unsupported);
    driver.set_named_property("gain", {1, 2, 3});
    EXPECT_EQ(call(5, {}, gain, 8), (reply{success, {1, 2, 3}}));
    EXPECT_EQ(call(4, {5}, gain_and_value, 0), (reply{success, {}}));
    EXPECT_EQ(call(5, {}, gain, 8), (reply{success, {7, 9}}));
    EXPECT_EQ(code_of(5, {}, gain, 1), no_room);
    EXPECT_EQ(code_of(5, {}, {'g', 'a', 0}, 8), platform::not_found);
    EXPECT_EQ(call(4, {3}, {'n', 'o', 0}, 0), (reply{success, {}}));
    EXPECT_EQ(call(5, {}, {'n', 'o', 0}, 8), (reply{success, {}}));
}

TEST_F(interface_service, refuses_a_property_name_that_does_not_end_where_it_says) {
    driver.set_named_property("gain", {1});
    for (const std::uint64_t size : {0ULL, 3ULL, 4ULL, 6ULL, 8ULL, 0x1'0000'0005ULL}) {
        EXPECT_EQ(code_of(4, {size}, gain_and_value, 0), bad_argument) << size;
    }
    EXPECT_EQ(code_of(5, {}, {'g', 'a', 'i', 'n'}, 8), bad_argument);
    EXPECT_EQ(code_of(5, {}, {'g', 0, 'n', 0}, 8), bad_argument);
    EXPECT_EQ(call(5, {}, gain, 8), (reply{success, {1}}));
}

}  // namespace
