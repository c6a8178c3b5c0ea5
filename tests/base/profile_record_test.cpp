#include "nrxctl/base/profile_record.h"

#include "tests/support/device_test.h"

namespace tests {

namespace {

std::vector<nrx::profile_record> printed_records;

void keep(const nrx::profile_record& record) {
    printed_records.push_back(record);
}

class profile_record_log : public device_test {
protected:
    // The log returns these replies, one per read, then nothing.
    void add_log(const std::vector<byte_list>& replies) {
        printed_records.clear();
        add_service(host, "profile", 1)
            .set_report_source(0xd1, [this, replies](std::size_t capacity, byte_list& reply) {
                EXPECT_EQ(capacity, 65536U);
                if (reads < replies.size()) reply = replies[reads];
                ++reads;
                return platform::success;
            });
    }

    std::size_t reads = 0;
};

TEST_F(profile_record_log, is_read_until_empty_in_complete_records) {
    byte_list first(100);
    first[0] = 1;
    first[48] = 2;
    first[95] = 3;
    add_log({first, byte_list(47), byte_list(48, 4)});
    nrx::read_profile_records(keep);
    ASSERT_EQ(printed_records.size(), 3U);
    EXPECT_EQ(printed_records[0].bytes[0], 1);
    EXPECT_EQ(printed_records[1].bytes[0], 2);
    EXPECT_EQ(printed_records[1].bytes[47], 3);
    EXPECT_EQ(printed_records[2].bytes[47], 4);
    EXPECT_EQ(reads, 4U);
}

TEST_F(profile_record_log, is_read_ten_times_at_most) {
    add_log(std::vector<byte_list>(20, byte_list(65536)));
    nrx::read_profile_records(keep);
    EXPECT_EQ(reads, 10U);
    EXPECT_EQ(printed_records.size(), 10U * 1365U);
}

}  // namespace

}  // namespace tests
