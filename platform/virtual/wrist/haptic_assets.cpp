// The vibration patterns that the button plays.

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

struct asset_row {
    std::string_view speed;  // speed and event are for the reader: the order of the rows counts
    std::string_view event;
    bool enabled;
    double gain;
    std::int64_t min;  // shortest and longest press that the asset is for, microseconds
    std::int64_t max;
    std::int64_t slot;  // in the actuator's memory; -1: none
};

// Three speeds with 17 events each.
constexpr std::array assets{
    asset_row{"Slow", "SingleDown", true, 1, 250'000, 2'000'000, 0},
    asset_row{"Slow", "SingleUp", true, 0.9375, 250'000, 2'000'000, 1},
    asset_row{"Slow", "DoubleDown", true, 1, 250'000, 2'000'000, 2},
    asset_row{"Slow", "DoubleUp", true, 0.9375, 250'000, 2'000'000, 3},
    asset_row{"Slow", "TripleDown", true, 1, 250'000, 2'000'000, 4},
    asset_row{"Slow", "TripleUp", true, 0.9375, 250'000, 2'000'000, 5},
    asset_row{"Slow", "SingleTapOn", false, 0, 0, 0, -1},
    asset_row{"Slow", "SingleTapOff", false, 0, 0, 0, -1},
    asset_row{"Slow", "DoubleTapOn", false, 0, 0, 0, -1},
    asset_row{"Slow", "DoubleTapOff", false, 0, 0, 0, -1},
    asset_row{"Slow", "TripleTapOn", false, 0, 0, 0, -1},
    asset_row{"Slow", "TripleTapOff", false, 0, 0, 0, -1},
    asset_row{"Slow", "DeepDown", true, 1.125, 250'000, 2'000'000, 6},
    asset_row{"Slow", "DeepUp", true, 1.0625, 250'000, 2'000'000, 7},
    asset_row{"Slow", "LongPress", true, 1.25, 2'000'000, 10'000'000, 8},
    asset_row{"Slow", "LongPressUp", true, 0.875, 2'000'000, 10'000'000, 9},
    asset_row{"Slow", "Spare", false, 0, 0, 0, -1},
    asset_row{"Medium", "SingleDown", true, 1.0625, 110'000, 249'999, 10},
    asset_row{"Medium", "SingleUp", true, 1, 110'000, 249'999, 11},
    asset_row{"Medium", "DoubleDown", true, 1.0625, 110'000, 249'999, 12},
    asset_row{"Medium", "DoubleUp", true, 1, 110'000, 249'999, 13},
    asset_row{"Medium", "TripleDown", true, 1.0625, 110'000, 249'999, 14},
    asset_row{"Medium", "TripleUp", true, 1, 110'000, 249'999, 15},
    asset_row{"Medium", "SingleTapOn", false, 0, 0, 0, -1},
    asset_row{"Medium", "SingleTapOff", false, 0, 0, 0, -1},
    asset_row{"Medium", "DoubleTapOn", false, 0, 0, 0, -1},
    asset_row{"Medium", "DoubleTapOff", false, 0, 0, 0, -1},
    asset_row{"Medium", "TripleTapOn", false, 0, 0, 0, -1},
    asset_row{"Medium", "TripleTapOff", false, 0, 0, 0, -1},
    asset_row{"Medium", "DeepDown", true, 1.1875, 110'000, 249'999, 16},
    asset_row{"Medium", "DeepUp", true, 1.125, 110'000, 249'999, 17},
    asset_row{"Medium", "LongPress", true, 1.25, 2'000'000, 10'000'000, 18},
    asset_row{"Medium", "LongPressUp", true, 0.875, 2'000'000, 10'000'000, 19},
    asset_row{"Medium", "Spare", false, 0, 0, 0, -1},
    asset_row{"Fast", "SingleDown", true, 1.125, 0, 109'999, 20},
    asset_row{"Fast", "SingleUp", true, 1.0625, 0, 109'999, 21},
    asset_row{"Fast", "DoubleDown", true, 1.125, 0, 109'999, 22},
    asset_row{"Fast", "DoubleUp", true, 1.0625, 0, 109'999, 23},
    asset_row{"Fast", "TripleDown", true, 1.1875, 0, 109'999, 24},
    asset_row{"Fast", "TripleUp", true, 1.125, 0, 109'999, 25},
    asset_row{"Fast", "SingleTapOn", false, 0, 0, 0, -1},
    asset_row{"Fast", "SingleTapOff", false, 0, 0, 0, -1},
    asset_row{"Fast", "DoubleTapOn", false, 0, 0, 0, -1},
    asset_row{"Fast", "DoubleTapOff", false, 0, 0, 0, -1},
    asset_row{"Fast", "TripleTapOn", false, 0, 0, 0, -1},
    asset_row{"Fast", "TripleTapOff", false, 0, 0, 0, -1},
    asset_row{"Fast", "DeepDown", true, 1.25, 0, 109'999, 26},
    asset_row{"Fast", "DeepUp", true, 1.1875, 0, 109'999, 27},
    asset_row{"Fast", "LongPress", false, 0, 0, 0, -1},
    asset_row{"Fast", "LongPressUp", false, 0, 0, 0, -1},
    asset_row{"Fast", "Spare", false, 0, 0, 0, -1},
};
static_assert(assets.size() == 3 * 17);

constexpr std::size_t asset_size = 29;

consteval report_bytes<assets.size() * asset_size> pack_assets() {
    report_bytes<assets.size() * asset_size> bytes{};
    std::size_t offset = 0;
    for (const asset_row& row : assets) {
        put_number(bytes, offset, 1, row.enabled ? 1 : 0);
        put_number(bytes, offset + 1, 4, fixed_point(row.gain));
        put_number(bytes, offset + 5, 8, row.min);
        put_number(bytes, offset + 13, 8, row.max);
        put_number(bytes, offset + 21, 4, row.slot);
        offset += asset_size;
    }
    return bytes;
}

constexpr auto asset_table = pack_assets();

constexpr std::array reports{service_report{"WQR_wqr-button", 0xd8, asset_table}};

}  // namespace

void add_haptic_assets(machine& device) {
    put_reports(device, reports);
}

}  // namespace platform::simulated
