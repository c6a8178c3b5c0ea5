#include "nrxctl/base/output.h"

#include <array>
#include <fcntl.h>
#include <string>
#include <thread>
#include <unistd.h>

#include <gtest/gtest.h>

namespace {

// Sends standard output to a descriptor for as long as it lives.
class output_to_descriptor {
public:
    explicit output_to_descriptor(int descriptor) : saved_(::dup(STDOUT_FILENO)) {
        ::dup2(descriptor, STDOUT_FILENO);
    }
    ~output_to_descriptor() {
        ::dup2(saved_, STDOUT_FILENO);
        ::close(saved_);
    }
    output_to_descriptor(const output_to_descriptor&) = delete;
    output_to_descriptor& operator=(const output_to_descriptor&) = delete;

private:
    int saved_;
};

TEST(output, arrives_whole_through_a_pipe_that_has_little_room_and_does_not_wait) {
    std::array<int, 2> ends{};
    ASSERT_EQ(::pipe(ends.data()), 0);
    ::fcntl(ends[1], F_SETFL, O_NONBLOCK);
    std::string sent;
    for (int i = 0; i < 100000; ++i)
        sent += std::to_string(i) + "\n";
    std::string received;
    std::thread reader;
    {
        const output_to_descriptor redirected(ends[1]);
        ::close(ends[1]);
        reader = std::thread([&] {
            std::array<char, 1000> part;
            for (ssize_t got = 0; (got = ::read(ends[0], part.data(), part.size())) > 0;) {
                received.append(part.data(), static_cast<std::size_t>(got));
            }
        });
        nrx::write_output(sent);
    }
    reader.join();
    ::close(ends[0]);
    EXPECT_EQ(received == sent, true);
}

}  // namespace
