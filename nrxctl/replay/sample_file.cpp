#include "nrxctl/replay/sample_file.h"

#include <algorithm>
#include <array>
#include <limits>
#include <string_view>
#include <system_error>

#include "nrxctl/base/check.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/fast/line_pattern.h"
#include "nrxctl/replay/line_reader.h"

namespace nrx {

namespace {

// An event with a copy of its timestamp, so that sorting touches no event.
struct timestamped_event {
    std::uint64_t timestamp;
    event_ptr event;
};

void sort_by_time(event_list& events) {
    std::vector<timestamped_event> dated;
    dated.reserve(events.size());
    for (event_ptr& event : events) {
        const std::uint64_t timestamp = event->timestamp();
        dated.push_back({timestamp, std::move(event)});
    }
    std::stable_sort(dated.begin(), dated.end(),
                     [](const timestamped_event& a, const timestamped_event& b) {
                         return a.timestamp < b.timestamp;
                     });
    std::transform(dated.begin(), dated.end(), events.begin(),
                   [](timestamped_event& sorted) { return std::move(sorted.event); });
}

void set_delta(VirtualEvent& event, std::uint64_t previous) {
    event.set_delta(static_cast<std::uint32_t>(event.timestamp() - previous));
}

// Fills the list of a service and sets deltas while each event is in the cache: a second pass over
// millions of events would add a tenth to the reading time.
class group_filler {
public:
    // Fills an empty list, which must outlive this object. expected is an upper estimate of its
    // size. Unused reserved storage costs no memory, whereas growing copies the list. The limit
    // guards against a misleading file size.
    group_filler(event_list& events, std::size_t expected) : events_(&events) {
        constexpr std::size_t max_expected = std::size_t{1} << 22;
        events.reserve(std::min(expected, max_expected));
        event_memory::prefer_huge_pages(events.data(), events.capacity() * sizeof(event_ptr));
    }

    void add(event_ptr event) {
        const std::uint64_t timestamp = event->timestamp();
        if (!events_->empty()) {
            event->set_delta(static_cast<std::uint32_t>(timestamp - last_timestamp_));
            if (timestamp < last_timestamp_) is_in_order_ = false;
        }
        last_timestamp_ = timestamp;
        events_->push_back(std::move(event));
    }

    // Puts the events in order, with their deltas except the first one's. Most recordings are in
    // order.
    void finish() {
        if (is_in_order_) return;
        sort_by_time(*events_);
        std::uint64_t previous = events_->front()->timestamp();
        for (const event_ptr& event : *events_) {
            set_delta(*event, previous);
            previous = event->timestamp();
        }
    }

private:
    event_list* events_;
    std::uint64_t last_timestamp_ = 0;
    bool is_in_order_ = true;
};

void set_first_deltas(sample_groups& groups) {
    std::uint64_t earliest = std::numeric_limits<std::uint64_t>::max();
    for (const auto& [name, events] : groups)
        earliest = std::min(earliest, events.front()->timestamp());
    for (const auto& [name, events] : groups)
        set_delta(*events.front(), earliest);
}

// What is known about a tag that has occurred: the pattern of its next line and the destination of
// its events.
struct tag_state {
    line_pattern pattern;
    event_maker make;
    group_filler group;
};

class sample_collector {
public:
    explicit sample_collector(std::size_t file_size) : file_size_(file_size) {}

    // Adds the event of the line at the front of the text if it matches the pattern of a tag.
    // Returns the length of the line with its line feed, or 0.
    std::size_t try_pattern(std::string_view text) {
        for (tag_state& tag : tags_) {
            const std::size_t length = tag.pattern.match(text);
            if (length == 0) continue;
            add_event(tag, tag.pattern.values());
            return length;
        }
        return 0;
    }

    // Adds the event of any line, if the line has one. Returns false if a field is not a pair.
    bool add(std::string_view line) {
        if (!split_sample_line(line, split_)) return false;
        if (is_skipped(split_.tag)) return true;
        tag_state* const tag = find_tag(line.size());
        if (tag == nullptr) {
            print_line(text_line().text("Warning: Unknown event tag ").text(split_.tag).view());
            return true;
        }
        add_event(*tag, split_.values);
        tag->pattern.learn(line);
        return true;
    }

    // Returns all events, in order and with their deltas.
    sample_groups finish() {
        for (tag_state& tag : tags_)
            tag.group.finish();
        set_first_deltas(groups_);
        return std::move(groups_);
    }

private:
    // Returns the state of the line's tag, or null if no event has that tag. The size of the line
    // tells how many such lines the file may have.
    tag_state* find_tag(std::size_t line_size) {
        const event_maker make = find_event_maker(split_.tag);
        if (make == nullptr) return nullptr;
        const auto match = std::find_if(tags_.begin(), tags_.end(),
                                        [&](const tag_state& tag) { return tag.make == make; });
        if (match != tags_.end()) return &*match;
        event_list& events = groups_[std::string(split_.tag)];
        return &tags_.emplace_back(tag_state{{}, make, {events, file_size_ / line_size}});
    }

    static void add_event(tag_state& tag, const sample_values& values) {
        event_ptr event = tag.make();
        event->parse(values);
        tag.group.add(std::move(event));
    }

    std::size_t file_size_;
    sample_groups groups_;  // the lists keep their addresses
    std::vector<tag_state> tags_;
    sample_line split_;
};

// Files that are no text, by their first bytes.
struct format_row {
    std::string_view magic;
    std::string_view explanation;
};

constexpr std::array formats{
    format_row{"\x1f\x8b", "is compressed; expand it with gunzip"},
    format_row{"BZh", "is compressed; expand it with bunzip2"},
    format_row{"\xfd"
               "7zXZ",
               "is compressed; expand it with unxz"},
    format_row{"\x28\xb5\x2f\xfd", "is compressed; expand it with unzstd"},
    format_row{"PK\x03\x04", "is compressed; expand it with unzip"},
};

// Returns what is wrong with a file that begins like this, or an empty text if it may be text. A
// NUL at the very beginning tells binary files from text.
std::string_view describe_format(std::string_view beginning) {
    constexpr std::size_t header_size = 512;
    const auto match = std::find_if(formats.begin(), formats.end(), [&](const format_row& format) {
        return beginning.starts_with(format.magic);
    });
    if (match != formats.end()) return match->explanation;
    return beginning.substr(0, header_size).find('\0') == std::string_view::npos ? ""
                                                                                 : "is not text";
}

// Says in explanations which file and which line is wrong.
class file_position {
public:
    explicit file_position(const std::string& path)
        : path_(path), scope_([this](explanation& given) {
              given.problem = std::string(text().view()).append(given.problem);
          }) {}

    void next_line() { ++line_; }

    // From here on explanations are about the file as a whole, as they are before the first line.
    void end_of_lines() { line_ = 0; }

private:
    // "PATH:LINE: " or "PATH ".
    [[nodiscard]] text_line text() const {
        text_line position;
        position.text(path_);
        if (line_ > 0) position.text(":").number(line_).text(":");
        position.text(" ");
        return position;
    }

    const std::string& path_;
    std::size_t line_ = 0;
    explanation_scope scope_;
};

explanation wrong_field() {
    return {"a field is not KEY=VALUE", "expected SERVICE,KEY=VALUE,..."};
}

explanation no_samples() {
    return {"contains no samples", "expected lines SERVICE,KEY=VALUE,..."};
}

}  // namespace

std::optional<sample_groups> read_sample_file(const std::string& path) {
    const block_output blocks;
    line_reader reader(path);
    file_position position(path);
    const std::string_view format = describe_format(reader.beginning());
    if (!format.empty()) {
        explain([&] { return explanation{std::string(format)}; });
        count_failure();
        return std::nullopt;
    }
    sample_collector collector(reader.file_size());
    for (;;) {
        position.next_line();
        if (const std::size_t length = collector.try_pattern(reader.buffered())) {
            reader.consume(length);
            continue;
        }
        const auto line = reader.next();
        if (!line) break;
        if (!check_explained(collector.add(*line), "pair.size() == 2", wrong_field))
            return std::nullopt;
    }
    position.end_of_lines();
    if (!check_explained(reader.good(), "fs", [&] {
            return explanation{"cannot be read: " + std::system_category().message(reader.error())};
        })) {
        return std::nullopt;
    }
    auto groups = collector.finish();
    if (groups.empty()) explain(no_samples);
    return groups;
}

}  // namespace nrx
