// A text file, line by line.
#pragma once

#include <cstddef>
#include <cstdio>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace nrx {

// Buffers a part of the file, at least one line.
class line_reader {
public:
    static constexpr std::size_t default_capacity = std::size_t{1} << 17;

    // Opens a file. The capacity of the buffer, at least 1, grows with the longest line.
    explicit line_reader(const std::string& path, std::size_t capacity = default_capacity);

    // Returns true if the file is open and every read has succeeded so far.
    [[nodiscard]] bool good() const;

    // Why it is not good: the code of the operating system.
    [[nodiscard]] int error() const { return error_; }

    // Returns the size of the file in bytes, or 0 if it is unknown before the file is read.
    [[nodiscard]] std::size_t file_size() const;

    // The beginning of the file, at most a buffer of it, valid until the next call of next(). Call
    // it before the first line is read.
    std::string_view beginning();

    // Returns the next line without its line feed, valid until the next call. Returns nullopt at
    // the end of what can be read. The last line needs no line feed.
    std::optional<std::string_view> next();

    // The bytes that were read and not consumed yet. They may end within a line, and are valid
    // until the next call of next().
    [[nodiscard]] std::string_view buffered() const {
        return {buffer_.data() + begin_, end_ - begin_};
    }

    // Consumes that many buffered bytes, which must be complete lines with their line feeds.
    void consume(std::size_t size) { scanned_ = begin_ += size; }

private:
    bool read_more();
    std::string_view extract_until(std::size_t line_end);

    std::unique_ptr<std::FILE, int (*)(std::FILE*)> file_;
    int error_ = 0;
    std::vector<char> buffer_;
    // Positions in the buffer.
    std::size_t begin_ = 0;    // of the first byte not consumed
    std::size_t scanned_ = 0;  // no line feed between begin_ and here
    std::size_t end_ = 0;      // after the last byte read
};

}  // namespace nrx
