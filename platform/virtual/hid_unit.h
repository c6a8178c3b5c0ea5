// A HID device of the virtual host: feature reports behind open and close.
#pragma once

#include <cstdint>
#include <map>
#include <vector>

namespace platform::simulated {

class hid_unit {
public:
    // Gives the device a feature report.
    void set_feature_report(std::uint8_t id, std::vector<std::uint8_t> bytes);

    // Takes a feature report away again.
    void drop_feature_report(std::uint8_t id) { feature_reports_.erase(id); }

    // The bytes of a feature report, owned by the device; null if it has no such report.
    [[nodiscard]] const std::vector<std::uint8_t>* feature_report(std::uint8_t id) const;

private:
    std::map<std::uint8_t, std::vector<std::uint8_t>> feature_reports_;
};

}  // namespace platform::simulated
