#include "nrxctl/base/profile_records.h"

#include "tests/support/device_test.h"

namespace {

using tests::byte_list;
using tests::capture;
using tests::failure_line;
using tests::put_service;

std::vector<nrx::profile_record> handed_on;

void keep(const nrx::profile_record& record) {
    handed_on.push_back(record);
}

// Answers one read after another with the replies given, then with nothing.
class log_driver : public platform::simulated::driver {
public:
    explicit log_driver(std::vector<byte_list> replies) : replies_(std::move(replies)) {}

    platform::return_code call(std::uint32_t selector, const platform::call_inputs& inputs,
                               platform::call_outputs& outputs) override {
        EXPECT_EQ(selector, 2U);
        EXPECT_EQ(inputs.scalars[0], 0xd1U);
        EXPECT_EQ(outputs.structure.size(), 65536U);
        const byte_list reply = reads < replies_.size() ? replies_[reads] : byte_list();
        ++reads;
        return platform::simulated::answer(reply, outputs);
    }

    std::size_t reads = 0;

private:
    std::vector<byte_list> replies_;
};

class profile_records : public tests::device_test {
protected:
    void SetUp() override { handed_on.clear(); }

    std::shared_ptr<log_driver> put_log(std::vector<byte_list> replies) {
        auto driver = std::make_shared<log_driver>(std::move(replies));
        host.add({.name = "profile", .classes = {"KeltoNRXInterface"}, .unit = driver});
        return driver;
    }
};

TEST_F(profile_records, hands_on_whole_records_in_order_and_reads_on_until_nothing_comes) {
    byte_list first(100);
    first[0] = 1;
    first[48] = 2;
    first[95] = 3;
    const auto log = put_log({first, byte_list(47), byte_list(48, 4)});
    nrx::read_profile_records(keep);
    ASSERT_EQ(handed_on.size(), 3U);
    EXPECT_EQ(handed_on[0].bytes[0], 1);
    EXPECT_EQ(handed_on[1].bytes[0], 2);
    EXPECT_EQ(handed_on[1].bytes[47], 3);
    EXPECT_EQ(handed_on[2].bytes[47], 4);
    EXPECT_EQ(log->reads, 4U);
}

TEST_F(profile_records, stops_after_ten_reads) {
    const auto log = put_log(std::vector<byte_list>(20, byte_list(65536)));
    nrx::read_profile_records(keep);
    EXPECT_EQ(log->reads, 10U);
    EXPECT_EQ(handed_on.size(), 10U * 1365U);
}

TEST_F(profile_records, reports_a_failed_read_twice_and_stops) {
    const auto result = capture([] { nrx::read_profile_records(keep); });
    EXPECT_EQ(result.err,
              failure_line("nrxtoollib", "service", "nrxctl/base/channel.cpp") +
                  failure_line("nrxtoollib", "result == 0 ", "nrxctl/base/profile_records.cpp",
                               "service not found (0xe00002f0)"));
    EXPECT_TRUE(handed_on.empty());
}

}  // namespace
