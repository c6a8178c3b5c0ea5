#include "tests/decoders/event_record.h"

#include <algorithm>

#include "nrxctl/decoders/record_text.h"

namespace tests {

nrx::profile_record record_of(record_ids ids, std::initializer_list<number_at> body,
                              std::uint8_t filler) {
    const auto bytes = report_with(48, body, filler);
    nrx::profile_record record;
    std::copy(bytes.begin(), bytes.end(), record.bytes.begin());
    const std::initializer_list<std::uint8_t> head{
        ids.type, ids.event, ids.component, ids.category, 42, 0, 0, 0, 0xbb, 0x1f, 0, 0, 0, 0, 0, 0,
    };
    std::copy(head.begin(), head.end(), record.bytes.begin());
    return record;
}

nrx::profile_record with_text(nrx::profile_record record, std::size_t offset,
                              std::string_view text) {
    for (const char character : text)
        record.bytes.at(offset++) = static_cast<std::uint8_t>(character);
    return record;
}

std::string decoded(const nrx::profile_record& record) {
    nrx::event_text line;
    return std::string(nrx::decode_profile_record(record, line));
}

std::string decoded_body(const nrx::profile_record& record) {
    const std::string line = decoded(record);
    const std::string before = "'sequence_num':        42,";
    const auto begin = line.find(before) + before.size();
    return line.substr(begin, line.find(" 'type-id'") - begin);
}

}  // namespace tests
