// Drivers of the virtual host: replies, and requests that are refused.

#include "platform/virtual/interface_driver.h"
#include "platform/virtual/little_endian.h"
#include "platform/virtual/replay_app.h"
#include "platform/virtual/wrist/parts.h"
#include "tests/platform/platform_test.h"
#include "tests/support/report_bytes.h"
#include "tests/support/rows.h"

namespace tests {

using namespace platform;
using namespace platform::simulated;

TEST(interface_drivers, read_back_what_was_written_and_check_arguments) {
    const byte_list gain{'g', 'a', 'i', 'n', 0};
    const byte_list gain_and_value{'g', 'a', 'i', 'n', 0, 7, 9};
    interface_driver driver;
    reply(driver, {unsupported, 0, {}});
    reply(driver, {unsupported, 4, {5}, gain_and_value});
    reply(driver, {unsupported, 5, {}, gain, 8});
    driver.set_report(0xd0, {1, 2, 3});
    driver.set_command(0x20, [](byte_view payload, byte_list& bytes) {
        bytes = {5, 6};
        return payload.empty() ? success : no_memory;
    });
    driver.set_named_property("gain", {1, 2, 3});
    driver.set_scalar_method([](std::span<const std::uint64_t> scalars) {
        return scalars.size() == 2 && scalars[1] == 0x1'0000'0002 ? success : no_memory;
    });
    EXPECT_EQ(driver.open(0), success);
    EXPECT_EQ(driver.open(1), unsupported);
    for (const auto& [call, bytes] :
         rows<method_call, byte_list>{{{success, 2, {0xd0}, {}, 3}, {1, 2, 3}},
                                      {{success, 1, {0xd0}, {9, 8, 7, 6}}, {}},
                                      {{success, 2, {0xd0}, {}, 4096}, {9, 8, 7, 6}},
                                      {{success, 3, {0x20}, {}, 2}, {5, 6}},
                                      {{success, 5, {}, gain, 8}, {1, 2, 3}},
                                      {{success, 4, {5}, gain}, {}},
                                      {{success, 5, {}, gain, 8}, {}},
                                      {{success, 4, {5}, gain_and_value}, {}},
                                      {{success, 5, {}, gain, 8}, {7, 9}},
                                      {{success, 0, {1, 0x1'0000'0002}}, {}}})
        EXPECT_EQ(reply(driver, call), bytes);
    using row = method_call;
    for (const row& call :
         {row{no_memory, 3, {0x20}, {1}, 2}, row{unsupported, 6, {}},
          row{unsupported, 2, {0xd1}, {}, 16}, row{unsupported, 2, {0x1'0000'00d0}, {}, 16},
          row{unsupported, 1, {0xd1}, {1}}, row{unsupported, 3, {0x21}, {}, 8},
          row{not_found, 5, {}, {'g', 'a', 0}, 8}, row{buffer_too_small, 2, {0xd0}, {}, 2},
          row{buffer_too_small, 3, {0x20}, {}, 1}, row{buffer_too_small, 5, {}, gain, 1},
          row{bad_argument, 0, {1}, {1}}, row{bad_argument, 0, {1}, {}, 8},
          row{bad_argument, 1, {0xd0}, {}}, row{bad_argument, 1, {0xd0}, {1}, 1},
          row{bad_argument, 2, {}, {}, 8}, row{bad_argument, 2, {0xd0}, {1}, 8},
          row{bad_argument, 2, {0xd0}, {}, 0}, row{bad_argument, 5, {}, {'g', 0, 'n', 0}, 8},
          row{bad_argument, 5, {}, {'g', 'a', 'i', 'n'}, 8}})
        reply(driver, call);
    for (const std::uint64_t name_size : {0ULL, 3ULL, 4ULL, 6ULL, 8ULL, 0x1'0000'0005ULL})
        reply(driver, {bad_argument, 4, {name_size}, gain_and_value});
}

// Service 7 plays back axis records of 28 bytes, service 9 pressure records of 20 bytes.
class virtual_replay : public ::testing::Test {
protected:
    replay_app app{{{7, 28}, {9, 20}}};
};

TEST_F(virtual_replay, refuses_malformed_requests) {
    byte_list request = u32_report({7, 1, 1, 0, 28, 28, 0, 0, 0, 0, 0, 0});
    using pair = std::pair<std::size_t, std::uint8_t>;
    for (const auto& [word, value] : {pair{1, 4}, pair{2, 0}, pair{2, 3}, pair{3, 2}, pair{4, 27},
                                      pair{5, 20}, pair{0, 9}, pair{0, 8}}) {
        byte_list changed = request;
        changed[4 * word] = value;
        EXPECT_EQ(app.load(changed), value == 8 ? not_found : bad_argument) << word;
    }
    request.pop_back();
    EXPECT_EQ(app.load(request), bad_argument);
    request[16] -= 1;
    EXPECT_EQ(app.load(request), bad_argument) << "a record is cut";
    request.resize(19);
    EXPECT_EQ(app.load(request), bad_argument);
    EXPECT_EQ(app.load(u32_report({7, 1, 1, 0, 0})), bad_argument);
    EXPECT_EQ(app.unload(u32_report({8})), not_found);
    EXPECT_EQ(app.unload(u32_report({7})), not_ready);
    EXPECT_EQ(app.unload(u32_report({7, 7})), bad_argument);
    EXPECT_EQ(app.states(), u32_report({7, 0, 0, 9, 0, 0}));
}

}  // namespace tests
