#include "platform/virtual/hid_unit.h"

#include <utility>

namespace platform::simulated {

void hid_unit::set_feature_report(std::uint8_t id, std::vector<std::uint8_t> bytes) {
    feature_reports_.insert_or_assign(id, std::move(bytes));
}

const std::vector<std::uint8_t>* hid_unit::feature_report(std::uint8_t id) const {
    const auto found = feature_reports_.find(id);
    return found == feature_reports_.end() ? nullptr : &found->second;
}

}  // namespace platform::simulated
