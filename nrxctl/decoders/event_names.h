// The names of the identifier bytes of an event record. An identifier that is not listed is shown
// as its number.
#pragma once

#include <array>

#include "nrxctl/decoders/short_text.h"

namespace nrx {

inline constexpr std::array category_names{
    id_name{0, "exec"},   id_name{1, "trace"},     id_name{2, "sensor"}, id_name{3, "orrin"},
    id_name{4, "talvor"}, id_name{5, "interrupt"}, id_name{6, "uart"},   id_name{8, "control"},
    id_name{9, "scm"},    id_name{10, "wake"},
};

inline constexpr std::array type_names{
    id_name{0, "stop"},
    id_name{1, "long-data"},
    id_name{2, "short-data"},
    id_name{3, "event"},
    id_name{4, "trigger"},
    id_name{5, "function"},
    id_name{6, "kpdx-context1"},
    id_name{7, "kpdx-context2"},
    id_name{8, "sensorinfo"},
    id_name{9, "extfunction"},
    id_name{10, "kpdx-context"},
    id_name{11, "annotation"},
    id_name{12, "decimationinfo"},
};

// Components, by category.

inline constexpr std::array execution_components{
    id_name{0, "scheduler"}, id_name{1, "function"},    id_name{2, "workloop"},
    id_name{3, "command"},   id_name{4, "extfunction"}, id_name{5, "timing"},
};
inline constexpr std::array trace_components{
    id_name{0, "remoteq"},
    id_name{1, "endpoint"},
    id_name{2, "systick"},
    id_name{3, "interrupt"},
};
inline constexpr std::array sensor_components{
    id_name{0, "accel"},  id_name{1, "gyro"}, id_name{2, "compass"},     id_name{3, "pressure"},
    id_name{4, "gostin"}, id_name{5, "als"},  id_name{6, "temperature"},
};
inline constexpr std::array orrin_components{id_name{0, "orrin"}};
inline constexpr std::array talvor_components{id_name{0, "talvor"}};
inline constexpr std::array interrupt_components{id_name{0, "gpio"}};
inline constexpr std::array uart_components{
    id_name{0, "uart0"},
    id_name{1, "uart1"},
    id_name{2, "uart2"},
};
inline constexpr std::array scm_components{
    id_name{0, "spi0"},  id_name{1, "smb0"},      id_name{2, "smb1"},
    id_name{3, "i2cm0"}, id_name{4, "i2c_ctrl0"}, id_name{5, "i2c_ctrl1"},
};
inline constexpr std::array wake_components{id_name{0, "wake"}};

// Events, by category; in the category "exec", by component.

inline constexpr std::array scheduler_events{
    id_name{0, "context-switch"},
    id_name{1, "prevent-nap"},
    id_name{2, "thread-state"},
};
inline constexpr std::array function_events{id_name{0, "function"}};
inline constexpr std::array workloop_events{id_name{0, "action"}, id_name{1, "signal"}};
inline constexpr std::array command_events{
    id_name{0, "start"},       id_name{1, "finalize"},    id_name{2, "new-packet"},
    id_name{3, "receive"},     id_name{4, "timeout"},     id_name{5, "live-report"},
    id_name{6, "hist-report"}, id_name{7, "user-report"},
};
inline constexpr std::array extfunction_events{id_name{0, "extfunction"}};
inline constexpr std::array sensor_events{
    id_name{0, "latency"},          id_name{1, "rawdata"},     id_name{2, "data"},
    id_name{3, "filtdata"},         id_name{4, "apdata"},      id_name{5, "regwrite"},
    id_name{6, "regread"},          id_name{7, "update"},      id_name{8, "filter-state"},
    id_name{9, "sensor-info"},      id_name{10, "annotation"}, id_name{16, "trigger-magnitude"},
    id_name{17, "trigger-latency"},
};
inline constexpr std::array orrin_events{
    id_name{0, "latency"},
    id_name{1, "monitor"},
    id_name{17, "trigger-latency"},
};
inline constexpr std::array talvor_events{id_name{0, "data-in"}, id_name{1, "data-out"}};
inline constexpr std::array interrupt_events{id_name{0, "latency"}};
inline constexpr std::array uart_events{
    id_name{0, "preamble"},  id_name{1, "sw-handshake"}, id_name{2, "hw-handshake"},
    id_name{3, "trace"},     id_name{4, "packet"},       id_name{5, "baseband"},
    id_name{6, "transport"}, id_name{7, "wqr-test"},
};
inline constexpr std::array wake_events{
    id_name{0, "wake-req-stats"},
    id_name{1, "wake-req-info"},
    id_name{2, "wake-event-info"},
};

// The event tables of the category "exec", by component.
inline constexpr std::array execution_events{
    basic_name_row<id_name_table>{0, scheduler_events},
    basic_name_row<id_name_table>{1, function_events},
    basic_name_row<id_name_table>{2, workloop_events},
    basic_name_row<id_name_table>{3, command_events},
    basic_name_row<id_name_table>{4, extfunction_events},
};

// All tables; the bound of a record's text is computed from them.
inline constexpr std::array component_tables{
    id_name_table(execution_components), id_name_table(trace_components),
    id_name_table(sensor_components),    id_name_table(orrin_components),
    id_name_table(talvor_components),    id_name_table(interrupt_components),
    id_name_table(uart_components),      id_name_table(scm_components),
    id_name_table(wake_components),
};
inline constexpr std::array event_tables{
    id_name_table(scheduler_events),   id_name_table(function_events),
    id_name_table(workloop_events),    id_name_table(command_events),
    id_name_table(extfunction_events), id_name_table(sensor_events),
    id_name_table(orrin_events),       id_name_table(talvor_events),
    id_name_table(interrupt_events),   id_name_table(uart_events),
    id_name_table(wake_events),
};

}  // namespace nrx
