#include "nrxctl/replay/line_reader.h"

#include <cstring>
#include <sys/stat.h>

namespace nrx {

namespace {

constexpr std::size_t first_capacity = std::size_t{1} << 17;

}  // namespace

line_reader::line_reader(const std::string& path)
    : file_(std::fopen(path.c_str(), "rbe"), std::fclose), buffer_(first_capacity) {
    // The buffer is here.
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

std::optional<std::string_view> line_reader::next() {
    do {
        const void* found = std::memchr(buffer_.data() + scanned_, '\n', end_ - scanned_);
        if (found != nullptr) {
            const auto* line_feed = static_cast<const char*>(found);
            const std::string_view line =
                take_until(static_cast<std::size_t>(line_feed - buffer_.data()));
            scanned_ = ++begin_;
            return line;
        }
        scanned_ = end_;
    } while (read_more());
    // What stands before a place that cannot be read is no line.
    if (begin_ == end_ || !good()) return std::nullopt;
    return take_until(end_);
}

std::string_view line_reader::take_until(std::size_t line_end) {
    const std::string_view line(buffer_.data() + begin_, line_end - begin_);
    begin_ = line_end;
    return line;
}

// Makes room behind what is left, moved to the front, and fills it.
bool line_reader::read_more() {
    if (!good()) return false;
    std::memmove(buffer_.data(), buffer_.data() + begin_, end_ - begin_);
    end_ -= begin_;
    scanned_ -= begin_;
    begin_ = 0;
    if (end_ == buffer_.size()) buffer_.resize(2 * buffer_.size());
    const std::size_t got =
        std::fread(buffer_.data() + end_, 1, buffer_.size() - end_, file_.get());
    end_ += got;
    return got > 0;
}

}  // namespace nrx
