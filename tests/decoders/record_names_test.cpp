#include <map>

#include "nrxctl/decoders/category_decoders.h"
#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"

namespace {

using namespace tests;
using record_names = device_test;

// The names that the records of a member's 256 values show under a key, as "number name "; a value
// that is shown as its number is left out.
std::string names(const std::string& key, std::uint8_t record_ids::*member, record_ids ids) {
    std::string all;
    for (int value = 0; value < 256; ++value) {
        ids.*member = static_cast<std::uint8_t>(value);
        const std::string line = decoded(make_record(ids));
        const auto begin = line.find('\'', line.find(" '" + key + "':") + key.size() + 4) + 1;
        const std::string name = line.substr(begin, line.find('\'', begin) - begin);
        const std::string number = std::to_string(value);
        if (name != number) all.append(number).append(" ").append(name).append(" ");
    }
    return all;
}

TEST_F(record_names, every_category_and_type_prints_its_name_or_number) {
    for (const std::uint8_t other : {std::uint8_t{0}, std::uint8_t{255}}) {
        EXPECT_EQ(names("category", &record_ids::category, {0, other, other, other}),
                  "0 exec 1 trace 2 sensor 3 orrin 4 talvor 5 interrupt 6 uart 8 control 9 scm "
                  "10 wake ");
        EXPECT_EQ(names("type", &record_ids::type, {other, other, other, 0}),
                  "0 stop 1 long-data 2 short-data 3 event 4 trigger 5 function 6 kpdx-context1 "
                  "7 kpdx-context2 8 sensorinfo 9 extfunction 10 kpdx-context 11 annotation "
                  "12 decimationinfo ");
    }
}

TEST_F(record_names, every_component_and_event_prints_its_name_or_number) {
    const std::string commands =
        "0 start 1 finalize 2 new-packet 3 receive 4 timeout 5 live-report 6 hist-report "
        "7 user-report ";
    // Events by component; the last ones are those of all further components.
    const std::map<std::uint8_t, std::pair<std::string, std::vector<std::string>>> categories{
        {0,
         {"0 scheduler 1 function 2 workloop 3 command 4 extfunction 5 timing ",
          {"0 context-switch 1 prevent-nap 2 thread-state ", "0 function ", "0 action 1 signal ",
           commands, "0 extfunction ", ""}}},
        {1, {"0 remoteq 1 endpoint 2 systick 3 interrupt ", {""}}},
        {2,
         {"0 accel 1 gyro 2 compass 3 pressure 4 gostin 5 als 6 temperature ",
          {"0 latency 1 rawdata 2 data 3 filtdata 4 apdata 5 regwrite 6 regread 7 update "
           "8 filter-state 9 sensor-info 10 annotation 16 trigger-magnitude 17 trigger-latency "}}},
        {3, {"0 orrin ", {"0 latency 1 monitor 17 trigger-latency "}}},
        {4, {"0 talvor ", {"0 data-in 1 data-out "}}},
        {5, {"0 gpio ", {"0 latency "}}},
        {6,
         {"0 uart0 1 uart1 2 uart2 ",
          {"0 preamble 1 sw-handshake 2 hw-handshake 3 trace 4 packet 5 baseband 6 transport "
           "7 wqr-test "}}},
        {9, {"0 spi0 1 smb0 2 smb1 3 i2cm0 4 i2c_ctrl0 5 i2c_ctrl1 ", {""}}},
        {10, {"0 wake ", {"0 wake-req-stats 1 wake-req-info 2 wake-event-info "}}},
    };
    for (const std::uint8_t category : byte_list{0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 255}) {
        const auto row = categories.find(category);
        const auto& [components, events] =
            row == categories.end() ? std::pair(std::string(), std::vector{std::string()})
                                    : row->second;
        EXPECT_EQ(names("component", &record_ids::component, {category, 0, 1, 3}), components);
        for (const std::uint8_t component : byte_list{0, 1, 2, 3, 4, 5, 6, 7, 255}) {
            EXPECT_EQ(names("event", &record_ids::event, {category, component, 0, 3}),
                      events[std::min<std::size_t>(component, events.size() - 1)])
                << int{category} << " " << int{component};
        }
    }
}

TEST(category_decoders, exist_for_every_category_up_to_10_but_7) {
    for (std::uint32_t category = 0; category < 300; ++category) {
        const bool exists = category <= 10 && category != 7;
        EXPECT_EQ(nrx::decoder_for_category(category) != nullptr, exists) << category;
    }
    EXPECT_EQ(nrx::decoder_for_category(2)->component_name(70000).view(), "70000");
    EXPECT_EQ(nrx::decoder_for_category(0)->event_name(4294967295, 4294967295).view(),
              "4294967295");
}

}  // namespace
