// Event records made by hand, and their text.
#pragma once

#include <algorithm>
#include <cstdint>
#include <initializer_list>
#include <string>

#include "nrxctl/decoders/record_text.h"
#include "tests/support/report_bytes.h"
#include "tests/support/rows.h"

namespace tests {

// The four bytes that classify a record.
struct record_ids {
    std::uint8_t category, component, event, type;
};

// A record with sequence number 42, timestamp 8123 and numbers in its body; filler elsewhere.
inline nrx::profile_record make_record(record_ids ids, std::initializer_list<field_value> body = {},
                                       std::uint8_t filler = 0) {
    const auto bytes = report_with(48, body, filler);
    const std::initializer_list<std::uint8_t> header{
        ids.type, ids.event, ids.component, ids.category, 42, 0, 0, 0, 0xbb, 0x1f, 0, 0, 0, 0, 0, 0,
    };
    nrx::profile_record record;
    std::copy(bytes.begin(), bytes.end(), record.bytes.begin());
    std::copy(header.begin(), header.end(), record.bytes.begin());
    return record;
}

// The same record with a text at an offset.
inline nrx::profile_record with_text(nrx::profile_record record, std::size_t offset,
                                     std::string_view text) {
    std::copy(text.begin(), text.end(), record.bytes.begin() + offset);
    return record;
}

inline std::string decoded(const nrx::profile_record& record) {
    nrx::event_text line;
    return std::string(nrx::decode_profile_record(record, line));
}

// The part of the text between sequence number and identifiers.
inline std::string decoded_body(const nrx::profile_record& record) {
    const std::string line = decoded(record);
    const std::string header_end = "'sequence_num':        42,";
    const auto begin = line.find(header_end) + header_end.size();
    return line.substr(begin, line.find(" 'type-id'") - begin);
}

}  // namespace tests
