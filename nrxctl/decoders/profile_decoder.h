// The base of the event decoders, and the decoder of records that have none of their own.
#pragma once

#include <cstdint>

#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/event_text.h"
#include "nrxctl/decoders/short_text.h"

namespace nrx {

// Turns the records of one category into text. A decoder holds nothing; it is a table of operations
// that any number of threads may use.
class profile_decoder {
public:
    constexpr profile_decoder() = default;
    profile_decoder(const profile_decoder&) = delete;
    profile_decoder& operator=(const profile_decoder&) = delete;

    // Appends the text of a whole record, without a line feed: names, time stamp and sequence
    // number, body, identifiers, bytes, calendar time and boot time. The last two are left out
    // where the host does not tell them.
    virtual void print_record(const profile_record& record, event_text& line) const;

    // The name of a category, of a component of the decoder's category, of an event of such a
    // component.
    [[nodiscard]] virtual short_text category_name(std::uint32_t category) const;
    [[nodiscard]] virtual short_text component_name(std::uint32_t component) const;
    [[nodiscard]] virtual short_text event_name(std::uint32_t component, std::uint32_t event) const;

    // Appends the fields of a record's body, each with a comma behind it, as its type says.
    virtual void decode_body(event_text& line, const profile_record& record) const;

    virtual constexpr ~profile_decoder() = default;
};

}  // namespace nrx
