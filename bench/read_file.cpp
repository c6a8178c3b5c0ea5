#include "bench/read_file.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace bench {

std::vector<std::uint8_t> read_file(const char* path) {
    const int file = ::open(path, O_RDONLY | O_CLOEXEC);
    if (file < 0) return {};
    struct stat status {};
    std::vector<std::uint8_t> bytes;
    if (::fstat(file, &status) == 0) bytes.resize(static_cast<std::size_t>(status.st_size));
    std::size_t filled = 0;
    for (ssize_t count = 1; count > 0 && filled < bytes.size();) {
        count = ::read(file, bytes.data() + filled, bytes.size() - filled);
        if (count > 0) filled += static_cast<std::size_t>(count);
    }
    ::close(file);
    bytes.resize(filled);
    return bytes;
}

}  // namespace bench
