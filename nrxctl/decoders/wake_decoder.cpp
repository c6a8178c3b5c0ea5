#include "nrxctl/decoders/wake_decoder.h"

#include "nrxctl/decoders/event_names.h"
#include "nrxctl/decoders/record_fields.h"
#include "nrxctl/decoders/record_layout.h"

namespace nrx {

namespace {

// First words: category, component, event, type. The type of a request has no name and no rows.
constexpr std::uint32_t request_info = 0x0a00010d;
constexpr std::uint32_t event_info = 0x0a000203;

}  // namespace

short_text wake_decoder::component_name(std::uint32_t component) const {
    return name_for_id(wake_components, component);
}

short_text wake_decoder::event_name(std::uint32_t /*component*/, std::uint32_t event) const {
    return name_for_id(wake_events, event);
}

void wake_decoder::decode_body(event_text& line, const profile_record& record) const {
    const std::uint32_t word = record.first_word();
    if (word == event_info) return append_fields(line, record, wake_event_rows);
    if (word == request_info) append_fields(line, record, wake_request_rows);
    profile_decoder::decode_body(line, record);
}

}  // namespace nrx
