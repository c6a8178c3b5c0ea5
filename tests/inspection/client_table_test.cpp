#include "nrxctl/inspection/client_table.h"

#include <algorithm>

#include "tests/inspection/sensor_host.h"

namespace tests {

using client_table = device_test;

const std::string heading =
    "=name                                report    batch threshold timelimit options power\n";

TEST_F(client_table, has_a_row_for_each_entry_in_use) {
    interface_driver& sensor = put_service(host, "accel", 31);
    byte_list entries = client_entry("steps", {1, 22, 333, 4444}, 1, 1, 7);
    const byte_list gone = client_entry("gone", {1, 2, 3, 4}, 0, 1, 1);
    entries.insert(entries.end(), gone.begin(), gone.end());
    set_clients(sensor, entries);
    const outcome result = capture([] { nrx::print_client_table("=", "accel"); });
    EXPECT_EQ(result.out, heading +
                              "=steps                           :        1       22       333"
                              "      4444       d     7\n");
    EXPECT_EQ(result.err, "");
}

TEST_F(client_table, takes_as_many_entries_as_there_is_room_for) {
    byte_list entries;
    for (int i = 0; i < 16; ++i) {
        const byte_list entry = client_entry("", {i, 0, 0, 0}, 1, 0, 0);
        entries.insert(entries.end(), entry.begin(), entry.end());
    }
    interface_driver& sensor = put_service(host, "accel", 31);
    set_clients(sensor, entries);
    const std::string text = capture([] { nrx::print_client_table("", "accel"); }).out;
    EXPECT_EQ(std::count(text.begin(), text.end(), '\n'), 17);
    entries.push_back(0);
    set_clients(sensor, entries);
    EXPECT_EQ(capture([] { nrx::print_client_table("", "accel"); }).out, "");
}

TEST_F(client_table, is_not_there_if_the_service_does_not_answer) {
    put_service(host, "accel", 31);
    const outcome refused = capture([] { nrx::print_client_table("=", "accel"); });
    EXPECT_EQ(refused.out + refused.err, "");
    const outcome missing = capture([] { nrx::print_client_table("=", "gyro"); });
    EXPECT_EQ(missing.out, "");
    EXPECT_EQ(missing.err, failure_line("nrxtoollib", "service", "nrxctl/base/channel.cpp"));
}

TEST_F(client_table, ends_with_the_last_whole_entry) {
    const byte_list one = client_entry("a", {1, 2, 3, 4}, 1, 0, 5);
    byte_list two = one;
    two.insert(two.end(), one.begin(), one.end());
    const std::string row =
        "=a                               :        1        2         3         4             5\n";
    for (std::size_t size = 0; size <= two.size(); ++size) {
        const byte_list prefix(two.begin(), two.begin() + static_cast<std::ptrdiff_t>(size));
        const outcome result = capture([&] { nrx::print_clients("=", prefix); });
        EXPECT_EQ(result.out, heading + (size >= 31 ? row : "") + (size >= 62 ? row : "")) << size;
        EXPECT_EQ(result.err, "");
    }
}

}  // namespace tests
