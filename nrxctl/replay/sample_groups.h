// The samples of a file, service by service.
#pragma once

#include <functional>
#include <map>
#include <string>
#include <vector>

#include "nrxctl/replay/virtual_event.h"

namespace nrx {

using event_list = std::vector<event_ptr>;

// Service names in byte-wise order; no list is empty.
using sample_groups = std::map<std::string, event_list, std::less<>>;

// Puts the events of each service in the order of their time stamps, compared as unsigned numbers,
// and gives each its delta: the time since the one before it, or, for the first of a service, since
// the earliest sample of all. Events of the same time keep their order.
void order_samples(sample_groups& groups);

}  // namespace nrx
