// The SPI status records of the HID devices: what goes over the bus to a sensor, what comes back,
// and how the transfers went.

#include <algorithm>
#include <array>
#include <chrono>
#include <memory>

#include "platform/registry.h"
#include "platform/virtual/little_endian.h"
#include "platform/virtual/wrist/parts.h"

namespace platform::simulated {

namespace {

constexpr std::chrono::milliseconds interval{50};
constexpr std::size_t header_size = 9;

constexpr std::array<std::uint8_t, 8> sent{0x80, 0x3b, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00};
constexpr std::array<std::uint8_t, 20> received{0x00, 0x00, 0xfe, 0xc4, 0x01, 0x1c, 0x3f,
                                                0xd8, 0x0b, 0x52, 0x00, 0x13, 0xff, 0xe6,
                                                0x00, 0x07, 0x5a, 0x00, 0x00, 0x91};
constexpr std::array<std::uint8_t, 12> variance{0x1a, 0x03, 0x00, 0x00, 0xc4, 0x02,
                                                0x00, 0x00, 0x59, 0x04, 0x00, 0x00};
constexpr std::array<std::uint8_t, 8> good{0x00, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00};
constexpr std::array<std::uint8_t, 8> bad_checksum{0x01, 0x70, 0x00, 0x00, 0x3c, 0x00, 0x00, 0x00};
constexpr std::array<std::uint8_t, 8> dropped{0x05, 0x70, 0x00, 0x00, 0x02, 0x00, 0x00, 0x00};

struct record_row {
    std::uint8_t type;
    byte_view bytes;
};

// They come in turn.
constexpr std::array record_rows{
    record_row{0, sent},     record_row{1, received},     record_row{3, variance},
    record_row{2, good},     record_row{0, sent},         record_row{1, received},
    record_row{2, dropped},  record_row{0, sent},         record_row{1, received},
    record_row{3, variance}, record_row{2, bad_checksum},
};

class spi_records final : public record_unit {
public:
    // The clock outlives the records.
    spi_records(const machine_clock& clock, std::int64_t service_id)
        : clock_(clock), service_id_(service_id) {}

    return_code set_mode(std::int32_t service_id, std::uint32_t mode) override {
        if (service_id != service_id_) return bad_argument;
        is_on_ = mode != 0;
        next_ = clock_.now() + interval;
        row_ = 0;
        return success;
    }

    [[nodiscard]] std::optional<machine_clock::time> next_due() const override {
        return is_on_ ? std::optional(next_) : std::nullopt;
    }

    std::vector<std::uint8_t> take_record() override {
        const record_row& row = record_rows[row_];
        const auto time = std::chrono::duration_cast<std::chrono::microseconds>(next_);
        std::vector<std::uint8_t> record(header_size + row.bytes.size());
        put_le(record, 0, sizeof(std::uint64_t), static_cast<std::uint64_t>(time.count()));
        record[header_size - 1] = row.type;
        std::copy(row.bytes.begin(), row.bytes.end(), record.begin() + header_size);
        row_ = (row_ + 1) % record_rows.size();
        next_ += interval;
        return record;
    }

private:
    const machine_clock& clock_;
    const std::int64_t service_id_;
    bool is_on_ = false;
    machine_clock::time next_{0};
    std::size_t row_ = 0;
};

}  // namespace

void add_spi_records(machine& device) {
    for (const entry_ref& one : device.entries_of_class("KeltoNRXHIDDevice")) {
        const property* location = one->properties.find(location_id_key);
        one->records = std::make_shared<spi_records>(device.clock(), *location->number());
    }
}

}  // namespace platform::simulated
