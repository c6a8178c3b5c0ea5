// Sensor samples that the coprocessor plays back in place of live ones.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "nrxctl/replay/fast/event_memory.h"
#include "nrxctl/replay/sample_line.h"

namespace nrx {

// Holds the record of a sample as it is uploaded, and its timestamp. A record consists of
// little-endian 32-bit words: its size in bytes, the delta in microseconds to the record before it,
// the sample id, the temperature in degrees with 16 fraction bits, and the sample's signed values.
class VirtualEvent {
public:
    VirtualEvent() = default;
    VirtualEvent(const VirtualEvent&) = delete;
    VirtualEvent& operator=(const VirtualEvent&) = delete;
    VirtualEvent(VirtualEvent&&) = delete;
    VirtualEvent& operator=(VirtualEvent&&) = delete;
    virtual ~VirtualEvent() = default;

    static void* operator new(std::size_t size) { return event_memory::allocate(size); }
    static void operator delete(void* event) noexcept { event_memory::deallocate(event); }

    // Fills the event from the values of a sample line. Always returns true: a value that is
    // missing or not a number ends the process with status 1, after a message with the value on
    // standard output.
    virtual bool parse(const sample_values& values) = 0;

    // The record's size in bytes and its bytes, which the event owns.
    [[nodiscard]] virtual std::uint32_t size() const = 0;
    [[nodiscard]] virtual const std::uint8_t* data() const = 0;

    // The tag of the event's lines, which is the name of its service.
    [[nodiscard]] virtual std::string name() const = 0;

    // Microseconds: a signed 32-bit number, sign-extended.
    [[nodiscard]] virtual std::uint64_t timestamp() const = 0;

    // Stores the delta in the record. It is 0 before.
    virtual void set_delta(std::uint32_t delta) = 0;

    // Starts a generated signal. Returns false if this class does not generate such signals.
    virtual bool init_generator(std::string_view signal_type) = 0;

    // The signals that this class generates.
    [[nodiscard]] virtual std::vector<std::string_view> signal_types() const { return {}; }

    // Returns the next sample line, without a line feed, of a signal with that many samples, one
    // every interval microseconds. Returns an empty text if this class generates none.
    virtual std::string generate(std::string_view signal_type, std::uint32_t interval,
                                 std::uint32_t samples) = 0;
};

using event_ptr = std::unique_ptr<VirtualEvent>;

// The record and timestamp of an event with the given number of values.
template <std::size_t ValueCount>
class recorded_event : public VirtualEvent {
public:
    [[nodiscard]] std::uint32_t size() const final { return record_size; }
    [[nodiscard]] const std::uint8_t* data() const final { return record_.data(); }
    [[nodiscard]] std::uint64_t timestamp() const final { return timestamp_; }
    void set_delta(std::uint32_t delta) final;

protected:
    using value_keys = std::array<sample_key, ValueCount>;

    // Fills the record and the timestamp; the keys are those of the values, in their order.
    void parse_record(const sample_values& values, const value_keys& keys);

private:
    static constexpr std::uint32_t record_size = 4 * (4 + ValueCount);

    std::uint64_t timestamp_ = 0;
    std::array<std::uint8_t, record_size> record_{};
};

// A sample of a sensor with three axes; the values are x, y and z. Generates the signals "random",
// "delta" (a unit impulse), "step" and "sin" (one period): x is between -1.0 and 1.0 with 16
// fraction bits, y and z are 0.
class AxisEvent : public recorded_event<3> {
public:
    // Ends the process with status 1 also for a shake, which cannot be played back.
    bool parse(const sample_values& values) override;
    // Seeds the C library's random generator with the time in seconds.
    bool init_generator(std::string_view signal_type) override;
    [[nodiscard]] std::vector<std::string_view> signal_types() const override;
    std::string generate(std::string_view signal_type, std::uint32_t interval,
                         std::uint32_t samples) override;

private:
    std::uint32_t next_sample_ = 0;     // of the generated signal
    std::uint64_t next_timestamp_ = 0;  // of the generated signal, in microseconds
};

class AccelEvent final : public AxisEvent {
public:
    static constexpr const char* tag = "accel";
    [[nodiscard]] std::string name() const override { return tag; }
};

class GyroEvent final : public AxisEvent {
public:
    static constexpr const char* tag = "gyro";
    [[nodiscard]] std::string name() const override { return tag; }
};

class CompassEvent final : public AxisEvent {
public:
    static constexpr const char* tag = "compass";
    [[nodiscard]] std::string name() const override { return tag; }
};

// A sample of the pressure sensor; the value is p. Generates no signals.
class PressureEvent final : public recorded_event<1> {
public:
    static constexpr const char* tag = "pressure";
    [[nodiscard]] std::string name() const override { return tag; }

    bool parse(const sample_values& values) override;
    bool init_generator(std::string_view /*signal_type*/) override { return false; }
    std::string generate(std::string_view /*signal_type*/, std::uint32_t /*interval*/,
                         std::uint32_t /*samples*/) override {
        return {};
    }
};

// Makes a new event of one class.
using event_maker = event_ptr (*)();

// The tags of all classes.
std::vector<std::string_view> event_tags();

// Returns the maker for the class with that tag ("accel", "gyro", "compass" or "pressure"), or null
// for any other tag.
event_maker find_event_maker(std::string_view tag);

// Returns a new event of the class with that tag, or null.
event_ptr make_event(std::string_view tag);

}  // namespace nrx
