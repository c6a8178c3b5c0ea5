// The state of replay, read and set, and the words of the command family.
#include "nrxctl/replay/replay_state.h"
#include "tests/replay/replay_host.h"

namespace tests {

namespace {

const std::string usage =
    "usage:\n"
    "    nrxctl --replay load <file> <completion_policy: default|periodic|stop> <location: "
    "sram|dram>\n"
    "    nrxctl --replay unload <service...>\n"
    "    nrxctl --replay schedule-enable <delay-seconds> <service...>\n"
    "    nrxctl --replay enable <service...>\n"
    "    nrxctl --replay disable <service...>\n"
    "    nrxctl --replay get-status\n"
    "    nrxctl --replay generate <service> <signal-type: random|delta|step|sin> <interval> "
    "<num_samples|frequency_hz>\n"
    "    nrxctl --replay help\n";

}  // namespace

using replay_states = replay_test;

TEST_F(replay_states, usage_is_the_answer_to_help_and_to_unknown_words) {
    says({"help", "ignored"}, usage);
    for (const std::string word : {"", "Load", "loa", "load ", "loads", "status"})
        says({word, "accel"}, "Invalid subcommand " + word + "\n\n" + usage);
    EXPECT_TRUE(host.log().empty());
}

TEST_F(replay_states, whole_entries_alone_are_read) {
    const auto status = [&](std::size_t size) {
        byte_list report = words_of({0x10, 0x01020304, 2, 0xffffffff});
        report.resize(size);
        answer_with(report);
        std::vector<nrx::replay_state_entry> read;
        capture([&] { read = nrx::replay_status(); });
        return read;
    };
    for (const auto& [size, count] : rows<std::size_t, std::size_t>{
             {0, 0}, {1, 0}, {11, 0}, {12, 1}, {16, 1}, {384, 32}, {385, 0}}) {
        EXPECT_EQ(status(size).size(), count) << size;
    }
    const auto first = status(16).at(0);
    EXPECT_EQ(first.service_id, 0x10U);
    EXPECT_EQ(first.delay, 0x01020304U);
    EXPECT_EQ(first.state, 2U);
}

TEST_F(replay_states, are_listed_with_names_where_there_are_any) {
    answer_with(words_of({0x13, 0x09090909, 0, 0x77, 0, 1, 0x10, 0, 2, 0x11, 0, 3, 0x3f9, 0, 0,
                          0xffffffff, 0, 0xffffffff}));
    put_service(host, "a long service name", 0x3f9);
    says({"get-status"},
         "Replay status:\n"
         "Service pressure   is inactive\n"
         "Service 119        is loaded\n"
         "Service accel      is enabled\n"
         "Service gyro       is 3\n"
         "Service a long service name is inactive\n"
         "Service 4294967295 is 4294967295\n",
         no_such_service + no_such_service);
    EXPECT_EQ(calls(), lines(2, read_state));
}

TEST_F(replay_states, every_subcommand_that_needs_replay_says_that_it_is_not_enabled) {
    answer_with({1, 2, 3});
    for (const lines& words : std::vector<lines>{{"load"},
                                                 {"load", "/nonexistent", "bogus"},
                                                 {"unload", "accel"},
                                                 {"enable"},
                                                 {"disable", "accel"},
                                                 {"schedule-enable", "junk"},
                                                 {"get-status"}}) {
        says(words, "Replay is not enabled\n");
        EXPECT_EQ(calls(), lines{read_state}) << words[0];
    }
    host.remove("NRXApp");
    says({"get-status"}, "Replay is not enabled\n", failed("base/channel.cpp", "service"));
}

TEST_F(replay_states, are_set_for_all_services_in_the_order_of_the_words) {
    answer_with(byte_list(12));
    for (const auto& [words, delay, state] : rows<lines, std::string, std::string>{
             {{"enable"}, "00 00 00 00", "02"},
             {{"disable"}, "00 00 00 00", "01"},
             {{"schedule-enable", "0x10203"}, "03 02 01 00", "02"},
             {{"schedule-enable", "-2"}, "fe ff ff ff", "02"},
         }) {
        lines all = words;
        all.insert(all.end(), {"compass", "19"});
        const auto result = replay(all, &taken);
        EXPECT_EQ(calls().back(), "call NRXApp 1 scalars [0x47] in [01 02 03 04 " + delay + " " +
                                      state + " 00 00 00 13 00 00 00 " + delay + " " + state +
                                      " 00 00 00]");
        EXPECT_EQ(result.out + result.err, "") << words[0];
        EXPECT_EQ(taken, static_cast<int>(all.size()) - 1);
    }
}

TEST_F(replay_states, words_that_are_missing_or_belong_to_no_service_send_nothing) {
    for (const lines& words :
         std::vector<lines>{{"enable"}, {"disable"}, {"schedule-enable"}, {"schedule-enable", "1"}})
        says(words, "", failed("replay/state_subcommands.cpp", "argc > optind"));
    const auto malformed = replay({"schedule-enable", "1s"});
    EXPECT_EQ(malformed.out, "invalid delay (1s)\n");
    EXPECT_EQ(malformed.status, 1);
    says({"enable", "accel", "nobody", "nobody"}, "",
         no_such_service + failed("replay/replay_state.cpp", "success"));
    EXPECT_EQ(calls(), lines(6, read_state));
}

TEST_F(replay_states, what_the_application_refuses_is_reported_twice) {
    const std::string code = "not in a state for this (0xe0000405)";
    says({"enable", "accel"}, "",
         failed("base/command_channel.cpp", "kr == 0 ", code) +
             failed("replay/replay_state.cpp", "kr == 0 ", code));
}

}  // namespace tests
