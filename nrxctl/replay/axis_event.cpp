#include "nrxctl/replay/axis_event.h"

#include <array>
#include <cmath>
#include <cstdlib>
#include <ctime>

#include "nrxctl/base/end_process.h"
#include "nrxctl/base/fixed_point.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/base/word_table.h"

namespace nrx {

namespace {

constexpr std::int32_t one = 0x10000;

// A sample of a signal, numbered from 0.
struct signal_sample {
    std::uint32_t number;
    std::uint32_t count;
};

std::int32_t random_value(const signal_sample& /*sample*/) {
    return std::rand() % (one + 1);
}

std::int32_t delta_value(const signal_sample& sample) {
    return sample.number == 0 ? one : 0;
}

std::int32_t step_value(const signal_sample& sample) {
    return sample.number < sample.count / 2 ? one : 0;
}

std::int32_t sine_value(const signal_sample& sample) {
    constexpr double full_turn = 6.283185307179586;
    if (sample.count == 0) return 0;
    const double angle = full_turn / sample.count * sample.number;
    return static_cast<std::int32_t>(std::sin(angle) * fixed_point_one);
}

struct signal_row {
    std::string_view word;
    std::int32_t (*value)(const signal_sample& sample);
};

constexpr std::array signals{
    signal_row{"random", random_value},
    signal_row{"delta", delta_value},
    signal_row{"step", step_value},
    signal_row{"sin", sine_value},
};

// A generated sample is as warm as a wrist: 28.80 degrees.
constexpr std::string_view generated_temperature = "2880";

}  // namespace

bool AxisEvent::parse(const sample_values& values) {
    record_.parse_head(values);
    record_.parse_value(0, values[sample_key::x]);
    record_.parse_value(1, values[sample_key::y]);
    record_.parse_value(2, values[sample_key::z]);
    timestamp_ = parse_timestamp(values[sample_key::timestamp]);
    if (values[sample_key::shake] == "1") {
        print_line("Shake samples are not allowed");
        end_process();
    }
    return true;
}

bool AxisEvent::init_generator(std::string_view signal_type) {
    if (find_word_row(signals, signal_type) == nullptr) return false;
    std::srand(static_cast<unsigned>(std::time(nullptr)));
    next_sample_ = 0;
    next_timestamp_ = 0;
    return true;
}

std::string AxisEvent::generate(std::string_view signal_type, std::uint32_t interval,
                                std::uint32_t samples) {
    const signal_row* signal = find_word_row(signals, signal_type);
    const std::int32_t value = signal == nullptr ? 0 : signal->value({next_sample_, samples});
    text_line line;
    line.text(name()).text(",x=0x").zero_padded_hex(static_cast<std::uint32_t>(value), 8);
    line.text(",y=0x00000000,z=0x00000000,sampleid=");
    line.number(static_cast<std::int32_t>(next_sample_));
    line.text(",timestamp=").number(static_cast<std::int64_t>(next_timestamp_));
    line.text(",temperature=").text(generated_temperature);
    ++next_sample_;
    next_timestamp_ += interval;
    return std::string(line.view());
}

}  // namespace nrx
