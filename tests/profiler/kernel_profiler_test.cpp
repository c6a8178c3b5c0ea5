#include "nrxctl/profiler/kernel_profiler.h"

#include "nrxctl/decoders/record_text.h"
#include "nrxctl/profiler/apply_configs.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "tests/profiler/profiler_host.h"

namespace tests {

using nrx::on_failure;
using profiler_operations = profiler_test;

TEST_F(profiler_operations, connection_reports_what_is_not_ignored) {
    const auto report = [](auto text) { return library_report(file::kernel_profiler, text); };
    const std::string unopened = report("success");
    const std::string refused = kr_report(file::kernel_profiler, io_text);
    const std::string unsupported = kr_report(file::kernel_profiler, unsupported_text);
    for (const on_failure mode : {on_failure::report, on_failure::ignore}) {
        const bool ignored = mode == on_failure::ignore;  // a failed mapping is
        // The call that fails: lookup, open, mapping, port and its attachment.
        for (const auto& [call, kind, reports] : rows<std::size_t, failure, std::string>{
                 {1, failure::empty_result, report("service") + unopened},
                 {2, failure::empty_result, report("connect") + unopened},
                 {2, failure::io, refused + unopened},
                 {3, failure::unsupported, ignored ? "" : unsupported},
                 {3, failure::empty_result, ignored ? "" : report("queue")},
                 {4, failure::no_memory, report("rxPort")},
                 {5, failure::io, refused}}) {
            host.fail_call(call, kind);
            EXPECT_EQ(attempt([=] { return nrx::profiler_conn().open_queue(mode); }),
                      result(false, reports));
        }
    }
}

TEST_F(profiler_operations, log_is_read_ten_times_or_until_it_is_empty) {
    const auto read = [](nrx::record_store store) {
        const auto print = [=] { nrx::read_profiler_log(nrx::dump_profile_record, store); };
        return attempt([=] { return print(), true; }).second;
    };
    driver->replies[9] = {{.bytes = byte_list(47, 1)},
                          {.bytes = joined({record_bytes(3, 1), record_bytes(3, 2), {9, 9, 9, 9}})},
                          {.bytes = record_bytes(3, 3)},
                          {.bytes = {}}};
    EXPECT_EQ(read(nrx::record_store::log), "");
    EXPECT_EQ(read(nrx::record_store::log), dumped(3, 1) + dumped(3, 2) + dumped(3, 3));
    const std::string call = "driver 9 [] capacity 48000\n";
    EXPECT_EQ(new_calls(), call + call + call + call);

    driver->replies[8] = {{.bytes = record_bytes(3, 1)}};
    std::string ten;
    for (int i = 0; i < 10; ++i)
        ten += dumped(3, 1);
    EXPECT_EQ(read(nrx::record_store::error_dump), ten);
    driver->replies[8] = {{.bytes = record_bytes(3, 1)}, {.code = platform::unsupported}};
    EXPECT_EQ(read(nrx::record_store::error_dump),
              dumped(3, 1) + kr_report(file::kernel_profiler, unsupported_text));
    remove_driver();
    EXPECT_EQ(read(nrx::record_store::error_dump), "");
}

TEST_F(profiler_operations, half_without_support_for_a_config_is_named) {
    const auto apply = [] {
        return attempt(
            [] { return nrx::apply_profiler_configs(std::array<nrx::profiler_config, 1>()); });
    };
    const auto failed = [](auto code) {
        return library_report(file::apply_configs, "result == 0 ", code);
    };
    const std::string fw = "fw config: At least one config failed\n";
    const std::string kext = "kext config: At least one config failed\n";
    set_reply(0x24, platform::unsupported);
    driver->replies[2] = {{.code = platform::unsupported}, {.code = platform::no_memory}, {}};
    EXPECT_EQ(apply(), result(true, fw + kext));
    EXPECT_EQ(apply(), result(false, fw + failed(no_memory_text)));
    set_reply(0x24, platform::simulated::io_failure);
    EXPECT_EQ(apply(), result(false, failed(io_text)));
    remove_service();
    EXPECT_EQ(apply(), result(true, ""));
    EXPECT_TRUE(nrx::read_fw_configs().empty());
    remove_driver();
    EXPECT_EQ(apply(), result(true, kext + library_report(file::kernel_profiler, "service") +
                                        library_report(file::apply_configs, "success")));
}

}  // namespace tests
