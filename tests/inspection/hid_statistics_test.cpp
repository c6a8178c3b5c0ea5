#include "nrxctl/inspection/hid_statistics.h"

#include <sstream>

#include "tests/inspection/event_host.h"

namespace tests {

namespace {

using hid_statistics = event_test;

byte_list record(std::uint8_t operation, std::uint8_t key, std::int32_t value) {
    const auto bits = static_cast<std::uint32_t>(value);
    const auto byte = [&](int n) { return static_cast<std::uint8_t>(bits >> (8 * n)); };
    return {0xee, operation, key, byte(0), byte(1), byte(2), byte(3)};
}

std::string printed(const byte_list& records) {
    const auto result = capture([&] { nrx::stats_callback(records); });
    EXPECT_EQ(result.err, "");
    return result.out;
}

TEST_F(hid_statistics, each_operation_has_its_label_and_its_kind_of_value) {
    constexpr std::int32_t value = 98'304;  // 1.5
    const std::string key = "com.kelto.wqr.test";
    EXPECT_EQ(printed(record(0, 57, value)), "TALY_CALLBACK: NOP" + key + "\n");
    EXPECT_EQ(printed(record(1, 57, value)), "TALY_CALLBACK: clear " + key + "\n");
    EXPECT_EQ(printed(record(2, 57, value)), "TALY_CALLBACK: set " + key + " 98304\n");
    EXPECT_EQ(printed(record(3, 57, -value)), "TALY_CALLBACK: add " + key + " -98304\n");
    EXPECT_EQ(printed(record(4, 57, value)), "TALY_CALLBACK: clear " + key + "\n");
    EXPECT_EQ(printed(record(5, 57, value)), "TALY_CALLBACK: set " + key + " 1.5\n");
    for (int operation = 6; operation < 256; ++operation) {
        EXPECT_EQ(printed(record(static_cast<std::uint8_t>(operation), 57, -value)),
                  "TALY_CALLBACK: push " + key + " -1.5\n")
            << operation;
    }
    // Whole 32-bit numbers, and fractions of 16 bits.
    EXPECT_EQ(printed(record(2, 48, std::numeric_limits<std::int32_t>::min())),
              "TALY_CALLBACK: set ? -2147483648\n");
    EXPECT_EQ(printed(record(5, 48, std::numeric_limits<std::int32_t>::max())),
              "TALY_CALLBACK: set ? 32768\n");
    EXPECT_EQ(printed(record(5, 48, 1)), "TALY_CALLBACK: set ? 1.52588e-05\n");
    EXPECT_EQ(printed(record(6, 48, 0)), "TALY_CALLBACK: push ? 0\n");
}

TEST_F(hid_statistics, only_whole_records_are_printed_whatever_the_length) {
    byte_list three;
    for (const auto& one : {record(2, 0, 1), record(3, 1, 2), record(1, 2, 3)})
        three.insert(three.end(), one.begin(), one.end());
    const std::array<std::string, 3> lines{
        "TALY_CALLBACK: set com.kelto.wqr.button.click.count 1\n",
        "TALY_CALLBACK: add com.kelto.wqr.button.single_click.count 2\n",
        "TALY_CALLBACK: clear com.kelto.wqr.button.double_click.count\n"};
    for (std::size_t size = 0; size <= three.size(); ++size) {
        // In an allocation of its own, so that a byte read beyond it is a sanitizer's find.
        const byte_list prefix(three.begin(), three.begin() + static_cast<std::ptrdiff_t>(size));
        std::string expected;
        for (std::size_t i = 0; i < size / 7; ++i)
            expected += lines[i];
        EXPECT_EQ(printed(prefix), expected) << size;
    }
}

TEST_F(hid_statistics, keys_have_the_vendors_domain_in_front_and_unknown_ones_a_question_mark) {
    std::istringstream names(R"(
com.kelto.wqr.button.click.count com.kelto.wqr.button.single_click.count
com.kelto.wqr.button.double_click.count com.kelto.wqr.button.triple_click.count
com.kelto.wqr.button.long_press.count com.kelto.wqr.button.touch_with_click.count
com.kelto.wqr.button.touch_no_click.count com.kelto.wqr.button.click.vesk
com.kelto.wqr.button.touch.vesk com.kelto.wqr.button.click_to_vesk.time
com.kelto.wqr.button.touch_to_vesk.time com.kelto.wqr.button.click.duration
com.kelto.wqr.button.touch.duration com.kelto.wqr.button.touch_to_first_click.time
com.kelto.wqr.button.touch_to_last_unclick.time
com.kelto.wqr.button.first_click_to_last_unclick.time
com.kelto.wqr.button.first_click_to_untouch.time com.kelto.wqr.button.last_unclick_to_untouch.time
com.kelto.wqr.button.critical_error.count com.kelto.wqr.button.timeout.count
com.kelto.wqr.prox.event.ext_bl_capture.count com.kelto.wqr.prox.event.smudge_timeout.bh.count
com.kelto.wqr.prox.event.smudge_timeout.nonbh.count com.kelto.wqr.prox.event.high_amb.count
com.kelto.wqr.prox.first_pocket_signal_sample.kcpss
com.kelto.com.wqr.prox.baseline_to_trigger.time.dist
com.kelto.wqr.prox.ext_bl_capture.signal_delta.dist
com.kelto.wqr.prox.ref_rate_increase.percent.dist
com.kelto.wqr.prox.num_frames_for_high_ambient_baseline_capture.dist
com.kelto.wqr.prox.num_bias_corrected_frames_for_high_ambient_baseline_capture.dist
com.kelto.wqr.prox.num_frames_for_high_ambient_baseline_capture_target_approched.dist
com.kelto.wqr.prox.num_bias_corrected_frames_for_high_ambient_baseline_capture_target_approched.dist
com.kelto.wqr.button.touch_with_click.ap_on.duration
com.kelto.wqr.button.touch_with_no_click.ap_on.duration
com.kelto.wqr.button.touch_with_click.ap_off.duration
com.kelto.wqr.button.touch_with_no_click.ap_off.duration com.kelto.wqr.button.touch.ap_on.duration
com.kelto.wqr.button.touch.ap_off.duration com.kelto.wqr.zarn.reset_hb_count
com.kelto.wqr.zarn.reset_count com.kelto.wqr.zarn.ibfd_timeout_count
com.kelto.wqr.tactkey.reset_timeout_count com.kelto.wqr.button.wendra.cl_timeout.count
com.kelto.wqr.button.wendra.cl_fault.count com.kelto.wqr.button.zarn_probe_failure_zarn_count
com.kelto.wqr.button.force_sensor_probe_failure_count com.kelto.wqr.button.arc_probe_failure_count
com.kelto.wqr.button.btmspk_probe_failure_count ? ? com.kelto.wqr.audio.arc.on.duration
com.kelto.wqr.audio.arc.off.duration com.kelto.wqr.audio.arc.prewarm.duration
com.kelto.wqr.audio.btmspk.on.duration com.kelto.wqr.audio.btmspk.off.duration
com.kelto.wqr.audio.btmspk.prewarm.duration ? com.kelto.wqr.test
)");
    std::string name;
    for (int key = 0; key < 256; ++key) {
        if (!(names >> name)) name.assign(1, '?');
        EXPECT_EQ(printed(record(0, static_cast<std::uint8_t>(key), 0)),
                  "TALY_CALLBACK: NOP" + name + "\n")
            << key;
    }
}

}  // namespace

}  // namespace tests
