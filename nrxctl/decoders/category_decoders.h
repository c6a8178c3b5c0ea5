// The decoders of categories whose records differ in their names alone.
#pragma once

#include <cstdint>

#include "nrxctl/decoders/profile_decoder.h"

namespace nrx {

// Events are named by component.
class execution_decoder : public profile_decoder {
public:
    [[nodiscard]] short_text component_name(std::uint32_t component) const override;
    [[nodiscard]] short_text event_name(std::uint32_t component,
                                        std::uint32_t event) const override;
};

class trace_decoder : public profile_decoder {
public:
    [[nodiscard]] short_text component_name(std::uint32_t component) const override;
};

class sensor_decoder : public profile_decoder {
public:
    [[nodiscard]] short_text component_name(std::uint32_t component) const override;
    [[nodiscard]] short_text event_name(std::uint32_t component,
                                        std::uint32_t event) const override;
};

class orrin_decoder : public profile_decoder {
public:
    [[nodiscard]] short_text component_name(std::uint32_t component) const override;
    [[nodiscard]] short_text event_name(std::uint32_t component,
                                        std::uint32_t event) const override;
};

class interrupt_decoder : public profile_decoder {
public:
    [[nodiscard]] short_text component_name(std::uint32_t component) const override;
    [[nodiscard]] short_text event_name(std::uint32_t component,
                                        std::uint32_t event) const override;
};

class uart_decoder : public profile_decoder {
public:
    [[nodiscard]] short_text component_name(std::uint32_t component) const override;
    [[nodiscard]] short_text event_name(std::uint32_t component,
                                        std::uint32_t event) const override;
};

class scm_decoder : public profile_decoder {
public:
    [[nodiscard]] short_text component_name(std::uint32_t component) const override;
};

}  // namespace nrx
