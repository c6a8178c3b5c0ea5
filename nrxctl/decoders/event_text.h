// The text of one event record, as it is being written.
#pragma once

#include <array>
#include <cstddef>
#include <string_view>

#include "nrxctl/base/failure_report.h"

namespace nrx {

// Stops the process with a report on standard error, as a failed assert does, in every build.
[[noreturn]] void assertion_failed(std::string_view function, std::string_view expression,
                                   source_location location = source_location::current());

// A buffer of fixed size, so that nothing is allocated.
class event_text {
public:
    // Large enough for the text of any record and a line feed.
    static constexpr std::size_t capacity = 1024;

    // A writer may overwrite this many characters after its text.
    static constexpr std::size_t slack = 32;

    // Removes everything.
    void clear() { size_ = 0; }

    // The text so far; valid until the next change.
    [[nodiscard]] std::string_view view() const { return {buffer_.data(), size_}; }

    // Appends the text that write(target) writes at target. It writes at most max_size characters
    // and returns their end. Stops the process if max_size characters do not fit.
    template <class Write>
    void append(std::size_t max_size, Write write) {
        if (max_size > capacity - size_) assertion_failed("append", "max_size <= capacity - size_");
        size_ = static_cast<std::size_t>(write(buffer_.data() + size_) - buffer_.data());
    }

private:
    std::size_t size_ = 0;
    std::array<char, capacity + slack> buffer_;  // only what was written is ever read
};

}  // namespace nrx
