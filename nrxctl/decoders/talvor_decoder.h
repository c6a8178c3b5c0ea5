// The decoder of the category "talvor", whose data records carry samples of three axes.
#pragma once

#include <cstdint>

#include "nrxctl/decoders/profile_decoder.h"

namespace nrx {

class talvor_decoder : public profile_decoder {
public:
    [[nodiscard]] short_text component_name(std::uint32_t component) const override;
    [[nodiscard]] short_text event_name(std::uint32_t component,
                                        std::uint32_t event) const override;
    void decode_body(event_text& line, const profile_record& record) const override;
};

}  // namespace nrx
