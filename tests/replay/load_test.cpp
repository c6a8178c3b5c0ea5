// Loading and unloading: requests, messages, and the reports of every failure in their order.
#include "nrxctl/replay/event_memory.h"
#include "tests/replay/replay_host.h"

namespace tests {

namespace {

constexpr const char* load_file = "replay/load_subcommand.cpp";
constexpr const char* conn_file = "base/service_conn.cpp";
const std::string success_failed = failed(load_file, "success");
const std::string refused = success_failed + success_failed;

std::string sample(const std::string& tag, const std::string& id, const std::string& timestamp) {
    return tag + ",sampleid=" + id +
           ",temperature=-100,x=0x14131211,y=-2,z=0x34333231,p=0x44434241,timestamp=" + timestamp +
           "\n";
}
const std::string three_services = sample("compass", "1", "5") + sample("pressure", "2", "3") +
                                   sample("compass", "0xb4b3b2b1", "0x14131216") +
                                   sample("accel", "4", "2");

// How the records of those samples look in the log.
std::string axis_record(const std::string& delta_and_id) {
    return " 1c 00 00 00 " + delta_and_id + " 00 00 ff ff 11 12 13 14 fe ff ff ff 31 32 33 34";
}
std::string pressure_record(const std::string& delta_and_id) {
    return " 14 00 00 00 " + delta_and_id + " 00 00 ff ff 41 42 43 44";
}

// A load request in the log: a service id, four words whose upper bytes are 0, and records.
std::string request(const std::string& id, const lines& words, const std::string& records) {
    std::string text = "call client 0 scalars [] in [" + id;
    for (const std::string& word : words)
        text += " " + word + " 00 00 00";
    return text + records + "]";
}

}  // namespace

class load_subcommand : public replay_test {
protected:
    // What was done with connections to the client so far.
    [[nodiscard]] std::string client_uses() const {
        std::string uses;
        for (const std::string& line : host.log()) {
            const auto verb = line.substr(0, line.find(' '));
            if (line.starts_with(verb + " client") && verb != "release") uses += verb + " ";
        }
        return uses;
    }
};

TEST_F(load_subcommand, checks_and_then_uploads_each_service_in_the_order_of_their_names) {
    load_says(three_services,
              "accel: loaded 1 events\ncompass: loaded 2 events\npressure: loaded 1 events\n");
    EXPECT_EQ(calls(), (lines{read_state, read_state, read_state, read_state,
                              request("10 00 00 00", {"01", "01", "00", "1c"},
                                      axis_record("00 00 00 00 04 00 00 00")),
                              request("01 02 03 04", {"01", "01", "00", "38"},
                                      axis_record("03 00 00 00 01 00 00 00") +
                                          axis_record("11 12 13 14 b1 b2 b3 b4")),
                              request("13 00 00 00", {"01", "01", "00", "14"},
                                      pressure_record("01 00 00 00 02 00 00 00"))}));
    EXPECT_EQ(client_uses(), "open call close open call close open call close ");
    says({"get-status"},
         "Replay status:\nService accel      is loaded\nService gyro       is inactive\n"
         "Service compass    is loaded\nService pressure   is loaded\n");
}

TEST_F(load_subcommand, counts_events_and_bytes_beyond_one_byte) {
    std::string many;
    for (int i = 0; i < 2400; ++i)
        many += sample("gyro", "1", "1");
    EXPECT_EQ(load(many).out, "gyro: loaded 2400 events\n");
    EXPECT_TRUE(calls().back().starts_with(
        "call client 0 scalars [] in [11 00 00 00 01 00 00 00 01 00 00 00 00 00 00 00 80 06 01 00 "
        "1c 00 00 00 "));
}

TEST_F(load_subcommand, words_choose_filter_completion_and_location) {
    for (const auto& [words, request_words, taken_words] : rows<lines, lines, int>{
             {{}, {"01", "01", "00", "1c"}, 1},
             {{"filter"}, {"01", "01", "01", "1c"}, 2},
             {{"default"}, {"00", "01", "00", "1c"}, 2},
             {{"periodic", "dram"}, {"01", "01", "00", "1c"}, 3},
             {{"stop", "sram"}, {"02", "02", "00", "1c"}, 3},
             {{"filter", "last", "local"}, {"03", "02", "01", "1c"}, 4},
             {{"last", "local", "nothing", "else"}, {"03", "02", "00", "1c"}, 3},
         }) {
        EXPECT_EQ(load(sample("accel", "4", "2"), words).out, "accel: loaded 1 events\n");
        EXPECT_EQ(calls().back(),
                  request("10 00 00 00", request_words, axis_record("00 00 00 00 04 00 00 00")));
        EXPECT_EQ(taken, taken_words);
        replay({"unload", "accel"});
    }
}

TEST_F(load_subcommand, words_that_are_none_of_these_stop_it_before_the_file_is_read) {
    for (const auto& [words, message] : rows<lines, std::string>{
             {{"Filter"}, "Invalid completion: Filter\n"},
             {{"filter", "filter"}, "Invalid completion: filter\n"},
             {{"sram"}, "Invalid completion: sram\n"},
             {{"stop", "Sram"}, "Invalid location: Sram\n"},
             {{"filter", "stop", "1"}, "Invalid location: 1\n"},
         }) {
        const auto result = load("no,pair\n", words);
        EXPECT_EQ(result.out, message);
        EXPECT_EQ(result.err, "");
    }
    EXPECT_EQ(replay({"load"}).err, failed(load_file, "argc > optind"));
}

TEST_F(load_subcommand, a_file_without_samples_or_with_a_bad_line_uploads_nothing) {
    const std::string good = sample("accel", "1", "1");
    for (const auto& [text, out, err, status] :
         rows<std::string, std::string, std::string, std::optional<int>>{
             {"# nothing\n\nnobody\n", "Warning: Unknown event tag nobody\n", "", {}},
             {good + "accel,x\n",
              "",
              failed("replay/sample_file.cpp", "pair.size() == 2") + refused,
              {}},
             {good + "accel,sampleid=x\n", "error converting samples (x)\n", "", 1},
         }) {
        const auto result = load(text);
        EXPECT_EQ(result.out, out);
        EXPECT_EQ(result.err, err);
        EXPECT_EQ(result.status, status);
        EXPECT_EQ(calls(), lines{read_state});
    }
    says({"load", "/nonexistent/samples"}, "", failed("replay/sample_file.cpp", "fs") + refused);
}

TEST_F(load_subcommand, a_service_without_id_or_state_refuses_the_whole_file) {
    const auto loads_nothing = [&](const std::string& reports) {
        load_says(three_services, "", reports);
        EXPECT_EQ(calls(), lines(3, read_state));
    };
    host.find("compass")->properties = {};
    loads_nothing(refused);
    host.remove("compass");
    loads_nothing(no_such_service + refused);
    put_service(host, "compass", 0x77);
    loads_nothing(refused);
}

TEST_F(load_subcommand, the_first_service_that_has_samples_refuses_the_whole_file_with_a_message) {
    for (const char* state : {"disable", "enable"}) {
        load(sample("pressure", "1", "1") + sample("compass", "1", "1"));
        replay({state, "compass", "pressure"});
        calls();
        load_says(three_services,
                  "Service compass had already samples; you have to unload first\n");
        EXPECT_EQ(calls(), lines(3, read_state));
        replay({"unload", "compass", "pressure"});
    }
    answer_with({0x10, 0, 0, 0, 0, 0, 0, 0, 3, 0, 0, 0});
    load_says(three_services, "Service accel had already samples; you have to unload first\n");
}

TEST_F(load_subcommand, a_state_that_cannot_be_read_again_fails_the_check) {
    // Four platform calls tell that replay is enabled: two look-ups, the opening and the call.
    host.before_call(5, [&] { host.remove("NRXApp"); });
    load_says(three_services, "", failed("base/channel.cpp", "service") + refused);
}

TEST_F(load_subcommand, what_fails_in_the_upload_is_reported_and_leaves_what_was_uploaded_before) {
    // To see that replay is enabled takes four platform calls, each of the three checks seven, and
    // an upload seven: the look-ups of the id, its reading, NRXApp, its child, the opening, the
    // call.
    constexpr std::size_t accel_uploaded = 4 + 3 * 7 + 7;
    const auto fails_with = [&](const std::string& reports) {
        load_says(three_services, "accel: loaded 1 events\n", reports);
        replay({"unload", "accel"});
        EXPECT_EQ(replay({"get-status"}).out.find(" is loaded"), std::string::npos) << reports;
    };
    for (const auto& [call, reports] : rows<std::size_t, std::string>{
             {3, refused},
             {4, failed(conn_file, "service") + refused},
             {5, failed(conn_file, "child") + refused},
             {6, failed(conn_file, "kr == 0 ", io_text) + refused},
             {7, failed(load_file, "kr == 0 ", io_text) + success_failed},
         }) {
        host.fail_call(accel_uploaded + call, failure::io);
        fails_with(reports);
    }
    host.before_call(accel_uploaded + 1, [&] { host.remove("compass"); });
    fails_with(no_such_service + refused);
}

TEST_F(load_subcommand, unloading_names_what_it_cannot_unload_and_goes_on) {
    load(three_services);
    calls();
    const std::string before = client_uses();
    const auto result =
        replay({"unload", "compass", "nobody", "gyro", "0x10", "99999999999", "19"}, &taken);
    EXPECT_EQ(result.out,
              "Service nobody not found\nService gyro can't be unloaded\n"
              "Service 99999999999 not found\n");
    EXPECT_EQ(result.err, no_such_service);
    EXPECT_EQ(taken, 6);
    EXPECT_EQ(calls(), (lines{read_state, "call client 1 scalars [] in [01 02 03 04]",
                              "call client 1 scalars [] in [11 00 00 00]",
                              "call client 1 scalars [] in [10 00 00 00]",
                              "call client 1 scalars [] in [13 00 00 00]"}));
    EXPECT_EQ(client_uses(), before + "open call call call call close ");
    EXPECT_EQ(replay({"get-status"}).out.find("loaded"), std::string::npos);
}

TEST_F(load_subcommand, unloading_needs_a_word_a_replay_application_and_its_driver) {
    const std::string unload_file = "replay/unload_subcommand.cpp";
    says({"unload"}, "", failed(unload_file, "argc > optind"));
    EXPECT_EQ(calls(), lines{});
    host.remove("client");
    const std::string unopened = failed(unload_file, "success");
    says({"unload", "accel"}, "", failed(conn_file, "child") + unopened);
    host.before_call(5, [&] { host.remove("NRXApp"); });
    says({"unload", "accel"}, "", failed(conn_file, "service") + unopened);
}

TEST_F(load_subcommand, events_are_deleted_however_a_subcommand_ends) {
    const auto next_event = [] {
        void* event = nrx::event_memory::take(48);
        nrx::event_memory::give_back(event);
        return event;
    };
    const void* before = next_event();
    for (const std::string text : {"", "accel,x\n", "accel,sampleid=x\n"})
        load(three_services + text);
    for (const char* signal : {"sin", "other"})
        replay({"generate", "gyro", signal, "1", "2"});
    EXPECT_EQ(next_event(), before);
}

}  // namespace tests
