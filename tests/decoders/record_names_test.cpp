// What the four identifier bytes are called, every value of each.
#include <map>
#include <string>
#include <vector>

#include "tests/decoders/event_record.h"
#include "tests/support/device_test.h"

namespace {

using names = std::map<int, std::string>;

names numbered(std::initializer_list<const char*> from_zero) {
    names all;
    for (const char* name : from_zero)
        all.emplace(static_cast<int>(all.size()), name);
    return all;
}

const names categories{
    {0, "exec"},      {1, "trace"}, {2, "sensor"},  {3, "orrin"}, {4, "talvor"},
    {5, "interrupt"}, {6, "uart"},  {8, "control"}, {9, "scm"},   {10, "wake"},
};
const names types = numbered({"stop", "long-data", "short-data", "event", "trigger", "function",
                              "kpdx-context1", "kpdx-context2", "sensorinfo", "extfunction",
                              "kpdx-context", "annotation", "decimationinfo"});

const std::map<int, names> components{
    {0, numbered({"scheduler", "function", "workloop", "command", "extfunction", "timing"})},
    {1, numbered({"remoteq", "endpoint", "systick", "interrupt"})},
    {2, numbered({"accel", "gyro", "compass", "pressure", "gostin", "als", "temperature"})},
    {3, {{0, "orrin"}}},
    {4, {{0, "talvor"}}},
    {5, {{0, "gpio"}}},
    {6, numbered({"uart0", "uart1", "uart2"})},
    {9, numbered({"spi0", "smb0", "smb1", "i2cm0", "i2c_ctrl0", "i2c_ctrl1"})},
    {10, {{0, "wake"}}},
};

// By component; the last row serves every component behind it.
const names sensor_events{
    {0, "latency"},          {1, "rawdata"},     {2, "data"},        {3, "filtdata"},
    {4, "apdata"},           {5, "regwrite"},    {6, "regread"},     {7, "update"},
    {8, "filter-state"},     {9, "sensor-info"}, {10, "annotation"}, {16, "trigger-magnitude"},
    {17, "trigger-latency"},
};
const std::map<int, std::vector<names>> events{
    {0,
     {numbered({"context-switch", "prevent-nap", "thread-state"}),
      {{0, "function"}},
      numbered({"action", "signal"}),
      numbered({"start", "finalize", "new-packet", "receive", "timeout", "live-report",
                "hist-report", "user-report"}),
      {{0, "extfunction"}},
      {}}},
    {2, {sensor_events}},
    {3, {{{0, "latency"}, {1, "monitor"}, {17, "trigger-latency"}}}},
    {4, {numbered({"data-in", "data-out"})}},
    {5, {{{0, "latency"}}}},
    {6,
     {numbered({"preamble", "sw-handshake", "hw-handshake", "trace", "packet", "baseband",
                "transport", "wqr-test"})}},
    {10, {numbered({"wake-req-stats", "wake-req-info", "wake-event-info"})}},
};

std::string name_in(const names& table, int id) {
    const auto found = table.find(id);
    return found == table.end() ? std::to_string(id) : found->second;
}

std::string component_name(int category, int component) {
    const auto found = components.find(category);
    return found == components.end() ? std::to_string(component)
                                     : name_in(found->second, component);
}

std::string event_name(int category, int component, int event) {
    const auto found = events.find(category);
    if (found == events.end()) return std::to_string(event);
    const auto row =
        std::min<std::size_t>(static_cast<std::size_t>(component), found->second.size() - 1);
    return name_in(found->second[row], event);
}

std::string field(const std::string& key, const std::string& name, std::size_t width) {
    const std::string quoted = "'" + name + "'";
    return " '" + key + "':" + std::string(quoted.size() < width ? width - quoted.size() : 0, ' ') +
           quoted + ",";
}

class event_names : public tests::device_test {
protected:
    static void expect_names(int category, int component, int event, int type) {
        const std::string expected = "{ " + field("category", name_in(categories, category), 8) +
                                     field("component", component_name(category, component), 8) +
                                     field("event", event_name(category, component, event), 12) +
                                     field("type", name_in(types, type), 12) +
                                     " 'timestamp':      8123,";
        const auto byte = [](int id) { return static_cast<std::uint8_t>(id); };
        const auto line = tests::decoded(
            tests::record_of({byte(category), byte(component), byte(event), byte(type)}));
        EXPECT_EQ(line.substr(0, expected.size()), expected);
    }
};

TEST_F(event_names, every_value_of_every_identifier) {
    for (int id = 0; id < 256; ++id) {
        expect_names(id, 0, 0, 0);
        expect_names(id, 255, 255, id);
        expect_names(0, 0, 0, id);
        for (int category = 0; category < 12; ++category) {
            expect_names(category, id, 1, 3);
            for (const int component : {0, 1, 2, 3, 4, 5, 6, 7, 255})
                expect_names(category, component, id, 3);
        }
    }
}

}  // namespace
