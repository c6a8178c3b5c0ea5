#include "nrxctl/decoders/record_text.h"

#include "nrxctl/base/output.h"
#include "nrxctl/decoders/decoder_registry.h"
#include "nrxctl/decoders/profile_hexdump.h"
#include "nrxctl/decoders/utf8.h"

namespace nrx {

std::string_view decode_profile_record(const profile_record& record, event_text& line) {
    const profile_decoder* own = decoder_for_category(record.category());
    line.clear();
    (own == nullptr ? default_decoder() : *own).print_record(record, line);
    return line.view();
}

std::optional<std::string_view> format_profile_record(const profile_record& record,
                                                      event_text& line) {
    const std::string_view text = decode_profile_record(record, line);
    return is_utf8(text) ? std::optional(text) : std::nullopt;
}

void print_profile_record(const profile_record& record) {
    event_text line;
    if (!format_profile_record(record, line)) return;
    line.append(1, [](char* to) {
        *to++ = '\n';
        return to;
    });
    write_output(line.view());
}

record_printer select_record_printer(bool decode) {
    return decode ? print_profile_record : dump_profile_record;
}

}  // namespace nrx
