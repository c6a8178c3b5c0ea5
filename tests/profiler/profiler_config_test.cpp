// Configurations: their records, their text and the arguments that they come from.
#include "nrxctl/profiler/profiler_config.h"

#include <sstream>

#include "nrxctl/profiler/config_parser.h"
#include "tests/profiler/profiler_host.h"
#include "tests/support/argument_vector.h"

namespace tests {

// "profiler.component state reports services", record by record.
std::string described(const std::vector<nrx::profiler_config>& configs) {
    std::ostringstream text;
    for (const nrx::profiler_config& config : configs) {
        text << (text.tellp() > 0 ? "; " : "") << std::dec << config.profiler << '.'
             << config.component << ' ' << static_cast<unsigned>(config.state) << ' ' << std::hex
             << config.reports;
        for (const std::uint32_t service : config.services) {
            if (service != 0) text << ' ' << service;
        }
    }
    return text.str();
}

TEST(profiler_config, record_has_52_bytes_and_every_field_at_its_offset) {
    const byte_list record = u32_report(
        {10, 0x04030201, 0x0a090001, 0x08070605, 0x006c6c61, 0x736e6573, 0x78, 4, 5, 6, 7, 8, 0});
    const auto decoded = nrx::decode_configs(record);
    EXPECT_EQ(described(decoded), "10.67305985 168361985 8070605 6c6c61 736e6573 78 4 5 6 7 8");
    EXPECT_EQ(nrx::encode_configs(decoded), record);
    byte_list two = joined({record, record});
    EXPECT_EQ(nrx::decode_configs(two).size(), 2U);
    two.pop_back();
    EXPECT_EQ(nrx::decode_configs(two).size(), 1U);
}

TEST(profiler_config, prints_as_one_line) {
    using numbers = std::array<std::uint32_t, 4>;  // profiler, component, state, reports
    using services = std::array<std::uint32_t, 8>;
    for (const auto& [config, codes, line] : rows<numbers, services, std::string>{
             {{2, 1, 0, 5}, {}, "sensor     is enabled [component=gyro, reports=5]"},
             {{2, 9, 1, 0}, {}, "sensor     is disabled [component=9, reports=0]"},
             {{10, 0, 2, ~0U}, {}, "wake       is stopd [component=, reports=ffffffff]"},
             {{5, 0, 3, 0xffff}, {}, "interrupt  is unknownd [component=gpio, reports=ffff]"},
             {{8, 2, 0, 0}, {}, "control    is enabled [component=2, reports=0]"},
             {{~0U, ~0U, 0, 0}, {}, "4294967295 is enabled [component=4294967295, reports=0]"},
             {{0, 3, 0, 0x1f},
              {0x006c6c61},
              "exec       is enabled [component=command, reports=1f services= all]"},
             {{0, 4, 0, 1},
              {0x736e6573, 0x62, 0, 0x63},
              "exec       is enabled [component=extfunction, reports=1 services= sens b]"},
             {{0, 2, 0, 1}, {0x61}, "exec       is enabled [component=workloop, reports=1]"},
             {{1, 4, 0, 1}, {}, "trace      is enabled [component=4, reports=1 services=]"},
             {{1, 3, 0, 1},
              {0x62006100, 0x61},
              "trace      is enabled [component=interrupt, reports=1 services=  a]"},
         }) {
        const nrx::profiler_config printed{
            config[0], config[1], static_cast<nrx::profiler_state>(config[2]), config[3], codes};
        EXPECT_EQ(capture([&] { nrx::print_profiler_config(printed); }).out,
                  "    profiler " + line + "\n");
    }
}

// What becomes of arguments, which are separated by spaces.
struct parsed {
    explicit parsed(const std::string& text) : arguments(split(text)) {
        nrx::argument_cursor cursor(arguments.span(), arguments_read);
        written = capture([&] { result = nrx::parse_profiler_configs(cursor, configs); });
    }

    argument_vector arguments;
    int arguments_read = 0;
    bool result = false;
    std::vector<nrx::profiler_config> configs;
    outcome written;
};

TEST(config_parser, valid_argument_gives_one_record_per_component) {
    const rows<std::string, std::string> cases{
        {"", ""},
        {"sensor:accel,gyro:data,lat sensor:accel:stop", "2.0 0 5; 2.1 0 5; 2.0 1 0"},
        {"sensor:stop sensor:accel,stop,gyro", "2.0 2 ffff; 2.0 0 ffff; 2.0 2 ffff; 2.1 0 ffff"},
        {"sensor:accel:1,0x10:ignored sensor:accel:0xffffffff", "2.0 0 11; 2.0 0 ffffffff"},
        {"sensor:accel:lat,stop sensor:accel:stop,lat sensor::data", "2.0 0 1; 2.0 1 1"},
        {"exec:thread exec:thread:bogus:x", "0.0 0 ffffffff; 0.0 0 ffffffff"},
        {"exec:thread:stop exec:stop", "0.0 1 ffffffff; 0.0 2 ffffffff"},
        {"exec:command:command:all exec:packet:report", "0.3 0 1f 6c6c61; 0.3 0 e0 6c6c61"},
        {"exec:extfunction:0x10:ab", "0.4 0 10 6261"},
        {"trace:0x1f,mbi", "1.31 0 ffffffff 6c6c61; 1.4 0 ffffffff 6c6c61"},
        {"trace:7 trace:stop", "1.7 0 ffffffff 6c6c61; 1.0 2 ffffffff 6c6c61"},
        {"trace:endpoint: trace:endpoint::x", "1.1 0 ffffffff 6c6c61; 1.1 0 0 78"},
        {"trace:endpoint:all:\xff", "1.1 0 ffffffff ff"},
        {"trace:endpoint:all:sensors,b", "1.1 0 ffffffff 736e6573 62"},
        {"trace:endpoint:all:1,2,3,4,5,6,7,8", "1.1 0 ffffffff 31 32 33 34 35 36 37 38"},
        {"wake:all wake:all,wake,stop:wake-req-info", "10.0 0 ffff; 10.0 0 2; 10.0 0 2; 10.0 2 2"},
        {"scm:i2c_ctrl1:ch3,ch15 scm:9", "9.5 0 8008; 9.9 0 ffffffff"},
        {"orrin:orrin:all uart:uart1:0x300", "3.0 0 1; 6.1 0 300"},
        {"exec:function exec:workloop exec:timing",
         "0.1 0 ffffffff; 0.2 0 ffffffff; 0.5 0 ffffffff"},
        {"trace:remoteq,endpoint,systick,interrupt,mbi:0:x",
         "1.0 0 0 78; 1.1 0 0 78; 1.2 0 0 78; 1.3 0 0 78; 1.4 0 0 78"},
        {"sensor:accel,gyro,compass,pressure,gostin,als,temperature:0",
         "2.0 0 0; 2.1 0 0; 2.2 0 0; 2.3 0 0; 2.4 0 0; 2.5 0 0; 2.6 0 0"},
        {"talvor:talvor interrupt:gpio wake:wake", "4.0 0 ffff; 5.0 0 ffff; 10.0 0 ffff"},
        {"uart:uart0,uart1,uart2", "6.0 0 ffff; 6.1 0 ffff; 6.2 0 ffff"},
        {"scm:spi0,smb0,smb1,i2cm0,i2c_ctrl0,i2c_ctrl1:0",
         "9.0 0 0; 9.1 0 0; 9.2 0 0; 9.3 0 0; 9.4 0 0; 9.5 0 0"},
    };
    for (const auto& [arguments, configs] : cases) {
        const parsed actual(arguments);
        EXPECT_TRUE(actual.result) << arguments;
        EXPECT_EQ(described(actual.configs), configs) << arguments;
        EXPECT_EQ(actual.written.out + actual.written.err, "") << arguments;
    }
}

TEST(config_parser, every_report_keyword_has_its_bits) {
    // A component; keywords and their bits.
    const rows<std::string, std::string> cases{
        {"exec:command", "all ffffffff command 1f report e0"},
        {"exec:extfunction", "all ffffffff"},
        {"sensor:als",
         "all ffff lat 1 raw 2 data 4 rdata 6 filtered 8 apdata 10 writereg 20 readreg 40 "
         "update 80 filterstate 100 sensorinfo 200 annotation 400 decimationinfo 800 "
         "t-magnitude 10000 t-latency 20000 error 40000 t-bad 80000"},
        {"orrin:orrin", "latency 1 monitor 2 trig-lat 10000"},
        {"uart:uart0",
         "all ffff preamble 1 swhand 2 hwhand 4 trace 8 packet 10 baseband 20 transport 40 "
         "test 80"},
        {"scm:spi0",
         "all ffffffff ch0 1 ch1 2 ch2 4 ch3 8 ch4 10 ch5 20 ch6 40 ch7 80 ch8 100 ch9 200 "
         "ch10 400 ch11 800 ch12 1000 ch13 2000 ch14 4000 ch15 8000"},
        {"wake:wake", "all ffff wake-req-stats 1 wake-req-info 2 wake-event-info 4"},
    };
    for (const auto& [component, keywords_and_bits] : cases) {
        std::istringstream source(keywords_and_bits);
        std::string keyword;
        std::uint32_t bits = 0;
        while (source >> keyword >> std::hex >> bits) {
            const parsed actual(component + ":" + keyword);
            ASSERT_EQ(actual.configs.size(), 1U) << component << " " << keyword;
            EXPECT_EQ(actual.configs[0].reports, bits) << component << " " << keyword;
        }
        EXPECT_TRUE(source.eof());
    }
}

TEST(config_parser, first_invalid_argument_is_reported_and_the_last_read) {
    const auto report = [](auto text) { return library_report(file::config_parser, text); };
    const std::string unknown_component = report("enable_num_components");
    const std::string invalid = report("result");
    // Arguments, their configurations and reports.
    for (const auto& [arguments, configs, reports] : rows<std::string, std::string, std::string>{
             {" exec exec: exec:thread:all:svc1:x", "", ""},
             {"exce:thread Exec:thread all:all", "", report("false")},
             {"exec:thread,function exec::all", "", report("components.size() == 1")},
             {"exec:3 sensor:7 sensor:stops", "", unknown_component + invalid},
             {"sensor:gyro,all,accel sensor:gyro,,accel", "; 2.1 0 ffff",
              unknown_component + invalid},
             {"trace:endpoint:all:1,2,3,4,5,6,7,8,9", "",
              report("service_i < (sizeof(config.services) / sizeof(config.services[0]))")}}) {
        for (const std::string& argument : split(arguments)) {
            const parsed actual("wake:all " + argument + " wake:all");
            EXPECT_FALSE(actual.result) << argument;
            EXPECT_EQ(described(actual.configs), "10.0 0 ffff" + configs) << argument;
            EXPECT_EQ(actual.written.out + actual.written.err, reports + invalid) << argument;
            EXPECT_EQ(actual.arguments_read, 2) << argument;
        }
    }
}

TEST(config_parser, invalid_number_ends_the_process) {
    const auto refuse = [](const std::string& argument, const std::string& message) {
        const parsed actual(argument);
        EXPECT_EQ(actual.written.status, 1) << argument;
        EXPECT_EQ(actual.written.out, message) << argument;
        EXPECT_TRUE(actual.configs.empty()) << argument;
    };
    for (const std::string component : {"bogus", "all", "sto", "", "-1", "0x100000000"})
        refuse("trace:" + component + ",endpoint", "component is invalid (" + component + ")\n");
    for (const std::string report : {"latt", "stopped", "", "-4", "4294967296", "0x"})
        refuse("sensor:als:lat," + report + ",raw", "report mask is invalid (" + report + ")\n");
}

}  // namespace tests
