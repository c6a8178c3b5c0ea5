#include "nrxctl/base/hid_driver.h"

#include <cstdint>

#include "nrxctl/base/channel.h"
#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/matching.h"
#include "platform/connection.h"
#include "platform/registry.h"

namespace nrx {

namespace {

constexpr std::uint32_t client_type = 0x7a756d6f;  // "zumo"
constexpr std::uint32_t structure_selector = 0;

platform::dictionary match_hid_driver() {
    constexpr std::int32_t location = 1234;
    platform::dictionary matching = match_name("KeltoNRXHIDDriver");
    matching.set(platform::location_id_key, location);
    return matching;
}

}  // namespace

platform::return_code call_hid_driver(platform::byte_view input, platform::byte_span& output) {
    channel to;
    const auto opened = open_channel(platform::first_match(match_hid_driver()), client_type, to);
    if (opened != platform::success) return opened;
    platform::call_outputs outputs{{}, output};
    const auto kr = platform::call(to.connect, structure_selector, {{}, input}, outputs);
    if (kr == platform::success) output = outputs.structure;
    check_success(kr, "kr == 0 ");
    return kr;
}

}  // namespace nrx
