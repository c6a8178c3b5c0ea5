// Samples of the pressure sensor.
#pragma once

#include "nrxctl/replay/sample_record.h"
#include "nrxctl/replay/virtual_event.h"

namespace nrx {

// The record's value is p. Cannot be generated.
class PressureEvent final : public VirtualEvent {
public:
    static constexpr const char* tag = "pressure";

    bool parse(const sample_values& values) override;
    [[nodiscard]] std::uint32_t size() const override { return record::size; }
    [[nodiscard]] const std::uint8_t* data() const override { return record_.data(); }
    [[nodiscard]] std::string name() const override { return tag; }
    [[nodiscard]] std::uint64_t timestamp() const override { return timestamp_; }
    void set_delta(std::uint32_t delta) override { record_.set_delta(delta); }
    bool init_generator(std::string_view /*signal_type*/) override { return false; }
    std::string generate(std::string_view /*signal_type*/, std::uint32_t /*interval*/,
                         std::uint32_t /*samples*/) override {
        return {};
    }

private:
    using record = sample_record<1>;

    record record_;
    std::uint64_t timestamp_ = 0;
};

}  // namespace nrx
