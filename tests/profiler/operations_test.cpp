#include "nrxctl/profiler/apply_configs.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/profiler_conn.h"
#include "tests/profiler/profiler_host.h"

namespace tests {

using lines = std::vector<std::string>;
using nrx::presence;

namespace {

const std::vector<nrx::profiler_config> one_config{
    {.profiler = 2, .component = 1, .reports = 4, .services = {}}};

std::vector<int> printed_marks;

void keep_mark(const nrx::profile_record& record) {
    printed_marks.push_back(record.bytes[47]);
}

}  // namespace

class profiler_operations : public profiler_test {
protected:
    void SetUp() override {
        profiler_test::SetUp();
        printed_marks.clear();
    }

    // Whether an operation succeeded, and all that it wrote.
    static std::pair<bool, std::string> tried(const std::function<bool()>& operation) {
        bool succeeded = false;
        const outcome written = capture([&] { succeeded = operation(); });
        return {succeeded, written.out + written.err};
    }
};

TEST_F(profiler_operations, connection_reports_what_is_missing_unless_it_is_optional) {
    const auto opening = [](presence wanted) {
        return tried([=] { return nrx::profiler_conn().open(wanted); });
    };
    const auto mapping = [](presence wanted) {
        return tried([=] { return nrx::profiler_conn().open_queue(wanted); });
    };
    const auto fails_with = [](const std::string& reports) { return std::pair(false, reports); };
    const std::string refused = failed(conn_file, "kr == 0 ", unsupported_text);
    const std::string broken = failed(conn_file, "kr == 0 ", io_text);
    EXPECT_EQ(opening(presence::is_required), fails_with(failed(conn_file, "service")));
    EXPECT_EQ(opening(presence::is_optional), fails_with(""));
    EXPECT_EQ(mapping(presence::is_optional),
              fails_with(failed(conn_file, "service") + failed(conn_file, "success")));

    put_driver();
    host.fail_call(2, failure::io);
    EXPECT_EQ(opening(presence::is_optional), fails_with(broken));
    host.fail_call(2, failure::nothing);
    EXPECT_EQ(opening(presence::is_required), fails_with(failed(conn_file, "connect")));
    const auto queue = std::exchange(driver->queue, nullptr);
    EXPECT_EQ(mapping(presence::is_required), fails_with(refused));
    EXPECT_EQ(mapping(presence::is_optional), fails_with(""));
    host.fail_call(3, failure::nothing);
    EXPECT_EQ(mapping(presence::is_required), fails_with(failed(conn_file, "queue")));
    host.fail_call(3, failure::nothing);
    EXPECT_EQ(mapping(presence::is_optional), fails_with(""));
    driver->queue = queue;
    host.fail_call(4, failure::no_memory);
    EXPECT_EQ(mapping(presence::is_optional), fails_with(failed(conn_file, "rxPort")));
    host.fail_call(5, failure::io);
    EXPECT_EQ(mapping(presence::is_optional), fails_with(broken));
}

TEST_F(profiler_operations, logs_are_read_until_less_than_a_record_comes_ten_times_at_most) {
    put_driver();
    const auto read = [] { return capture([] { nrx::read_profiler_log(keep_mark); }).err; };
    driver->answers[9] = {{.bytes = byte_list(47, 1)}};
    EXPECT_EQ(read(), "");
    EXPECT_TRUE(printed_marks.empty());
    driver->answers[9] = {{.bytes = joined({record_bytes(3, 1), record_bytes(3, 2), {9, 9, 9, 9}})},
                          {.bytes = record_bytes(3, 3)},
                          {.bytes = {}}};
    EXPECT_EQ(read(), "");
    EXPECT_EQ(printed_marks, (std::vector<int>{1, 2, 3}));
    EXPECT_EQ(logged("call"),
              lines(4, "call KeltoNRXProfileDriver 9 scalars [] in [] results 0 room 48000"));

    const auto read_errors = [] {
        return capture([] { nrx::read_profiler_log(keep_mark, nrx::stored_records::error_dump); })
            .err;
    };
    driver->answers[8] = {{.bytes = record_bytes(3, 1)}};
    EXPECT_EQ(read_errors(), "");
    EXPECT_EQ(printed_marks.size(), 13U);
    driver->answers[8] = {{.bytes = record_bytes(3, 1)}, {.code = platform::unsupported}};
    EXPECT_EQ(read_errors(), failed(kernel_file, "kr == 0 ", unsupported_text));
    EXPECT_EQ(printed_marks.size(), 14U);
    host.remove(driver_name);
    EXPECT_EQ(read_errors(), "");
}

TEST_F(profiler_operations, halves_that_do_not_support_a_configuration_are_named) {
    put_both_halves();
    const auto applying = [] {
        return tried([] { return nrx::apply_profiler_configs(one_config); });
    };
    const std::string fw = "fw config: At least one config failed\n";
    const std::string kext = "kext config: At least one config failed\n";
    answer(0x24, platform::unsupported);
    driver->answers[2] = {{.code = platform::unsupported}, {.code = platform::no_memory}};
    EXPECT_EQ(applying(), std::pair(true, fw + kext));
    EXPECT_EQ(applying(),
              std::pair(false, fw + failed(apply_file, "result == 0 ", no_memory_text)));
    answer(0x24, platform::simulated::io_failure);
    EXPECT_EQ(applying(), std::pair(false, failed(apply_file, "result == 0 ", io_text)));

    host.remove("profile");
    driver->answers[2] = {};
    EXPECT_EQ(applying(), std::pair(true, std::string()));
    EXPECT_TRUE(nrx::read_fw_configs().empty());
    host.remove(driver_name);
    EXPECT_EQ(applying(),
              std::pair(true, kext + failed(conn_file, "service") + failed(apply_file, "success")));
}

}  // namespace tests
