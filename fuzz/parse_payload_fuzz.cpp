// A payload that parse_payload accepts must be fully described by its values. The input is a byte
// for the first position, then arguments, one per list.
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "fuzz/support/argument_list.h"
#include "fuzz/support/harness.h"
#include "nrxctl/base/end_process.h"
#include "nrxctl/base/payload.h"

namespace {

std::size_t width_for(std::string_view argument) {
    if (argument == "u16") return 2;
    return argument == "u32" ? 4 : 1;
}

// The payload as arguments: the width, then each value in decimal.
fuzz::argument_list format(const std::vector<std::uint8_t>& payload, std::size_t width) {
    std::vector<std::string> arguments{"u" + std::to_string(8 * width)};
    for (std::size_t offset = 0; offset < payload.size(); offset += width) {
        std::uint32_t value = 0;
        for (std::size_t i = width; i-- > 0;) {
            value = value << 8 | payload[offset + i];
        }
        arguments.push_back("0d" + std::to_string(value));
    }
    return fuzz::argument_list(std::move(arguments));
}

void check_payload(const fuzz::argument_list& list, int first, int position,
                   const std::vector<std::uint8_t>& payload) {
    if (first >= list.count()) {
        fuzz::require(position == first && payload.empty());
        return;
    }
    const auto first_argument = list.argument(first);
    const auto width = width_for(first_argument);
    const bool has_width = width > 1 || first_argument == "u8";
    const auto values = position - first - (has_width ? 1 : 0);
    fuzz::require(values >= 0 && position <= list.count());
    fuzz::require(position == list.count() || list.argument(position).starts_with('-'));
    fuzz::require(payload.size() == static_cast<std::size_t>(values) * width);

    const auto formatted = format(payload, width);
    std::vector<std::uint8_t> reparsed;
    int end = 0;
    fuzz::require(
        nrx::run_to_completion([&] { nrx::parse_payload(formatted.arguments(), end, reparsed); }));
    fuzz::require(end == formatted.count() && reparsed == payload);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) return 0;
    const fuzz::argument_list list = fuzz::split_arguments(fuzz::as_text(data + 1, size - 1));
    const int first = data[0] % 4;
    int position = first;
    std::vector<std::uint8_t> payload{0xee};  // earlier content must go
    if (nrx::run_to_completion([&] { nrx::parse_payload(list.arguments(), position, payload); })) {
        check_payload(list, first, position, payload);
    }
    return 0;
}
