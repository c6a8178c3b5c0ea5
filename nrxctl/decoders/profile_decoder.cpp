#include "nrxctl/decoders/profile_decoder.h"

#include <optional>

#include "nrxctl/decoders/boot_time.h"
#include "nrxctl/decoders/calendar_time.h"
#include "nrxctl/decoders/name_tables.h"
#include "nrxctl/decoders/record_fields.h"
#include "nrxctl/decoders/record_layout.h"

namespace nrx {

namespace {

void append_name(event_text& line, const name_field& field, const id_text& name) {
    line.key(field.key);
    line.quoted(name.view(), field.width);
    line.append(',');
}

void append_bytes(event_text& line, const profile_record& record) {
    line.key(binary_data_key);
    line.byte_list(record.bytes, 0);
}

void append_calendar_time(event_text& line, const std::optional<calendar_text>& time) {
    if (!time) return;
    line.append(',');
    line.key(calendar_time_key);
    line.quoted(time->view(), 0);
}

void append_boot_time(event_text& line, const std::optional<std::int64_t>& time) {
    if (!time) return;
    line.append(',');
    line.key(boot_timestamp_key);
    line.number(static_cast<std::uint64_t>(*time), 0);
}

}  // namespace

void profile_decoder::print_record(const profile_record& record, event_text& line) const {
    const auto calendar = calendar_time(record.timestamp());
    const auto booted = boot_time_usec();
    line.append("{ ");
    append_name(line, category_field, category_name(record.category()));
    append_name(line, component_field, component_name(record.component()));
    append_name(line, event_field, event_name(record.component(), record.event()));
    append_name(line, type_field, name_for_id(type_names, record.type()));
    append_fields(line, record, header_rows);
    decode_body(line, record);
    append_fields(line, record, id_rows);
    append_bytes(line, record);
    append_calendar_time(line, calendar);
    append_boot_time(line, booted);
    line.append('}');
}

id_text profile_decoder::category_name(std::uint32_t category) const {
    return name_for_id(category_names, category);
}

id_text profile_decoder::component_name(std::uint32_t component) const {
    return id_text(component);
}

id_text profile_decoder::event_name(std::uint32_t /*component*/, std::uint32_t event) const {
    return id_text(event);
}

void profile_decoder::decode_body(event_text& line, const profile_record& record) const {
    if (record.type() < body_by_type.size()) {
        append_fields(line, record, body_by_type[record.type()]);
    }
}

}  // namespace nrx
