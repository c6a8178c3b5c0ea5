// Generated signals.
#include <algorithm>
#include <cstdlib>
#include <ctime>

#include "nrxctl/base/little_endian.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/sample_file.h"
#include "tests/replay/replay_host.h"

namespace tests {

namespace {

// The values of x, as written, with a space after each.
std::string x_values(const outcome& generated) {
    EXPECT_EQ(generated.err, "");
    std::string values;
    for (const std::string& line : split(generated.out, '\n'))
        values += line.substr(line.find(",x=0x") + 5, 8) + " ";
    return values;
}

std::string sample(const std::string& tag, const std::string& x, int id, std::int64_t timestamp) {
    return tag + ",x=0x" + x + ",y=0x00000000,z=0x00000000,sampleid=" + std::to_string(id) +
           ",timestamp=" + std::to_string(timestamp) + ",temperature=2880\n";
}

outcome generated(const std::string& arguments) {
    return replay(split("generate " + arguments));
}

// Runs an action within one second of the clock, which it returns.
std::time_t at_one_time(const std::function<void()>& action) {
    std::time_t before = 0;
    do {
        before = std::time(nullptr);
        action();
    } while (std::time(nullptr) != before);
    return before;
}

}  // namespace

using generate = device_test;

TEST_F(generate, writes_a_line_per_sample) {
    const auto impulse = generated("accel delta 10 4");
    EXPECT_EQ(impulse.out, sample("accel", "00010000", 0, 0) + sample("accel", "00000000", 1, 10) +
                               sample("accel", "00000000", 2, 20) +
                               sample("accel", "00000000", 3, 30));
    EXPECT_EQ(impulse.err, "");
    EXPECT_EQ(generated("compass step 0xffffffff 3").out,
              sample("compass", "00010000", 0, 0) + sample("compass", "00000000", 1, 4294967295) +
                  sample("compass", "00000000", 2, 8589934590));
    EXPECT_EQ(generated("gyro delta -1 0x100000001").out, sample("gyro", "00010000", 0, 0));
    EXPECT_EQ(generated("gyro delta 1 0").out, "");
    EXPECT_EQ(host.calls_made(), 0U);
}

TEST_F(generate, each_signal_has_its_shape) {
    for (const auto& [arguments, values] : rows<std::string, std::string>{
             {"step 1 5", "00010000 00010000 00000000 00000000 00000000 "},
             {"step 1 1", "00000000 "},
             // Rounded towards zero on both sides: 65536 times 0.5, 0.7071 and 0.8660.
             {"sin 1 8",
              "00000000 0000b504 00010000 0000b504 00000000 ffff4afc ffff0000 ffff4afc "},
             {"sin 1 12",
              "00000000 00007fff 0000ddb3 00010000 0000ddb3 00008000 00000000 ffff8001 ffff224d "
              "ffff0000 ffff224d ffff8000 "}})
        EXPECT_EQ(x_values(generated("gyro " + arguments)), values) << arguments;
}

TEST_F(generate, random_values_come_from_rand_seeded_with_the_time) {
    std::string values;
    auto seed = at_one_time([&] { values = x_values(generated("gyro random 1 2000")); });
    std::srand(static_cast<unsigned>(seed));
    ASSERT_EQ(values.size(), 2000U * 9);
    for (std::size_t offset = 0; offset < values.size(); offset += 9)
        ASSERT_EQ(std::stol(values.substr(offset, 8), nullptr, 16), std::rand() % 65537);
    // Every signal seeds.
    seed = at_one_time([] { generated("gyro sin 1 1"); });
    const int next = std::rand();
    std::srand(static_cast<unsigned>(seed));
    EXPECT_EQ(next, std::rand());
}

TEST_F(generate, a_frequency_gives_one_period_with_at_least_one_sample) {
    // The low 32 bits of a frequency, and of its product with the interval, count.
    using row = std::tuple<std::string, std::ptrdiff_t, std::string>;
    for (const auto& [arguments, samples, condition] :
         {row{"10000 1hz", 100, ""}, row{"10000 100Hz", 1, ""}, row{"1000 0x32hz", 20, ""},
          row{"1 300000hz", 3, ""}, row{"1 1000000hz", 1, ""}, row{"1 0x1000186a0hz", 10, ""},
          row{"65536 65537hz", 15, ""}, row{"10000 101hz", 0, "num_samples"},
          row{"1 1000001hz", 0, "num_samples"}, row{"0 1hz", 0, "num_samples"},
          row{"65536 65536Hz", 0, "num_samples"}, row{"1 -1hz", 0, "num_samples"},
          row{"1 0hz", 0, "hz"}, row{"0 0hz", 0, "hz"}, row{"1 0x100000000hz", 0, "hz"}}) {
        const auto result =
            generated((condition.empty() ? "gyro sin " : "nobody sin ") + arguments);
        EXPECT_EQ(std::count(result.out.begin(), result.out.end(), '\n'), samples) << arguments;
        EXPECT_EQ(result.err, condition.empty()
                                  ? ""
                                  : library_report(source_file::generate_samples, condition));
    }
}

TEST_F(generate, missing_and_malformed_arguments_are_rejected_in_order) {
    int consumed = 77;
    for (const char* arguments : {"generate", "generate a", "generate a b", "generate a b c"}) {
        EXPECT_EQ(replay(split(arguments), &consumed).err,
                  library_report(source_file::generate_samples, "argc >= optind+4"));
        EXPECT_EQ(consumed, 0);
    }
    for (const auto& [arguments, message] :
         rows<std::string, std::string>{{"a b c d", "invalid interval (c)"},
                                        {"a b 1 d", "invalid number of samples (d)"},
                                        {"a b 1 5HZ", "invalid number of samples (5HZ)"},
                                        {"a b 1 5hZ", "invalid number of samples (5hZ)"},
                                        {"a b 1 hz", "invalid number of samples (hz)"},
                                        {"a b 1 xhz", "invalid frequency (x)"},
                                        {"a b 1 1.5Hz", "invalid frequency (1.5)"}}) {
        const auto result = generated(arguments);
        EXPECT_EQ(result.out, message + "\n");
        EXPECT_EQ(result.status, 1);
    }
    EXPECT_EQ(generated("als sin 1 1").out, "invalid service als\n");
    EXPECT_EQ(generated("pressure sin 1 1").out, "invalid generator sin\n");
    EXPECT_EQ(generated("accel Sin 1 1").out, "invalid generator Sin\n");
}

TEST_F(generate, init_generator_starts_the_signal_again) {
    const auto event = nrx::make_event("accel");
    EXPECT_EQ(event->generate("other", 7, 2) + "\n", sample("accel", "00000000", 0, 0));
    EXPECT_TRUE(event->init_generator("delta"));
    const std::string first = event->generate("delta", 7, 2);
    for (int i = 1; i < 65536; ++i)
        EXPECT_NE(event->generate("delta", 7, 2), first);
    EXPECT_EQ(event->generate("delta", 7, 2) + "\n", sample("accel", "00000000", 65536, 458752));
    EXPECT_TRUE(event->init_generator("delta"));
    EXPECT_EQ(event->generate("delta", 7, 2), first);
    EXPECT_EQ(event->generate("other", 7, 2) + "\n", sample("accel", "00000000", 1, 7));
    EXPECT_EQ(event->timestamp(), 0U);
    EXPECT_EQ(nrx::make_event("pressure")->generate("sin", 1, 1), "");
    EXPECT_EQ(nrx::make_event("pressure")->timestamp(), 0U);
}

TEST_F(generate, every_signal_loads_back_as_it_was_written) {
    for (const std::string tag : {"accel", "gyro", "compass"}) {
        for (const std::string signal : {"random", "delta", "step", "sin"}) {
            const std::string written = generated(tag + " " + signal + " 250 8hz").out;
            std::string loaded;
            const auto messages = capture([&] {
                const auto groups = nrx::read_sample_file(sample_file(written));
                ASSERT_TRUE(groups && groups->size() == 1 && groups->contains(tag));
                for (const auto& event : groups->at(tag)) {
                    nrx::text_line x;
                    x.zero_padded_hex(nrx::load_le<std::uint32_t>(event->data() + 16), 8);
                    loaded += sample(tag, std::string(x.view()),
                                     nrx::load_le<std::int32_t>(event->data() + 8),
                                     static_cast<std::int64_t>(event->timestamp()));
                }
            });
            EXPECT_EQ(std::count(loaded.begin(), loaded.end(), '\n'), 500);
            EXPECT_EQ(loaded, written);
            EXPECT_EQ(messages.out + messages.err, "") << tag << " " << signal;
        }
    }
}

}  // namespace tests
