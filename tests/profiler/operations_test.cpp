#include "nrxctl/decoders/profile_hexdump.h"
#include "nrxctl/profiler/apply_configs.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/profiler_conn.h"
#include "tests/profiler/profiler_host.h"

namespace tests {

using nrx::expected_failure;

class profiler_operations : public profiler_test {
protected:
    // Whether an operation succeeded, and all that it wrote.
    static std::pair<bool, std::string> tried(const std::function<bool()>& operation) {
        bool succeeded = false;
        const outcome written = capture([&] { succeeded = operation(); });
        return {succeeded, written.out + written.err};
    }
};

TEST_F(profiler_operations, connection_reports_what_is_missing_unless_it_is_silent_about_it) {
    const auto opening = [](expected_failure wanted, const std::string& reports) {
        EXPECT_EQ(tried([=] { return nrx::profiler_conn().open(wanted); }),
                  std::pair(false, reports));
    };
    const auto mapping = [](expected_failure wanted, const std::string& reports) {
        EXPECT_EQ(tried([=] { return nrx::profiler_conn().open_queue(wanted); }),
                  std::pair(false, reports));
    };
    const std::string broken = failed(conn_file, "kr == 0 ", io_text);
    opening(expected_failure::is_reported, failed(conn_file, "service"));
    opening(expected_failure::is_silent, "");
    mapping(expected_failure::is_silent,
            failed(conn_file, "service") + failed(conn_file, "success"));

    put_driver();
    host.fail_call(2, failure::io);
    opening(expected_failure::is_silent, broken);
    host.fail_call(2, failure::nothing);
    opening(expected_failure::is_reported, failed(conn_file, "connect"));
    const auto queue = std::exchange(driver->queue, nullptr);
    mapping(expected_failure::is_reported, failed(conn_file, "kr == 0 ", unsupported_text));
    mapping(expected_failure::is_silent, "");
    host.fail_call(3, failure::nothing);
    mapping(expected_failure::is_reported, failed(conn_file, "queue"));
    host.fail_call(3, failure::nothing);
    mapping(expected_failure::is_silent, "");
    driver->queue = queue;
    host.fail_call(4, failure::no_memory);
    mapping(expected_failure::is_silent, failed(conn_file, "rxPort"));
    host.fail_call(5, failure::io);
    mapping(expected_failure::is_silent, broken);
}

TEST_F(profiler_operations, logs_are_read_until_less_than_a_record_comes_ten_times_at_most) {
    put_driver();
    const auto read = [](nrx::stored_records which = nrx::stored_records::log) {
        const outcome written =
            capture([&] { nrx::read_profiler_log(nrx::dump_profile_record, which); });
        return written.out + written.err;
    };
    driver->answers[9] = {{.bytes = byte_list(47, 1)}};
    EXPECT_EQ(read(), "");
    driver->answers[9] = {{.bytes = joined({record_bytes(3, 1), record_bytes(3, 2), {9, 9, 9, 9}})},
                          {.bytes = record_bytes(3, 3)},
                          {.bytes = {}}};
    EXPECT_EQ(read(), dumped(3, 1) + dumped(3, 2) + dumped(3, 3));
    EXPECT_EQ(logged("call"),
              lines(4, "call KeltoNRXProfileDriver 9 scalars [] in [] results 0 room 48000"));

    constexpr auto errors = nrx::stored_records::error_dump;
    driver->answers[8] = {{.bytes = record_bytes(3, 1)}};
    std::string ten;
    for (int i = 0; i < 10; ++i)
        ten += dumped(3, 1);
    EXPECT_EQ(read(errors), ten);
    driver->answers[8] = {{.bytes = record_bytes(3, 1)}, {.code = platform::unsupported}};
    EXPECT_EQ(read(errors), dumped(3, 1) + failed(kernel_file, "kr == 0 ", unsupported_text));
    host.remove(driver_name);
    EXPECT_EQ(read(errors), "");
}

TEST_F(profiler_operations, halves_that_do_not_support_a_configuration_are_named) {
    put_both_halves();
    const auto applying = [] {
        const std::vector<nrx::profiler_config> one(1);
        return tried([&] { return nrx::apply_profiler_configs(one); });
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
