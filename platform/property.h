// Property values of the driver registry: numbers, text, arrays and dictionaries.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

namespace platform {

class property;
struct dictionary_entry;

using array = std::vector<property>;

// Keys and values, in the order in which the keys were first set. Copies are deep.
class dictionary {
public:
    dictionary();
    dictionary(std::initializer_list<dictionary_entry> entries);  // as if set one by one
    dictionary(const dictionary& other);
    dictionary(dictionary&& other) noexcept;
    dictionary& operator=(const dictionary& other);
    dictionary& operator=(dictionary&& other) noexcept;
    ~dictionary();

    // Sets the value of a key, replacing an existing value.
    void set(std::string_view key, property value);

    // Value of a key, owned by the dictionary; null if there is no such key.
    [[nodiscard]] const property* find(std::string_view key) const;

    [[nodiscard]] const std::vector<dictionary_entry>& entries() const { return entries_; }

private:
    std::vector<dictionary_entry> entries_;
};

// A value. Copies share nothing with the original.
class property {
public:
    property(std::int32_t value) : value_(value) {}
    property(std::int64_t value) : value_(value) {}
    property(std::string value) : value_(std::move(value)) {}
    property(std::string_view value) : value_(std::string(value)) {}
    property(const char* value) : value_(std::string(value)) {}
    property(array value) : value_(std::move(value)) {}
    property(dictionary value) : value_(std::move(value)) {}

    // The number, of either width; nullopt for any other kind of value.
    [[nodiscard]] std::optional<std::int64_t> number() const;

    // The value, owned by the property; null for any other kind of value.
    [[nodiscard]] const std::string* text() const { return std::get_if<std::string>(&value_); }
    [[nodiscard]] const array* items() const { return std::get_if<array>(&value_); }
    [[nodiscard]] const dictionary* entries() const { return std::get_if<dictionary>(&value_); }

private:
    std::variant<std::int32_t, std::int64_t, std::string, array, dictionary> value_;
};

struct dictionary_entry {
    std::string key;
    property value;
};

// Returns true if two values are equal. Numbers are compared by value regardless of their width,
// arrays item by item, dictionaries key by key in any order.
bool same_value(const property& a, const property& b);

// Formats a value on one line: numbers in decimal, text in double quotes with a dot for each
// control character, arrays as (a, b), dictionaries as {key = value; key = value}.
std::string describe(const property& value);

}  // namespace platform
