#include "nrxctl/profiler/config_grammar.h"

#include <sstream>

#include "tests/profiler/profiler_host.h"
#include "tests/support/word_vector.h"

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

}  // namespace

TEST(config_grammar, words_become_one_record_per_component) {
    const rows<std::string, std::string> cases{
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
        {"trace:endpoint:all:\xff", "1.1 0 ffffffff 000000ff"},
        // every component
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
    for (const auto& [word, configs] : cases) {
        const parsed one = parse(word);
        EXPECT_TRUE(one.result) << word;
        EXPECT_EQ(described(one.configs), configs) << word;
        EXPECT_EQ(one.written.out + one.written.err, "") << word;
    }
}

TEST(config_grammar, every_report_word_has_its_bits) {
    // A component; words and their masks.
    const rows<std::string, std::string> cases{
        {"exec:command", "all ffffffff command 1f report e0"},
        {"exec:extfunction", "all ffffffff"},
        {"trace:mbi", "all ffffffff"},
        {"sensor:als",
         "all ffff lat 1 raw 2 data 4 rdata 6 filtered 8 apdata 10 writereg 20 readreg 40 "
         "update 80 filterstate 100 sensorinfo 200 annotation 400 decimationinfo 800 "
         "t-magnitude 10000 t-latency 20000 error 40000 t-bad 80000"},
        {"orrin:orrin", "latency 1 monitor 2"},
        {"talvor:talvor", "all ffff"},
        {"interrupt:gpio", "all ffff"},
        {"uart:uart0",
         "all ffff preamble 1 swhand 2 hwhand 4 trace 8 packet 10 baseband 20 transport 40 "
         "test 80"},
        {"scm:spi0",
         "all ffffffff ch0 1 ch1 2 ch2 4 ch3 8 ch4 10 ch5 20 ch6 40 ch7 80 ch8 100 ch9 200 "
         "ch10 400 ch11 800 ch12 1000 ch13 2000 ch14 4000 ch15 8000"},
        {"wake:wake", "all ffff wake-req-stats 1 wake-req-info 2 wake-event-info 4"},
    };
    for (const auto& [component, words_and_masks] : cases) {
        std::istringstream from(words_and_masks);
        std::string word;
        std::uint32_t mask = 0;
        while (from >> word >> std::hex >> mask) {
            const parsed one = parse(component + ":" + word);
            ASSERT_EQ(one.configs.size(), 1U) << component << " " << word;
            EXPECT_EQ(one.configs[0].reports, mask) << component << " " << word;
        }
        EXPECT_TRUE(from.eof());
    }
}

TEST(config_grammar, words_that_fail_are_reported_and_keep_what_came_before) {
    const std::string too_many_services =
        failed(grammar_file, "service_i < (sizeof(config.services) / sizeof(config.services[0]))");
    const std::string unknown_component =
        failed(grammar_file, "enable_num_components") + failed(grammar_file, "result");
    for (const auto& [word, configs, reports] : rows<std::string, std::string, std::string>{
             {"", "", ""},
             {"exec", "", ""},
             {"exec:", "", ""},
             {"exec:thread:all:svc1:x", "", ""},
             {"exce:thread", "", failed(grammar_file, "false")},
             {"Exec:thread", "", failed(grammar_file, "false")},
             {"all:all", "", failed(grammar_file, "false")},
             {"exec:thread,function", "", failed(grammar_file, "components.size() == 1")},
             {"exec::all", "", failed(grammar_file, "components.size() == 1")},
             {"exec:3", "", unknown_component},
             {"sensor:7", "", unknown_component},
             {"sensor:stops", "", unknown_component},
             {"sensor:gyro,all,accel", "2.1 0 ffff", unknown_component},
             {"sensor:gyro,,accel", "2.1 0 ffff", unknown_component},
             {"trace:endpoint:all:1,2,3,4,5,6,7,8,9", "", too_many_services},
         }) {
        const parsed one = parse(word);
        EXPECT_FALSE(one.result) << word;
        EXPECT_EQ(described(one.configs), configs) << word;
        EXPECT_EQ(one.written.err, reports) << word;
        EXPECT_EQ(one.written.out, "") << word;
    }
}

TEST(config_grammar, words_that_are_no_numbers_of_32_bits_end_the_process) {
    const rows<std::string, std::string> cases{
        {"trace:bogus", "component is invalid (bogus)\n"},
        {"trace:sto", "component is invalid (sto)\n"},
        {"trace:,endpoint:all", "component is invalid ()\n"},
        {"trace:-1", "component is invalid (-1)\n"},
        {"scm:0x100000000", "component is invalid (0x100000000)\n"},
        {"sensor:accel:latt", "report mask is invalid (latt)\n"},
        {"sensor:accel:stopped", "report mask is invalid (stopped)\n"},
        {"sensor:accel:lat,,raw", "report mask is invalid ()\n"},
        {"sensor:accel:-4", "report mask is invalid (-4)\n"},
        {"wake:wake:4294967296", "report mask is invalid (4294967296)\n"},
        {"orrin:orrin:0x", "report mask is invalid (0x)\n"},
    };
    for (const auto& [word, message] : cases) {
        const parsed one = parse(word);
        EXPECT_EQ(one.written.status, 1) << word;
        EXPECT_EQ(one.written.out, message) << word;
        EXPECT_TRUE(one.configs.empty()) << word;
    }
}

TEST(config_grammar, all_words_that_are_left_are_taken_up_to_the_first_that_fails) {
    const word_vector words({"nrxctl", "wake:all", "scm:stop", "sensor", "wake:all"});
    std::vector<nrx::profiler_config> configs;
    int index = 1;
    nrx::argument_words left(words.all().first(3), index);
    EXPECT_TRUE(nrx::parse_profiler_configs(left, configs));
    EXPECT_EQ(described(configs), "10.0 0 ffff; 9.0 2 ffffffff");
    EXPECT_EQ(index, 3);
    EXPECT_TRUE(nrx::parse_profiler_configs(left, configs));
    EXPECT_EQ(configs.size(), 2U);

    configs.clear();
    index = 2;
    nrx::argument_words failing(words.all(), index);
    const outcome written =
        capture([&] { EXPECT_FALSE(nrx::parse_profiler_configs(failing, configs)); });
    EXPECT_EQ(written.err, failed(grammar_file, "result"));
    EXPECT_EQ(configs.size(), 1U);
    EXPECT_EQ(index, 4);
}

}  // namespace tests
