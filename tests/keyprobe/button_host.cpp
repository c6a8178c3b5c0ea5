#include "tests/keyprobe/button_host.h"

#include <memory>

namespace tests {

button_host put_button_services(machine& host) {
    button_host services{};
    services.button = &put_service(host, "WQR_wqr-button", 16);
    services.arc = &put_service(host, "arc", 17);
    services.btmspk = &put_service(host, "btmspk", 18);
    services.arc->set_report(0xd0, {'a'});
    services.btmspk->set_report(0xd0, {'b'});
    services.button->set_report(0xd0, {'c'});
    services.button->set_report(0xd1, {'d'});
    services.button->set_report(0xd7, {0, 0});
    services.button->set_report(0xd8, {0});
    auto unit = std::make_shared<platform::simulated::hid_unit>();
    for (std::uint8_t id = 0xe0; id <= 0xe4; ++id) {
        unit->set_feature_report(id, {id});
    }
    unit->set_feature_report(0xb4, {});
    const platform::dictionary usage{{"DeviceUsagePage", 0xFF00}, {"DeviceUsage", 0x20}};
    host.add({.name = "button-hid",
              .classes = {"KeltoNRXHIDDevice", "IOHIDDevice"},
              .properties = {{"DeviceUsagePairs", platform::array{usage}}},
              .hid = unit});
    services.hid = unit.get();
    return services;
}

std::string whole_text() {
    return stats_text() + diagnostics_text() + assets_text() + features_text();
}

std::string stats_text() {
    const auto click = [](const std::string& number) {
        return "--Click " + number +
               "--\n"
               "Latency   - Button Down to Play Asset                     : 0 us\n"
               "Timestamp - Button Down                                   : 0 us\n"
               "Timestamp - Button Down Play Asset                        : 0 us\n"
               "Latency   - Button Up to Play Asset                       : 0 us\n"
               "Timestamp - Button Up                                     : 0 us\n"
               "Timestamp - Button Up Play Asset                          : 0 us\n";
    };
    return "==========keyprobe get-stats==============\n"
           "kpdx_stats\n"
           "-- Last Button Press --\n"
           "Click Count                                               : 0\n"
           "Finger ON Timestamp                                       : 0 us\n"
           "Start Haptics Timestamp                                   : 0 us\n"
           "Latency - Finger Detect to Button Down                    : 0 us\n" +
           click("1") + click("2") +
           "Second scan delta from FD                                 : 0 us\n"
           "Num dorran Scans                                          : 0\n"
           "Num brevo Scans                                           : 0\n"
           "Finger OFF Timestamp                                      : 0 us\n"
           "\n\n\n";
}

std::string diagnostics_text() {
    return "==========keyprobe arc 0xd0==============\n"
           "00000000: 61                                                | a\n"
           "==========keyprobe btmspk 0xd0==============\n"
           "00000000: 62                                                | b\n"
           "==========keyprobe wqr-button 0xd0==============\n"
           "00000000: 63                                                | c\n"
           "==========keyprobe wqr-button 0xd1==============\n"
           "00000000: 64                                                | d\n";
}

std::string assets_text() {
    std::string text =
        "==========keyprobe wqr-button get-assets==============\n"
        "Length: 1, expected 1479\n";
    for (const std::string speed : {"Slow", "Medium", "Fast"}) {
        for (const std::string name :
             {"SingleDown", "SingleUp", "DoubleDown", "DoubleUp", "TripleDown", "TripleUp",
              "SingleTapOn", "SingleTapOff", "DoubleTapOn", "DoubleTapOff", "TripleTapOn",
              "TripleTapOff", "DeepDown", "DeepUp", "LongPress", "LongPressUp", ""}) {
            text += "ASSET [" + speed + "][" + name + "]: enable 0, slot 0, gain 0, min 0, max 0\n";
        }
    }
    return text;
}

std::string features_text() {
    return "==============hidreport get 0xe0 -u 0xFF00,0x0020===============\n"
           "00000000: e0                                                | .\n"
           "==============hidreport get 0xb4 -u 0xFF00,0x0020===============\n"
           "==============hidreport get 0xe1 -u 0xFF00,0x0020===============\n"
           "00000000: e1                                                | .\n"
           "==============hidreport get 0xe2 -u 0xFF00,0x0020===============\n"
           "00000000: e2                                                | .\n"
           "==============hidreport get 0xe3 -u 0xFF00,0x0020===============\n"
           "00000000: e3                                                | .\n"
           "==============hidreport get 0xe4 -u 0xFF00,0x0020===============\n"
           "00000000: e4                                                | .\n";
}

}  // namespace tests
