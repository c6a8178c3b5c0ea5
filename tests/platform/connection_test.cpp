#include "platform/connection.h"

#include <array>
#include <memory>

#include "tests/support/device_test.h"

namespace {

using platform::call_inputs;
using platform::call_outputs;
using platform::first_match;
using platform::return_code;
using tests::failure;

// A driver that opens type 3 too, gives back one scalar and three bytes by selector 0, and refuses
// everything else.
class echo_driver : public platform::simulated::driver {
public:
    return_code open(std::uint32_t type) override {
        return type == 3 ? platform::success : driver::open(type);
    }
    return_code call(std::uint32_t selector, const call_inputs& inputs,
                     call_outputs& outputs) override {
        if (selector != 0) return platform::bad_argument;
        outputs.scalars[0] = inputs.scalars[0] + 1;
        outputs.scalars = outputs.scalars.first(1);
        return platform::simulated::answer(std::array<std::uint8_t, 3>{1, 2, 3}, outputs);
    }
};

class connection : public tests::device_test {
protected:
    void SetUp() override {
        device_test::SetUp();
        host.add({.name = "echo", .unit = std::make_shared<echo_driver>()});
        host.add({.name = "bare"});
    }

    return_code open(std::string_view name, std::uint32_t type) {
        return platform::open(first_match({{"IONameMatch", name}}), type, opened);
    }

    return_code call(std::uint32_t selector) {
        return platform::call(opened, selector, {.scalars = numbers_in, .structure = {}}, outputs);
    }

    void expect_untouched_outputs() const {
        EXPECT_EQ(outputs.scalars.size(), 2U);
        EXPECT_EQ(outputs.structure.size(), 8U);
    }

    platform::connection opened;
    std::array<std::uint64_t, 1> numbers_in{41};
    std::array<std::uint64_t, 2> numbers_out{};
    std::array<std::uint8_t, 8> bytes_out{};
    call_outputs outputs{numbers_out, bytes_out};

    void TearDown() override {
        opened.reset();
        device_test::TearDown();
    }
};

TEST_F(connection, opens_the_types_that_the_driver_knows) {
    EXPECT_EQ(open("echo", 0), platform::success);
    EXPECT_TRUE(opened);
    EXPECT_EQ(open("echo", 3), platform::success);
    EXPECT_EQ(logged("close"), std::vector<std::string>{"close echo"});
    opened.reset();
    EXPECT_EQ(open("echo", 1), platform::unsupported);
    EXPECT_EQ(open("bare", 0), platform::unsupported);
    EXPECT_EQ(open("absent", 0), platform::not_found);
    EXPECT_FALSE(opened);
}

TEST_F(connection, cannot_be_opened_on_a_service_that_is_gone) {
    const platform::service echo = first_match({{"IONameMatch", "echo"}});
    host.remove("echo");
    EXPECT_EQ(platform::open(echo, 0, opened), platform::not_found);
    EXPECT_FALSE(opened);
}

TEST_F(connection, may_be_none_although_opening_succeeded) {
    host.fail_call(2, failure::nothing);
    EXPECT_EQ(open("echo", 0), platform::success);
    EXPECT_FALSE(opened);
}

TEST_F(connection, outlives_the_service_reference_that_it_was_opened_with) {
    open("echo", 0);
    EXPECT_EQ(host.open_handles(), 1U);
    EXPECT_EQ(call(0), platform::success);
}

TEST_F(connection, cuts_the_outputs_to_what_the_driver_returned) {
    open("echo", 0);
    EXPECT_EQ(call(0), platform::success);
    EXPECT_EQ(outputs.scalars.size(), 1U);
    EXPECT_EQ(numbers_out[0], 42U);
    EXPECT_EQ(tests::byte_list(outputs.structure.begin(), outputs.structure.end()),
              (tests::byte_list{1, 2, 3}));
    EXPECT_EQ(outputs.structure.data(), bytes_out.data());
}

TEST_F(connection, leaves_the_outputs_alone_when_a_call_fails) {
    EXPECT_EQ(call(0), platform::not_found);
    expect_untouched_outputs();
    open("echo", 0);
    EXPECT_EQ(call(1), platform::bad_argument);
    expect_untouched_outputs();
    host.fail_call(1, failure::io);
    EXPECT_EQ(call(0), platform::simulated::io_failure);
    expect_untouched_outputs();
    host.remove("echo");
    EXPECT_EQ(call(0), platform::not_found);
    expect_untouched_outputs();
}

TEST_F(connection, may_succeed_with_nothing) {
    open("echo", 0);
    host.fail_call(1, failure::nothing);
    EXPECT_EQ(call(0), platform::success);
    EXPECT_TRUE(outputs.scalars.empty());
    EXPECT_TRUE(outputs.structure.empty());
}

}  // namespace
