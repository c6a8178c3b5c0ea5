#include "nrxctl/base/profile_records.h"

#include "tests/support/device_test.h"

namespace tests {

namespace {

std::vector<nrx::profile_record> handed_on;

void keep(const nrx::profile_record& record) {
    handed_on.push_back(record);
}

class profile_records : public device_test {
protected:
    // Answers one read after another with the replies given, then with nothing.
    void put_log(const std::vector<byte_list>& replies) {
        handed_on.clear();
        put_service(host, "profile", 1)
            .set_report_source(0xd1, [this, replies](std::size_t room, byte_list& reply) {
                EXPECT_EQ(room, 65536U);
                if (reads < replies.size()) reply = replies[reads];
                ++reads;
                return platform::success;
            });
    }

    std::size_t reads = 0;
};

TEST_F(profile_records, hands_on_whole_records_in_order_and_reads_on_until_nothing_comes) {
    byte_list first(100);
    first[0] = 1;
    first[48] = 2;
    first[95] = 3;
    put_log({first, byte_list(47), byte_list(48, 4)});
    nrx::read_profile_records(keep);
    ASSERT_EQ(handed_on.size(), 3U);
    EXPECT_EQ(handed_on[0].bytes[0], 1);
    EXPECT_EQ(handed_on[1].bytes[0], 2);
    EXPECT_EQ(handed_on[1].bytes[47], 3);
    EXPECT_EQ(handed_on[2].bytes[47], 4);
    EXPECT_EQ(reads, 4U);
}

TEST_F(profile_records, stops_after_ten_reads) {
    put_log(std::vector<byte_list>(20, byte_list(65536)));
    nrx::read_profile_records(keep);
    EXPECT_EQ(reads, 10U);
    EXPECT_EQ(handed_on.size(), 10U * 1365U);
}

}  // namespace

}  // namespace tests
