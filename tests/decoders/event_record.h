// Event records, put together by hand, and their text.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <string>

#include "nrxctl/base/profile_record.h"
#include "tests/support/report_bytes.h"
#include "tests/support/rows.h"

namespace tests {

// The four bytes that classify a record.
struct record_ids {
    std::uint8_t category;
    std::uint8_t component;
    std::uint8_t event;
    std::uint8_t type;
};

// A record with sequence number 42 and time stamp 8123, numbers in its body, and filler elsewhere
// in it.
nrx::profile_record record_of(record_ids ids, std::initializer_list<number_at> body = {},
                              std::uint8_t filler = 0);

// The same record with characters from an offset on.
nrx::profile_record with_text(nrx::profile_record record, std::size_t offset,
                              std::string_view text);

// The record's text.
std::string decoded(const nrx::profile_record& record);

// The part of it that the body makes: what stands between sequence number and identifiers.
std::string decoded_body(const nrx::profile_record& record);

}  // namespace tests
