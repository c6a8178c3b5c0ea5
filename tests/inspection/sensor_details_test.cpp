// Clients, registers and performance counters.
#include <algorithm>

#include "nrxctl/inspection/client_table.h"
#include "tests/inspection/sensor_host.h"

namespace tests {

using namespace std::string_view_literals;

using sensor_details = sensor_test;

TEST_F(sensor_details, clients_of_a_service_that_is_missing_are_no_table) {
    const outcome result = capture([] { nrx::print_client_table("=", "gyro"); });
    EXPECT_EQ(result.out, "");
    EXPECT_EQ(result.err, failure_line("nrxtoollib", "service", "nrxctl/base/channel.cpp"));
}

TEST_F(sensor_details, clients_up_to_the_last_whole_entry) {
    const byte_list one = client_entry("a", {1, 2, 3, 4}, 1, 0, 5);
    byte_list entries;
    std::string rows =
        "=name                                report    batch threshold timelimit options power\n";
    for (std::size_t size = 0; size <= 16 * one.size(); ++size) {
        if (size > 0 && size % one.size() == 0) {
            rows +=
                "=a                               :        1        2         3         4       "
                "      5\n";
        }
        const outcome result = capture([&] { nrx::print_clients("=", entries); });
        EXPECT_EQ(result.out, rows) << size;
        EXPECT_EQ(result.err, "");
        entries.push_back(one[size % one.size()]);
    }
}

const std::string whole_registers = "R0f=a0 R10=abc ";
const std::string list_too_short = failure_line(
    "nrxtoollib", "size >= sizeof(NrxRegisterList) + list->count*sizeof(list->regs[0])",
    "nrxctl/inspection/register_list.cpp");

TEST_F(sensor_details, registers_in_at_least_two_digits) {
    expect_changes("als", {{0x38, bytes_of("\3\0\0\0\0\0\x0f\0\x10\0\xff\0\xff\xff\0\1"sv),
                            whole_registers, "R00=0f R10=ff Rffff=100 "},
                           {0x38, words({1, 0x20001, 0x40003}), whole_registers, "R01=02 "},
                           {0x38, words({0}), whole_registers, ""}});
}

TEST_F(sensor_details, a_list_of_more_registers_than_came_back_is_reported_instead) {
    std::vector<byte_list> lists{words({0xffffffff, 1, 2, 3})};
    for (const std::int64_t count : {256, 0x40000000, 0x40000001, 0x7fffffff}) {
        lists.push_back(words({count}));
        lists.back().resize(1024);
    }
    for (std::size_t size = 0; size < 12; ++size)
        lists.push_back(first_bytes(words({2, 0x20001, 0x40003}), size));
    for (const byte_list& list : lists)
        expect_changes("als", {{0x38, list, whole_registers, "", list_too_short}});
}

const std::string whole_counters = "cycles: 16777216 allmisse: -1 ";

TEST_F(sensor_details, counters_only_of_a_monitor_in_automatic_mode) {
    expect_changes("als", {{0x26, {}, whole_counters, "perfmon is not supported"}});
    for (const std::int64_t mode : {0, 1, 3, 0x102, -2})
        expect_changes("als",
                       {{0x26, words({mode}), whole_counters, "perfmon is not in auto mode"}});
}

TEST_F(sensor_details, counters_as_many_as_are_counted_and_came_back_whole) {
    const auto repeated = [](std::string_view text, std::size_t count) {
        std::string all;
        for (; count > 0; --count)
            all += text;
        return all;
    };
    for (const std::size_t count : {0U, 1U, 10U, 11U, 0xffffffffU}) {
        byte_list reply = words({static_cast<std::int64_t>(count)});
        reply.resize(256, 'n');
        expect_changes("als",
                       {{0x31, reply, whole_counters,
                         repeated("nnnnnnnn: 1852730990 ", std::min<std::size_t>(count, 10))}});
    }
    const byte_list huge =
        bytes_of("\xff\xff\xff\xff" + repeated("counter\0\7\0\0\0////////////"sv, 2));
    for (std::size_t size = 0; size <= huge.size(); ++size) {
        expect_changes("als", {{0x31, first_bytes(huge, size), whole_counters,
                                repeated("counter: 7 ", size < 4 ? 0 : (size - 4) / 24),
                                size < 4 ? too_short(4, "perf_counters.cpp") : ""}});
    }
}

TEST_F(sensor_details, of_which_two_fail_are_followed_by_the_rest) {
    interface_driver& sensor = put_whole_sensor(host, "als");
    sensor.set_report(0x38, words({2, 0x20001}));
    sensor.drop_report(0x31);
    const outcome result = inspect("als", 2);
    const std::string whole = whole_text("als", 2);
    EXPECT_EQ(result.out,
              whole.substr(0, whole.find(whole_registers)) + "\n" + event_line + "\n\n");
    EXPECT_EQ(result.err, list_too_short + failure_line("nrxtoollib", "kr == 0 ",
                                                        "nrxctl/inspection/perf_counters.cpp",
                                                        "unsupported request (0xe00002c7)"));
}

}  // namespace tests
