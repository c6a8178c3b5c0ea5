#include "nrxctl/profiler/config_words.h"

#include <array>

#include "nrxctl/base/word_table.h"

namespace nrx {

namespace {

constexpr std::uint32_t every_report = 0xffffffff;
constexpr std::uint32_t every_usual_report = 0xffff;

// Components.

constexpr std::array exec_components{
    word_number{"thread", 0},  word_number{"function", 1}, word_number{"workloop", 2},
    word_number{"command", 3}, word_number{"packet", 3},   word_number{"extfunction", 4},
    word_number{"timing", 5},
};
constexpr std::array trace_components{
    word_number{"remoteq", 0},   word_number{"endpoint", 1}, word_number{"systick", 2},
    word_number{"interrupt", 3}, word_number{"mbi", 4},
};
constexpr std::array sensor_components{
    word_number{"accel", 0},       word_number{"gyro", 1},   word_number{"compass", 2},
    word_number{"pressure", 3},    word_number{"gostin", 4}, word_number{"als", 5},
    word_number{"temperature", 6},
};
constexpr std::array orrin_components{word_number{"orrin", 0}};
constexpr std::array talvor_components{word_number{"talvor", 0}};
constexpr std::array interrupt_components{word_number{"gpio", 0}};
constexpr std::array uart_components{
    word_number{"uart0", 0},
    word_number{"uart1", 1},
    word_number{"uart2", 2},
};
constexpr std::array scm_components{
    word_number{"spi0", 0},  word_number{"smb0", 1},      word_number{"smb1", 2},
    word_number{"i2cm0", 3}, word_number{"i2c_ctrl0", 4}, word_number{"i2c_ctrl1", 5},
};
constexpr std::array wake_components{word_number{"wake", 0}};

// Reports.

constexpr std::array command_words{
    word_number{"all", every_report},
    word_number{"command", 0x1f},
    word_number{"report", 0xe0},
};
constexpr std::array all_word{word_number{"all", every_report}};
constexpr std::array all_usual_word{word_number{"all", every_usual_report}};
constexpr std::array sensor_words{
    word_number{"all", every_usual_report},
    word_number{"lat", 0x1},
    word_number{"raw", 0x2},
    word_number{"data", 0x4},
    word_number{"rdata", 0x6},
    word_number{"filtered", 0x8},
    word_number{"apdata", 0x10},
    word_number{"writereg", 0x20},
    word_number{"readreg", 0x40},
    word_number{"update", 0x80},
    word_number{"filterstate", 0x100},
    word_number{"sensorinfo", 0x200},
    word_number{"annotation", 0x400},
    word_number{"decimationinfo", 0x800},
    word_number{"t-magnitude", 0x10000},
    word_number{"t-latency", 0x20000},
    word_number{"error", 0x40000},
    word_number{"t-bad", 0x80000},
};
// "all" is the latency alone, and the latency of triggers has not the sensors' bit.
constexpr std::array orrin_words{
    word_number{"all", 0x1},
    word_number{"latency", 0x1},
    word_number{"monitor", 0x2},
    word_number{"trig-lat", 0x10000},
};
constexpr std::array uart_words{
    word_number{"all", every_usual_report},
    word_number{"preamble", 0x1},
    word_number{"swhand", 0x2},
    word_number{"hwhand", 0x4},
    word_number{"trace", 0x8},
    word_number{"packet", 0x10},
    word_number{"baseband", 0x20},
    word_number{"transport", 0x40},
    word_number{"test", 0x80},
};
constexpr std::array scm_words{
    word_number{"all", every_report}, word_number{"ch0", 0x1},     word_number{"ch1", 0x2},
    word_number{"ch2", 0x4},          word_number{"ch3", 0x8},     word_number{"ch4", 0x10},
    word_number{"ch5", 0x20},         word_number{"ch6", 0x40},    word_number{"ch7", 0x80},
    word_number{"ch8", 0x100},        word_number{"ch9", 0x200},   word_number{"ch10", 0x400},
    word_number{"ch11", 0x800},       word_number{"ch12", 0x1000}, word_number{"ch13", 0x2000},
    word_number{"ch14", 0x4000},      word_number{"ch15", 0x8000},
};
constexpr std::array wake_words{
    word_number{"all", every_usual_report},
    word_number{"wake-req-stats", 0x1},
    word_number{"wake-req-info", 0x2},
    word_number{"wake-event-info", 0x4},
};

constexpr std::array exec_special_reports{
    component_reports{"command", {command_words, true}},
    component_reports{"packet", {command_words, true}},
    component_reports{"extfunction", {all_word, true}},
};
constexpr report_grammar trace_reports{all_word, true};
constexpr report_grammar sensor_reports{sensor_words, false};
constexpr report_grammar orrin_reports{orrin_words, false};
constexpr report_grammar plain_reports{all_usual_word, false};
constexpr report_grammar uart_reports{uart_words, false};
constexpr report_grammar scm_reports{scm_words, false};
constexpr report_grammar wake_reports{wake_words, false};

constexpr std::array profilers{
    profiler_grammar{.word = "exec",
                     .number = 0,
                     .components = exec_components,
                     .takes_one_component_only = true,
                     .special_reports = exec_special_reports},
    profiler_grammar{.word = "trace",
                     .number = 1,
                     .components = trace_components,
                     .takes_numeric_components = true,
                     .reports = &trace_reports},
    profiler_grammar{
        .word = "sensor", .number = 2, .components = sensor_components, .reports = &sensor_reports},
    profiler_grammar{
        .word = "orrin", .number = 3, .components = orrin_components, .reports = &orrin_reports},
    profiler_grammar{
        .word = "talvor", .number = 4, .components = talvor_components, .reports = &plain_reports},
    profiler_grammar{.word = "interrupt",
                     .number = 5,
                     .components = interrupt_components,
                     .reports = &plain_reports},
    profiler_grammar{
        .word = "uart", .number = 6, .components = uart_components, .reports = &uart_reports},
    profiler_grammar{.word = "scm",
                     .number = 9,
                     .components = scm_components,
                     .takes_numeric_components = true,
                     .reports = &scm_reports},
    profiler_grammar{.word = "wake",
                     .number = 10,
                     .components = wake_components,
                     .all_components = "wake",
                     .reports = &wake_reports},
};

}  // namespace

const profiler_grammar* find_profiler_grammar(std::string_view word) {
    return find_word_row(profilers, word);
}

const report_grammar* reports_of(const profiler_grammar& profiler, std::string_view component) {
    const component_reports* special = find_word_row(profiler.special_reports, component);
    return special == nullptr ? profiler.reports : &special->reports;
}

}  // namespace nrx
