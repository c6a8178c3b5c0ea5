// What sensors report about themselves: parts, rates, modes, calibration, ranges.

#include <array>
#include <cstddef>

#include "platform/virtual/wrist/parts.h"
#include "platform/virtual/wrist/report_table.h"

namespace platform::simulated {

namespace {

enum class sensor_mode { normal, raw, factory };
enum class calibration_source { uncalibrated, built_in, system };

// Batch intervals at each stage in microseconds, and the number of samples that are waiting.
struct batching {
    std::int64_t sensor;
    std::int64_t mux;
    std::int64_t processor;
    std::int64_t report;
    std::int64_t waiting;
};

struct sensor_row {
    std::string_view service;
    std::string_view vendor;  // vendor and model: at most 31 characters
    std::string_view model;
    char place;  // on the board; 0: irrelevant
    std::int64_t alternate;
    std::int64_t interval;       // between samples, microseconds
    std::int64_t part_interval;  // of the part itself; samples in between are dropped
    std::int64_t tick_interval;  // between system ticks; -1: none
    bool filter;
    bool fixed_rate;
    batching batched;
    sensor_mode mode;
    calibration_source calibrated;
    std::int64_t startup;                   // milliseconds
    std::int64_t internal_at_100hz;         // the part's own calibration
    std::array<std::int64_t, 6> intervals;  // supported; 0 is none
};

constexpr std::array sensors{
    sensor_row{.service = "accel",
               .vendor = "Varnis",
               .model = "VA316",
               .place = 'M',
               .alternate = 0,
               .interval = 10'000,
               .part_interval = 2'500,
               .tick_interval = 10'000,
               .filter = true,
               .fixed_rate = true,
               .batched = {10'000, 20'000, 160'000, 160'000, 16},
               .mode = sensor_mode::normal,
               .calibrated = calibration_source::system,
               .startup = 12,
               .internal_at_100hz = 1'004,
               .intervals = {40'000, 20'000, 10'000, 5'000, 2'500}},
    sensor_row{.service = "gyro",
               .vendor = "Varnis",
               .model = "VG520",
               .place = 'M',
               .alternate = 1,
               .interval = 10'000,
               .part_interval = 5'000,
               .tick_interval = -1,
               .filter = true,
               .fixed_rate = false,
               .batched = {10'000, 20'000, 160'000, 160'000, 16},
               .mode = sensor_mode::normal,
               .calibrated = calibration_source::system,
               .startup = 80,
               .internal_at_100hz = 997,
               .intervals = {40'000, 20'000, 10'000, 5'000}},
    sensor_row{.service = "compass",
               .vendor = "Ostrel",
               .model = "OM12-B",
               .place = 'T',
               .alternate = 0,
               .interval = 100'000,
               .part_interval = 100'000,
               .tick_interval = -1,
               .filter = false,
               .fixed_rate = false,
               .batched = {100'000, 100'000, 1'000'000, 1'000'000, 10},
               .mode = sensor_mode::raw,
               .calibrated = calibration_source::built_in,
               .startup = 9,
               .internal_at_100hz = 0,
               .intervals = {1'000'000, 100'000, 50'000, 20'000, 10'000}},
    sensor_row{.service = "pressure",
               .vendor = "Tharn",
               .model = "TP88",
               .place = 'B',
               .alternate = 2,
               .interval = 1'000'000,
               .part_interval = 250'000,
               .tick_interval = -1,
               .filter = true,
               .fixed_rate = false,
               .batched = {1'000'000, 1'000'000, 4'000'000, 4'000'000, 4},
               .mode = sensor_mode::normal,
               .calibrated = calibration_source::system,
               .startup = 25,
               .internal_at_100hz = 0,
               .intervals = {1'000'000, 250'000, 40'000}},
    sensor_row{.service = "als",
               .vendor = "Lumet",
               .model = "LX21",
               .place = 'D',
               .alternate = 0,
               .interval = 250'000,
               .part_interval = 250'000,
               .tick_interval = -1,
               .filter = false,
               .fixed_rate = true,
               .batched = {250'000, 250'000, 250'000, 250'000, 1},
               .mode = sensor_mode::factory,
               .calibrated = calibration_source::built_in,
               .startup = 110,
               .internal_at_100hz = 0,
               .intervals = {1'000'000, 250'000}},
    sensor_row{.service = "temperature",
               .vendor = "Tharn",
               .model = "TT12",
               .place = 0,
               .alternate = 0,
               .interval = 5'000'000,
               .part_interval = 5'000'000,
               .tick_interval = -1,
               .filter = false,
               .fixed_rate = false,
               .batched = {5'000'000, 5'000'000, 5'000'000, 5'000'000, 1},
               .mode = sensor_mode::normal,
               .calibrated = calibration_source::uncalibrated,
               .startup = 2,
               .internal_at_100hz = 0,
               .intervals = {5'000'000, 1'000'000}},
};

using word_report = report_bytes<4>;
using text_report = report_bytes<32>;

constexpr word_report u32_report(std::int64_t value) {
    word_report bytes{};
    store_number(bytes, 0, 4, value);
    return bytes;
}

constexpr text_report text(std::string_view text) {
    text_report bytes{};
    store_text(bytes, 0, bytes.size(), text);
    return bytes;
}

constexpr report_bytes<5> location(char place, std::int64_t alternate) {
    report_bytes<5> bytes{};
    store_number(bytes, 0, 1, place);
    store_number(bytes, 1, 4, alternate);
    return bytes;
}

constexpr report_bytes<20> pack(const batching& batched) {
    report_bytes<20> bytes{};
    store_number(bytes, 0, 4, batched.sensor);
    store_number(bytes, 4, 4, batched.mux);
    store_number(bytes, 8, 4, batched.processor);
    store_number(bytes, 12, 4, batched.report);
    store_number(bytes, 16, 4, batched.waiting);
    return bytes;
}

// The reports of one sensor.
struct packed_sensor {
    word_report interval;
    word_report part_interval;
    word_report tick_interval;
    word_report filter;
    word_report fixed_rate;
    word_report decimation;
    report_bytes<20> batched;
    word_report raw_mode;
    word_report factory_mode;
    text_report vendor;
    text_report model;
    report_bytes<24> intervals;
    std::size_t intervals_length;
    word_report startup;
    word_report internal_at_100hz;
    word_report calibrated;
    report_bytes<5> location;
};

consteval packed_sensor pack(const sensor_row& row) {
    packed_sensor packed{
        .interval = u32_report(row.interval),
        .part_interval = u32_report(row.part_interval),
        .tick_interval = u32_report(row.tick_interval),
        .filter = u32_report(row.filter ? 1 : 0),
        .fixed_rate = u32_report(row.fixed_rate ? 1 : 0),
        .decimation = u32_report(row.part_interval < row.interval ? 1 : 0),
        .batched = pack(row.batched),
        .raw_mode = u32_report(row.mode == sensor_mode::raw ? 1 : 0),
        .factory_mode = u32_report(row.mode == sensor_mode::factory ? 1 : 0),
        .vendor = text(row.vendor),
        .model = text(row.model),
        .intervals = {},
        .intervals_length = 0,
        .startup = u32_report(row.startup),
        .internal_at_100hz = u32_report(row.internal_at_100hz),
        .calibrated = u32_report(static_cast<std::int64_t>(row.calibrated)),
        .location = location(row.place, row.alternate),
    };
    for (const std::int64_t interval : row.intervals) {
        if (interval == 0) continue;
        store_number(packed.intervals, packed.intervals_length, 4, interval);
        packed.intervals_length += 4;
    }
    return packed;
}

consteval std::array<packed_sensor, sensors.size()> pack_all() {
    std::array<packed_sensor, sensors.size()> packed{};
    for (std::size_t i = 0; i < packed.size(); ++i)
        packed[i] = pack(sensors[i]);
    return packed;
}

constexpr auto packed_sensors = pack_all();

void add_sensor_reports(const machine& device, std::string_view service,
                        const packed_sensor& sensor) {
    const std::array reports{
        service_report{service, 0x00, sensor.interval},
        service_report{service, 0x33, sensor.part_interval},
        service_report{service, 0x40, sensor.tick_interval},
        service_report{service, 0x22, sensor.filter},
        service_report{service, 0x23, sensor.fixed_rate},
        service_report{service, 0x24, sensor.decimation},
        service_report{service, 0x43, sensor.batched},
        service_report{service, 0x0a, sensor.raw_mode},
        service_report{service, 0x0d, sensor.factory_mode},
        service_report{service, 0x0f, sensor.vendor},
        service_report{service, 0x10, sensor.model},
        service_report{service, 0x3f, byte_view(sensor.intervals).first(sensor.intervals_length)},
        service_report{service, 0x2d, sensor.startup},
        service_report{service, 0x19, sensor.internal_at_100hz},
        service_report{service, 0x3d, sensor.calibrated},
        service_report{service, 0x44, sensor.location},
    };
    add_reports(device, reports);
}

// --- motion sensors ---

using row_of_three = std::array<double, 3>;

consteval report_bytes<36> matrix(row_of_three x, row_of_three y, row_of_three z) {
    report_bytes<36> bytes{};
    std::size_t offset = 0;
    for (const row_of_three& row : {x, y, z}) {
        for (const double value : row) {
            store_number(bytes, offset, 4, q16_16(value));
            offset += 4;
        }
    }
    return bytes;
}

constexpr auto accel_matrix = matrix({1.0078125, -0.001953125, 0.00390625},  //
                                     {0.001953125, 0.99609375, 0},           //
                                     {-0.00390625, 0, 1.001953125});
constexpr auto gyro_matrix = matrix({0.998046875, 0, 0.0009765625},  //
                                    {0, 1.00390625, -0.001953125},   //
                                    {0, 0.001953125, 1});
constexpr auto compass_matrix = matrix({1.03125, 0.015625, -0.0078125},   //
                                       {0.015625, 0.9765625, 0.0234375},  //
                                       {-0.0078125, 0.0234375, 0.9921875});
constexpr auto compass_sensitivity = matrix({0.9921875, 0, 0},   //
                                            {0, 1.00390625, 0},  //
                                            {0, 0, 1.0234375});

consteval report_bytes<12> numbers(std::int64_t x, std::int64_t y, std::int64_t z) {
    return make_report<12>({{0, 4, x, "x"}, {4, 4, y, "y"}, {8, 4, z, "z"}});
}

constexpr auto accel_offset = numbers(-214, 97, 1'310);
constexpr auto gyro_offset = numbers(18, -7, -31);
constexpr auto compass_offset = numbers(-4'120, 2'986, 655);
constexpr auto compass_compensation = numbers(q16_16(-1.25), q16_16(0.5), q16_16(2.125));

consteval report_bytes<9> axes(std::array<std::int64_t, 9> signs) {
    report_bytes<9> bytes{};
    for (std::size_t i = 0; i < signs.size(); ++i)
        store_number(bytes, i, 1, signs[i]);
    return bytes;
}

// Accelerometer and gyroscope are one part. The magnetometer is mounted upside down.
constexpr auto inertial_axes = axes({0, -1, 0, 1, 0, 0, 0, 0, 1});
constexpr auto compass_axes = axes({1, 0, 0, 0, -1, 0, 0, 0, -1});

template <std::size_t Count>
consteval report_bytes<4 * Count> list(const std::int64_t (&values)[Count]) {
    report_bytes<4 * Count> bytes{};
    for (std::size_t i = 0; i < Count; ++i)
        store_number(bytes, 4 * i, 4, values[i]);
    return bytes;
}

// Ranges in g and degrees per second; bandwidths in Hz, 0 means automatic.
constexpr auto accel_range = u32_report(8);
constexpr auto accel_ranges = list({2, 4, 8, 16, 32});
constexpr auto accel_bandwidth = u32_report(50);
constexpr auto accel_bandwidths = list({0, 25, 50, 100, 200});
constexpr auto gyro_range = u32_report(2'000);
constexpr auto gyro_ranges = list({250, 500, 1'000, 2'000});

constexpr std::array motion_reports{
    service_report{"accel", 0x0b, accel_matrix},
    service_report{"accel", 0x1a, accel_offset},
    service_report{"accel", 0x18, inertial_axes},
    service_report{"accel", 0x06, accel_range},
    service_report{"accel", 0x36, accel_ranges},
    service_report{"accel", 0x04, accel_bandwidth},
    service_report{"accel", 0x37, accel_bandwidths},
    service_report{"gyro", 0x0b, gyro_matrix},
    service_report{"gyro", 0x1a, gyro_offset},
    service_report{"gyro", 0x18, inertial_axes},
    service_report{"gyro", 0x06, gyro_range},
    service_report{"gyro", 0x36, gyro_ranges},
    service_report{"compass", 0x0b, compass_matrix},
    service_report{"compass", 0x1a, compass_offset},
    service_report{"compass", 0x18, compass_axes},
    service_report{"compass", 0x1d, compass_sensitivity},
    service_report{"compass", 0xd6, compass_compensation},
};

}  // namespace

void add_sensors(machine& device) {
    for (std::size_t i = 0; i < sensors.size(); ++i)
        add_sensor_reports(device, sensors[i].service, packed_sensors[i]);
    add_reports(device, motion_reports);
}

}  // namespace platform::simulated
