// Samples of the sensors with three axes.
#pragma once

#include "nrxctl/replay/sample_record.h"
#include "nrxctl/replay/virtual_event.h"

namespace nrx {

// The record's values are x, y and z. Can be generated: a signal of the type "random", "delta" (a
// unit impulse), "step" or "sin" (one period) on x, between -1.0 and 1.0 with 16 fraction bits; y
// and z stay 0.
class AxisEvent : public VirtualEvent {
public:
    // A shake ends the process with status 1, too: it cannot be played back.
    bool parse(const sample_values& values) override;
    [[nodiscard]] std::uint32_t size() const override { return record::size; }
    [[nodiscard]] const std::uint8_t* data() const override { return record_.data(); }
    [[nodiscard]] std::uint64_t timestamp() const override { return timestamp_; }
    void set_delta(std::uint32_t delta) override { record_.set_delta(delta); }
    // Seeds the C library's random generator with the time in seconds.
    bool init_generator(std::string_view signal_type) override;
    std::string generate(std::string_view signal_type, std::uint32_t interval,
                         std::uint32_t samples) override;

private:
    using record = sample_record<3>;

    record record_;
    std::uint32_t next_sample_ = 0;     // of the generated signal
    std::uint64_t next_timestamp_ = 0;  // likewise, microseconds
    std::uint64_t timestamp_ = 0;
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

}  // namespace nrx
