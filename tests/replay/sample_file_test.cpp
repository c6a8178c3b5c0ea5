// Files of samples: what is read, in which order and with which deltas; what is refused, and how.
#include "nrxctl/replay/sample_file.h"

#include "nrxctl/base/little_endian.h"
#include "tests/replay/replay_host.h"

namespace tests {

namespace {

const std::string pair_failure = failed("replay/sample_file.cpp", "pair.size() == 2");

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

struct reading {
    outcome written;
    std::string events;  // "none" if nothing was handed over
};

reading read(std::string_view text) {
    const sample_text_file file(text);
    reading result;
    result.written = capture([&] {
        const auto groups = nrx::read_sample_file(file.path());
        result.events = groups ? dumped(*groups) : "none";
    });
    return result;
}

// An accelerometer line with some numbers, and one more field.
std::string accel(const std::string& more) {
    return "accel,sampleid=1,temperature=0,x=2,y=3,z=4,timestamp=5," + more;
}
const std::string accel_event = "accel 28 0 1 0 2 3 4 @5\n";

std::string at(const std::string& tag, const std::string& id, const std::string& timestamp) {
    return tag + ",sampleid=" + id + ",temperature=0,x=0,y=0,z=0,p=0,timestamp=" + timestamp + "\n";
}

}  // namespace

TEST(sample_file, reads_what_the_grammar_allows) {
    for (const auto& [text, events] : rows<std::string, std::string>{
             {"", ""},
             {"\n\n\n", ""},
             {accel("k=v"), accel_event},            // keys that nobody reads, no line feed
             {accel("k=v") + "\n", accel_event},     //
             {accel("k=v,") + "\n", accel_event},    // one comma at the end
             {accel("=v"), accel_event},             // an empty key
             {accel("X=9,xx=9, x=9"), accel_event},  // nearly a key
             {accel("x=7,x=6"), "accel 28 0 1 0 6 3 4 @5\n"},
             {accel("shake=0"), accel_event},
             {accel("shake=01"), accel_event},
             {accel("shake=1,shake=2"), accel_event},
             {accel("p=junk"), accel_event},
             // Values of a line are none of the next one's: neither the shake nor the numbers.
             {"pressure,p=-1,timestamp=3,temperature=100,sampleid=8,shake=1,x=junk\n" +
                  accel("k=v"),
              "accel 28 2 1 0 2 3 4 @5\npressure 20 0 8 65536 -1 @3\n"},
             {"# a comment\n#\n#accel,x=1\n,k=v\n,\n two words\naccel too,k=v\n" + accel("k=v"),
              accel_event},
         }) {
        const reading result = read(text);
        EXPECT_EQ(result.events, events) << text;
        EXPECT_EQ(result.written.out + result.written.err, "") << text;
    }
}

TEST(sample_file, warns_of_unknown_tags_and_reads_on) {
    const auto result = read("accelx,k=v\n" + accel("k=v") + "\nACCEL\n#x\naccel\t,k=v\nal\n");
    EXPECT_EQ(result.events, accel_event);
    EXPECT_EQ(result.written.out,
              "Warning: Unknown event tag accelx\nWarning: Unknown event tag ACCEL\n"
              "Warning: Unknown event tag accel\t\nWarning: Unknown event tag al\n");
    EXPECT_EQ(result.written.err, "");
}

TEST(sample_file, a_field_that_is_no_pair_fails_the_whole_file) {
    for (const std::string field : {"k", "k=", "=", "==", "k=v=", "k==v", "k=v=w", "=v=", ",k=v",
                                    "k=v,,k=v", "k=v,,", "\r"}) {
        // Wherever it stands: among samples, in a comment, under a tag that would be passed over.
        for (const std::string& text :
             {accel(field), "#," + field, "a b," + field, "," + field, "nobody," + field}) {
            const auto result = read(accel("k=v") + "\n" + text + "\nnever,k=v\n");
            EXPECT_EQ(result.events, "none") << text;
            EXPECT_EQ(result.written.err, pair_failure) << text;
            EXPECT_EQ(result.written.out, "") << text;
        }
    }
    // Before a number of the same line is read.
    EXPECT_EQ(read("accel,sampleid=junk,k\n").written.err, pair_failure);
}

TEST(sample_file, a_file_that_cannot_be_read_is_reported) {
    for (const std::string path : {"/nonexistent/samples", "", "/tmp"}) {
        bool has_groups = true;
        const auto result = capture([&] { has_groups = nrx::read_sample_file(path).has_value(); });
        EXPECT_FALSE(has_groups) << path;
        EXPECT_EQ(result.err, failed("replay/sample_file.cpp", "fs")) << path;
        EXPECT_EQ(result.out, "") << path;
    }
}

TEST(sample_file, a_value_that_is_missing_or_no_number_ends_the_process) {
    for (const auto& [line, message] : rows<std::string, std::string>{
             // The first in the order of reading is named.
             {"accel", "error converting samples ()"},
             {"accel,sampleid=a,temperature=b", "error converting samples (a)"},
             {"accel,sampleid=1,temperature=b,x=c", "error converting samples (b)"},
             {"accel,sampleid=1,temperature=1,y=d,z=e,x=c", "error converting samples (c)"},
             {"accel,sampleid=1,temperature=1,x=1,z=e,y=d", "error converting samples (d)"},
             {"accel,sampleid=1,temperature=1,x=1,y=1,timestamp=f,z=e",
              "error converting samples (e)"},
             {"accel,sampleid=1,temperature=1,x=1,y=1,z=1,shake=1,timestamp=f",
              "error converting timestamp (f)"},
             {"accel,sampleid=1,x=1,y=1,z=1,timestamp=1", "error converting samples ()"},
             {"accel,sampleid=1,temperature=1,y=1,z=1,timestamp=1", "error converting samples ()"},
             {"accel,sampleid=1,temperature=1,x=1,z=1,timestamp=1", "error converting samples ()"},
             {"accel,sampleid=1,temperature=1,x=1,y=1,timestamp=1", "error converting samples ()"},
             {"pressure,sampleid=1,temperature=1,timestamp=1", "error converting samples ()"},
             {"gyro,sampleid=1,temperature=1,x=1,y=1,z=1", "error converting timestamp ()"},
             {accel("shake=1"), "Shake samples are not allowed"},
             {accel("shake=0,shake=1"), "Shake samples are not allowed"},
             {accel("x=9,x=-"), "error converting samples (-)"},
             {accel("temperature=1\r"), "error converting samples (1\r)"},
             {accel("x=0X10"), "error converting samples (0X10)"},
             {accel("x= 1"), "error converting samples ( 1)"},
             {"pressure,sampleid=g,p=h,temperature=1,timestamp=i", "error converting samples (g)"},
             {"pressure,sampleid=1,p=h,temperature=i,timestamp=j", "error converting samples (i)"},
             {"pressure,sampleid=1,p=h,temperature=1,timestamp=j", "error converting samples (h)"},
             {"pressure,sampleid=1,p=1,temperature=1", "error converting timestamp ()"},
         }) {
        const auto result = read(accel("p=1,shake=0\n") + line + "\nnobody\n");
        EXPECT_EQ(result.written.out, message + "\n") << line;
        EXPECT_EQ(result.written.status, 1) << line;
        EXPECT_EQ(result.written.err, "") << line;
    }
}

TEST(sample_file, numbers_keep_their_low_32_bits) {
    for (const auto& [written, sampleid, x, timestamp] :
         rows<std::string, std::string, std::string, std::string>{
             {"+7", "7", "7", "7"},
             {"007", "7", "7", "7"},
             {"0xffff0000", "4294901760", "-65536", "18446744073709486080"},
             {"-0x10", "4294967280", "-16", "18446744073709551600"},
             {"2147483647", "2147483647", "2147483647", "2147483647"},
             {"2147483648", "2147483648", "-2147483648", "18446744071562067968"},
             {"0x700000001", "1", "1", "1"},
             {"9223372036854775807", "4294967295", "-1", "18446744073709551615"},
         }) {
        const auto result = read("accel,sampleid=" + written +
                                 ",temperature=0,y=0,z=0,x=" + written + ",timestamp=" + written);
        EXPECT_EQ(result.events,
                  "accel 28 0 " + sampleid + " 0 " + x + " 0 0 @" + timestamp + "\n");
    }
}

TEST(sample_file, temperatures_are_degrees_with_16_fraction_bits_cut_towards_zero) {
    for (const auto& [hundredths, degrees] : rows<std::string, std::string>{
             {"2880", "1887436"},
             {"-2880", "-1887436"},
             {"1", "655"},
             {"-1", "-655"},
             {"100", "65536"},
             {"32767", "21474181"},
             {"32768", "-21474836"},
             {"-32769", "21474181"},
             {"65536", "0"},
             {"0x8000", "-21474836"},
             {"4294967296000", "0"},
         }) {
        EXPECT_EQ(read(accel("temperature=" + hundredths)).events,
                  "accel 28 0 1 " + degrees + " 2 3 4 @5\n");
        EXPECT_EQ(read("pressure,sampleid=1,p=2,timestamp=5,temperature=" + hundredths).events,
                  "pressure 20 0 1 " + degrees + " 2 @5\n");
    }
}

TEST(sample_file, samples_are_in_order_by_service_and_time_with_deltas_from_the_earliest) {
    const auto result =
        read(at("gyro", "1", "1500") + at("pressure", "2", "4000") + at("accel", "3", "3000") +
             at("compass", "4", "9000") + at("gyro", "5", "1600") + at("accel", "6", "1000") +
             at("accel", "7", "2000"));
    EXPECT_EQ(result.events,
              "accel 28 0 6 0 0 0 0 @1000\n"
              "accel 28 1000 7 0 0 0 0 @2000\n"
              "accel 28 1000 3 0 0 0 0 @3000\n"
              "compass 28 8000 4 0 0 0 0 @9000\n"
              "gyro 28 500 1 0 0 0 0 @1500\n"
              "gyro 28 100 5 0 0 0 0 @1600\n"
              "pressure 20 3000 2 0 0 @4000\n");
}

TEST(sample_file, negative_times_come_after_all_others_and_equal_times_keep_their_order) {
    EXPECT_EQ(read(at("gyro", "1", "-5") + at("gyro", "2", "0x80000000") + at("gyro", "3", "10") +
                   at("accel", "4", "-1"))
                  .events,
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
    EXPECT_EQ(read(text).events, expected + "accel 28 1 100 0 0 0 0 @9\n");
}

TEST(sample_file, lines_are_read_whole_wherever_they_fall_in_the_file) {
    // Longer, all together, than what is read at a time; one line alone is longer, too.
    const std::string filler(300'000, 'k');
    std::string text;
    std::string expected;
    for (int i = 0; i < 9000; ++i) {
        text += at("accel", std::to_string(i), std::to_string(i));
        expected += "accel 28 " + std::string(i == 0 ? "0 " : "1 ") + std::to_string(i) +
                    " 0 0 0 0 @" + std::to_string(i) + "\n";
        if (i == 4000) text += "#" + filler + "\n";
    }
    EXPECT_EQ(read(text).events, expected);
    EXPECT_EQ(read(accel(filler + "=v")).events, accel_event);
    EXPECT_EQ(read("#" + filler + "\n" + accel("k=" + filler)).events, accel_event);
}

}  // namespace tests
