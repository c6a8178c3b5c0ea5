#include "platform/property.h"

#include <algorithm>

namespace platform {

dictionary::dictionary() = default;
dictionary::dictionary(const dictionary& other) = default;
dictionary::dictionary(dictionary&& other) noexcept = default;
dictionary& dictionary::operator=(const dictionary& other) = default;
dictionary& dictionary::operator=(dictionary&& other) noexcept = default;
dictionary::~dictionary() = default;

dictionary::dictionary(std::initializer_list<dictionary_entry> entries) {
    entries_.reserve(entries.size());
    for (const dictionary_entry& entry : entries) {
        set(entry.key, entry.value);
    }
}

void dictionary::set(std::string_view key, property value) {
    const auto match =
        std::find_if(entries_.begin(), entries_.end(),
                     [&](const dictionary_entry& entry) { return entry.key == key; });
    if (match == entries_.end()) {
        entries_.push_back({std::string(key), std::move(value)});
    } else {
        match->value = std::move(value);
    }
}

const property* dictionary::find(std::string_view key) const {
    const auto match =
        std::find_if(entries_.begin(), entries_.end(),
                     [&](const dictionary_entry& entry) { return entry.key == key; });
    return match == entries_.end() ? nullptr : &match->value;
}

std::optional<std::int64_t> property::number() const {
    if (const auto* narrow = std::get_if<std::int32_t>(&value_)) return *narrow;
    if (const auto* wide = std::get_if<std::int64_t>(&value_)) return *wide;
    return std::nullopt;
}

namespace {

bool same_items(const array& a, const array& b) {
    return std::equal(a.begin(), a.end(), b.begin(), b.end(), same_value);
}

bool same_entries(const dictionary& a, const dictionary& b) {
    if (a.entries().size() != b.entries().size()) return false;
    return std::all_of(a.entries().begin(), a.entries().end(), [&](const dictionary_entry& entry) {
        const property* other = b.find(entry.key);
        return other != nullptr && same_value(entry.value, *other);
    });
}

std::string describe_text(std::string text) {
    std::replace_if(
        text.begin(), text.end(), [](unsigned char byte) { return byte < ' ' || byte == 0x7f; },
        '.');
    return '"' + text + '"';
}

std::string describe_items(const array& items) {
    std::string text = "(";
    for (const property& item : items) {
        if (text.size() > 1) text += ", ";
        text += describe(item);
    }
    return text + ")";
}

std::string describe_entries(const dictionary& entries) {
    std::string text = "{";
    for (const dictionary_entry& entry : entries.entries()) {
        if (text.size() > 1) text += "; ";
        text += entry.key + " = " + describe(entry.value);
    }
    return text + "}";
}

}  // namespace

bool same_value(const property& a, const property& b) {
    if (a.number() || b.number()) return a.number() == b.number();
    if (a.text() != nullptr && b.text() != nullptr) return *a.text() == *b.text();
    if (a.items() != nullptr && b.items() != nullptr) return same_items(*a.items(), *b.items());
    if (a.entries() != nullptr && b.entries() != nullptr) {
        return same_entries(*a.entries(), *b.entries());
    }
    return false;
}

std::string describe(const property& value) {
    if (const auto number = value.number()) return std::to_string(*number);
    if (value.text() != nullptr) return describe_text(*value.text());
    if (value.items() != nullptr) return describe_items(*value.items());
    return describe_entries(*value.entries());
}

}  // namespace platform
