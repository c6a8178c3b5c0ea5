// A sensor sample that the coprocessor plays back in place of a live one.
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

#include "nrxctl/replay/event_memory.h"
#include "nrxctl/replay/sample_values.h"

namespace nrx {

// Holds the sample's record, little-endian, as it is uploaded, and beside it the time stamp in
// microseconds. Every record begins with its own size in bytes, the delta in microseconds to the
// record before it, the sample id, and the temperature in degrees with 16 fraction bits, 32 bits
// each; the sample's signed 32-bit values follow.
class VirtualEvent {
public:
    VirtualEvent() = default;
    VirtualEvent(const VirtualEvent&) = delete;
    VirtualEvent& operator=(const VirtualEvent&) = delete;
    VirtualEvent(VirtualEvent&&) = delete;
    VirtualEvent& operator=(VirtualEvent&&) = delete;
    virtual ~VirtualEvent() = default;

    static void* operator new(std::size_t size) { return event_memory::take(size); }
    static void operator delete(void* event) noexcept { event_memory::give_back(event); }

    // Fills the event from the values of a sample line. Always true: a value that is missing or no
    // number ends the process with status 1, after a message with the value on standard output.
    virtual bool parse(const sample_values& values) = 0;

    // The record's size in bytes, and its first byte. The record is the event's.
    [[nodiscard]] virtual std::uint32_t size() const = 0;
    [[nodiscard]] virtual const std::uint8_t* data() const = 0;

    // The tag of the event's lines, which is the name of its service.
    [[nodiscard]] virtual std::string name() const = 0;

    // Microseconds: a signed 32-bit number, widened with its sign.
    [[nodiscard]] virtual std::uint64_t timestamp() const = 0;

    // Stores the delta in the record; it is 0 at first.
    virtual void set_delta(std::uint32_t delta) = 0;

    // Begins a generated signal. False if events of this class, or signals of this type, are not
    // generated.
    virtual bool init_generator(std::string_view signal_type) = 0;

    // The next sample line, without a line feed, of a signal with so many samples, one every
    // interval microseconds; empty if events of this class are not generated.
    virtual std::string generate(std::string_view signal_type, std::uint32_t interval,
                                 std::uint32_t samples) = 0;
};

// Events are owned by whoever made them.
using event_ptr = std::unique_ptr<VirtualEvent>;

}  // namespace nrx
