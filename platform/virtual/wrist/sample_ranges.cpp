// The lowest and highest samples that the motion sensors delivered.

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"
#include "platform/virtual/wrist/services.h"

namespace platform::simulated {

namespace {

struct range {
    double lowest;
    double highest;
};

consteval report_bytes<28> pack(std::int64_t samples, range x, range y, range z) {
    return make_report<28>({
        {0, 4, samples, "samples"},
        {4, 4, fixed_point(x.lowest), "lowest x"},
        {8, 4, fixed_point(x.highest), "highest x"},
        {12, 4, fixed_point(y.lowest), "lowest y"},
        {16, 4, fixed_point(y.highest), "highest y"},
        {20, 4, fixed_point(z.lowest), "lowest z"},
        {24, 4, fixed_point(z.highest), "highest z"},
    });
}

// Multiples of the earth's acceleration, degrees per second, microteslas.
constexpr auto accel = pack(2'048, {-0.34375, 0.40625}, {-0.5, 0.28125}, {-1.15625, -0.84375});
constexpr auto gyro = pack(2'048, {-42.5, 38.25}, {-61.75, 57.125}, {-18.0, 22.875});
constexpr auto compass = pack(205, {-24.5, -19.875}, {6.25, 11.5}, {-43.125, -38.75});

constexpr std::array reports{
    service_report{"accel", 0x53, accel},
    service_report{"gyro", 0x53, gyro},
    service_report{"compass", 0x53, compass},
};

}  // namespace

void add_sample_ranges(machine& device) {
    put_reports(device, reports);
}

}  // namespace platform::simulated
