// The virtual replay application takes what a driver would take, and nothing else. How its states
// go on is held by the tests of the replay family, which work on it.
#include "platform/virtual/replay_app.h"

#include <gtest/gtest.h>

#include "platform/virtual/return_codes.h"

namespace {

using platform::bad_argument;
using platform::not_found;
using platform::return_code;
using platform::success;
using platform::simulated::byte_list;
using platform::simulated::not_ready;
using word_list = std::vector<std::uint32_t>;

byte_list bytes_of(const word_list& words) {
    byte_list bytes;
    for (const std::uint32_t word : words) {
        for (unsigned shift = 0; shift < 32; shift += 8)
            bytes.push_back(static_cast<std::uint8_t>(word >> shift));
    }
    return bytes;
}

// Good requests, with one axis record and with two pressure records.
const word_list axis_request{7, 1, 1, 0, 28, 28, 0, 0, 0, 0, 0, 0};
const word_list pressure_request{9, 3, 2, 1, 40, 20, 0, 0, 0, 0, 20, 5, 5, 5, 5};

class virtual_replay : public ::testing::Test {
protected:
    virtual_replay() { serve_replay(service, app); }

    return_code client_call(std::uint32_t selector, const byte_list& structure) {
        platform::call_outputs nothing;
        return client->call(selector, {{}, structure}, nothing);
    }
    return_code load(const word_list& request) { return client_call(0, bytes_of(request)); }

    return_code write(const word_list& entries) {
        platform::call_outputs nothing;
        return service.call(1, {report_id, bytes_of(entries)}, nothing);
    }
    void expect_states(const word_list& expected) {
        byte_list bytes(384);
        platform::call_outputs outputs{{}, bytes};
        EXPECT_EQ(service.call(2, {report_id, {}}, outputs), success);
        EXPECT_EQ(byte_list(outputs.structure.begin(), outputs.structure.end()),
                  bytes_of(expected));
    }

    const std::vector<std::uint64_t> report_id{0x47};
    std::shared_ptr<platform::simulated::replay_app> app =
        std::make_shared<platform::simulated::replay_app>(
            std::vector<platform::simulated::replay_service>{{7, 28}, {9, 20}});
    platform::simulated::interface_driver service;
    std::shared_ptr<platform::simulated::driver> client = make_replay_client(app);
};

TEST_F(virtual_replay, refuses_a_request_that_is_cut_or_has_words_out_of_range) {
    struct changed_word {
        std::size_t index;
        std::uint32_t value;
        return_code code = bad_argument;
    };
    for (const auto& [index, value, code] :
         {changed_word{0, 8, not_found}, changed_word{1, 4}, changed_word{2, 0}, changed_word{2, 3},
          changed_word{3, 2}, changed_word{4, 27}, changed_word{5, 20}, changed_word{0, 9}}) {
        word_list request = axis_request;
        request[index] = value;
        EXPECT_EQ(load(request), code) << index << " " << value;
    }
    byte_list cut = bytes_of(axis_request);
    cut.pop_back();
    EXPECT_EQ(client_call(0, cut), bad_argument);
    cut[16] -= 1;
    EXPECT_EQ(client_call(0, cut), bad_argument);
    cut.resize(19);
    EXPECT_EQ(client_call(0, cut), bad_argument);
    EXPECT_EQ(client_call(1, {7, 0, 0}), bad_argument);
    expect_states({7, 0, 0, 9, 0, 0});
}

TEST_F(virtual_replay, sets_all_states_of_a_report_or_none) {
    EXPECT_EQ(load(pressure_request), success);
    EXPECT_EQ(load(pressure_request), not_ready);
    for (const auto& [last_entry, code] :
         std::vector<std::pair<word_list, return_code>>{{{8, 0, 2}, not_found},
                                                        {{9, 0, 0}, bad_argument},
                                                        {{9, 0, 3}, bad_argument},
                                                        {{7, 0, 2}, not_ready},
                                                        {{7, 0}, bad_argument}}) {
        word_list entries{9, 5, 2};
        entries.insert(entries.end(), last_entry.begin(), last_entry.end());
        EXPECT_EQ(write(entries), code);
        expect_states({7, 0, 0, 9, 0, 1});
    }
    EXPECT_EQ(write({9, 5, 2}), success);
    expect_states({7, 0, 0, 9, 5, 2});
}

}  // namespace
