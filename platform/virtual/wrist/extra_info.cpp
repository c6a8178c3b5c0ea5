// What the firmware of the sensors tells in its own words: blocks of tagged items.

#include <cstddef>
#include <initializer_list>

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

struct info_item {
    std::uint8_t tag;
    std::size_t number_width = 0;  // in bytes
    std::int64_t number = 0;
    const char* text = nullptr;  // packed with its NUL
};

constexpr info_item number(std::int64_t value) {
    return {0, 4, value};
}
constexpr info_item long_number(std::int64_t value) {
    return {1, 8, value};
}
constexpr info_item text(const char* words) {
    return {2, 0, 0, words};
}
constexpr info_item line_break{3};
constexpr info_item in_hexadecimal{4};
constexpr info_item in_decimal{5};

byte_list pack(std::initializer_list<info_item> items) {
    byte_list block;
    for (const info_item& item : items) {
        block.push_back(item.tag);
        for (std::size_t i = 0; i < item.number_width; ++i)
            block.push_back(static_cast<std::uint8_t>(item.number >> (8 * i)));
        if (item.text == nullptr) continue;
        const std::string_view words(item.text);
        block.insert(block.end(), words.begin(), words.end());
        block.push_back(0);
    }
    return block;
}

}  // namespace

void add_extra_info(machine& device) {
    interface_driver& accel = interface_of(device, "accel");
    accel.set_report(0x39, pack({text("queue "), number(16), text(" of 256, overruns "), number(0),
                                 line_break, text("status 0x"), in_hexadecimal, number(0x2c04),
                                 in_decimal, text(", self test "), number(-3), text(" mg")}));
    accel.set_report(0x3a, pack({text("last sample "), long_number(86'412'305'118), text(" us")}));
    accel.set_report(0x3b, pack({text("lot 0x"), in_hexadecimal, long_number(0x4b1d'20f7'0316),
                                 text(" die "), number(0xa7), in_decimal}));
    accel.set_report(0x3c, pack({text("shocks since start "), number(2)}));
    interface_driver& gyro = interface_of(device, "gyro");
    gyro.set_report(0x39,
                    pack({text("queue "), number(16), text(" of 256, overruns "), number(1)}));
    gyro.set_report(0x3a,
                    pack({text("drive "), number(1'412), text(" mV"), line_break, text("bias "),
                          number(18), text(" "), number(-7), text(" "), number(-31)}));
    interface_driver& compass = interface_of(device, "compass");
    compass.set_report(0x39, pack({text("set/reset "), number(864), line_break, text("field "),
                                   number(48'730), text(" nT")}));
    interface_of(device, "pressure")
        .set_report(0x39, pack({text("oversampling "), number(8), text(", trim 0x"), in_hexadecimal,
                                number(0x6b43), text(" 0x"), number(0x67ed)}));
}

}  // namespace platform::simulated
