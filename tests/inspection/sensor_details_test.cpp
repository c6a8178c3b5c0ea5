// Registers and performance counters.
#include "nrxctl/inspection/perf_counters.h"
#include "nrxctl/inspection/register_list.h"
#include "tests/inspection/sensor_host.h"

namespace tests {

using namespace std::string_view_literals;

class sensor_details : public device_test {
protected:
    outcome registers(const byte_list& list) {
        sensor_.set_report(0x38, list);
        return capture([] { nrx::print_register_list("accel"); });
    }

    outcome counters(const byte_list& reply) {
        sensor_.set_report(0x31, reply);
        return capture([] { nrx::print_perf_counters("accel"); });
    }

    interface_driver& sensor_ = put_service(host, "accel", 31);
};

const std::string list_too_short = failure_line(
    "nrxtoollib", "size >= sizeof(NrxRegisterList) + list->count*sizeof(list->regs[0])",
    "nrxctl/inspection/register_list.cpp");

TEST_F(sensor_details, registers_in_at_least_two_digits) {
    EXPECT_EQ(registers(bytes_of("\3\0\0\0\0\0\x0f\0\x10\0\xff\0\xff\xff\0\1"sv)).out,
              "SensorRegs  : R00=0f R10=ff Rffff=100 \n");
    EXPECT_EQ(registers(bytes_of("\1\0\0\0\1\0\2\0\3\0\4\0"sv)).out, "SensorRegs  : R01=02 \n");
    EXPECT_EQ(registers(bytes_of("\0\0\0\0"sv)).out, "SensorRegs  : \n");
}

TEST_F(sensor_details, a_list_of_more_registers_than_came_back_is_reported_instead) {
    const auto expect_refused = [&](const byte_list& list) {
        const outcome result = registers(list);
        EXPECT_EQ(result.out, "SensorRegs  : \n");
        EXPECT_EQ(result.err, list_too_short);
    };
    const byte_list two = bytes_of("\2\0\0\0\1\0\2\0\3\0\4\0"sv);
    for (std::size_t size = 0; size < two.size(); ++size)
        expect_refused({two.begin(), two.begin() + static_cast<std::ptrdiff_t>(size)});
    EXPECT_EQ(registers(two).err, "");
    for (const std::int64_t count : {0x40000000, 0x40000001, 0x7fffffff}) {
        byte_list list = words({count});
        list.resize(1024);
        expect_refused(list);
    }
    byte_list list = words({0xffffffff, 1, 2, 3});
    expect_refused(list);
    list = words({255});
    list.resize(1024);
    EXPECT_EQ(registers(list).err, "");
}

TEST_F(sensor_details, counters_only_of_a_monitor_in_automatic_mode) {
    const std::string label = "APPerfmon   : ";
    EXPECT_EQ(counters(words({0})).out, label + "perfmon is not supported\n");
    for (const std::int64_t mode : {0, 1, 3, 0x102, -2}) {
        sensor_.set_report(0x26, words({mode}));
        EXPECT_EQ(counters(words({0})).out, label + "perfmon is not in auto mode\n");
    }
    sensor_.set_report(0x26, words({2}));
    EXPECT_EQ(counters(words({0})).out, label + "\n");
    sensor_.drop_report(0x31);
    const outcome unread = capture([] { nrx::print_perf_counters("accel"); });
    EXPECT_EQ(unread.out, "");
    EXPECT_EQ(unread.err,
              failure_line("nrxtoollib", "kr == 0 ", "nrxctl/inspection/perf_counters.cpp",
                           "unsupported request (0xe00002c7)"));
}

TEST_F(sensor_details, counters_up_to_the_last_that_came_back_whole) {
    sensor_.set_report(0x26, words({2}));
    const std::string_view entry = "counter\0\7\0\0\0////////////"sv;
    for (std::size_t size = 0; size <= 52; ++size) {
        byte_list reply = words({0xffffffff});
        reply.insert(reply.end(), entry.begin(), entry.end());
        reply.insert(reply.end(), entry.begin(), entry.end());
        reply.resize(size);
        const outcome result = counters(reply);
        EXPECT_EQ(result.out, std::string("APPerfmon   : ") + (size >= 28 ? "counter: 7 " : "") +
                                  (size >= 52 ? "counter: 7 " : "") + "\n")
            << size;
        EXPECT_EQ(result.err, size < 4 ? too_short(4, "perf_counters.cpp") : "") << size;
    }
    byte_list more = words({1});
    more.resize(256, 'n');
    EXPECT_EQ(counters(more).out, "APPerfmon   : nnnnnnnn: 1852730990 \n");
}

}  // namespace tests
