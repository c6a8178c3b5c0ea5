#include "platform/virtual/profiler/record_log.h"

namespace platform::simulated {

void record_log::add(const event_record& record) {
    records_.push_back(record);
    if (records_.size() > capacity) records_.pop_front();
}

std::vector<std::uint8_t> record_log::take(std::size_t room) {
    std::vector<std::uint8_t> bytes;
    while (!records_.empty() && bytes.size() + event_record_size <= room) {
        bytes.insert(bytes.end(), records_.front().begin(), records_.front().end());
        records_.pop_front();
    }
    return bytes;
}

}  // namespace platform::simulated
