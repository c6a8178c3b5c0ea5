// Where in the source a check stands.
#pragma once

namespace nrx {

// The built-ins stand in for std::source_location, which one of the supported compilers lacks.
struct source_place {
    const char* file;  // path from the root of the repository
    int line;

    // As a default argument: the place of the call.
    static constexpr source_place here(const char* file = __builtin_FILE(),
                                       int line = __builtin_LINE()) {
        return {file, line};
    }
};

}  // namespace nrx
