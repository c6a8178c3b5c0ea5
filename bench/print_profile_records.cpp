// Prints the event records in a file as text, each as the profiler's monitor prints it:
//   print_profile_records FILE
// The embedded device publishes its time-sync point and its boot time meanwhile.

#include <array>
#include <cstdio>
#include <cstdlib>
#include <memory>

#include "nrxctl/base/profile_records.h"
#include "nrxctl/decoders/record_text.h"

int main(int argc, char** argv) {
    if (argc < 2) return EXIT_FAILURE;
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> file(std::fopen(argv[1], "rb"),
                                                               std::fclose);
    if (!file) return EXIT_FAILURE;
    std::array<std::uint8_t, 1024 * nrx::profile_record_size> buffer;
    while (const std::size_t size = std::fread(buffer.data(), 1, buffer.size(), file.get())) {
        nrx::print_whole_records({buffer.data(), size}, nrx::print_profile_record);
    }
    return EXIT_SUCCESS;
}
