#include "nrxctl/inspection/stats_key_names.h"

#include <array>
#include <string_view>

namespace nrx {

namespace {

// In front of every name.
constexpr std::string_view domain = "com.kelto.";

// By index; empty: no counter.
constexpr std::array<std::string_view, 58> names{
    "wqr.button.click.count",
    "wqr.button.single_click.count",
    "wqr.button.double_click.count",
    "wqr.button.triple_click.count",
    "wqr.button.long_press.count",
    "wqr.button.touch_with_click.count",
    "wqr.button.touch_no_click.count",
    "wqr.button.click.vesk",
    "wqr.button.touch.vesk",
    "wqr.button.click_to_vesk.time",
    "wqr.button.touch_to_vesk.time",
    "wqr.button.click.duration",
    "wqr.button.touch.duration",
    "wqr.button.touch_to_first_click.time",
    "wqr.button.touch_to_last_unclick.time",
    "wqr.button.first_click_to_last_unclick.time",
    "wqr.button.first_click_to_untouch.time",
    "wqr.button.last_unclick_to_untouch.time",
    "wqr.button.critical_error.count",
    "wqr.button.timeout.count",
    "wqr.prox.event.ext_bl_capture.count",
    "wqr.prox.event.smudge_timeout.bh.count",
    "wqr.prox.event.smudge_timeout.nonbh.count",
    "wqr.prox.event.high_amb.count",
    "wqr.prox.first_pocket_signal_sample.kcpss",
    "com.wqr.prox.baseline_to_trigger.time.dist",
    "wqr.prox.ext_bl_capture.signal_delta.dist",
    "wqr.prox.ref_rate_increase.percent.dist",
    "wqr.prox.num_frames_for_high_ambient_baseline_capture.dist",
    "wqr.prox.num_bias_corrected_frames_for_high_ambient_baseline_capture.dist",
    "wqr.prox.num_frames_for_high_ambient_baseline_capture_target_approched.dist",
    "wqr.prox.num_bias_corrected_frames_for_high_ambient_baseline_capture_target_approched.dist",
    "wqr.button.touch_with_click.ap_on.duration",
    "wqr.button.touch_with_no_click.ap_on.duration",
    "wqr.button.touch_with_click.ap_off.duration",
    "wqr.button.touch_with_no_click.ap_off.duration",
    "wqr.button.touch.ap_on.duration",
    "wqr.button.touch.ap_off.duration",
    "wqr.zarn.reset_hb_count",
    "wqr.zarn.reset_count",
    "wqr.zarn.ibfd_timeout_count",
    "wqr.tactkey.reset_timeout_count",
    "wqr.button.wendra.cl_timeout.count",
    "wqr.button.wendra.cl_fault.count",
    "wqr.button.zarn_probe_failure_zarn_count",
    "wqr.button.force_sensor_probe_failure_count",
    "wqr.button.arc_probe_failure_count",
    "wqr.button.btmspk_probe_failure_count",
    "",
    "",
    "wqr.audio.arc.on.duration",
    "wqr.audio.arc.off.duration",
    "wqr.audio.arc.prewarm.duration",
    "wqr.audio.btmspk.on.duration",
    "wqr.audio.btmspk.off.duration",
    "wqr.audio.btmspk.prewarm.duration",
    "",
    "wqr.test",
};

}  // namespace

void print_stats_key_name(std::ostream& out, std::uint8_t index) {
    const std::string_view name = index < names.size() ? names[index] : std::string_view();
    if (name.empty()) {
        out << "?";
    } else {
        out << domain << name;
    }
}

}  // namespace nrx
