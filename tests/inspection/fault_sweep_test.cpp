// The inspection of a sensor, with each of its platform calls failing in turn.
#include "tests/support/fault_sweep.h"

#include "nrxctl/inspection/sensor_info.h"
#include "tests/inspection/sensor_host.h"

namespace tests {

namespace {

std::unique_ptr<machine> make_host() {
    auto host = std::make_unique<machine>();
    put_whole_sensor(*host, "accel");
    host->add({.name = "one", .classes = {"KeltoNRXHIDInterface"}});
    host->add({.name = "two", .classes = {"KeltoNRXHIDInterface"}});
    return host;
}

// Reports that are texts, lists or blocks, and the command: a reply without bytes lacks nothing.
bool may_be_empty(const fault& one) {
    for (const char* scalar : {"[0xf]", "[0x10]", "[0x3f]", "[0x36]", "[0x37]", "[0x39]", "[0x3a]",
                               "[0x3b]", "[0x3c]"}) {
        if (one.name.find(scalar) != std::string::npos) return true;
    }
    return false;
}

// Reports are optional, but for the counters; a service that is not found when they are read is
// silent too, unlike one that cannot be opened, and a missing child.
bool must_be_told(const fault& one) {
    if (one.name.starts_with("open ") || one.name.starts_with("first child ")) return true;
    if (!one.name.starts_with("call ")) return false;
    if (one.name.find("[0x31]") != std::string::npos) return true;
    return one.how == failure::nothing && !may_be_empty(one);
}

bool is_as_foreseen(const fault& one, std::int32_t level) {
    const bool is_look_up = one.name.starts_with("first match ");
    const std::string& out = one.result.out;
    const bool is_whole = out.starts_with("Sensor type : accel\n") && out.ends_with("\n\n\n") &&
                          (level == 2) == (out.find("\nSensorRegs  : ") != std::string::npos);
    const bool is_refused = out.starts_with("sensor accel doesn't provide sensor info (kr=");
    return (is_look_up || one.result.err.empty() != must_be_told(one)) && (is_whole || is_refused);
}

TEST(inspection_fault_sweep, a_sensor_at_both_levels) {
    for (const std::int32_t level : {1, 2}) {
        sweep_faults(
            make_host, [&] { nrx::print_sensor_info("accel", level); },
            [&](const fault& one) { return is_as_foreseen(one, level); });
    }
}

TEST(inspection_fault_sweep, a_sensor_that_there_is_not) {
    sweep_faults(
        make_host, [] { nrx::print_sensor_info("nobody", 1); },
        [](const fault& one) {
            const bool must_be_told =
                one.name.starts_with("all matches ") || one.name.starts_with("name of ");
            const std::string& out = one.result.out;
            return (must_be_told && one.how != failure::nothing) != one.result.err.empty() &&
                   out.starts_with("sensor nobody doesn't provide sensor info (kr=e00002f0)\n\n") &&
                   out.find("\nMatching nobody [0x") != std::string::npos &&
                   out.ends_with(", 0]\n\n\n\n");
        });
}

}  // namespace

}  // namespace tests
