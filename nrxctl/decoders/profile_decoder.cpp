#include "nrxctl/decoders/profile_decoder.h"

#include "nrxctl/decoders/boot_time.h"
#include "nrxctl/decoders/calendar_time.h"
#include "nrxctl/decoders/event_names.h"
#include "nrxctl/decoders/id_names.h"
#include "nrxctl/decoders/record_fields.h"
#include "nrxctl/decoders/record_layout.h"

namespace nrx {

namespace {

char* put_name(char* to, const name_field& field, const short_text& name) {
    to = put_quoted(put(to, field.key.text), name, field.width);
    *to++ = ',';
    return to;
}

}  // namespace

void profile_decoder::print_record(const profile_record& record, event_text& line) const {
    const short_text category = category_name(record.category());
    const short_text component = component_name(record.component());
    const short_text event = event_name(record.component(), record.event());
    const short_text type = name_for_id(type_names, record.type());
    const auto calendar = calendar_time(record.timestamp());
    const auto booted = boot_time_usec();
    line.append(longest_names, [&](char* to) {
        to = put_name(put(to, short_text("{ ")), category_field, category);
        to = put_name(to, component_field, component);
        to = put_name(to, event_field, event);
        return put_name(to, type_field, type);
    });
    append_fields(line, record, header_rows);
    decode_body(line, record);
    append_fields(line, record, id_rows);
    line.append(longest_end, [&](char* to) {
        to = put_list(put(to, binary_data_key.text), record.bytes, 0);
        if (calendar) {
            *to++ = ',';
            to = put_quoted(put(to, calendar_time_key.text), *calendar, 0);
        }
        if (booted) {
            *to++ = ',';
            to = put(to, boot_timestamp_key.text);
            to = put_number(to, static_cast<std::uint64_t>(*booted), 0);
        }
        *to++ = '}';
        return to;
    });
}

short_text profile_decoder::category_name(std::uint32_t category) const {
    return name_for_id(category_names, category);
}

short_text profile_decoder::component_name(std::uint32_t component) const {
    return id_number(component);
}

short_text profile_decoder::event_name(std::uint32_t /*component*/, std::uint32_t event) const {
    return id_number(event);
}

void profile_decoder::decode_body(event_text& line, const profile_record& record) const {
    if (record.type() < body_by_type.size()) {
        append_fields(line, record, body_by_type[record.type()]);
    }
}

}  // namespace nrx
