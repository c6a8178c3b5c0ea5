#include "nrxctl/replay/line_reader.h"

#include <cerrno>
#include <cstring>
#include <sys/stat.h>

#include "nrxctl/base/output.h"

namespace nrx {

line_reader::line_reader(const std::string& path, std::size_t capacity)
    : file_(std::fopen(path.c_str(), "rbe"), std::fclose), buffer_(capacity) {
    if (!file_) error_ = errno;
    // The stream needs no buffer of its own.
    if (file_) std::setvbuf(file_.get(), nullptr, _IONBF, 0);
}

bool line_reader::good() const {
    return file_ && std::ferror(file_.get()) == 0;
}

std::size_t line_reader::file_size() const {
    struct stat status {};
    if (!file_ || ::fstat(::fileno(file_.get()), &status) != 0) return 0;
    return static_cast<std::size_t>(status.st_size);
}

std::string_view line_reader::beginning() {
    if (end_ == 0) read_more();
    return buffered();
}

std::optional<std::string_view> line_reader::next() {
    do {
        const void* match = std::memchr(buffer_.data() + scanned_, '\n', end_ - scanned_);
        if (match != nullptr) {
            const auto* line_feed = static_cast<const char*>(match);
            const std::string_view line =
                extract_until(static_cast<std::size_t>(line_feed - buffer_.data()));
            scanned_ = ++begin_;
            return line;
        }
        scanned_ = end_;
    } while (read_more());
    // A line cut off by a read error is not returned.
    if (begin_ == end_ || !good()) return std::nullopt;
    return extract_until(end_);
}

std::string_view line_reader::extract_until(std::size_t line_end) {
    const std::string_view line(buffer_.data() + begin_, line_end - begin_);
    begin_ = line_end;
    return line;
}

// Moves the remaining bytes to the front, doubles a full buffer, and reads into the rest of it.
bool line_reader::read_more() {
    if (!good()) return false;
    std::memmove(buffer_.data(), buffer_.data() + begin_, end_ - begin_);
    end_ -= begin_;
    scanned_ -= begin_;
    begin_ = 0;
    if (end_ == buffer_.size()) buffer_.resize(2 * buffer_.size());
    flush_output();  // the file may be a pipe
    const std::size_t count =
        std::fread(buffer_.data() + end_, 1, buffer_.size() - end_, file_.get());
    if (!good()) error_ = errno;
    end_ += count;
    return count > 0;
}

}  // namespace nrx
