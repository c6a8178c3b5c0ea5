#include "nrxctl/base/output.h"

#include <array>
#include <csignal>
#include <fcntl.h>
#include <optional>
#include <string>
#include <thread>
#include <unistd.h>
#include <vector>

#include "nrxctl/base/services.h"
#include "nrxctl/base/utf8.h"
#include "tests/support/argument_vector.h"
#include "tests/support/device_test.h"
#include "tests/support/rows.h"
#include "tests/support/terminal.h"

namespace tests {

namespace {

// Keeps each write apart, and fails while told to.
class recording_sink final : public nrx::line_sink {
public:
    bool write(std::string_view text) override {
        if (!failing) writes.emplace_back(text);
        return note_result(!failing);
    }

    std::vector<std::string> writes;
    bool failing = false;
};

TEST(descriptor_sink, whole_text_passes_a_small_nonblocking_pipe) {
    std::array<int, 2> ends{};
    ASSERT_EQ(::pipe2(ends.data(), O_NONBLOCK), 0);
    std::string sent;
    for (int i = 0; i < 100000; ++i)
        sent += std::to_string(i) + "\n";
    std::string received;
    ::fcntl(ends[0], F_SETFL, 0);
    std::thread reader([&] {
        std::array<char, 1000> buffer;
        ssize_t count = 0;
        while ((count = ::read(ends[0], buffer.data(), buffer.size())) > 0)
            received.append(buffer.data(), static_cast<std::size_t>(count));
    });
    nrx::descriptor_sink sink(ends[1]);
    EXPECT_TRUE(sink.write(sent));
    EXPECT_FALSE(sink.failed());
    ::close(ends[1]);
    reader.join();
    ::close(ends[0]);
    EXPECT_TRUE(received == sent);
    EXPECT_FALSE(sink.write("x\n"));
    EXPECT_TRUE(sink.write(""));
    EXPECT_TRUE(sink.failed());
}

TEST(descriptor_sink, tells_a_reader_that_went_away_from_lost_text) {
    std::signal(SIGPIPE, SIG_IGN);
    std::array<int, 2> ends{};
    ASSERT_EQ(::pipe2(ends.data(), O_CLOEXEC), 0);
    ::close(ends[0]);
    const int full = ::open("/dev/full", O_WRONLY | O_CLOEXEC);
    for (const auto& [descriptor, loss] : rows<int, std::optional<std::string>>{
             {ends[1], std::nullopt}, {full, "No space left on device"}}) {
        nrx::descriptor_sink sink(descriptor);
        nrx::terminal_sink filter(sink);
        nrx::block_sink blocks(filter);
        const nrx::scoped_sink installed(nrx::standard_stream::output, blocks);
        EXPECT_EQ(nrx::lost_output(), std::nullopt);
        nrx::write_output("x\n");
        nrx::flush_output();
        EXPECT_TRUE(blocks.failed());
        EXPECT_EQ(blocks.reader_gone(), !loss);
        EXPECT_EQ(nrx::lost_output(), loss);
        ::close(descriptor);
    }
    const nrx::descriptor_sink untouched(full);
    EXPECT_FALSE(untouched.reader_gone());
    std::signal(SIGPIPE, SIG_DFL);
}

TEST(terminal_sink, escapes_controls_and_invalid_utf8_alone) {
    const rows<std::string, std::string> cases{
        {"µs ∂ \U0001f600\t~ \\x1b\n", "µs ∂ \U0001f600\t~ \\x1b\n"},
        {"\x1b]0;title\a\n", "\\x1b]0;title\\x07\n"},
        {std::string("a\0b\r\x1f\x20\x7f\n", 8), "a\\x00b\\x0d\\x1f \\x7f\n"},
        {"\xc2\x80\xc2\x9f\xc2\xa0\xc2\x7f", "\\xc2\\x80\\xc2\\x9f\xc2\xa0\\xc2\\x7f"},
        {"\xff\xe2\x88 \xed\xa0\x80", "\\xff\\xe2\\x88 \\xed\\xa0\\x80"},
        {"\xe2\x88\x82\x9b", "\xe2\x88\x82\\x9b"},
        {"", ""},
    };
    for (const auto& [text, shown] : cases) {
        nrx::memory_sink memory;
        nrx::terminal_sink sink(memory);
        EXPECT_TRUE(sink.write(text));
        EXPECT_EQ(memory.text(), shown);
    }
    recording_sink target;
    target.failing = true;
    nrx::terminal_sink sink(target);
    EXPECT_FALSE(sink.write("x\n"));
    EXPECT_TRUE(sink.failed());
}

TEST(block_sink, writes_when_full_flushed_or_destroyed) {
    constexpr std::size_t block = 65536;
    recording_sink target;
    const std::string line(999, 'x');
    {
        nrx::block_sink sink(target);
        for (int i = 0; i < 65; ++i)
            EXPECT_TRUE(sink.write(line));
        EXPECT_TRUE(target.writes.empty());
        sink.write(std::string(block - 65 * 999, 'y'));
        EXPECT_TRUE(target.writes.empty());
        sink.write("z");
        ASSERT_EQ(target.writes.size(), 1U);
        EXPECT_EQ(target.writes[0].size(), block);
        EXPECT_TRUE(sink.flush());
        EXPECT_TRUE(sink.flush());
        EXPECT_EQ(target.writes.size(), 2U);
        EXPECT_EQ(target.writes[1], "z");
        // Text larger than a block is written at once, after what came before.
        sink.write("before");
        sink.write(std::string(block + 1, 'l'));
        ASSERT_EQ(target.writes.size(), 4U);
        EXPECT_EQ(target.writes[2], "before");
        EXPECT_EQ(target.writes[3].size(), block + 1);
        sink.write("last");
    }
    EXPECT_EQ(target.writes.back(), "last");
}

TEST(block_sink, failure_is_reported_from_the_lost_block_on) {
    recording_sink target;
    nrx::block_sink sink(target);
    target.failing = true;
    EXPECT_TRUE(sink.write("lost\n"));
    EXPECT_FALSE(sink.flush());
    target.failing = false;
    EXPECT_FALSE(sink.write("kept\n"));
    EXPECT_FALSE(sink.flush());
    EXPECT_TRUE(sink.failed());
    EXPECT_EQ(target.writes, lines{"kept\n"});
}

TEST(scoped_sink, redirects_one_stream_until_it_is_destroyed) {
    recording_sink out;
    recording_sink err;
    recording_sink inner;
    const nrx::scoped_sink installed_out(nrx::standard_stream::output, out);
    const nrx::scoped_sink installed_err(nrx::standard_stream::error, err);
    {
        const nrx::scoped_sink installed_inner(nrx::standard_stream::output, inner);
        nrx::print_line("one");
    }
    nrx::print_line("two");
    EXPECT_TRUE(nrx::write_output("three\nfour\n"));
    nrx::write_error("error\n");
    out.failing = true;
    EXPECT_FALSE(nrx::write_output("lost\n"));
    EXPECT_EQ(inner.writes, lines{"one\n"});
    EXPECT_EQ(out.writes, (lines{"two\n", "three\nfour\n"}));
    EXPECT_EQ(err.writes, lines{"error\n"});
}

TEST(block_output, is_written_before_errors_and_waits) {
    recording_sink sink;
    const nrx::scoped_sink installed_out(nrx::standard_stream::output, sink);
    const nrx::scoped_sink installed_err(nrx::standard_stream::error, sink);
    {
        const nrx::block_output blocks;
        nrx::print_line("one");
        nrx::print_line("two");
        nrx::write_error("error\n");
        nrx::print_line("three");
        nrx::flush_output();
        EXPECT_EQ(sink.writes.size(), 3U);
        nrx::print_line("four");
    }
    nrx::print_line("five");
    EXPECT_EQ(sink.writes, (lines{"one\ntwo\n", "error\n", "three\n", "four\n", "five\n"}));
}

class program_output : public device_test {};

TEST_F(program_output, device_name_cannot_set_the_title_of_a_terminal) {
    add_service(host, "\x1b]0;title\a", 1);
    for (const int descriptor : {STDOUT_FILENO, STDERR_FILENO}) {
        const terminal screen(descriptor);
        const nrx::program_output output;
        if (descriptor == STDERR_FILENO) {
            nrx::write_error("\x1b[2J\n");
            EXPECT_EQ(screen.text(), "\\x1b[2J\r\n");
        } else {
            nrx::list_services();
            EXPECT_EQ(screen.text(), "\\x1b]0;title\\x07" + std::string(15, ' ') + "0x1\r\n");
        }
    }
    // A file gets the bytes as they are.
    const outcome file = capture_descriptors([] {
        const nrx::program_output output;
        nrx::list_services();
    });
    EXPECT_EQ(file.out.substr(0, 10), "\x1b]0;title\a");
}

TEST(utf8, accepts_well_formed_sequences_only) {
    // The first bytes of a sequence, the second bytes that may follow, and how many bytes follow
    // these.
    const rows<int, int, int, int, std::size_t> sequences{
        {0xc2, 0xdf, 0x80, 0xbf, 0}, {0xe0, 0xe0, 0xa0, 0xbf, 1}, {0xe1, 0xec, 0x80, 0xbf, 1},
        {0xed, 0xed, 0x80, 0x9f, 1}, {0xee, 0xef, 0x80, 0xbf, 1}, {0xf0, 0xf0, 0x90, 0xbf, 2},
        {0xf1, 0xf3, 0x80, 0xbf, 2}, {0xf4, 0xf4, 0x80, 0x8f, 2},
    };
    for (int first = 0x80; first <= 0xff; ++first) {
        for (int second = 0; second <= 0xff; ++second) {
            for (std::size_t further = 0; further <= 2; ++further) {
                bool is_well_formed = false;
                for (const auto& [first_min, first_max, min, max, count] : sequences) {
                    is_well_formed |= first_min <= first && first <= first_max && min <= second &&
                                      second <= max && further == count;
                }
                std::string text{static_cast<char>(first), static_cast<char>(second)};
                text.append(further, '\xbf');
                EXPECT_EQ(nrx::is_utf8(text), is_well_formed) << first << " " << second;
            }
        }
    }
    for (const char* text : {"", "\x7f plain", "seventeen letters\xc3\xa9 and more", "\xe1\x80\x80",
                             "\xf1\x80\x80\x80"})
        EXPECT_TRUE(nrx::is_utf8(text)) << text;
    for (const char* text : {"\xc2", "\xe1\x80\x7f", "\xe1\x80\xc0", "\xf1\x80\x7f\x80",
                             "\xf1\x80\xc0\x80", "\xf1\x80\x80\x7f", "\xf1\x80\x80\xc0",
                             "a\xc3\xa9\x80", "seventeen letters\xc3 and more"}) {
        EXPECT_FALSE(nrx::is_utf8(text)) << text;
    }
}

}  // namespace

}  // namespace tests
