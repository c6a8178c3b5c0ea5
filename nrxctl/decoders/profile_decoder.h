// The base of the event decoders, and the decoder of categories that have none of their own.
#pragma once

#include <cstdint>

#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/event_text.h"
#include "nrxctl/decoders/short_text.h"

namespace nrx {

// Turns the records of one category into text. A decoder is a constant; any number of threads may
// use it.
class profile_decoder {
public:
    constexpr profile_decoder() = default;
    profile_decoder(const profile_decoder&) = delete;
    profile_decoder& operator=(const profile_decoder&) = delete;
    virtual constexpr ~profile_decoder() = default;

    // Appends the text of a whole record, without a line feed: names, timestamp and sequence
    // number, body, identifiers, bytes, calendar time and boot time. A time that the host does not
    // provide is left out.
    virtual void print_record(const profile_record& record, event_text& line) const;

    // The names of a category, of a component of the decoder's category, and of an event of such a
    // component.
    [[nodiscard]] virtual short_text category_name(std::uint32_t category) const;
    [[nodiscard]] virtual short_text component_name(std::uint32_t component) const;
    [[nodiscard]] virtual short_text event_name(std::uint32_t component, std::uint32_t event) const;

    // Appends the fields of a record's body, each with a comma after it. The record's type
    // determines the fields.
    virtual void decode_body(event_text& line, const profile_record& record) const;
};

}  // namespace nrx
