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

// Holds a part of the file at a time, at least one line.
class line_reader {
public:
    explicit line_reader(const std::string& path);

    // Whether the file is open, and all reading of it went well so far.
    [[nodiscard]] bool good() const;

    // The size of the file in bytes, 0 if it is not known before it is read.
    [[nodiscard]] std::size_t file_size() const;

    // The next line without its line feed, valid until the next call; none at the end of what can
    // be read. A last line needs no line feed.
    std::optional<std::string_view> next();

    // What was read and not taken yet, which may end within a line; valid until the next call.
    [[nodiscard]] std::string_view at_hand() const {
        return {buffer_.data() + begin_, end_ - begin_};
    }

    // Takes so many bytes of what is at hand, which must be whole lines with their line feeds.
    void pass(std::size_t size) { scanned_ = begin_ += size; }

private:
    bool read_more();
    std::string_view take_until(std::size_t line_end);

    std::unique_ptr<std::FILE, int (*)(std::FILE*)> file_;
    std::vector<char> buffer_;
    std::size_t begin_ = 0;    // of what was read and not taken
    std::size_t scanned_ = 0;  // no line feed before this
    std::size_t end_ = 0;
};

}  // namespace nrx
