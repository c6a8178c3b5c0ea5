#include "nrxctl/decoders/category_decoders.h"

#include "nrxctl/decoders/event_names.h"

namespace nrx {

short_text execution_decoder::component_name(std::uint32_t component) const {
    return name_for_id(execution_components, component);
}

short_text execution_decoder::event_name(std::uint32_t component, std::uint32_t event) const {
    return component < execution_events.size() ? name_for_id(execution_events[component], event)
                                               : id_number(event);
}

short_text trace_decoder::component_name(std::uint32_t component) const {
    return name_for_id(trace_components, component);
}

short_text sensor_decoder::component_name(std::uint32_t component) const {
    return name_for_id(sensor_components, component);
}

short_text sensor_decoder::event_name(std::uint32_t /*component*/, std::uint32_t event) const {
    return name_for_id(sensor_events, event);
}

short_text orrin_decoder::component_name(std::uint32_t component) const {
    return name_for_id(orrin_components, component);
}

short_text orrin_decoder::event_name(std::uint32_t /*component*/, std::uint32_t event) const {
    return name_for_id(orrin_events, event);
}

short_text interrupt_decoder::component_name(std::uint32_t component) const {
    return name_for_id(interrupt_components, component);
}

short_text interrupt_decoder::event_name(std::uint32_t /*component*/, std::uint32_t event) const {
    return name_for_id(interrupt_events, event);
}

short_text uart_decoder::component_name(std::uint32_t component) const {
    return name_for_id(uart_components, component);
}

short_text uart_decoder::event_name(std::uint32_t /*component*/, std::uint32_t event) const {
    return name_for_id(uart_events, event);
}

short_text scm_decoder::component_name(std::uint32_t component) const {
    return name_for_id(scm_components, component);
}

}  // namespace nrx
