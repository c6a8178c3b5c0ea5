#include "platform/virtual/return_codes.h"

#include <algorithm>
#include <array>

namespace platform {

namespace {

struct code_text {
    return_code code;
    std::string_view text;
};

constexpr std::array code_texts{
    code_text{success, "success"},
    code_text{no_memory, "out of memory"},
    code_text{bad_argument, "bad argument"},
    code_text{unsupported, "unsupported request"},
    code_text{not_found, "service not found"},
    code_text{simulated::io_failure, "device i/o failure"},
    code_text{simulated::buffer_too_small, "reply larger than the room for it"},
    code_text{simulated::queue_empty, "nothing in the queue"},
    code_text{simulated::not_ready, "not in a state for this"},
    code_text{simulated::deadlock, "nothing left to wait for"},
};

}  // namespace

std::string_view return_code_text(return_code code) {
    const auto* row = std::find_if(code_texts.begin(), code_texts.end(),
                                   [&](const code_text& known) { return known.code == code; });
    return row == code_texts.end() ? "unknown return code" : row->text;
}

}  // namespace platform
