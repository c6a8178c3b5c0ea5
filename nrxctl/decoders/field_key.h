// The key that begins every field of an event line.
#pragma once

#include "nrxctl/decoders/short_text.h"

namespace nrx {

// A key as it is written: a blank, the key in single quotes, a colon. It is spelled out when the
// tool is compiled; a key that is too long does not compile.
struct field_key {
    consteval field_key(const char* key) {
        text.append(" '").append(key).append("':");
        if (!text.view().ends_with("':")) throw "the key is too long";
    }

    short_text text;
};

}  // namespace nrx
