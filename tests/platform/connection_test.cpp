#include "platform/connection.h"

#include <array>
#include <memory>

#include "tests/support/device_test.h"

namespace tests {

namespace {

using platform::return_code;

// A driver that opens type 3 too, gives back one scalar and three bytes by selector 0, and refuses
// everything else.
class echo_driver : public platform::simulated::driver {
public:
    return_code open(std::uint32_t type) override {
        return type == 3 ? platform::success : driver::open(type);
    }
    return_code call(std::uint32_t selector, const platform::call_inputs& inputs,
                     platform::call_outputs& outputs) override {
        if (selector != 0) return platform::bad_argument;
        outputs.scalars[0] = inputs.scalars[0] + 1;
        outputs.scalars = outputs.scalars.first(1);
        return platform::simulated::answer(std::array<std::uint8_t, 3>{1, 2, 3}, outputs);
    }
};

class connection : public device_test {
protected:
    connection() {
        host.add({.name = "echo", .unit = std::make_shared<echo_driver>()});
        host.add({.name = "bare"});
    }

    return_code open(std::string_view name, std::uint32_t type) {
        return platform::open(service_named(name), type, opened);
    }
    return_code call(std::uint32_t selector) {
        return platform::call(opened, selector, {.scalars = numbers_in, .structure = {}}, outputs);
    }
    // A call that fails leaves the outputs alone.
    void expect_failure(std::uint32_t selector, return_code expected) {
        EXPECT_EQ(call(selector), expected);
        EXPECT_EQ(outputs.scalars.size(), 2U);
        EXPECT_EQ(outputs.structure.size(), 8U);
    }

    platform::connection opened;
    std::array<std::uint64_t, 1> numbers_in{41};
    std::array<std::uint64_t, 2> numbers_out{};
    std::array<std::uint8_t, 8> bytes_out{};
    platform::call_outputs outputs{numbers_out, bytes_out};
};

TEST_F(connection, opens_the_types_that_the_driver_knows_while_it_is_there) {
    EXPECT_EQ(open("echo", 0), platform::success);
    EXPECT_TRUE(opened);
    EXPECT_EQ(open("echo", 3), platform::success);
    EXPECT_EQ(logged("close"), std::vector<std::string>{"close echo"});
    opened.reset();
    EXPECT_EQ(open("echo", 1), platform::unsupported);
    EXPECT_EQ(open("bare", 0), platform::unsupported);
    EXPECT_EQ(open("absent", 0), platform::not_found);
    const platform::service echo = service_named("echo");
    host.remove("echo");
    EXPECT_EQ(platform::open(echo, 0, opened), platform::not_found);
    EXPECT_FALSE(opened);
}

TEST_F(connection, cuts_the_outputs_to_what_the_driver_returned) {
    open("echo", 0);
    EXPECT_EQ(host.open_handles(), 1U) << "the service reference is not needed any more";
    EXPECT_EQ(call(0), platform::success);
    EXPECT_EQ(outputs.scalars.size(), 1U);
    EXPECT_EQ(numbers_out[0], 42U);
    EXPECT_EQ(byte_list(outputs.structure.begin(), outputs.structure.end()), (byte_list{1, 2, 3}));
    EXPECT_EQ(outputs.structure.data(), bytes_out.data());
}

TEST_F(connection, leaves_the_outputs_alone_when_a_call_fails_and_may_succeed_with_nothing) {
    expect_failure(0, platform::not_found);
    open("echo", 0);
    expect_failure(1, platform::bad_argument);
    host.fail_call(1, failure::io);
    expect_failure(0, platform::simulated::io_failure);
    host.remove("echo");
    expect_failure(0, platform::not_found);
    host.fail_call(1, failure::nothing);
    EXPECT_EQ(call(0), platform::success);
    EXPECT_TRUE(outputs.scalars.empty() && outputs.structure.empty());
}

}  // namespace

}  // namespace tests
