#include "nrxctl/replay/virtual_event.h"

#include <cmath>
#include <cstdlib>
#include <ctime>

#include "nrxctl/base/arguments.h"
#include "nrxctl/base/end_process.h"
#include "nrxctl/base/explanation.h"
#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/reply_fields.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/fast/fast_number.h"

namespace nrx {

namespace {

// The word positions of a record's head.
constexpr std::size_t size_word = 0;
constexpr std::size_t delta_word = 1;
constexpr std::size_t sampleid_word = 2;
constexpr std::size_t temperature_word = 3;
constexpr std::size_t first_value_word = 4;

template <std::size_t Size>
void set_word(std::array<std::uint8_t, Size>& record, std::size_t position, std::uint32_t value) {
    store_le(record.data() + 4 * position, value);
}

[[noreturn]] void reject_missing_value(sample_key key, std::string_view message) {
    const explanation_scope scope(
        [&](explanation& given) { given = {std::string(sample_key_name(key)) + " is missing"}; });
    reject_number({}, message);
}

std::int64_t parse_value(const sample_values& values, sample_key key, std::string_view message) {
    const std::string_view text = values[key];
    if (text.empty()) [[unlikely]]
        reject_missing_value(key, message);
    return parse_fast_number(text, message);
}

std::uint32_t parse_sample(const sample_values& values, sample_key key) {
    return static_cast<std::uint32_t>(parse_value(values, key, "error converting samples"));
}

std::uint64_t parse_timestamp(const sample_values& values) {
    const auto low = static_cast<std::int32_t>(
        parse_value(values, sample_key::timestamp, "error converting timestamp"));
    return static_cast<std::uint64_t>(std::int64_t{low});
}

// Converts a temperature in hundredths of a degree to degrees with 16 fraction bits, rounded
// towards zero. Both are signed. Bits that do not fit the intermediate 32 bits are lost.
constexpr std::uint32_t q16_16_degrees(std::uint32_t hundredths) {
    return static_cast<std::uint32_t>(static_cast<std::int32_t>(hundredths << 16) / 100);
}

}  // namespace

template <std::size_t ValueCount>
void recorded_event<ValueCount>::set_delta(std::uint32_t delta) {
    set_word(record_, delta_word, delta);
}

template <std::size_t ValueCount>
void recorded_event<ValueCount>::parse_record(const sample_values& values, const value_keys& keys) {
    set_word(record_, size_word, record_size);
    set_word(record_, sampleid_word, parse_sample(values, sample_key::sampleid));
    set_word(record_, temperature_word,
             q16_16_degrees(parse_sample(values, sample_key::temperature)));
    for (std::size_t i = 0; i < ValueCount; ++i)
        set_word(record_, first_value_word + i, parse_sample(values, keys[i]));
    timestamp_ = parse_timestamp(values);
}

bool AxisEvent::parse(const sample_values& values) {
    parse_record(values, {sample_key::x, sample_key::y, sample_key::z});
    if (values[sample_key::shake] == "1") {
        print_line("Shake samples are not allowed");
        explain([] { return explanation{"a shake cannot be played back", "remove the line"}; });
        end_process();
    }
    return true;
}

bool PressureEvent::parse(const sample_values& values) {
    parse_record(values, {sample_key::p});
    return true;
}

// Generated signals.

namespace {

constexpr std::int32_t full_scale = 0x10000;

struct signal_sample {
    std::uint32_t number;  // from 0
    std::uint32_t count;
};

std::int32_t random_value(const signal_sample& /*sample*/) {
    return std::rand() % (full_scale + 1);
}

std::int32_t delta_value(const signal_sample& sample) {
    return sample.number == 0 ? full_scale : 0;
}

std::int32_t step_value(const signal_sample& sample) {
    return sample.number < sample.count / 2 ? full_scale : 0;
}

std::int32_t sine_value(const signal_sample& sample) {
    constexpr double two_pi = 6.283185307179586;
    if (sample.count == 0) return 0;
    const double angle = two_pi / sample.count * sample.number;
    return static_cast<std::int32_t>(std::sin(angle) * q16_16_one);
}

struct signal_row {
    std::string_view keyword;
    std::int32_t (*value)(const signal_sample& sample);
};

constexpr std::array signals{
    signal_row{"random", random_value},
    signal_row{"delta", delta_value},
    signal_row{"step", step_value},
    signal_row{"sin", sine_value},
};

// Close to skin temperature: 28.80 degrees.
constexpr std::string_view generated_temperature = "2880";

}  // namespace

bool AxisEvent::init_generator(std::string_view signal_type) {
    if (find_keyword(signals, signal_type) == nullptr) return false;
    std::srand(static_cast<unsigned>(std::time(nullptr)));
    next_sample_ = 0;
    next_timestamp_ = 0;
    return true;
}

std::vector<std::string_view> AxisEvent::signal_types() const {
    return keywords_of(signals);
}

std::string AxisEvent::generate(std::string_view signal_type, std::uint32_t interval,
                                std::uint32_t samples) {
    const signal_row* signal = find_keyword(signals, signal_type);
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

// Tags.

namespace {

template <class Event>
event_ptr make() {
    return std::make_unique<Event>();
}

struct event_class_row {
    std::string_view keyword;  // the tag
    event_maker make;
};

constexpr std::array event_classes{
    event_class_row{AccelEvent::tag, make<AccelEvent>},
    event_class_row{GyroEvent::tag, make<GyroEvent>},
    event_class_row{CompassEvent::tag, make<CompassEvent>},
    event_class_row{PressureEvent::tag, make<PressureEvent>},
};

}  // namespace

std::vector<std::string_view> event_tags() {
    return keywords_of(event_classes);
}

event_maker find_event_maker(std::string_view tag) {
    const event_class_row* row = find_keyword(event_classes, tag);
    return row == nullptr ? nullptr : row->make;
}

event_ptr make_event(std::string_view tag) {
    const event_maker make = find_event_maker(tag);
    return make == nullptr ? nullptr : make();
}

}  // namespace nrx
