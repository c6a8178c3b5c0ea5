#include "nrxctl/profiler/config_grammar.h"

#include "nrxctl/profiler/split.h"
#include "tests/profiler/profiler_host.h"

namespace tests {

namespace {

// "profiler.component state mask services", a record after the other.
std::string described(const std::vector<nrx::profiler_config>& configs) {
    std::string text;
    for (const nrx::profiler_config& config : configs) {
        char fields[80];
        std::snprintf(fields, sizeof(fields), "%s%u.%u %u %x", text.empty() ? "" : "; ",
                      config.profiler, config.component, static_cast<unsigned>(config.state),
                      config.reports);
        text += fields;
        for (const std::uint32_t service : config.services) {
            if (service == 0) continue;
            std::snprintf(fields, sizeof(fields), " %08x", service);
            text += fields;
        }
    }
    return text;
}

struct parsed {
    bool result = false;
    std::vector<nrx::profiler_config> configs;
    outcome written;
};

parsed parse(const std::string& word) {
    parsed one;
    one.written = capture([&] { one.result = nrx::parse_profiler_config(word, one.configs); });
    return one;
}

struct grammar_row {
    std::string word;
    std::string configs;
};

constexpr const char* grammar = "profiler/config_grammar.cpp";

}  // namespace

TEST(config_grammar, words_become_one_record_per_component) {
    const std::vector<grammar_row> rows{
        {"sensor:accel,gyro:data,lat", "2.0 0 5; 2.1 0 5"},
        {"exec:command:command:all", "0.3 0 1f 006c6c61"},
        {"sensor:accel:stop", "2.0 1 0"},
        {"sensor:stop", "2.0 2 ffff"},
        {"sensor:accel,stop,gyro", "2.0 0 ffff; 2.0 2 ffff; 2.1 0 ffff"},
        {"exec:thread", "0.0 0 ffffffff"},
        {"exec:thread:bogus:x", "0.0 0 ffffffff"},
        {"exec:stop", "0.0 2 ffffffff"},
        {"exec:thread:stop", "0.0 1 ffffffff"},
        {"exec:packet:report", "0.3 0 e0 006c6c61"},
        {"exec:extfunction:0x10:ab", "0.4 0 10 00006261"},
        {"trace:7", "1.7 0 ffffffff 006c6c61"},
        {"trace:0x1f,mbi", "1.31 0 ffffffff 006c6c61; 1.4 0 ffffffff 006c6c61"},
        {"trace:endpoint:", "1.1 0 ffffffff 006c6c61"},
        {"trace:endpoint::x", "1.1 0 0 00000078"},
        {"trace:stop", "1.0 2 ffffffff 006c6c61"},
        {"trace:endpoint:all:sensors,b", "1.1 0 ffffffff 736e6573 00000062"},
        {"trace:endpoint:all:1,2,3,4,5,6,7,8",
         "1.1 0 ffffffff 00000031 00000032 00000033 00000034 00000035 00000036 00000037 00000038"},
        {"wake:all", "10.0 0 ffff"},
        {"wake:all,wake,stop:wake-req-info", "10.0 0 2; 10.0 0 2; 10.0 2 2"},
        {"orrin:orrin:all", "3.0 0 1"},
        {"orrin:orrin:trig-lat", "3.0 0 10000"},
        {"scm:i2c_ctrl1:ch3,ch15", "9.5 0 8008"},
        {"scm:9", "9.9 0 ffffffff"},
        {"uart:uart1:0x300", "6.1 0 300"},
        {"sensor:accel:1,0x10:ignored", "2.0 0 11"},
        {"sensor:accel:lat,stop", "2.0 0 1"},
        {"sensor:accel:stop,lat", "2.0 1 1"},
        {"sensor:accel:0xffffffff", "2.0 0 ffffffff"},
        {"sensor::data", ""},
    };
    for (const grammar_row& row : rows) {
        const parsed one = parse(row.word);
        EXPECT_TRUE(one.result) << row.word;
        EXPECT_EQ(described(one.configs), row.configs) << row.word;
        EXPECT_EQ(one.written.out + one.written.err, "") << row.word;
    }
}

TEST(config_grammar, every_component_word_has_its_number) {
    const std::vector<grammar_row> rows{
        {"exec:function", "0.1 0 ffffffff"},
        {"exec:workloop", "0.2 0 ffffffff"},
        {"exec:timing", "0.5 0 ffffffff"},
        {"trace:remoteq,endpoint,systick,interrupt,mbi:0:x",
         "1.0 0 0 00000078; 1.1 0 0 00000078; 1.2 0 0 00000078; 1.3 0 0 00000078; "
         "1.4 0 0 00000078"},
        {"sensor:accel,gyro,compass,pressure,gostin,als,temperature:0",
         "2.0 0 0; 2.1 0 0; 2.2 0 0; 2.3 0 0; 2.4 0 0; 2.5 0 0; 2.6 0 0"},
        {"talvor:talvor", "4.0 0 ffff"},
        {"interrupt:gpio", "5.0 0 ffff"},
        {"uart:uart0,uart1,uart2", "6.0 0 ffff; 6.1 0 ffff; 6.2 0 ffff"},
        {"scm:spi0,smb0,smb1,i2cm0,i2c_ctrl0,i2c_ctrl1:0",
         "9.0 0 0; 9.1 0 0; 9.2 0 0; 9.3 0 0; 9.4 0 0; 9.5 0 0"},
        {"wake:wake", "10.0 0 ffff"},
    };
    for (const grammar_row& row : rows)
        EXPECT_EQ(described(parse(row.word).configs), row.configs) << row.word;
}

TEST(config_grammar, every_report_word_has_its_bits) {
    struct report_row {
        std::string component;
        std::vector<std::pair<std::string, std::uint32_t>> words;
    };
    const std::vector<report_row> rows{
        {"exec:command", {{"all", 0xffffffff}, {"command", 0x1f}, {"report", 0xe0}}},
        {"exec:extfunction", {{"all", 0xffffffff}}},
        {"trace:mbi", {{"all", 0xffffffff}}},
        {"sensor:als",
         {{"all", 0xffff},
          {"lat", 0x1},
          {"raw", 0x2},
          {"data", 0x4},
          {"rdata", 0x6},
          {"filtered", 0x8},
          {"apdata", 0x10},
          {"writereg", 0x20},
          {"readreg", 0x40},
          {"update", 0x80},
          {"filterstate", 0x100},
          {"sensorinfo", 0x200},
          {"annotation", 0x400},
          {"decimationinfo", 0x800},
          {"t-magnitude", 0x10000},
          {"t-latency", 0x20000},
          {"error", 0x40000},
          {"t-bad", 0x80000}}},
        {"orrin:orrin", {{"latency", 0x1}, {"monitor", 0x2}}},
        {"talvor:talvor", {{"all", 0xffff}}},
        {"interrupt:gpio", {{"all", 0xffff}}},
        {"uart:uart0",
         {{"all", 0xffff},
          {"preamble", 0x1},
          {"swhand", 0x2},
          {"hwhand", 0x4},
          {"trace", 0x8},
          {"packet", 0x10},
          {"baseband", 0x20},
          {"transport", 0x40},
          {"test", 0x80}}},
        {"scm:spi0",
         {{"all", 0xffffffff},
          {"ch0", 0x1},
          {"ch1", 0x2},
          {"ch2", 0x4},
          {"ch3", 0x8},
          {"ch4", 0x10},
          {"ch5", 0x20},
          {"ch6", 0x40},
          {"ch7", 0x80},
          {"ch8", 0x100},
          {"ch9", 0x200},
          {"ch10", 0x400},
          {"ch11", 0x800},
          {"ch12", 0x1000},
          {"ch13", 0x2000},
          {"ch14", 0x4000},
          {"ch15", 0x8000}}},
        {"wake:wake",
         {{"all", 0xffff},
          {"wake-req-stats", 0x1},
          {"wake-req-info", 0x2},
          {"wake-event-info", 0x4}}},
    };
    for (const report_row& row : rows) {
        for (const auto& [word, mask] : row.words) {
            const parsed one = parse(row.component + ":" + word);
            ASSERT_EQ(one.configs.size(), 1U) << row.component << " " << word;
            EXPECT_EQ(one.configs[0].reports, mask) << row.component << " " << word;
        }
    }
}

TEST(config_grammar, words_that_fail_are_reported_and_keep_what_came_before) {
    struct failing_row {
        std::string word;
        std::string configs;
        std::string reports;
    };
    const std::string too_many_services =
        failed(grammar, "service_i < (sizeof(config.services) / sizeof(config.services[0]))");
    const std::string unknown_component =
        failed(grammar, "enable_num_components") + failed(grammar, "result");
    const std::vector<failing_row> rows{
        {"", "", ""},
        {"exec", "", ""},
        {"exec:", "", ""},
        {"exec:thread:all:svc1:x", "", ""},
        {"exce:thread", "", failed(grammar, "false")},
        {"Exec:thread", "", failed(grammar, "false")},
        {"all:all", "", failed(grammar, "false")},
        {"exec:thread,function", "", failed(grammar, "components.size() == 1")},
        {"exec::all", "", failed(grammar, "components.size() == 1")},
        {"exec:3", "", unknown_component},
        {"sensor:7", "", unknown_component},
        {"sensor:gyro,all,accel", "2.1 0 ffff", unknown_component},
        {"sensor:gyro,,accel", "2.1 0 ffff", unknown_component},
        {"trace:endpoint:all:1,2,3,4,5,6,7,8,9", "", too_many_services},
    };
    for (const failing_row& row : rows) {
        const parsed one = parse(row.word);
        EXPECT_FALSE(one.result) << row.word;
        EXPECT_EQ(described(one.configs), row.configs) << row.word;
        EXPECT_EQ(one.written.err, row.reports) << row.word;
        EXPECT_EQ(one.written.out, "") << row.word;
    }
}

TEST(config_grammar, words_that_are_no_numbers_of_32_bits_end_the_process) {
    struct refused_row {
        std::string word;
        std::string message;
    };
    const std::vector<refused_row> rows{
        {"trace:bogus", "component is invalid (bogus)\n"},
        {"trace:,endpoint:all", "component is invalid ()\n"},
        {"trace:-1", "component is invalid (-1)\n"},
        {"scm:0x100000000", "component is invalid (0x100000000)\n"},
        {"sensor:accel:latt", "report mask is invalid (latt)\n"},
        {"sensor:accel:lat,,raw", "report mask is invalid ()\n"},
        {"sensor:accel:-4", "report mask is invalid (-4)\n"},
        {"wake:wake:4294967296", "report mask is invalid (4294967296)\n"},
        {"orrin:orrin:0x", "report mask is invalid (0x)\n"},
    };
    for (const refused_row& row : rows) {
        const parsed one = parse(row.word);
        EXPECT_EQ(one.written.status, 1) << row.word;
        EXPECT_EQ(one.written.out, row.message) << row.word;
        EXPECT_TRUE(one.configs.empty()) << row.word;
    }
}

TEST(config_grammar, all_words_that_are_left_are_taken_up_to_the_first_that_fails) {
    std::array<std::string, 5> words{"nrxctl", "wake:all", "scm:stop", "sensor", "wake:all"};
    std::vector<char*> argv;
    for (std::string& word : words)
        argv.push_back(word.data());
    std::vector<nrx::profiler_config> configs;
    int index = 1;
    const std::span<char* const> all(argv);
    nrx::argument_words left(all.first(3), index);
    EXPECT_TRUE(nrx::parse_profiler_configs(left, configs));
    EXPECT_EQ(described(configs), "10.0 0 ffff; 9.0 2 ffffffff");
    EXPECT_EQ(index, 3);
    EXPECT_TRUE(nrx::parse_profiler_configs(left, configs));
    EXPECT_EQ(configs.size(), 2U);

    configs.clear();
    index = 2;
    nrx::argument_words failing(all, index);
    const outcome written =
        capture([&] { EXPECT_FALSE(nrx::parse_profiler_configs(failing, configs)); });
    EXPECT_EQ(written.err, failed(grammar, "result"));
    EXPECT_EQ(configs.size(), 1U);
    EXPECT_EQ(index, 4);
}

TEST(config_grammar, split_keeps_empty_fields_but_for_the_last) {
    using fields = std::vector<std::string_view>;
    EXPECT_EQ(nrx::split("", ':'), fields{});
    EXPECT_EQ(nrx::split(":", ':'), fields{""});
    EXPECT_EQ(nrx::split("::", ':'), (fields{"", ""}));
    EXPECT_EQ(nrx::split("a", ':'), fields{"a"});
    EXPECT_EQ(nrx::split("a:", ':'), fields{"a"});
    EXPECT_EQ(nrx::split("a::b", ':'), (fields{"a", "", "b"}));
    EXPECT_EQ(nrx::split(":b", ':'), (fields{"", "b"}));
}

}  // namespace tests
