#include "tests/support/capture.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <string_view>
#include <sys/mman.h>
#include <unistd.h>

namespace tests {

namespace {

// Sends a descriptor into memory for as long as it lives.
class redirection {
public:
    explicit redirection(int descriptor)
        : descriptor_(descriptor),
          saved_(::dup(descriptor)),
          memory_(::memfd_create("output", MFD_CLOEXEC)) {
        ::dup2(memory_, descriptor_);
    }
    ~redirection() {
        ::dup2(saved_, descriptor_);
        ::close(saved_);
        ::close(memory_);
    }
    redirection(const redirection&) = delete;
    redirection& operator=(const redirection&) = delete;

    [[nodiscard]] std::string text() const {
        std::string all;
        std::array<char, 4096> part;
        off_t offset = 0;
        for (ssize_t got = 0; (got = ::pread(memory_, part.data(), part.size(), offset)) > 0;) {
            all.append(part.data(), static_cast<std::size_t>(got));
            offset += got;
        }
        return all;
    }

private:
    int descriptor_;
    int saved_;
    int memory_;
};

}  // namespace

outcome capture(const std::function<void()>& action) {
    std::fflush(nullptr);
    const redirection out(STDOUT_FILENO);
    const redirection err(STDERR_FILENO);
    outcome result;
    try {
        action();
    } catch (const process_ended& end) {
        result.status = end.status;
    }
    std::fflush(nullptr);
    result.out = out.text();
    result.err_as_written = err.text();
    result.err = without_line_numbers(result.err_as_written);
    return result;
}

std::string without_line_numbers(const std::string& text) {
    constexpr std::string_view digits = "0123456789";
    std::string shortened;
    for (std::size_t at = 0; at < text.size();) {
        const std::string_view written = shortened;
        const std::size_t number_end =
            std::min(text.find_first_not_of(digits, at + 1), text.size());
        if (text[at] == ':' && number_end > at + 1 &&
            (written.ends_with(".cpp") || written.ends_with(".h"))) {
            at = number_end;
        } else {
            shortened += text[at++];
        }
    }
    return shortened;
}

}  // namespace tests
