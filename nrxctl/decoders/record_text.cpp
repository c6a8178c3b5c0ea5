#include "nrxctl/decoders/record_text.h"

#include <algorithm>
#include <array>
#include <cstddef>

#include "nrxctl/base/output.h"
#include "nrxctl/base/print_limit.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/base/utf8.h"
#include "nrxctl/decoders/category_decoders.h"

namespace nrx {

namespace {

std::uint64_t unprintable_records = 0;

}  // namespace

std::string_view decode_profile_record(const profile_record& record, event_text& line) {
    const profile_decoder* decoder = decoder_for_category(record.category());
    line.clear();
    (decoder == nullptr ? default_decoder() : *decoder).print_record(record, line);
    return line.view();
}

std::optional<std::string_view> format_profile_record(const profile_record& record,
                                                      event_text& line) {
    const std::string_view text = decode_profile_record(record, line);
    return is_utf8(text) ? std::optional(text) : std::nullopt;
}

void print_profile_record(const profile_record& record) {
    event_text line;
    if (!format_profile_record(record, line)) {
        ++unprintable_records;
        return;
    }
    if (!may_print_event()) return;
    line.append(1, [](char* target) {
        *target++ = '\n';
        return target;
    });
    write_output(line.view());
}

void nrx_profile_hexdump(std::string_view label, platform::byte_view bytes, int spaced) {
    constexpr std::size_t capacity = 256;
    if (label.size() + 3 * bytes.size() + 1 >= capacity) {
        assertion_failed(__func__, "(strlen(label) + 3*bufLen + 1) < sizeof(line)");
    }
    std::array<char, capacity> line;
    char* end = std::copy(label.begin(), label.end(), line.begin());
    for (const std::uint8_t byte : bytes) {
        *end++ = hex_digits[byte / 16];
        *end++ = hex_digits[byte % 16];
        if (spaced == 1) *end++ = ' ';
    }
    *end++ = '\n';
    write_output({line.data(), static_cast<std::size_t>(end - line.data())});
}

void dump_profile_record(const profile_record& record) {
    if (may_print_event()) nrx_profile_hexdump("prof-event ", record.bytes, 0);
}

std::uint64_t unprintable_record_count() {
    return unprintable_records;
}

record_printer select_record_printer(bool decode) {
    return decode ? print_profile_record : dump_profile_record;
}

}  // namespace nrx
