// Standard output and standard error.
//
// All text leaves through a line sink, one for each stream. By default a line is written to the
// stream's descriptor as soon as it is complete, in one write; a program or a test can install
// another sink for a scope. Output that cannot be written (a full disk, a closed pipe) is dropped
// and the tool continues, because what it does to the device must not depend on who reads its
// output. A reader that has gone away is an interrupt, which ends a watch.
//
// Sinks are installed and written by one thread.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace nrx {

// Where lines go.
class line_sink {
public:
    constexpr line_sink() = default;
    virtual ~line_sink() = default;
    line_sink(const line_sink&) = delete;
    line_sink& operator=(const line_sink&) = delete;

    // Writes text, usually whole lines, in one piece. Returns false if it could not be written.
    virtual bool write(std::string_view text) = 0;

    // Writes what the sink has buffered. Returns false if it could not be written.
    virtual bool flush() { return true; }

    // Returns true if any text was lost so far.
    [[nodiscard]] bool failed() const { return failed_; }

    // The operating system's code for the loss; 0 if nothing was lost or there is no code.
    [[nodiscard]] virtual int error() const { return 0; }

    // Returns true if text was lost because nobody reads it any more.
    [[nodiscard]] bool reader_gone() const;

protected:
    // Remembers a failure. Returns written.
    bool note_result(bool written) {
        if (!written) failed_ = true;
        return written;
    }

private:
    bool failed_ = false;
};

// Writes to a file descriptor, which it does not own, one write per call. An interrupt ends a write
// that blocks because nobody reads; everything after it is lost.
class descriptor_sink final : public line_sink {
public:
    constexpr explicit descriptor_sink(int descriptor) : descriptor_(descriptor) {}
    bool write(std::string_view text) override;
    [[nodiscard]] int error() const override { return error_; }

private:
    int descriptor_;
    int error_ = 0;
};

// Makes text from a device safe for a terminal: writes control characters (but tab and line feed)
// and bytes that are not UTF-8 as "\xNN", one for each byte; an escape becomes "\x1b". Everything
// else passes unchanged to the target.
class terminal_sink final : public line_sink {
public:
    explicit terminal_sink(line_sink& target) : target_(target) {}
    bool write(std::string_view text) override;
    bool flush() override { return note_result(target_.flush()); }
    [[nodiscard]] int error() const override { return target_.error(); }

private:
    line_sink& target_;
};

// Gathers lines in a buffer that is written to the target when it is full, when it is flushed, and
// when the sink is destroyed. A failed write is reported by the call that causes it and by every
// call after it.
class block_sink final : public line_sink {
public:
    explicit block_sink(line_sink& target);
    ~block_sink() override;
    block_sink(const block_sink&) = delete;
    block_sink& operator=(const block_sink&) = delete;

    bool write(std::string_view text) override;
    bool flush() override;
    [[nodiscard]] int error() const override { return target_.error(); }

private:
    bool write_buffer();

    line_sink& target_;
    std::string buffer_;
};

// Keeps everything in memory.
class memory_sink final : public line_sink {
public:
    bool write(std::string_view text) override {
        text_.append(text);
        return true;
    }

    // The text so far; valid until the next write.
    [[nodiscard]] const std::string& text() const { return text_; }

private:
    std::string text_;
};

enum class standard_stream { output, error };

// Installs a sink for a stream in place of the current one, which is reinstalled on destruction.
// The sink must outlive this object.
class scoped_sink {
public:
    scoped_sink(standard_stream stream, line_sink& sink);
    ~scoped_sink();
    scoped_sink(const scoped_sink&) = delete;
    scoped_sink& operator=(const scoped_sink&) = delete;

private:
    standard_stream stream_;
    line_sink* previous_;
};

// Writes standard output in blocks for a scope. For output that nobody follows live.
class block_output {
public:
    block_output();

private:
    block_sink block_;
    scoped_sink installed_;
};

// Prepares the streams of a program: text to a terminal passes a terminal_sink, and writing to a
// pipe that nobody reads, or beyond the limit of a file's size, fails instead of ending the
// process. A program creates one before it writes anything.
class program_output {
public:
    program_output();

private:
    class terminal_filter {
    public:
        explicit terminal_filter(standard_stream stream);

    private:
        terminal_sink sink_;
        scoped_sink installed_;
    };

    std::optional<terminal_filter> output_;
    std::optional<terminal_filter> error_;
};

// Writes text, to which no line feed is added, on standard output. Returns false if it could not be
// written; a reader that has gone away is also an interrupt (see platform/interrupt.h).
bool write_output(std::string_view text);

// Writes text and a line feed on standard output.
void print_line(std::string_view text);

// Writes text, to which no line feed is added, on standard error, after all buffered standard
// output.
void write_error(std::string_view text);

// Writes buffered standard output. Call it before waiting for anything.
void flush_output();

// Returns why either stream has lost text that somebody may have wanted, as a text of the operating
// system; nullopt if nothing was lost, or only because the reader has gone away.
std::optional<std::string> lost_output();

}  // namespace nrx
