#include "nrxctl/decoders/talvor_decoder.h"

#include "nrxctl/decoders/event_names.h"
#include "nrxctl/decoders/record_fields.h"
#include "nrxctl/decoders/record_layout.h"

namespace nrx {

namespace {

// First words: category, component, event, type.
constexpr std::uint32_t data_in = 0x04000003;
constexpr std::uint32_t data_out = 0x04000103;

}  // namespace

short_text talvor_decoder::component_name(std::uint32_t component) const {
    return name_for_id(talvor_components, component);
}

short_text talvor_decoder::event_name(std::uint32_t /*component*/, std::uint32_t event) const {
    return name_for_id(talvor_events, event);
}

void talvor_decoder::decode_body(event_text& line, const profile_record& record) const {
    switch (record.first_word()) {
        case data_in:
            return append_fields(line, record, talvor_data_in_rows);
        case data_out:
            return append_fields(line, record, talvor_data_out_rows);
        default:
            return profile_decoder::decode_body(line, record);
    }
}

}  // namespace nrx
