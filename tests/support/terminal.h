// A standard stream as a terminal.
#pragma once

#include <algorithm>
#include <array>
#include <pty.h>
#include <string>
#include <unistd.h>

#include <gtest/gtest.h>

namespace tests {

// Redirects a standard stream to a new pseudo-terminal.
class terminal {
public:
    explicit terminal(int descriptor) : descriptor_(descriptor), saved_(::dup(descriptor)) {
        int program_end = -1;
        EXPECT_EQ(::openpty(&reader_, &program_end, nullptr, nullptr, nullptr), 0);
        ::dup2(program_end, descriptor_);
        ::close(program_end);
    }
    ~terminal() {
        ::dup2(saved_, descriptor_);
        ::close(saved_);
        ::close(reader_);
    }
    terminal(const terminal&) = delete;
    terminal& operator=(const terminal&) = delete;

    // What was written to the terminal, which adds a carriage return to each line.
    [[nodiscard]] std::string text() const {
        std::array<char, 4096> buffer;
        const ssize_t count = ::read(reader_, buffer.data(), buffer.size());
        return {buffer.data(), static_cast<std::size_t>(std::max<ssize_t>(count, 0))};
    }

private:
    int descriptor_;
    int saved_;
    int reader_ = -1;
};

}  // namespace tests
