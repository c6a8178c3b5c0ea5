// Generated signals.
#include <cstdlib>
#include <ctime>
#include <set>
#include <sstream>

#include "nrxctl/replay/make_event.h"
#include "nrxctl/replay/sample_file.h"
#include "tests/replay/replay_host.h"

namespace tests {

namespace {

using lines = std::vector<std::string>;

lines lines_of(const std::string& text) {
    lines all;
    std::istringstream from(text);
    for (std::string line; std::getline(from, line);)
        all.push_back(line);
    return all;
}

// The values of x, as written.
lines values_of(const outcome& generated) {
    EXPECT_EQ(generated.err, "");
    lines values;
    for (const std::string& line : lines_of(generated.out))
        values.push_back(line.substr(line.find(",x=0x") + 5, 8));
    return values;
}

std::string sample(const std::string& tag, const std::string& x, int id, std::int64_t timestamp) {
    return tag + ",x=0x" + x + ",y=0x00000000,z=0x00000000,sampleid=" + std::to_string(id) +
           ",timestamp=" + std::to_string(timestamp) + ",temperature=2880\n";
}

const std::string request_file = "replay/signal_request.cpp";

}  // namespace

TEST(generate, writes_a_line_per_sample) {
    const auto impulse = replay({"generate", "accel", "delta", "10", "4"});
    EXPECT_EQ(impulse.out, sample("accel", "00010000", 0, 0) + sample("accel", "00000000", 1, 10) +
                               sample("accel", "00000000", 2, 20) +
                               sample("accel", "00000000", 3, 30));
    EXPECT_EQ(impulse.err, "");
    const auto late = replay({"generate", "compass", "step", "0xffffffff", "3"});
    EXPECT_EQ(late.out, sample("compass", "00010000", 0, 0) +
                            sample("compass", "00000000", 1, 4294967295) +
                            sample("compass", "00000000", 2, 8589934590));
    EXPECT_EQ(replay({"generate", "gyro", "delta", "-1", "0x100000001"}).out,
              sample("gyro", "00010000", 0, 0));
    EXPECT_EQ(replay({"generate", "gyro", "delta", "1", "0"}).out, "");
}

TEST(generate, each_signal_has_its_shape) {
    EXPECT_EQ(values_of(replay({"generate", "gyro", "step", "1", "5"})),
              (lines{"00010000", "00010000", "00000000", "00000000", "00000000"}));
    EXPECT_EQ(values_of(replay({"generate", "gyro", "step", "1", "1"})), (lines{"00000000"}));
    EXPECT_EQ(values_of(replay({"generate", "gyro", "sin", "1", "4"})),
              (lines{"00000000", "00010000", "00000000", "ffff0000"}));
    // Cut towards zero on both sides: 65536 times 0.7071 and 0.8660.
    EXPECT_EQ(values_of(replay({"generate", "gyro", "sin", "1", "8"})),
              (lines{"00000000", "0000b504", "00010000", "0000b504", "00000000", "ffff4afc",
                     "ffff0000", "ffff4afc"}));
    EXPECT_EQ(values_of(replay({"generate", "gyro", "sin", "1", "6"})),
              (lines{"00000000", "0000ddb3", "0000ddb3", "00000000", "ffff224d", "ffff224d"}));
}

TEST(generate, random_values_are_the_c_librarys_after_a_seed_of_the_time) {
    std::time_t before = 0;
    lines values;
    do {
        before = std::time(nullptr);
        values = values_of(replay({"generate", "gyro", "random", "1", "2000"}));
    } while (std::time(nullptr) != before);
    std::srand(static_cast<unsigned>(before));
    for (const std::string& value : values)
        ASSERT_EQ(std::strtol(value.c_str(), nullptr, 16), std::rand() % 65537);
    // Every signal seeds.
    do {
        before = std::time(nullptr);
        replay({"generate", "gyro", "sin", "1", "1"});
    } while (std::time(nullptr) != before);
    const int next = std::rand();
    std::srand(static_cast<unsigned>(before));
    EXPECT_EQ(next, std::rand());
}

TEST(generate, a_frequency_makes_one_period) {
    struct frequency_row {
        std::string interval;
        std::string frequency;
        std::size_t samples;
    };
    for (const auto& [interval, frequency, samples] : std::vector<frequency_row>{
             {"10000", "1hz", 100},
             {"10000", "100Hz", 1},
             {"1000", "50hz", 20},
             {"1000", "0x32hz", 20},
             {"1", "300000hz", 3},
             {"1", "1000000hz", 1},
             {"1", "0x1000186a0hz",
              10},  // a frequency, and a product, of which the low 32 bits count
             {"65536", "65537hz", 15},
         }) {
        EXPECT_EQ(values_of(replay({"generate", "gyro", "sin", interval, frequency})).size(),
                  samples)
            << interval << " " << frequency;
    }
}

TEST(generate, a_frequency_without_a_sample_in_its_period_is_reported) {
    struct refused {
        std::string interval;
        std::string frequency;
        std::string check;
    };
    for (const auto& [interval, frequency, check] : std::vector<refused>{
             {"10000", "101hz", "num_samples"},
             {"1", "1000001hz", "num_samples"},
             {"0", "1hz", "num_samples"},
             {"65536", "65536Hz", "num_samples"},
             {"1", "-1hz", "num_samples"},
             {"1", "0hz", "hz"},
             {"0", "0hz", "hz"},
             {"1", "0x100000000hz", "hz"},
         }) {
        const auto result = replay({"generate", "nobody", "sin", interval, frequency});
        EXPECT_EQ(result.err, failed(request_file, check)) << interval << " " << frequency;
        EXPECT_EQ(result.out, "");
    }
}

TEST(generate, words_that_are_missing_or_no_numbers_are_refused_in_order) {
    for (const lines& words : {lines{"generate"}, lines{"generate", "a"},
                               lines{"generate", "a", "b"}, lines{"generate", "a", "b", "c"}}) {
        const auto result = replay(words);
        EXPECT_EQ(result.err, failed(request_file, "argc >= optind+4"));
        EXPECT_EQ(result.out, "");
    }
    struct refused {
        lines words;
        std::string message;
    };
    for (const auto& [words, message] : std::vector<refused>{
             {{"a", "b", "c", "d"}, "invalid interval (c)"},
             {{"a", "b", "1", "d"}, "invalid number of samples (d)"},
             {{"a", "b", "1", "5HZ"}, "invalid number of samples (5HZ)"},
             {{"a", "b", "1", "5hZ"}, "invalid number of samples (5hZ)"},
             {{"a", "b", "1", "hz"}, "invalid number of samples (hz)"},
             {{"a", "b", "1", "xhz"}, "invalid frequency (x)"},
             {{"a", "b", "1", "1.5Hz"}, "invalid frequency (1.5)"},
         }) {
        lines all{"generate"};
        all.insert(all.end(), words.begin(), words.end());
        const auto result = replay(all);
        EXPECT_EQ(result.out, message + "\n");
        EXPECT_EQ(result.status, 1);
    }
}

TEST(generate, services_and_signals_that_are_none_are_named) {
    EXPECT_EQ(replay({"generate", "als", "sin", "1", "1"}).out, "invalid service als\n");
    EXPECT_EQ(replay({"generate", "pressure", "sin", "1", "1"}).out, "invalid generator sin\n");
    EXPECT_EQ(replay({"generate", "pressure", "x", "1", "1"}).out, "invalid generator x\n");
    EXPECT_EQ(replay({"generate", "accel", "Sin", "1", "1"}).out, "invalid generator Sin\n");
    EXPECT_EQ(nrx::make_event("pressure")->generate("sin", 1, 1), "");
    EXPECT_EQ(nrx::make_event("accel")->generate("other", 1, 1) + "\n",
              sample("accel", "00000000", 0, 0));
}

TEST(generate, a_generator_begins_anew_when_it_is_prepared) {
    const auto event = nrx::make_event("accel");
    EXPECT_TRUE(event->init_generator("delta"));
    const std::string first = event->generate("delta", 7, 2);
    EXPECT_NE(event->generate("delta", 7, 2), first);
    EXPECT_FALSE(event->init_generator("other"));
    EXPECT_TRUE(event->init_generator("delta"));
    EXPECT_EQ(event->generate("delta", 7, 2), first);
}

TEST(generate, every_signal_loads_back_as_it_was_written) {
    for (const std::string tag : {"accel", "gyro", "compass"}) {
        for (const std::string signal : {"random", "delta", "step", "sin"}) {
            const auto generated = replay({"generate", tag, signal, "250", "8hz"});
            const lines values = values_of(generated);
            ASSERT_EQ(values.size(), 500U);
            const sample_text_file file(generated.out);
            const auto result = capture([&] {
                const auto groups = nrx::read_sample_file(file.path());
                ASSERT_TRUE(groups && groups->size() == 1 && groups->contains(tag));
                const auto& events = groups->at(tag);
                ASSERT_EQ(events.size(), values.size());
                for (std::size_t i = 0; i < events.size(); ++i) {
                    const std::uint8_t* x = events[i]->data() + 16;
                    std::string written(8, '.');
                    std::snprintf(written.data(), 9, "%02x%02x%02x%02x", x[3], x[2], x[1], x[0]);
                    EXPECT_EQ(written, values[i]);
                    EXPECT_EQ(events[i]->timestamp(), 250 * i);
                }
            });
            EXPECT_EQ(result.out + result.err, "") << tag << " " << signal;
        }
    }
}

}  // namespace tests
