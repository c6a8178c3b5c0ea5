// Files of samples: what is read, in which order and with which deltas; what is rejected, and how.
// Lines are read cold, as the first of their kind, and warm, after lines whose pattern is tried.
#include "nrxctl/replay/sample_file.h"

#include "nrxctl/base/little_endian.h"
#include "nrxctl/replay/line_reader.h"
#include "tests/replay/replay_host.h"

namespace tests {

namespace {

const std::string pair_failure =
    "none\n" + library_report(source_file::sample_file, "pair.size() == 2");

// Enough text after a line that its pattern can be tried.
const std::string padding = "\n#" + std::string(32, '-') + "\n";

// "accel 28 delta sampleid temperature values... @timestamp" and a line feed, event by event.
std::string dumped(const nrx::sample_groups& groups) {
    std::string text;
    for (const auto& [name, events] : groups) {
        for (const auto& event : events) {
            EXPECT_EQ(event->name(), name);
            text += name;
            for (std::uint32_t offset = 0; offset < event->size(); offset += 4) {
                const auto* word = event->data() + offset;
                text += ' ' + (offset < 12 ? std::to_string(nrx::load_le<std::uint32_t>(word))
                                           : std::to_string(nrx::load_le<std::int32_t>(word)));
            }
            text += " @" + std::to_string(event->timestamp()) + "\n";
        }
    }
    return text;
}

// Reads a file. Returns its events, or "none" and a line feed if it has no groups, then what was
// written on standard output and standard error, then the status if the process has ended.
std::string read_path(const std::string& path) {
    std::string events;
    const outcome written = capture([&] {
        const auto groups = nrx::read_sample_file(path);
        events = groups ? dumped(*groups) : "none\n";
    });
    return events + written.out + written.err +
           (written.status ? "status " + std::to_string(*written.status) : "");
}

std::string read(std::string_view text) {
    return read_path(sample_file(text));
}

// Accelerometer lines with a field at their end or in the middle, and their event.
std::string accel(const std::string& field) {
    return "accel,sampleid=1,temperature=0,x=2,y=3,z=4,timestamp=5," + field;
}
std::string middle(const std::string& field) {
    return "accel,sampleid=1," + field + ",temperature=0,x=2,y=3,z=4,timestamp=5";
}
const std::string accel_event = "accel 28 0 1 0 2 3 4 @5\n";

// What may stand before a line: nothing, or lines that teach a pattern and the lengths of values.
const lines prefixes{"", accel("k=vvvv") + "\n" + accel("k=vvvv") + "\n",
                     middle("k=vvvv") + "\n" + middle("k=vvvv") + "\n"};

std::string at(const std::string& tag, const std::string& id, const std::string& timestamp) {
    return tag + ",sampleid=" + id + ",temperature=0,x=0,y=0,z=0,p=0,timestamp=" + timestamp + "\n";
}

}  // namespace

TEST(line_reader, reads_lines_with_any_capacity_up_to_the_last_byte) {
    for (const std::string text :
         {"", "\n", "a", "abcdefg\n", "abcdefgh\n\nxyz\nlast", "\n\nabcdefghijklmnopq\n\n"}) {
        lines expected = split(text, '\n');
        const std::string path = sample_file(text);
        for (std::size_t capacity = 1; capacity <= 24; ++capacity) {
            nrx::line_reader reader(path, capacity);
            EXPECT_EQ(reader.file_size(), text.size());
            lines read;
            while (const auto line = reader.next())
                read.emplace_back(*line);
            EXPECT_EQ(read, expected) << capacity;
            EXPECT_TRUE(reader.good());
        }
    }
}

TEST(sample_files, reads_what_the_grammar_allows) {
    rows<std::string, std::string> cases{{"", ""},
                                         {"\n\n\n", ""},
                                         {accel("x=7,x=6"), "accel 28 0 1 0 6 3 4 @5\n"},
                                         {accel("k=vvvv,x=6"), "accel 28 0 1 0 6 3 4 @5\n"}};
    // Keys that nobody reads, a comma at the end, an empty key, similar keys, another order.
    for (const std::string& text :
         {accel("k=v"), accel("k=v,"), accel("=v"), accel("X=9,xx=9, x=9"), middle("k=vvvv,x=7"),
          middle("x=7777"), middle("K=vvvv"), middle("kk=vvv"), accel("p=junk"), accel("shake=0"),
          accel("shake=01"), accel("shake=1,shake=2"),
          std::string("accel,sampleid=1,temperature=0,y=3,x=2,z=4,timestamp=5,k=vvvv"),
          "# a comment\n#\n#accel,x=1\n,k=v\n,\n two words\naccel too,k=v\n" + accel("k=v")})
        cases.push_back({text, accel_event});
    for (const auto& [text, events] : cases) {
        for (const std::string& prefix : prefixes) {
            for (const std::string& end : {std::string(), padding}) {
                EXPECT_EQ(read(prefix + text + end),
                          (prefix.empty() ? "" : accel_event + accel_event) + events)
                    << text;
            }
        }
    }
    // A line leaves no value to the next one: neither the shake nor the numbers.
    EXPECT_EQ(read("pressure,p=-1,timestamp=3,temperature=100,sampleid=8,shake=1,x=junk\n" +
                   accel("k=v")),
              "accel 28 2 1 0 2 3 4 @5\npressure 20 0 8 65536 -1 @3\n");
}

TEST(sample_files, warns_of_unknown_tags_and_reads_on) {
    for (const std::string& prefix : prefixes) {
        EXPECT_TRUE(read(prefix + "accelx" + accel("k=vvvv").substr(5) + "\naccem,k=v\n" +
                         accel("k=v") + "\nACCEL\n#x\naccel\t,k=v\nal\n")
                        .ends_with(accel_event + "Warning: Unknown event tag accelx\n"
                                                 "Warning: Unknown event tag accem\n"
                                                 "Warning: Unknown event tag ACCEL\n"
                                                 "Warning: Unknown event tag accel\t\n"
                                                 "Warning: Unknown event tag al\n"));
    }
}

TEST(sample_files, a_malformed_field_rejects_the_whole_file) {
    for (const std::string field :
         {"k", "k=", "=", "==", "k=v=", "k==v", "k=v=w", "=v=", ",k=v", "k=v,,k=v", "k=v,,", "\r",
          "k=,vvv", "k=vv=v", "k=vvv=", "k=vvvv=", "k=vvvv,,"}) {
        // Anywhere: among samples, in a comment, under a tag that would be skipped.
        for (const std::string& text : {accel(field), middle(field), "#," + field, "a b," + field,
                                        "," + field, "nobody," + field}) {
            for (const std::string& prefix : prefixes)
                EXPECT_EQ(read(prefix + text + "\nnever,k=v" + padding), pair_failure) << text;
        }
    }
    // Before a number of the same line is read.
    EXPECT_EQ(read("accel,sampleid=junk,k\n"), pair_failure);
}

TEST(sample_files, a_file_that_cannot_be_read_is_reported) {
    for (const std::string path : {"/nonexistent/samples", "", "/tmp"})
        EXPECT_EQ(read_path(path), "none\n" + library_report(source_file::sample_file, "fs"))
            << path;
}

TEST(sample_files, a_missing_or_malformed_value_ends_the_process) {
    // After a line with the same keys, so that its pattern is tried, and without one.
    const auto expect_end = [](const std::string& twin, const std::string& line,
                               const std::string& message) {
        for (const std::string& prefix : {std::string(), twin + "\n" + twin + "\n"})
            EXPECT_EQ(read(prefix + line + "\nnobody" + padding), message + "\nstatus 1")
                << prefix << line;
    };
    for (const std::string tag : {"accel", "gyro", "compass", "pressure"}) {
        // In the order of reading. The line has them backwards, and all from one on are malformed.
        const lines keys = tag == "pressure" ? split("sampleid temperature p timestamp")
                                             : split("sampleid temperature x y z timestamp");
        for (std::size_t first = 0; first < keys.size(); ++first) {
            std::string twin = tag + ",shake=0";
            lines bad(2, tag + ",shake=1");  // malformed, missing
            for (std::size_t i = keys.size(); i-- > 0;) {
                twin += "," + keys[i] + "=1";
                const std::string field = "," + keys[i] + "=" + (i < first ? "1" : "g" + keys[i]);
                bad[0] += field;
                if (i != first) bad[1] += field;
            }
            const std::string message = std::string("error converting ") +
                                        (keys[first] == "timestamp" ? "timestamp (" : "samples (");
            expect_end(twin, bad[0], message + "g" + keys[first] + ")");
            expect_end(twin, bad[1], message + ")");
        }
    }
    for (const auto& [line, message] : rows<std::string, std::string>{
             {accel("shake=1"), "Shake samples are not allowed"},
             {accel("shake=0,shake=1"), "Shake samples are not allowed"},
             {accel("x=9,x=-"), "error converting samples (-)"},
             {accel("temperature=1\r"), "error converting samples (1\r)"},
             {accel("x=0X10"), "error converting samples (0X10)"},
             {accel("x= 1"), "error converting samples ( 1)"},
             {"accel", "error converting samples ()"},
             {"accel,sampleid=1,temperaturE=0,x=2,y=3,z=4,timestamp=5,k=vvvv",
              "error converting samples ()"},
             {"accel,sampleid=1,k=vvvv\ntemperature=0,x=2,y=3,z=4,timestamp=5",
              "error converting samples ()"}}) {
        expect_end(middle("k=vvvv"), line, message);
        if (line.starts_with(accel("")))
            expect_end(line.substr(0, line.rfind('=') + 1) + "0", line, message);
    }
}

TEST(sample_files, numbers_keep_their_low_32_bits) {
    for (const auto& [number, sampleid, x, timestamp] :
         rows<std::string, std::string, std::string, std::string>{
             {"65536", "65536", "65536", "65536"},
             {"0xffff0000", "4294901760", "-65536", "18446744073709486080"},
             {"-0x10", "4294967280", "-16", "18446744073709551600"},
             {"2147483648", "2147483648", "-2147483648", "18446744071562067968"},
             {"0x700000001", "1", "1", "1"},
             {"9223372036854775807", "4294967295", "-1", "18446744073709551615"}}) {
        const std::string line = "accel,sampleid=" + number + ",temperature=0,y=0,z=0,x=" + number +
                                 ",timestamp=" + number;
        const std::string event =
            "accel 28 0 " + sampleid + " 0 " + x + " 0 0 @" + timestamp + "\n";
        EXPECT_EQ(read(line), event);
        EXPECT_EQ(read(line + "\n" + line + "\n" + line + padding), event + event + event);
    }
}

TEST(sample_files, temperatures_are_converted_to_16_fraction_bits) {
    // Rounded towards zero.
    using row = std::pair<std::string, std::string>;
    for (const auto& [hundredths, degrees] :
         {row{"2880", "1887436"}, row{"-2880", "-1887436"}, row{"1", "655"}, row{"-1", "-655"},
          row{"100", "65536"}, row{"32767", "21474181"}, row{"32768", "-21474836"},
          row{"-32769", "21474181"}, row{"65536", "0"}, row{"0x8000", "-21474836"},
          row{"4294967296000", "0"}}) {
        EXPECT_EQ(read(accel("temperature=" + hundredths)),
                  "accel 28 0 1 " + degrees + " 2 3 4 @5\n");
        EXPECT_EQ(read("pressure,sampleid=1,p=2,timestamp=5,temperature=" + hundredths),
                  "pressure 20 0 1 " + degrees + " 2 @5\n");
    }
}

TEST(sample_files, samples_are_ordered_by_service_and_time_with_deltas) {
    EXPECT_EQ(read(at("gyro", "1", "1500") + at("pressure", "2", "4000") +
                   at("accel", "3", "3000") + at("compass", "4", "9000") + at("gyro", "5", "1600") +
                   at("accel", "6", "1000") + at("accel", "7", "2000")),
              "accel 28 0 6 0 0 0 0 @1000\n"
              "accel 28 1000 7 0 0 0 0 @2000\n"
              "accel 28 1000 3 0 0 0 0 @3000\n"
              "compass 28 8000 4 0 0 0 0 @9000\n"
              "gyro 28 500 1 0 0 0 0 @1500\n"
              "gyro 28 100 5 0 0 0 0 @1600\n"
              "pressure 20 3000 2 0 0 @4000\n");
}

TEST(sample_files, negative_times_come_last_and_equal_times_keep_their_order) {
    EXPECT_EQ(read(at("gyro", "1", "-5") + at("gyro", "2", "0x80000000") + at("gyro", "3", "10") +
                   at("accel", "4", "-1")),
              "accel 28 4294967285 4 0 0 0 0 @18446744073709551615\n"
              "gyro 28 0 3 0 0 0 0 @10\n"
              "gyro 28 2147483638 2 0 0 0 0 @18446744071562067968\n"
              "gyro 28 2147483643 1 0 0 0 0 @18446744073709551611\n");
    std::string text = at("accel", "100", "9");
    std::string expected;
    for (int i = 0; i < 40; ++i) {
        text += at("accel", std::to_string(i), "8");
        expected += "accel 28 0 " + std::to_string(i) + " 0 0 0 0 @8\n";
    }
    EXPECT_EQ(read(text), expected + "accel 28 1 100 0 0 0 0 @9\n");
}

}  // namespace tests
