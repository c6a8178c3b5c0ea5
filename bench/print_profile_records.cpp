// print_profile_records FILE: prints the event records of a file as text, in the format of the
// profiler's monitor. The embedded device provides the time-sync point and the boot time.
#include <array>
#include <cstdio>
#include <cstdlib>
#include <memory>

#include "nrxctl/base/profile_record.h"
#include "nrxctl/decoders/record_text.h"

int main(int argc, char** argv) {
    if (argc < 2) return EXIT_FAILURE;
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> file(std::fopen(argv[1], "rb"),
                                                               std::fclose);
    if (!file) return EXIT_FAILURE;
    std::array<std::uint8_t, 1024 * nrx::profile_record_size> buffer;
    while (const std::size_t size = std::fread(buffer.data(), 1, buffer.size(), file.get())) {
        nrx::print_complete_records({buffer.data(), size}, nrx::print_profile_record);
    }
    return EXIT_SUCCESS;
}
