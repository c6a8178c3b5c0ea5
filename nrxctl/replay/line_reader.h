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

    // The next line without its line feed, valid until the next call; none at the end of what can
    // be read. A last line needs no line feed.
    std::optional<std::string_view> next();

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
