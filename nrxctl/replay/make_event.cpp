#include "nrxctl/replay/make_event.h"

#include <algorithm>
#include <array>

#include "nrxctl/replay/axis_event.h"
#include "nrxctl/replay/pressure_event.h"

namespace nrx {

namespace {

template <class Event>
event_ptr make() {
    return std::make_unique<Event>();
}

struct event_class {
    std::string_view tag;
    event_maker make;
};

constexpr std::array event_classes{
    event_class{AccelEvent::tag, make<AccelEvent>},
    event_class{GyroEvent::tag, make<GyroEvent>},
    event_class{CompassEvent::tag, make<CompassEvent>},
    event_class{PressureEvent::tag, make<PressureEvent>},
};

}  // namespace

event_maker find_event_maker(std::string_view tag) {
    const auto* row = std::find_if(event_classes.begin(), event_classes.end(),
                                   [&](const event_class& known) { return known.tag == tag; });
    return row == event_classes.end() ? nullptr : row->make;
}

event_ptr make_event(std::string_view tag) {
    const event_maker make = find_event_maker(tag);
    return make == nullptr ? nullptr : make();
}

}  // namespace nrx
