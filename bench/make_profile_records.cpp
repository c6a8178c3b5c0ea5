// make_profile_records COUNT [random]: writes event records to standard output, like those of a
// busy device or random bytes. The same arguments always produce the same bytes.
#include <array>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <random>
#include <string_view>

#include "nrxctl/base/profile_record.h"

namespace {

using nrx::profile_record;

// A kind of record and its frequency, relative to the sum of all weights.
struct record_kind {
    unsigned weight;
    std::uint8_t category;
    std::uint8_t components;  // number of components in use
    std::uint8_t events;      // number of events in use
    std::uint8_t type;
};
constexpr std::array kinds{
    record_kind{30, 0, 1, 3, 3},   // scheduler events
    record_kind{15, 0, 2, 1, 5},   // functions
    record_kind{6, 0, 4, 8, 2},    // commands
    record_kind{4, 0, 5, 1, 9},    // external functions
    record_kind{12, 1, 4, 4, 3},   // traces
    record_kind{4, 1, 4, 4, 11},   // annotations
    record_kind{14, 2, 7, 8, 1},   // sensor data
    record_kind{2, 2, 7, 11, 8},   // sensor information
    record_kind{1, 2, 7, 11, 12},  // decimation
    record_kind{2, 3, 1, 2, 3},    // orrin
    record_kind{6, 4, 1, 2, 3},    // talvor samples
    record_kind{4, 5, 1, 1, 4},    // triggers
    record_kind{3, 6, 3, 8, 1},    // uart packets
    record_kind{1, 8, 2, 2, 3},    // control
    record_kind{8, 9, 6, 32, 3},   // bus transfers
    record_kind{2, 10, 1, 3, 3},   // wake-ups
    record_kind{1, 10, 1, 2, 13},  // wake requests
};
constexpr std::array<std::string_view, 4> texts{"accel", "als_filter", "gyro_decimate", "imu"};

void set_field(profile_record& record, std::size_t offset, std::uint64_t value, std::size_t width) {
    for (std::size_t i = 0; i < width; ++i)
        record.bytes[offset + i] = static_cast<std::uint8_t>(value >> (8 * i));
}

class record_generator {
public:
    profile_record random_record() {
        profile_record record;
        for (std::size_t offset = 0; offset < record.bytes.size(); offset += 8)
            set_field(record, offset, random_(), 8);
        return record;
    }

    profile_record realistic_record() {
        const record_kind& kind = pick_kind();
        profile_record record{};
        timestamp_ += random_below(400);
        set_field(record, 0, kind.type, 1);
        set_field(record, 1, random_below(kind.events), 1);
        set_field(record, 2, random_below(kind.components), 1);
        set_field(record, 3, kind.category, 1);
        set_field(record, 4, ++sequence_, 4);
        set_field(record, 8, timestamp_, 8);
        set_body(record, kind.type);
        return record;
    }

private:
    std::uint64_t random_below(std::uint64_t limit) { return random_() % limit; }

    // Small numbers are more common than large ones.
    std::uint64_t skewed_number() { return (random_() & 0xffffffff) >> random_below(32); }

    const record_kind& pick_kind() {
        unsigned sum = 0;
        for (const record_kind& kind : kinds)
            sum += kind.weight;
        std::uint64_t remaining = random_below(sum);
        const auto* kind = kinds.data();
        for (; remaining >= kind->weight; ++kind)
            remaining -= kind->weight;
        return *kind;
    }

    void set_text(profile_record& record, std::size_t offset, std::size_t capacity) {
        const std::string_view text = texts[random_below(texts.size())].substr(0, capacity);
        for (std::size_t i = 0; i < capacity; ++i)
            record.bytes[offset + i] = i < text.size() ? static_cast<std::uint8_t>(text[i]) : 0;
    }

    void set_random_bytes(profile_record& record, std::size_t offset, std::size_t count) {
        for (std::size_t i = 0; i < count; ++i)
            set_field(record, offset + i, random_(), 1);
    }

    void set_body(profile_record& record, std::uint8_t type) {
        for (std::size_t offset = 16; offset < 40; offset += 4)
            set_field(record, offset, skewed_number(), 4);
        switch (type) {
            case 1: {  // long data
                const std::uint64_t length = 4 + random_below(21);
                set_field(record, 16, random_below(8), 2);
                set_field(record, 18, 24 + random_below(200), 2);
                set_field(record, 20, length, 2);
                set_field(record, 22, random_below(100), 2);
                set_random_bytes(record, 24, length);
                break;
            }
            case 2:  // short data
                set_field(record, 16, random_below(8), 2);
                set_random_bytes(record, 18, 30);
                break;
            case 8:  // sensor info
                set_field(record, 32, 0x000201, 3);
                set_text(record, 35, 12);
                break;
            case 9:  // external function
                set_text(record, 32, 16);
                break;
            case 11:  // annotation
                set_text(record, 24, 8);
                break;
            case 12:  // decimation
                set_text(record, 36, 12);
                break;
            default:
                break;
        }
    }

    std::mt19937_64 random_{48};
    std::uint64_t timestamp_ = 5000000;
    std::uint32_t sequence_ = 0;
};

}  // namespace

int main(int argc, char** argv) {
    if (argc < 2) return EXIT_FAILURE;
    const auto count = std::strtoull(argv[1], nullptr, 10);
    const bool random = argc > 2 && std::string_view(argv[2]) == "random";
    record_generator generator;
    for (std::uint64_t i = 0; i < count; ++i) {
        const profile_record record =
            random ? generator.random_record() : generator.realistic_record();
        std::fwrite(record.bytes.data(), record.bytes.size(), 1, stdout);
    }
    return std::fflush(stdout) == 0 ? EXIT_SUCCESS : EXIT_FAILURE;
}
