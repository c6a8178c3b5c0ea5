// The samples of a file, service by service.
#pragma once

#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <vector>

#include "nrxctl/replay/virtual_event.h"

namespace nrx {

using event_list = std::vector<event_ptr>;

// Service names in byte-wise order; no list is empty.
using sample_groups = std::map<std::string, event_list, std::less<>>;

// Fills a group with the events of a file, while each is at hand: a second walk through millions of
// them would cost as much as a tenth of reading them.
class group_filler {
public:
    // Fills an empty group, which must outlive this object, with about so many events at most.
    group_filler(event_list& events, std::size_t expected);

    void add(event_ptr event);

    // To be called behind the last event: puts them in the order of their time stamps, compared as
    // unsigned numbers. Events of the same time keep their order. Each has its delta then, the time
    // since the one before it; that of the first is 0.
    void finish();

private:
    event_list* events_;
    std::uint64_t last_timestamp_ = 0;
    bool is_in_order_ = true;
};

// Gives the first event of each finished group its delta: the time since the earliest of all.
void set_first_deltas(sample_groups& groups);

}  // namespace nrx
