#include "nrxctl/decoders/profile_decoder.h"

#include "nrxctl/decoders/event_names.h"
#include "nrxctl/decoders/record_fields.h"
#include "nrxctl/decoders/record_layout.h"
#include "nrxctl/decoders/record_times.h"
#include "nrxctl/decoders/write_text.h"

namespace nrx {

namespace {

static_assert(max_record_text + 1 <= event_text::capacity);
static_assert(write_slack <= event_text::slack);

constexpr id_name_table categories(category_names);
constexpr id_name_table types(type_names);

char* write_name(char* target, const name_field& field, const short_text& name) {
    target = write_quoted(write_text(target, field.key.text), name, field.width);
    *target++ = ',';
    return target;
}

}  // namespace

void profile_decoder::print_record(const profile_record& record, event_text& line) const {
    const short_text category = category_name(record.category());
    const short_text component = component_name(record.component());
    const short_text event = event_name(record.component(), record.event());
    const short_text type = name_for_id(types, record.type());
    const auto calendar = calendar_time(record.timestamp());
    const auto boot_time = boot_time_usec();
    line.append(max_names_text, [&](char* target) {
        target = write_name(write_text(target, short_text("{ ")), category_field, category);
        target = write_name(target, component_field, component);
        target = write_name(target, event_field, event);
        return write_name(target, type_field, type);
    });
    append_fields(line, record, header_rows);
    decode_body(line, record);
    append_fields(line, record, id_rows);
    line.append(max_end_text, [&](char* target) {
        target = write_list(write_text(target, binary_data_key.text), record.bytes, 0);
        if (calendar) {
            *target++ = ',';
            target = write_quoted(write_text(target, calendar_time_key.text), *calendar, 0);
        }
        if (boot_time) {
            *target++ = ',';
            target = write_text(target, boot_timestamp_key.text);
            target = write_number(target, static_cast<std::uint64_t>(*boot_time), 0);
        }
        *target++ = '}';
        return target;
    });
}

short_text profile_decoder::category_name(std::uint32_t category) const {
    return name_for_id(categories, category);
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
