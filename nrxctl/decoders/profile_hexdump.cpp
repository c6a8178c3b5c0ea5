#include "nrxctl/decoders/profile_hexdump.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <cstdlib>

#include "nrxctl/base/hex_digits.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/source_place.h"
#include "nrxctl/base/text_line.h"

namespace nrx {

namespace {

constexpr std::size_t line_room = 256;

// Stops the process in the way of the host's assertions, whatever the build.
[[noreturn]] void stop(std::string_view function, std::string_view expression,
                       source_place place = source_place::here()) {
    text_line report;
    report.text(place.file).text(":").number(place.line).text(": ").text(function);
    report.text(": Assertion `").text(expression).text("' failed.\n");
    write_error(report.view());
    std::abort();
}

}  // namespace

void nrx_profile_hexdump(std::string_view label, platform::byte_view bytes, int spaced) {
    if (label.size() + 3 * bytes.size() + 1 >= line_room) {
        stop(__func__, "(strlen(label) + 3*bufLen + 1) < sizeof(line)");
    }
    std::array<char, line_room> line;
    char* end = std::copy(label.begin(), label.end(), line.begin());
    for (const std::uint8_t byte : bytes) {
        *end++ = hex_digits[byte / 16];
        *end++ = hex_digits[byte % 16];
        if (spaced == 1) *end++ = ' ';
    }
    *end++ = '\n';
    write_output({line.data(), static_cast<std::size_t>(end - line.data())});
}

void dump_profile_record(const profile_record& record) {
    nrx_profile_hexdump("prof-event ", record.bytes, 0);
}

}  // namespace nrx
