#include "nrxctl/inspection/hid_service_list.h"

#include <regex>
#include <tuple>

#include "tests/inspection/sensor_host.h"

namespace tests {

class hid_service_list : public device_test {
protected:
    void put_hid_interfaces(std::initializer_list<const char*> names) {
        for (const char* name : names)
            host.add({.name = name, .classes = {"KeltoNRXHIDInterface"}});
    }
};

// An address differs from run to run.
std::string without_addresses(const std::string& text) {
    return std::regex_replace(text, std::regex("\\[0x[0-9a-f]+, "), "[0x*, ");
}

outcome list_for(std::string_view name) {
    outcome result = capture([&] { nrx::print_hid_services(name); });
    result.out = without_addresses(result.out);
    return result;
}

// What it prints: the line of the list, then which service each look-up finds.
std::string list_text(const std::string& list, const std::string& name, int prefixed, int bare) {
    return list + "\nMatching WQR_" + name.substr(0, 123) + " [0x*, " + std::to_string(prefixed) +
           "]\nMatching " + name + " [0x*, " + std::to_string(bare) + "]\n\n\n\n";
}

const std::string label = "Available HID services: ";

TEST_F(hid_service_list, follows_the_reason_if_there_is_no_such_service) {
    put_hid_interfaces({"accel"});
    put_service(host, "stranger", 3);
    put_hid_interfaces({"gyro"});
    const outcome result = inspect("nobody", 2);
    EXPECT_EQ(without_addresses(result.out),
              "sensor nobody doesn't provide sensor info (kr=e00002f0)\n\n" +
                  list_text(label + "accel gyro ", "nobody", 0, 0));
    EXPECT_EQ(result.err, "");
}

TEST_F(hid_service_list, shows_what_each_look_up_finds) {
    EXPECT_EQ(list_for("nobody").out, list_text(label, "nobody", 0, 0));
    put_service(host, "WQR_accel", 31);
    EXPECT_EQ(list_for("accel").out, list_text(label, "accel", 1, 0));
    put_service(host, "accel", 2);
    EXPECT_EQ(list_for("accel").out, list_text(label, "accel", 2, 3));
    host.remove("WQR_accel");
    EXPECT_EQ(list_for("accel").out, list_text(label, "accel", 0, 4));
    // Neither is by id, nor among the services of the list.
    EXPECT_EQ(list_for("2").out, list_text(label, "2", 0, 0));
    put_hid_interfaces({"gyro", "WQR_gyro"});
    EXPECT_EQ(list_for("gyro").out, list_text(label + "gyro WQR_gyro ", "gyro", 0, 0));
}

TEST_F(hid_service_list, goes_on_with_the_look_ups_after_a_failure) {
    put_hid_interfaces({"accel", "gyro", "compass"});
    const std::string no_list = "Can't enumerate HID services";
    for (const auto& [call, how, list] :
         {std::tuple{1U, failure::io, no_list},
          std::tuple{3U, failure::not_found, label + "accel " + no_list}}) {
        host.fail_call(call, how);
        const outcome result = list_for("nobody");
        EXPECT_EQ(result.out, list_text(list, "nobody", 0, 0));
        EXPECT_EQ(result.err,
                  failure_line("nrxtoollib", "kr == 0", "nrxctl/inspection/hid_service_list.cpp"));
    }
}

TEST_F(hid_service_list, releases_each_service_once_its_name_is_known) {
    put_hid_interfaces({"accel", "gyro"});
    list_for("nobody");
    const auto& log = host.log();
    ASSERT_GE(log.size(), 5U);
    EXPECT_EQ(std::vector<std::string>(log.begin() + 1, log.begin() + 5),
              (std::vector<std::string>{"name of accel", "release accel", "name of gyro",
                                        "release gyro"}));
}

TEST_F(hid_service_list, cuts_a_long_name_behind_the_prefix_alone) {
    for (const std::size_t length : {123U, 124U, 200U}) {
        const std::string name(length, 'n');
        EXPECT_EQ(list_for(name).out, list_text(label, name, 0, 0));
    }
    put_service(host, "WQR_" + std::string(123, 'n'), 1);
    const std::string name(150, 'n');
    EXPECT_EQ(list_for(name).out, list_text(label, name, 1, 0));
}

}  // namespace tests
