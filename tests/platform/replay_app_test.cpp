// The virtual replay application takes what a driver would take, and nothing else.
#include "platform/virtual/replay_app.h"

#include <gtest/gtest.h>

#include "platform/virtual/return_codes.h"

namespace {

using platform::bad_argument;
using platform::not_found;
using platform::return_code;
using platform::success;
using platform::unsupported;
using platform::simulated::byte_list;
using platform::simulated::not_ready;
using platform::simulated::replay_app;

byte_list words(const std::vector<std::uint32_t>& numbers) {
    byte_list bytes;
    for (const std::uint32_t number : numbers) {
        for (unsigned shift = 0; shift < 32; shift += 8)
            bytes.push_back(static_cast<std::uint8_t>(number >> shift));
    }
    return bytes;
}

// A good request with one axis record, and one with two pressure records.
const std::vector<std::uint32_t> axis_request{7, 1, 1, 0, 28, 28, 0, 0, 0, 0, 0, 0};
const std::vector<std::uint32_t> pressure_request{9, 3, 2, 1, 40, 20, 0, 0, 0, 0, 20, 5, 5, 5, 5};

class virtual_replay : public ::testing::Test {
protected:
    virtual_replay() { serve_replay(service, app); }

    return_code client_call(std::uint32_t selector, const byte_list& structure,
                            std::size_t scalars = 0, std::size_t room = 0) {
        const std::vector<std::uint64_t> in(scalars);
        byte_list out(room);
        platform::call_outputs outputs{{}, out};
        return client->call(selector, {in, structure}, outputs);
    }
    return_code load(const std::vector<std::uint32_t>& request) {
        return client_call(0, words(request));
    }
    return_code unload(std::uint32_t id) { return client_call(1, words({id})); }

    return_code write(const byte_list& entries) {
        const std::vector<std::uint64_t> id{0x47};
        platform::call_outputs nothing;
        return service.call(1, {id, entries}, nothing);
    }

    // What the service answers, in words; its code alone on failure.
    byte_list read(std::size_t room = 384) {
        const std::vector<std::uint64_t> id{0x47};
        byte_list bytes(room);
        platform::call_outputs outputs{{}, bytes};
        const return_code kr = service.call(2, {id, {}}, outputs);
        if (kr != success) return words({static_cast<std::uint32_t>(kr)});
        return {outputs.structure.begin(), outputs.structure.end()};
    }

    std::shared_ptr<replay_app> app = std::make_shared<replay_app>(
        std::vector<platform::simulated::replay_service>{{7, 28}, {9, 20}});
    platform::simulated::interface_driver service;
    std::shared_ptr<platform::simulated::driver> client = make_replay_client(app);
};

TEST_F(virtual_replay, keeps_a_state_per_service) {
    EXPECT_EQ(read(), words({7, 0, 0, 9, 0, 0}));
    EXPECT_EQ(load(pressure_request), success);
    EXPECT_EQ(read(), words({7, 0, 0, 9, 0, 1}));
    EXPECT_EQ(load(axis_request), success);
    EXPECT_EQ(write(words({9, 60, 2, 7, 0, 2, 7, 1, 1})), success);
    EXPECT_EQ(read(), words({7, 1, 1, 9, 60, 2}));
    EXPECT_EQ(unload(9), success);
    EXPECT_EQ(read(24), words({7, 1, 1, 9, 0, 0}));
    EXPECT_EQ(read(23), words({static_cast<std::uint32_t>(platform::simulated::no_room)}));
}

TEST_F(virtual_replay, refuses_a_request_whose_words_are_out_of_range) {
    struct changed_word {
        std::size_t index;
        std::uint32_t value;
        return_code code;
    };
    for (const auto& [index, value, code] : {
             changed_word{0, 8, not_found},
             changed_word{1, 4, bad_argument},
             changed_word{2, 0, bad_argument},
             changed_word{2, 3, bad_argument},
             changed_word{3, 2, bad_argument},
             changed_word{4, 27, bad_argument},
             changed_word{4, 29, bad_argument},
             changed_word{5, 20, bad_argument},
             changed_word{0, 9, bad_argument},
         }) {
        auto request = axis_request;
        request[index] = value;
        EXPECT_EQ(load(request), code) << index << " " << value;
    }
    auto second_record = pressure_request;
    second_record[10] = 28;
    EXPECT_EQ(load(second_record), bad_argument);
    EXPECT_EQ(read(), words({7, 0, 0, 9, 0, 0}));
}

TEST_F(virtual_replay, refuses_every_part_of_a_request) {
    const byte_list whole = words(axis_request);
    for (std::size_t size = 0; size < whole.size(); ++size) {
        byte_list part(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size));
        EXPECT_EQ(client_call(0, part), bad_argument) << size;
        // So it does with a byte count that fits.
        if (size < 20) continue;
        part[16] = static_cast<std::uint8_t>(size - 20);
        EXPECT_EQ(client_call(0, part), bad_argument) << size;
    }
    EXPECT_EQ(client_call(0, whole, 1), bad_argument);
    EXPECT_EQ(client_call(0, whole, 0, 4), bad_argument);
    EXPECT_EQ(client_call(2, whole), unsupported);
    EXPECT_EQ(client_call(0, whole), success);
}

TEST_F(virtual_replay, loads_and_unloads_once) {
    EXPECT_EQ(unload(7), not_ready);
    EXPECT_EQ(load(axis_request), success);
    EXPECT_EQ(load(axis_request), not_ready);
    EXPECT_EQ(client_call(1, {7, 0, 0}), bad_argument);
    EXPECT_EQ(client_call(1, {7, 0, 0, 0, 0}), bad_argument);
    EXPECT_EQ(unload(8), not_found);
    EXPECT_EQ(unload(7), success);
    EXPECT_EQ(unload(7), not_ready);
}

TEST_F(virtual_replay, sets_all_states_of_a_report_or_none) {
    load(axis_request);
    for (const auto& [last_entry, code] :
         std::vector<std::pair<std::vector<std::uint32_t>, return_code>>{
             {{8, 0, 2}, not_found},
             {{7, 0, 0}, bad_argument},
             {{7, 0, 3}, bad_argument},
             {{9, 0, 2}, not_ready},
             {{7, 0}, bad_argument},
         }) {
        std::vector<std::uint32_t> entries{7, 5, 2};
        entries.insert(entries.end(), last_entry.begin(), last_entry.end());
        EXPECT_EQ(write(words(entries)), code);
        EXPECT_EQ(read(), words({7, 0, 1, 9, 0, 0}));
    }
}

}  // namespace
