// Names of the codes that the haptic asset report uses.
#pragma once

#include <array>
#include <cstdint>
#include <span>
#include <string_view>

namespace nrx {

// Names by code; the first is the name of code 0.
using code_names = std::span<const std::string_view>;

// The name of a code; the empty text for a code that has none.
std::string_view name_of(code_names names, std::int32_t code);

inline constexpr std::array<std::string_view, 3> speed_names{"Slow", "Medium", "Fast"};

inline constexpr std::array<std::string_view, 16> button_event_names{
    "SingleDown",  "SingleUp",     "DoubleDown",  "DoubleUp",     "TripleDown",  "TripleUp",
    "SingleTapOn", "SingleTapOff", "DoubleTapOn", "DoubleTapOff", "TripleTapOn", "TripleTapOff",
    "DeepDown",    "DeepUp",       "LongPress",   "LongPressUp",
};

}  // namespace nrx
