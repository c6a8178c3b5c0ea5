#include "nrxctl/profiler/apply_configs.h"
#include "nrxctl/profiler/fw_profiler.h"
#include "nrxctl/profiler/kernel_profiler.h"
#include "nrxctl/profiler/profiler_conn.h"
#include "tests/profiler/profiler_host.h"

namespace tests {

using lines = std::vector<std::string>;
using nrx::presence;

namespace {

constexpr const char* conn = "profiler/profiler_conn.cpp";
constexpr const char* kernel = "profiler/kernel_profiler.cpp";
constexpr const char* apply = "profiler/apply_configs.cpp";
constexpr const char* unsupported_text = "unsupported request (0xe00002c7)";
constexpr const char* io_text = "device i/o failure (0xe0000401)";

const std::vector<nrx::profiler_config> one_config{
    {.profiler = 2, .component = 1, .reports = 4, .services = {}}};
constexpr const char* one_config_bytes =
    "02 00 00 00 01 00 00 00 00 00 00 00 04 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 "
    "00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00";

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
};

TEST_F(profiler_operations, connection_opens_the_driver_itself_and_maps_its_queue) {
    put_driver();
    {
        nrx::profiler_conn opened;
        EXPECT_TRUE(opened.open_queue(presence::is_required));
        EXPECT_TRUE(opened.queue());
        EXPECT_TRUE(opened.port());
    }
    EXPECT_EQ(happened(), (lines{"open KeltoNRXProfileDriver type 0",
                                 "map KeltoNRXProfileDriver memory 0", "allocate port",
                                 "attach port to KeltoNRXProfileDriver notification 0 reference 0",
                                 "unmap KeltoNRXProfileDriver", "close KeltoNRXProfileDriver"}));
}

TEST_F(profiler_operations, connection_reports_what_is_missing_unless_it_is_optional) {
    const auto opening = [](presence wanted) {
        return capture([&] {
            nrx::profiler_conn opened;
            EXPECT_FALSE(opened.open(wanted));
        });
    };
    const auto opening_queue = [](presence mapping) {
        return capture([&] {
            nrx::profiler_conn opened;
            EXPECT_FALSE(opened.open_queue(mapping));
        });
    };
    EXPECT_EQ(opening(presence::is_required).err, failed(conn, "service"));
    EXPECT_EQ(opening(presence::is_optional).err, "");
    EXPECT_EQ(opening_queue(presence::is_optional).err,
              failed(conn, "service") + failed(conn, "success"));

    put_driver();
    host.fail_call(2, failure::io);
    EXPECT_EQ(opening(presence::is_optional).err, failed(conn, "kr == 0 ", io_text));
    host.fail_call(2, failure::nothing);
    EXPECT_EQ(opening(presence::is_required).err, failed(conn, "connect"));
    driver->queue = nullptr;
    EXPECT_EQ(opening_queue(presence::is_required).err, failed(conn, "kr == 0 ", unsupported_text));
    EXPECT_EQ(opening_queue(presence::is_optional).err, "");
    host.fail_call(3, failure::nothing);
    EXPECT_EQ(opening_queue(presence::is_required).err, failed(conn, "queue"));
    host.fail_call(3, failure::nothing);
    EXPECT_EQ(opening_queue(presence::is_optional).err, "");
    driver->queue = std::make_shared<platform::simulated::shared_queue>();
    host.fail_call(4, failure::no_memory);
    EXPECT_EQ(opening_queue(presence::is_optional).err, failed(conn, "rxPort"));
    host.fail_call(5, failure::io);
    EXPECT_EQ(opening_queue(presence::is_optional).err, failed(conn, "kr == 0 ", io_text));
}

TEST_F(profiler_operations, status_is_the_scalar_that_comes_back) {
    bool connected = true;
    const auto status = [&] {
        bool told = false;
        const outcome written = capture([&] { told = nrx::get_profiler_status(connected); });
        return std::pair(told, written.err);
    };
    EXPECT_EQ(status(), std::pair(false, failed(conn, "service") + failed(kernel, "success")));
    EXPECT_TRUE(connected);
    put_driver();
    driver->answers[1] = {{.scalar = 0}, {.scalar = 0x100000000}, {.code = platform::unsupported}};
    EXPECT_EQ(status(), std::pair(true, std::string()));
    EXPECT_FALSE(connected);
    EXPECT_EQ(status(), std::pair(true, std::string()));
    EXPECT_TRUE(connected);
    EXPECT_EQ(status(), std::pair(false, failed(kernel, "kr == 0 ", unsupported_text)));
    EXPECT_EQ(logged("call"),
              lines(3, "call KeltoNRXProfileDriver 1 scalars [] in [] results 1 room 0"));
}

TEST_F(profiler_operations, log_is_read_until_less_than_a_record_comes) {
    put_driver();
    const auto read = [&] { return capture([] { nrx::read_profiler_log(keep_mark); }).err; };
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
}

TEST_F(profiler_operations, log_is_read_ten_times_at_most_and_not_after_a_failure) {
    put_driver();
    driver->answers[8] = {{.bytes = record_bytes(3, 1)}};
    const auto read = [&] {
        return capture([] { nrx::read_profiler_log(keep_mark, nrx::stored_records::error_dump); });
    };
    EXPECT_EQ(read().err, "");
    EXPECT_EQ(printed_marks.size(), 10U);
    driver->answers[8] = {{.bytes = record_bytes(3, 1)}, {.code = platform::unsupported}};
    EXPECT_EQ(read().err, failed(kernel, "kr == 0 ", unsupported_text));
    EXPECT_EQ(printed_marks.size(), 11U);
    host.remove(driver_name);
    EXPECT_EQ(read().err, "");
}

TEST_F(profiler_operations, configurations_go_to_both_halves) {
    put_both_halves();
    EXPECT_TRUE(nrx::apply_profiler_configs(one_config));
    const std::string bytes = one_config_bytes;
    EXPECT_EQ(happened(),
              (lines{"open profile type 0",
                     "call profile 3 scalars [0x24] in [" + bytes + "] results 0 room 0",
                     "close profile", "open KeltoNRXProfileDriver type 0",
                     "call KeltoNRXProfileDriver 2 scalars [] in [" + bytes + "] results 0 room 0",
                     "close KeltoNRXProfileDriver"}));
}

TEST_F(profiler_operations, no_configurations_are_sent_to_both_halves_too) {
    put_both_halves();
    EXPECT_TRUE(nrx::apply_profiler_configs({}));
    EXPECT_EQ(logged("call"),
              (lines{"call profile 3 scalars [0x24] in [] results 0 room 0",
                     "call KeltoNRXProfileDriver 2 scalars [] in [] results 0 room 0"}));
}

TEST_F(profiler_operations, halves_that_do_not_support_a_configuration_are_named) {
    put_both_halves();
    const auto applying = [&] {
        bool applied = false;
        const outcome written = capture([&] { applied = nrx::apply_profiler_configs(one_config); });
        return std::pair(applied, written.out + written.err);
    };
    const std::string fw = "fw config: At least one config failed\n";
    const std::string kext = "kext config: At least one config failed\n";
    const auto answer_of_service = [&](platform::return_code code) {
        service->set_command(0x24, [=](platform::byte_view, byte_list&) { return code; });
    };

    answer_of_service(platform::unsupported);
    driver->answers[2] = {{.code = platform::unsupported}};
    EXPECT_EQ(applying(), std::pair(true, fw + kext));
    driver->answers[2] = {{.code = platform::no_memory}};
    EXPECT_EQ(applying(),
              std::pair(false, fw + failed(apply, "result == 0 ", "out of memory (0xe00002bd)")));
    answer_of_service(platform::simulated::io_failure);
    EXPECT_EQ(applying(), std::pair(false, failed(apply, "result == 0 ", io_text)));

    host.remove("profile");
    driver->answers[2] = {};
    EXPECT_EQ(applying(), std::pair(true, std::string()));
    EXPECT_TRUE(nrx::read_fw_configs().empty());
    host.remove(driver_name);
    EXPECT_EQ(applying(),
              std::pair(true, kext + failed(conn, "service") + failed(apply, "success")));
}

}  // namespace tests
