#include "nrxctl/inspection/hid_statistics.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

#include "nrxctl/base/name_table.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/inspection/hid_event_state.h"

namespace nrx {

namespace {

constexpr std::size_t record_size = 7;

enum class value_kind { none, integer, q16_16 };

struct operation_row {
    std::string_view label;
    value_kind value;
};

// By operation. The last row also stands for every higher number.
constexpr std::array operation_rows{
    operation_row{": NOP", value_kind::none},     operation_row{": clear ", value_kind::none},
    operation_row{": set ", value_kind::integer}, operation_row{": add ", value_kind::integer},
    operation_row{": clear ", value_kind::none},  operation_row{": set ", value_kind::q16_16},
    operation_row{": push ", value_kind::q16_16},
};

// The counters, by key index, without the domain that all of them belong to.
constexpr std::string_view key_domain = "com.kelto.";
constexpr std::array stats_key_rows{
    name_row{0, "wqr.button.click.count"},
    name_row{1, "wqr.button.single_click.count"},
    name_row{2, "wqr.button.double_click.count"},
    name_row{3, "wqr.button.triple_click.count"},
    name_row{4, "wqr.button.long_press.count"},
    name_row{5, "wqr.button.touch_with_click.count"},
    name_row{6, "wqr.button.touch_no_click.count"},
    name_row{7, "wqr.button.click.vesk"},
    name_row{8, "wqr.button.touch.vesk"},
    name_row{9, "wqr.button.click_to_vesk.time"},
    name_row{10, "wqr.button.touch_to_vesk.time"},
    name_row{11, "wqr.button.click.duration"},
    name_row{12, "wqr.button.touch.duration"},
    name_row{13, "wqr.button.touch_to_first_click.time"},
    name_row{14, "wqr.button.touch_to_last_unclick.time"},
    name_row{15, "wqr.button.first_click_to_last_unclick.time"},
    name_row{16, "wqr.button.first_click_to_untouch.time"},
    name_row{17, "wqr.button.last_unclick_to_untouch.time"},
    name_row{18, "wqr.button.critical_error.count"},
    name_row{19, "wqr.button.timeout.count"},
    name_row{20, "wqr.prox.event.ext_bl_capture.count"},
    name_row{21, "wqr.prox.event.smudge_timeout.bh.count"},
    name_row{22, "wqr.prox.event.smudge_timeout.nonbh.count"},
    name_row{23, "wqr.prox.event.high_amb.count"},
    name_row{24, "wqr.prox.first_pocket_signal_sample.kcpss"},
    name_row{25, "com.wqr.prox.baseline_to_trigger.time.dist"},
    name_row{26, "wqr.prox.ext_bl_capture.signal_delta.dist"},
    name_row{27, "wqr.prox.ref_rate_increase.percent.dist"},
    name_row{28, "wqr.prox.num_frames_for_high_ambient_baseline_capture.dist"},
    name_row{29, "wqr.prox.num_bias_corrected_frames_for_high_ambient_baseline_capture.dist"},
    name_row{30, "wqr.prox.num_frames_for_high_ambient_baseline_capture_target_approched.dist"},
    name_row{31,
             "wqr.prox.num_bias_corrected_frames_for_high_ambient_baseline_capture_target_"
             "approched.dist"},
    name_row{32, "wqr.button.touch_with_click.ap_on.duration"},
    name_row{33, "wqr.button.touch_with_no_click.ap_on.duration"},
    name_row{34, "wqr.button.touch_with_click.ap_off.duration"},
    name_row{35, "wqr.button.touch_with_no_click.ap_off.duration"},
    name_row{36, "wqr.button.touch.ap_on.duration"},
    name_row{37, "wqr.button.touch.ap_off.duration"},
    name_row{38, "wqr.zarn.reset_hb_count"},
    name_row{39, "wqr.zarn.reset_count"},
    name_row{40, "wqr.zarn.ibfd_timeout_count"},
    name_row{41, "wqr.tactkey.reset_timeout_count"},
    name_row{42, "wqr.button.wendra.cl_timeout.count"},
    name_row{43, "wqr.button.wendra.cl_fault.count"},
    name_row{44, "wqr.button.zarn_probe_failure_zarn_count"},
    name_row{45, "wqr.button.force_sensor_probe_failure_count"},
    name_row{46, "wqr.button.arc_probe_failure_count"},
    name_row{47, "wqr.button.btmspk_probe_failure_count"},
    name_row{50, "wqr.audio.arc.on.duration"},
    name_row{51, "wqr.audio.arc.off.duration"},
    name_row{52, "wqr.audio.arc.prewarm.duration"},
    name_row{53, "wqr.audio.btmspk.on.duration"},
    name_row{54, "wqr.audio.btmspk.off.duration"},
    name_row{55, "wqr.audio.btmspk.prewarm.duration"},
    name_row{57, "wqr.test"},
};
constexpr std::string_view unknown_key = "?";
constexpr name_table stats_key_names(stats_key_rows, unknown_key);

void print_record(platform::byte_view bytes) {
    const reply_fields record(bytes);
    const std::uint32_t key = record.u8(2);
    const std::int32_t value = record.s32(3);
    const auto& row =
        operation_rows[std::min<std::size_t>(record.u8(1), operation_rows.size() - 1)];
    std::ostream& out = event_stream();
    out << "TALY_CALLBACK" << row.label;
    const std::string_view name = stats_key_names.name(key);
    if (name != unknown_key) out << key_domain;
    out << name;
    if (row.value == value_kind::integer) out << " " << value;
    if (row.value == value_kind::q16_16) out << " " << value / q16_16_one;
    end_event_line();
}

}  // namespace

void stats_callback(platform::byte_view records) {
    for_each_record(records, record_size, print_record);
}

}  // namespace nrx
