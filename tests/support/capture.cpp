#include "tests/support/capture.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <string_view>
#include <sys/mman.h>
#include <unistd.h>

#include "nrxctl/base/end_process.h"
#include "nrxctl/base/output.h"

namespace tests {

namespace {

// Redirects a descriptor into memory for its lifetime.
class redirected_descriptor {
public:
    explicit redirected_descriptor(int descriptor)
        : descriptor_(descriptor),
          saved_(::dup(descriptor)),
          memory_(::memfd_create("output", MFD_CLOEXEC)) {
        ::dup2(memory_, descriptor_);
    }
    ~redirected_descriptor() {
        ::dup2(saved_, descriptor_);
        ::close(saved_);
        ::close(memory_);
    }
    redirected_descriptor(const redirected_descriptor&) = delete;
    redirected_descriptor& operator=(const redirected_descriptor&) = delete;

    [[nodiscard]] std::string text() const {
        std::string text;
        std::array<char, 4096> buffer;
        off_t offset = 0;
        ssize_t count = 0;
        while ((count = ::pread(memory_, buffer.data(), buffer.size(), offset)) > 0) {
            text.append(buffer.data(), static_cast<std::size_t>(count));
            offset += count;
        }
        return text;
    }

private:
    int descriptor_;
    int saved_;
    int memory_;
};

// Runs action. Returns the exit status if it would have ended the process.
std::optional<int> exit_status(const std::function<void()>& action) {
    return nrx::run_to_completion(action) ? std::nullopt : std::optional(EXIT_FAILURE);
}

}  // namespace

outcome capture(const std::function<void()>& action) {
    nrx::memory_sink out;
    nrx::memory_sink err;
    const nrx::scoped_sink installed_out(nrx::standard_stream::output, out);
    const nrx::scoped_sink installed_err(nrx::standard_stream::error, err);
    const auto status = exit_status(action);
    return {out.text(), without_line_numbers(err.text()), err.text(), status};
}

outcome capture_descriptors(const std::function<void()>& action) {
    std::fflush(nullptr);
    const redirected_descriptor out(STDOUT_FILENO);
    const redirected_descriptor err(STDERR_FILENO);
    const auto status = exit_status(action);
    std::fflush(nullptr);
    return {out.text(), without_line_numbers(err.text()), err.text(), status};
}

std::string without_line_numbers(const std::string& text) {
    constexpr std::string_view digits = "0123456789";
    std::string shortened;
    for (std::size_t position = 0; position < text.size();) {
        const std::string_view before = shortened;
        const std::size_t number_end =
            std::min(text.find_first_not_of(digits, position + 1), text.size());
        if (text[position] == ':' && number_end > position + 1 &&
            (before.ends_with(".cpp") || before.ends_with(".h"))) {
            position = number_end;
        } else {
            shortened += text[position++];
        }
    }
    return shortened;
}

}  // namespace tests
