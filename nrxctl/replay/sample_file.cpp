#include "nrxctl/replay/sample_file.h"

#include "nrxctl/base/failure_report.h"
#include "nrxctl/base/output.h"
#include "nrxctl/base/text_line.h"
#include "nrxctl/replay/line_reader.h"
#include "nrxctl/replay/make_event.h"
#include "nrxctl/replay/sample_line.h"

namespace nrx {

namespace {

void add_event(const sample_line& line, sample_groups& groups) {
    event_ptr event = make_event(line.tag);
    if (!event) {
        print_line(text_line().text("Warning: Unknown event tag ").text(line.tag).view());
        return;
    }
    event->parse(line.values);
    auto group = groups.find(line.tag);
    if (group == groups.end()) group = groups.try_emplace(event->name()).first;
    group->second.push_back(std::move(event));
}

}  // namespace

std::optional<sample_groups> read_sample_file(const std::string& path) {
    line_reader fs(path);
    sample_groups groups;
    sample_line split;
    while (const auto line = fs.next()) {
        if (line->empty()) continue;
        if (!check(split_sample_line(*line, split), "pair.size() == 2")) return std::nullopt;
        if (!is_passed_over(split.tag)) add_event(split, groups);
    }
    if (!check(fs.good(), "fs")) return std::nullopt;
    order_samples(groups);
    return groups;
}

}  // namespace nrx
