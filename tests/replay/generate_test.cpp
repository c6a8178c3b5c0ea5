// Generated signals.
#include <algorithm>
#include <array>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <sstream>

#include "nrxctl/base/little_endian.h"
#include "nrxctl/replay/make_event.h"
#include "nrxctl/replay/sample_file.h"
#include "tests/replay/replay_host.h"
#include "tests/support/word_vector.h"

namespace tests {

namespace {

// The values of x, as written, with a blank behind each.
std::string values_of(const outcome& generated) {
    EXPECT_EQ(generated.err, "");
    std::string values;
    std::istringstream from(generated.out);
    for (std::string line; std::getline(from, line);)
        values += line.substr(line.find(",x=0x") + 5, 8) + " ";
    return values;
}

std::string sample(const std::string& tag, const std::string& x, int id, std::int64_t timestamp) {
    return tag + ",x=0x" + x + ",y=0x00000000,z=0x00000000,sampleid=" + std::to_string(id) +
           ",timestamp=" + std::to_string(timestamp) + ",temperature=2880\n";
}

}  // namespace

// The host is left alone.
class generate : public device_test {
protected:
    void TearDown() override {
        EXPECT_EQ(host.calls_made(), 0U);
        device_test::TearDown();
    }

    static outcome run(lines further) {
        further.insert(further.begin(), "generate");
        return replay(further);
    }
};

TEST_F(generate, writes_a_line_per_sample) {
    const auto impulse = run({"accel", "delta", "10", "4"});
    EXPECT_EQ(impulse.out, sample("accel", "00010000", 0, 0) + sample("accel", "00000000", 1, 10) +
                               sample("accel", "00000000", 2, 20) +
                               sample("accel", "00000000", 3, 30));
    EXPECT_EQ(impulse.err, "");
    EXPECT_EQ(run({"compass", "step", "0xffffffff", "3"}).out,
              sample("compass", "00010000", 0, 0) + sample("compass", "00000000", 1, 4294967295) +
                  sample("compass", "00000000", 2, 8589934590));
    EXPECT_EQ(run({"gyro", "delta", "-1", "0x100000001"}).out, sample("gyro", "00010000", 0, 0));
    EXPECT_EQ(run({"gyro", "delta", "1", "0"}).out, "");
}

TEST_F(generate, each_signal_has_its_shape) {
    for (const auto& [signal, count, values] : rows<std::string, std::string, std::string>{
             {"step", "5", "00010000 00010000 00000000 00000000 00000000 "},
             {"step", "1", "00000000 "},
             // Cut towards zero on both sides: 65536 times 0.5, 0.7071 and 0.8660.
             {"sin", "8",
              "00000000 0000b504 00010000 0000b504 00000000 ffff4afc ffff0000 ffff4afc "},
             {"sin", "12",
              "00000000 00007fff 0000ddb3 00010000 0000ddb3 00008000 00000000 ffff8001 ffff224d "
              "ffff0000 ffff224d ffff8000 "},
         }) {
        EXPECT_EQ(values_of(run({"gyro", signal, "1", count})), values) << signal << " " << count;
    }
}

TEST_F(generate, random_values_are_the_c_librarys_after_a_seed_of_the_time) {
    std::time_t before = 0;
    std::string values;
    do {
        before = std::time(nullptr);
        values = values_of(run({"gyro", "random", "1", "2000"}));
    } while (std::time(nullptr) != before);
    std::srand(static_cast<unsigned>(before));
    ASSERT_EQ(values.size(), 2000U * 9);
    for (std::size_t at = 0; at < values.size(); at += 9)
        ASSERT_EQ(std::stol(values.substr(at, 8), nullptr, 16), std::rand() % 65537);
    // Every signal seeds.
    do {
        before = std::time(nullptr);
        run({"gyro", "sin", "1", "1"});
    } while (std::time(nullptr) != before);
    const int next = std::rand();
    std::srand(static_cast<unsigned>(before));
    EXPECT_EQ(next, std::rand());
}

TEST_F(generate, a_frequency_makes_one_period_in_which_there_must_be_a_sample) {
    // The low 32 bits of a frequency, and of its product with the interval, count.
    for (const auto& [interval, frequency, samples, check] :
         rows<std::string, std::string, std::ptrdiff_t, std::string>{
             {"10000", "1hz", 100, ""},
             {"10000", "100Hz", 1, ""},
             {"1000", "0x32hz", 20, ""},
             {"1", "300000hz", 3, ""},
             {"1", "1000000hz", 1, ""},
             {"1", "0x1000186a0hz", 10, ""},
             {"65536", "65537hz", 15, ""},
             {"10000", "101hz", 0, "num_samples"},
             {"1", "1000001hz", 0, "num_samples"},
             {"0", "1hz", 0, "num_samples"},
             {"65536", "65536Hz", 0, "num_samples"},
             {"1", "-1hz", 0, "num_samples"},
             {"1", "0hz", 0, "hz"},
             {"0", "0hz", 0, "hz"},
             {"1", "0x100000000hz", 0, "hz"},
         }) {
        const std::string service = check.empty() ? "gyro" : "nobody";
        const auto result = run({service, "sin", interval, frequency});
        EXPECT_EQ(std::count(result.out.begin(), result.out.end(), '\n'), samples) << frequency;
        EXPECT_EQ(result.err, check.empty() ? "" : failed("replay/signal_request.cpp", check));
    }
}

TEST_F(generate, words_that_are_missing_or_no_numbers_are_refused_in_order) {
    for (const char* words : {"generate", "generate a", "generate a b", "generate a b c"})
        says(split(words), "", failed("replay/signal_request.cpp", "argc >= optind+4"));
    int taken = 77;
    replay({"generate", "a", "b", "c"}, &taken);
    EXPECT_EQ(taken, 0);
    for (const auto& [words, message] : rows<std::string, std::string>{
             {"a b c d", "invalid interval (c)"},
             {"a b 1 d", "invalid number of samples (d)"},
             {"a b 1 5HZ", "invalid number of samples (5HZ)"},
             {"a b 1 5hZ", "invalid number of samples (5hZ)"},
             {"a b 1 hz", "invalid number of samples (hz)"},
             {"a b 1 xhz", "invalid frequency (x)"},
             {"a b 1 1.5Hz", "invalid frequency (1.5)"},
         }) {
        const auto result = run(split(words));
        EXPECT_EQ(result.out, message + "\n");
        EXPECT_EQ(result.status, 1);
    }
}

TEST_F(generate, services_and_signals_that_are_none_are_named) {
    EXPECT_EQ(run({"als", "sin", "1", "1"}).out, "invalid service als\n");
    EXPECT_EQ(run({"pressure", "sin", "1", "1"}).out, "invalid generator sin\n");
    EXPECT_EQ(run({"accel", "Sin", "1", "1"}).out, "invalid generator Sin\n");
    EXPECT_EQ(nrx::make_event("pressure")->generate("sin", 1, 1), "");
}

TEST_F(generate, a_generator_begins_anew_when_it_is_prepared) {
    const auto event = nrx::make_event("accel");
    EXPECT_TRUE(event->init_generator("delta"));
    const std::string first = event->generate("delta", 7, 2);
    EXPECT_NE(event->generate("delta", 7, 2), first);
    EXPECT_TRUE(event->init_generator("delta"));
    EXPECT_EQ(event->generate("delta", 7, 2), first);
    EXPECT_EQ(event->generate("other", 7, 2) + "\n", sample("accel", "00000000", 1, 7));
    EXPECT_EQ(event->timestamp(), 0U);
}

TEST_F(generate, every_signal_loads_back_as_it_was_written) {
    for (const std::string tag : {"accel", "gyro", "compass"}) {
        for (const std::string signal : {"random", "delta", "step", "sin"}) {
            const auto generated = run({tag, signal, "250", "8hz"});
            std::string values;
            const auto loaded = capture([&] {
                const auto groups = nrx::read_sample_file(sample_text_file(generated.out).path());
                ASSERT_TRUE(groups && groups->size() == 1 && groups->contains(tag));
                std::uint64_t timestamp = 0;
                for (const auto& event : groups->at(tag)) {
                    std::array<char, 10> x{};
                    std::snprintf(x.data(), x.size(), "%08x ",
                                  nrx::load_le<std::uint32_t>(event->data() + 16));
                    values += x.data();
                    EXPECT_EQ(event->timestamp(), timestamp);
                    timestamp += 250;
                }
            });
            EXPECT_EQ(values.size(), 500U * 9);
            EXPECT_EQ(values, values_of(generated));
            EXPECT_EQ(loaded.out + loaded.err, "") << tag << " " << signal;
        }
    }
}

}  // namespace tests
