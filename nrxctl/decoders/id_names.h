// Names of the numbers that classify an event.
#pragma once

#include <array>
#include <cstdint>
#include <span>
#include <string_view>

namespace nrx {

struct id_name {
    std::uint32_t id;
    std::string_view name;
};

// What an identifier is called: a name, or its number in decimal.
class id_text {
public:
    // The name must outlive the object; a name in a table does.
    explicit id_text(std::string_view name) : name_(name) {}
    explicit id_text(std::uint32_t id);

    // Valid as long as the object.
    [[nodiscard]] std::string_view view() const {
        return name_.empty() ? std::string_view(digits_.data(), digit_count_) : name_;
    }

private:
    std::string_view name_;
    std::array<char, 10> digits_;
    std::uint8_t digit_count_ = 0;
};

// The name of the first entry with that identifier, else the identifier in decimal.
id_text name_for_id(std::span<const id_name> table, std::uint32_t id);

}  // namespace nrx
