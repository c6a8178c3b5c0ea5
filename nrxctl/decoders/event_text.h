// The text of one event record, as it is being written.
#pragma once

#include <array>
#include <cstddef>
#include <string_view>

#include "nrxctl/decoders/line_bound.h"
#include "nrxctl/decoders/put_text.h"

namespace nrx {

// Holds its room in itself, enough for the longest text of a record and a line feed, so that
// nothing is allocated. What is appended when there is no room is left out.
class event_text {
public:
    // Removes everything.
    void clear() { size_ = 0; }

    // The text so far; valid until the next change.
    [[nodiscard]] std::string_view view() const { return {room_.data(), size_}; }

    // Appends up to longest characters, which write puts at the place that it is given; it returns
    // where they end.
    template <class Write>
    void append(std::size_t longest, Write write) {
        if (longest > capacity - size_) return;
        size_ = static_cast<std::size_t>(write(room_.data() + size_) - room_.data());
    }

private:
    static constexpr std::size_t capacity = longest_record_text + 1;

    std::size_t size_ = 0;
    std::array<char, capacity + put_slack> room_;  // only what was written is ever read
};

}  // namespace nrx
