#include "nrxctl/replay/sample_file.h"

#include <algorithm>

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/line_pattern.h"
#include "nrxctl/replay/line_reader.h"
#include "nrxctl/replay/make_event.h"
#include "nrxctl/replay/sample_line.h"

namespace nrx {

namespace {

// A tag that lines of the file had: what its next line will look like, and where its event goes.
struct met_tag {
    line_pattern pattern;
    event_maker make;
    group_filler group;
};

class sample_collector {
public:
    explicit sample_collector(std::size_t file_size) : file_size_(file_size) {}

    // Adds the event of the line at the front of a text, if it is like one before it with the same
    // tag; returns the length of the line with its line feed, else 0.
    std::size_t add_alike(std::string_view text) {
        for (met_tag& met : tags_) {
            const std::size_t length = met.pattern.match(text);
            if (length == 0) continue;
            add_event(met, met.pattern.values());
            return length;
        }
        return 0;
    }

    // Adds the event of a line of any kind, if there is one. False if a field is no pair.
    bool add(std::string_view line) {
        if (!split_sample_line(line, split_)) return false;
        if (is_passed_over(split_.tag)) return true;
        met_tag* const met = find_tag(line.size());
        if (met == nullptr) {
            print_line(text_line().text("Warning: Unknown event tag ").text(split_.tag).view());
            return true;
        }
        add_event(*met, split_.values);
        met->pattern.learn(line);
        return true;
    }

    // Hands the events over, in their order and with their deltas.
    sample_groups finish() {
        for (met_tag& met : tags_)
            met.group.finish();
        set_first_deltas(groups_);
        return std::move(groups_);
    }

private:
    // Null if no event has the tag of the line, whose size hints at how many there may be.
    met_tag* find_tag(std::size_t line_size) {
        const event_maker make = find_event_maker(split_.tag);
        if (make == nullptr) return nullptr;
        const auto met = std::find_if(tags_.begin(), tags_.end(),
                                      [&](const met_tag& other) { return other.make == make; });
        if (met != tags_.end()) return &*met;
        event_list& events = groups_[std::string(split_.tag)];
        return &tags_.emplace_back(met_tag{{}, make, {events, file_size_ / line_size}});
    }

    static void add_event(met_tag& met, const sample_values& values) {
        event_ptr event = met.make();
        event->parse(values);
        met.group.add(std::move(event));
    }

    std::size_t file_size_;
    sample_groups groups_;  // each stays where it is
    std::vector<met_tag> tags_;
    sample_line split_;
};

}  // namespace

std::optional<sample_groups> read_sample_file(const std::string& path) {
    line_reader fs(path);
    sample_collector collector(fs.file_size());
    for (;;) {
        if (const std::size_t length = collector.add_alike(fs.at_hand())) {
            fs.pass(length);
            continue;
        }
        const auto line = fs.next();
        if (!line) break;
        if (line->empty()) continue;
        if (!check(collector.add(*line), "pair.size() == 2")) return std::nullopt;
    }
    if (!check(fs.good(), "fs")) return std::nullopt;
    return collector.finish();
}

}  // namespace nrx
