#include "nrxctl/replay/make_event.h"

#include <array>

#include "nrxctl/base/word_table.h"
#include "nrxctl/replay/axis_event.h"
#include "nrxctl/replay/pressure_event.h"

namespace nrx {

namespace {

template <class Event>
event_ptr make() {
    return std::make_unique<Event>();
}

struct event_class {
    std::string_view word;  // the tag
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
    const event_class* known = find_word_row(event_classes, tag);
    return known == nullptr ? nullptr : known->make;
}

event_ptr make_event(std::string_view tag) {
    const event_maker make = find_event_maker(tag);
    return make == nullptr ? nullptr : make();
}

}  // namespace nrx
