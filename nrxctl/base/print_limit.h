// How many events or records a watch prints.
//
// Process-wide, for one thread.
#pragma once

#include <cstdint>
#include <optional>

namespace nrx {

// Limits what each watch prints from now on; nullopt: no limit. Set it before the watch starts.
void set_print_limit(std::optional<std::uint32_t> events);

// A watch, which counts what is printed while this object exists.
class limited_watch {
public:
    limited_watch();
    ~limited_watch();
    limited_watch(const limited_watch&) = delete;
    limited_watch& operator=(const limited_watch&) = delete;
};

// Counts an event or a record that is about to be printed. Returns false once the limit is reached;
// the event must then not be printed. The last one interrupts the process; with a handler
// installed, that ends the watch cleanly. Outside a watch always returns true.
bool may_print_event();

}  // namespace nrx
