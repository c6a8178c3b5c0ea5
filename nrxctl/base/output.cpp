#include "nrxctl/base/output.h"

#include <cerrno>
#include <csignal>
#include <poll.h>
#include <system_error>
#include <unistd.h>

#include "nrxctl/base/text_line.h"
#include "nrxctl/base/utf8.h"
#include "platform/interrupt.h"

namespace nrx {

namespace {

constinit descriptor_sink standard_output(STDOUT_FILENO);
constinit descriptor_sink standard_error(STDERR_FILENO);

// The installed sinks.
constinit line_sink* output_sink = &standard_output;
constinit line_sink* error_sink = &standard_error;

line_sink*& installed(standard_stream stream) {
    return stream == standard_stream::output ? output_sink : error_sink;
}

// Waits until a failed write can be retried: at once after a signal, otherwise when a full pipe
// accepts more. Returns false if the error is final, or after an interrupt.
bool wait_to_retry(int descriptor, int error) {
    if (platform::interrupt_received()) return false;
    if (error == EINTR) return true;
    if (error != EAGAIN) return false;
    pollfd writable{descriptor, POLLOUT, 0};
    return ::poll(&writable, 1, -1) > 0 || errno == EINTR;
}

// Returns 0, or the code of the operating system.
int write_all(int descriptor, std::string_view text) {
    while (!text.empty()) {
        const ssize_t written = ::write(descriptor, text.data(), text.size());
        const int error = written == 0 ? EIO : errno;
        if (written > 0) {
            text.remove_prefix(static_cast<std::size_t>(written));
        } else if (!wait_to_retry(descriptor, error)) {
            return error;
        }
    }
    return 0;
}

// Returns true for a character that a terminal may act upon: C0 controls but tab and line feed,
// DEL, and C1 controls, which are c2 80 to c2 9f in UTF-8.
bool is_control(std::string_view character) {
    const auto first = static_cast<unsigned char>(character[0]);
    if (character.size() == 1) {
        return (first < 0x20 && first != '\t' && first != '\n') || first == 0x7f;
    }
    return first == 0xc2 && static_cast<unsigned char>(character[1]) < 0xa0;
}

// The size of the longest prefix that can be shown as it is.
std::size_t printable_size(std::string_view text) {
    std::size_t end = 0;
    while (end < text.size()) {
        const std::size_t size = utf8_character_size(text.substr(end));
        if (size == 0 || is_control(text.substr(end, size))) break;
        end += size;
    }
    return end;
}

std::string escape_controls(std::string_view text) {
    text_line escaped;
    while (!text.empty()) {
        const std::size_t printable = printable_size(text);
        escaped.text(text.substr(0, printable));
        text.remove_prefix(printable);
        if (text.empty()) break;
        const std::size_t size = utf8_character_size(text) == 2 ? 2 : 1;
        for (const char byte : text.substr(0, size))
            escaped.text("\\x").zero_padded_hex(static_cast<unsigned char>(byte), 2);
        text.remove_prefix(size);
    }
    return std::string(escaped.view());
}

}  // namespace

bool line_sink::reader_gone() const {
    return error() == EPIPE || error() == ECONNRESET;
}

bool descriptor_sink::write(std::string_view text) {
    const bool given_up = error_ == EINTR || error_ == EAGAIN;
    if (given_up) return false;
    const int error = write_all(descriptor_, text);
    if (error != 0) error_ = error;
    return note_result(error == 0);
}

bool terminal_sink::write(std::string_view text) {
    const bool printable = printable_size(text) == text.size();
    return note_result(target_.write(printable ? text : escape_controls(text)));
}

block_sink::block_sink(line_sink& target) : target_(target) {
    constexpr std::size_t block_size = 65'536;
    buffer_.reserve(block_size);
}

block_sink::~block_sink() {
    block_sink::flush();
}

bool block_sink::write(std::string_view text) {
    if (text.size() > buffer_.capacity() - buffer_.size()) write_buffer();
    if (text.size() > buffer_.capacity()) {
        note_result(target_.write(text));
    } else {
        buffer_.append(text);
    }
    return !failed();
}

bool block_sink::flush() {
    write_buffer();
    note_result(target_.flush());
    return !failed();
}

bool block_sink::write_buffer() {
    const bool written = buffer_.empty() || target_.write(buffer_);
    buffer_.clear();
    return note_result(written);
}

scoped_sink::scoped_sink(standard_stream stream, line_sink& sink)
    : stream_(stream), previous_(installed(stream)) {
    installed(stream) = &sink;
}

scoped_sink::~scoped_sink() {
    installed(stream_) = previous_;
}

block_output::block_output() : block_(*output_sink), installed_(standard_stream::output, block_) {
}

program_output::terminal_filter::terminal_filter(standard_stream stream)
    : sink_(*installed(stream)), installed_(stream, sink_) {
}

program_output::program_output() {
    std::signal(SIGPIPE, SIG_IGN);
    std::signal(SIGXFSZ, SIG_IGN);
    if (::isatty(STDOUT_FILENO) != 0) output_.emplace(standard_stream::output);
    if (::isatty(STDERR_FILENO) != 0) error_.emplace(standard_stream::error);
}

bool write_output(std::string_view text) {
    const bool written = output_sink->write(text);
    if (!written && output_sink->reader_gone()) platform::request_interrupt();
    return written;
}

void print_line(std::string_view text) {
    std::string line;
    line.reserve(text.size() + 1);
    line.append(text).push_back('\n');
    write_output(line);
}

void write_error(std::string_view text) {
    output_sink->flush();
    error_sink->write(text);
}

void flush_output() {
    output_sink->flush();
}

std::optional<std::string> lost_output() {
    for (const line_sink* sink : {output_sink, error_sink}) {
        if (sink->failed() && !sink->reader_gone())
            return std::system_category().message(sink->error());
    }
    return std::nullopt;
}

}  // namespace nrx
