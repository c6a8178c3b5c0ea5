#include "nrxctl/inspection/hid_service_list.h"

#include <regex>

#include "tests/inspection/sensor_host.h"

namespace tests {

class hid_service_list : public device_test {
protected:
    void put_hid_interface(const std::string& name) {
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

const std::string nothing_matches =
    "Matching WQR_nobody [0x*, 0]\n"
    "Matching nobody [0x*, 0]\n"
    "\n\n\n";
const std::string reported =
    failure_line("nrxtoollib", "kr == 0", "nrxctl/inspection/hid_service_list.cpp");

TEST_F(hid_service_list, follows_the_reason_if_there_is_no_such_service) {
    put_hid_interface("accel");
    put_service(host, "stranger", 3);
    put_hid_interface("gyro");
    const outcome result = inspect("nobody", 2);
    EXPECT_EQ(without_addresses(result.out),
              "sensor nobody doesn't provide sensor info (kr=e00002f0)\n\n"
              "Available HID services: accel gyro \n" +
                  nothing_matches);
    EXPECT_EQ(result.err, "");
    EXPECT_EQ(list_for("nobody").out, "Available HID services: accel gyro \n" + nothing_matches);
}

TEST_F(hid_service_list, is_empty_without_any_and_shows_what_each_look_up_finds) {
    EXPECT_EQ(list_for("nobody").out, "Available HID services: \n" + nothing_matches);
    const std::string label = "Available HID services: \n";
    put_service(host, "accel", 1);
    EXPECT_EQ(list_for("accel").out, label +
                                         "Matching WQR_accel [0x*, 0]\n"
                                         "Matching accel [0x*, 1]\n\n\n\n");
    put_service(host, "WQR_accel", 2);
    EXPECT_EQ(list_for("accel").out, label +
                                         "Matching WQR_accel [0x*, 2]\n"
                                         "Matching accel [0x*, 3]\n\n\n\n");
}

TEST_F(hid_service_list, goes_on_with_the_look_ups_after_a_failure) {
    put_hid_interface("accel");
    put_hid_interface("gyro");
    put_hid_interface("compass");
    host.fail_call(1, failure::io);
    const outcome unlisted = list_for("nobody");
    EXPECT_EQ(unlisted.out, "Can't enumerate HID services\n" + nothing_matches);
    EXPECT_EQ(unlisted.err, reported);
    host.fail_call(3, failure::not_found);
    const outcome unnamed = list_for("nobody");
    EXPECT_EQ(unnamed.out,
              "Available HID services: accel Can't enumerate HID services\n" + nothing_matches);
    EXPECT_EQ(unnamed.err, reported);
}

TEST_F(hid_service_list, releases_each_service_once_its_name_is_known) {
    put_hid_interface("accel");
    put_hid_interface("gyro");
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
        EXPECT_EQ(list_for(name).out,
                  "Available HID services: \n"
                  "Matching WQR_" +
                      std::string(123, 'n') + " [0x*, 0]\nMatching " + name + " [0x*, 0]\n\n\n\n");
    }
    put_service(host, "WQR_" + std::string(123, 'n'), 1);
    EXPECT_NE(list_for(std::string(150, 'n')).out.find(" [0x*, 1]\nMatching n"), std::string::npos);
}

}  // namespace tests
