// The state of replay, read and set, and the words of the command family.
#include "nrxctl/replay/replay_state.h"
#include "tests/replay/replay_host.h"

namespace tests {

using lines = std::vector<std::string>;

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

const std::string no_word = failed("replay/state_subcommands.cpp", "argc > optind");
const std::string no_such_service =
    failed("base/service_discovery.cpp", "service != ((io_object_t) 0)");

// What is sent for the services accel and pressure.
std::string state_call(const std::string& delay, const std::string& state) {
    return "call NRXApp 1 scalars [0x47] in [10 00 00 00 " + delay + " " + state +
           " 00 00 00 13 00 00 00 " + delay + " " + state + " 00 00 00]";
}

}  // namespace

class replay_states : public replay_test {
protected:
    // Lets the application answer with these bytes, and take any.
    void answer_with(const byte_list& report) {
        app->set_report_source(0x47, [report](std::size_t, byte_list& reply) {
            reply = report;
            return platform::success;
        });
        app->set_report_sink(0x47, [](platform::byte_view) { return platform::success; });
    }

    std::vector<nrx::replay_state_entry> status() {
        std::vector<nrx::replay_state_entry> entries;
        capture([&] { entries = nrx::replay_status(); });
        return entries;
    }
};

TEST_F(replay_states, usage_is_the_answer_to_help_and_to_unknown_words) {
    EXPECT_EQ(replay({"help", "ignored"}).out, usage);
    for (const std::string word : {"", "Load", "loa", "load ", "loads", "status"}) {
        const auto result = replay({word, "accel"});
        EXPECT_EQ(result.out, "Invalid subcommand " + word + "\n\n" + usage);
        EXPECT_EQ(result.err, "");
    }
    EXPECT_TRUE(host.log().empty());
}

TEST_F(replay_states, whole_entries_alone_are_read) {
    byte_list report{0x10, 0, 0, 0, 4, 3, 2, 1, 2, 0, 0, 0, 0xff, 0xff, 0xff, 0xff};
    for (const std::size_t size : {0U, 1U, 11U}) {
        answer_with({report.begin(), report.begin() + static_cast<std::ptrdiff_t>(size)});
        EXPECT_TRUE(status().empty()) << size;
    }
    answer_with(report);
    const auto entries = status();
    ASSERT_EQ(entries.size(), 1U);
    EXPECT_EQ(entries[0].service_id, 0x10U);
    EXPECT_EQ(entries[0].delay, 0x01020304U);
    EXPECT_EQ(entries[0].state, 2U);
    report.resize(384);
    answer_with(report);
    EXPECT_EQ(status().size(), 32U);
    report.resize(385);
    answer_with(report);
    EXPECT_TRUE(status().empty());
}

TEST_F(replay_states, are_listed_with_names_where_there_are_any) {
    answer_with({0x13, 0, 0, 0,    9,    9,    9,    9, 0, 0,    0, 0,    0x77, 0,    0,
                 0,    0, 0, 0,    0,    1,    0,    0, 0, 0x10, 0, 0,    0,    0,    0,
                 0,    0, 2, 0,    0,    0,    0x11, 0, 0, 0,    0, 0,    0,    0,    3,
                 0,    0, 0, 0xff, 0xff, 0xff, 0xff, 0, 0, 0,    0, 0xff, 0xff, 0xff, 0xff});
    put_service(host, "a long service name", 0x11 + 1000);
    const auto result = replay({"get-status"});
    EXPECT_EQ(result.out,
              "Replay status:\n"
              "Service pressure   is inactive\n"
              "Service 119        is loaded\n"
              "Service accel      is enabled\n"
              "Service gyro       is 3\n"
              "Service 4294967295 is 4294967295\n");
    EXPECT_EQ(result.err, no_such_service + no_such_service);
    EXPECT_EQ(calls().size(), 2U);
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
        const auto result = replay(words);
        EXPECT_EQ(result.out, "Replay is not enabled\n") << words[0];
        EXPECT_EQ(result.err, "") << words[0];
        EXPECT_EQ(calls().size(), 1U) << words[0];
    }
    host.remove("NRXApp");
    const auto missing = replay({"get-status"});
    EXPECT_EQ(missing.err, failed("base/channel.cpp", "service"));
    EXPECT_EQ(missing.out, "Replay is not enabled\n");
}

TEST_F(replay_states, are_set_for_all_services_in_the_order_of_the_words) {
    answer_with(byte_list(12));
    struct setting {
        lines words;
        std::string delay;
        std::string state;
    };
    for (const auto& [words, delay, state] : std::vector<setting>{
             {{"enable"}, "00 00 00 00", "02"},
             {{"disable"}, "00 00 00 00", "01"},
             {{"schedule-enable", "0x10203"}, "03 02 01 00", "02"},
             {{"schedule-enable", "-2"}, "fe ff ff ff", "02"},
         }) {
        lines all = words;
        all.insert(all.end(), {"accel", "19"});
        int taken = 0;
        const auto result = replay(all, &taken);
        EXPECT_EQ(calls().back(), state_call(delay, state)) << words[0];
        EXPECT_EQ(result.out + result.err, "") << words[0];
        EXPECT_EQ(taken, static_cast<int>(all.size()) - 1);
    }
}

TEST_F(replay_states, words_that_are_missing_or_belong_to_no_service_send_nothing) {
    for (const lines& words :
         std::vector<lines>{{"enable"}, {"disable"}, {"schedule-enable"}, {"schedule-enable", "1"}})
        EXPECT_EQ(replay(words).err, no_word) << words[0];
    const auto malformed = replay({"schedule-enable", "1s"});
    EXPECT_EQ(malformed.out, "invalid delay (1s)\n");
    EXPECT_EQ(malformed.status, 1);
    const auto unknown = replay({"enable", "accel", "nobody", "nobody"});
    EXPECT_EQ(unknown.err, no_such_service + failed("replay/replay_state.cpp", "success"));
    EXPECT_EQ(unknown.out, "");
    for (const std::string& call : calls())
        EXPECT_TRUE(call.starts_with("call NRXApp 2 ")) << call;
}

TEST_F(replay_states, what_the_application_refuses_is_reported_twice) {
    const std::string code = "not in a state for this (0xe0000405)";
    EXPECT_EQ(replay({"enable", "accel"}).err,
              failed("base/command_channel.cpp", "kr == 0 ", code) +
                  failed("replay/replay_state.cpp", "kr == 0 ", code));
}

TEST_F(replay_states, follow_what_is_loaded_enabled_and_unloaded) {
    const sample_text_file file("accel,sampleid=1,temperature=0,x=0,y=0,z=0,timestamp=0\n");
    const auto state = [&] {
        const std::string text = replay({"get-status"}).out;
        const auto at = text.find("Service accel      is ");
        return text.substr(at + 22, text.find('\n', at) - at - 22);
    };
    EXPECT_EQ(state(), "inactive");
    replay({"load", file.path()});
    EXPECT_EQ(state(), "loaded");
    replay({"schedule-enable", "5", "accel"});
    EXPECT_EQ(state(), "enabled");
    EXPECT_EQ(status().front().delay, 5U);
    replay({"disable", "0x10"});
    EXPECT_EQ(state(), "loaded");
    replay({"unload", "accel"});
    EXPECT_EQ(state(), "inactive");
}

}  // namespace tests
