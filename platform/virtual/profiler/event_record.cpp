#include "platform/virtual/profiler/event_record.h"

#include <algorithm>

#include "platform/virtual/little_endian.h"

namespace platform::simulated {

namespace {

constexpr std::uint32_t control_category = 8;
constexpr std::uint32_t scm_category = 9;
constexpr std::uint8_t long_data_type = 1;
constexpr std::uint8_t event_type = 3;

event_record make_record(std::uint32_t category, std::uint32_t component, std::uint8_t event,
                         std::uint8_t type, machine_clock::time time, std::uint32_t& sequence_num) {
    const auto microseconds = std::chrono::duration_cast<std::chrono::microseconds>(time);
    event_record record{};
    store_le(record, 0, 1, type);
    store_le(record, 1, 1, event);
    store_le(record, 2, 1, component);
    store_le(record, 3, 1, category);
    store_le(record, 4, 4, sequence_num++);
    store_le(record, 8, 8, static_cast<std::uint64_t>(microseconds.count()));
    return record;
}

// Adds the data of a bus transfer, in records of up to 24 bytes with the same timestamp.
void add_transfer_data(std::vector<event_record>& records, std::uint32_t component,
                       std::uint8_t channel, std::uint64_t number, machine_clock::time time,
                       std::uint32_t& sequence_num) {
    constexpr std::size_t max_bytes = 24;
    const std::size_t packet_size = 8 + number * 7 % 48;
    for (std::size_t offset = 0; offset < packet_size; offset += max_bytes) {
        const std::size_t length = std::min(max_bytes, packet_size - offset);
        event_record record =
            make_record(scm_category, component, channel, long_data_type, time, sequence_num);
        store_le(record, 18, 2, packet_size);
        store_le(record, 20, 2, length);
        store_le(record, 22, 2, offset);
        for (std::size_t i = 0; i < length; ++i) {
            store_le(record, 24 + i, 1, number + offset + i);
        }
        records.push_back(record);
    }
}

}  // namespace

std::vector<event_record> make_event(const event_kind& kind, std::uint32_t component,
                                     std::uint64_t number, machine_clock::time time,
                                     std::uint32_t& sequence_num) {
    std::vector<event_record> records{
        make_record(kind.category, component, kind.event, kind.type, time, sequence_num)};
    kind.fill(records.front(), number);
    if (kind.category == scm_category) {
        add_transfer_data(records, component, kind.event, number, time, sequence_num);
    }
    return records;
}

event_record make_control_record(control_event event, std::uint32_t argument,
                                 machine_clock::time time, std::uint32_t& sequence_num) {
    event_record record = make_record(control_category, 0, static_cast<std::uint8_t>(event),
                                      event_type, time, sequence_num);
    store_le(record, 16, 4, argument);
    return record;
}

void record_log::add(const event_record& record) {
    records_.push_back(record);
    if (records_.size() > capacity) records_.pop_front();
}

std::vector<std::uint8_t> record_log::read(std::size_t max_bytes) {
    std::vector<std::uint8_t> bytes;
    while (!records_.empty() && bytes.size() + event_record_size <= max_bytes) {
        bytes.insert(bytes.end(), records_.front().begin(), records_.front().end());
        records_.pop_front();
    }
    return bytes;
}

}  // namespace platform::simulated
