#include "nrxctl/decoders/category_decoders.h"

#include <algorithm>
#include <array>

#include "nrxctl/decoders/event_names.h"
#include "nrxctl/decoders/record_fields.h"
#include "nrxctl/decoders/record_layout.h"

namespace nrx {

namespace {

// A decoder that names components, and events whatever their component.
class naming_decoder : public profile_decoder {
public:
    consteval naming_decoder(id_name_table components, id_name_table events)
        : components_(components), events_(events) {}

    [[nodiscard]] short_text component_name(std::uint32_t component) const override {
        return name_for_id(components_, component);
    }
    [[nodiscard]] short_text event_name(std::uint32_t /*component*/,
                                        std::uint32_t event) const override {
        return name_for_id(events_, event);
    }

private:
    id_name_table components_;
    id_name_table events_;
};

// Events are named by component.
class execution_decoder : public naming_decoder {
public:
    consteval execution_decoder() : naming_decoder(execution_components, {}) {}

    [[nodiscard]] short_text event_name(std::uint32_t component,
                                        std::uint32_t event) const override {
        static constexpr basic_name_table<id_name_table> events_by_component(execution_events);
        return name_for_id(events_by_component.name(component), event);
    }
};

class trace_decoder : public naming_decoder {
public:
    consteval trace_decoder() : naming_decoder(trace_components, {}) {}
};

class sensor_decoder : public naming_decoder {
public:
    consteval sensor_decoder() : naming_decoder(sensor_components, sensor_events) {}
};

class orrin_decoder : public naming_decoder {
public:
    consteval orrin_decoder() : naming_decoder(orrin_components, orrin_events) {}
};

// Data records carry samples of three axes.
class talvor_decoder : public naming_decoder {
public:
    consteval talvor_decoder() : naming_decoder(talvor_components, talvor_events) {}

    void decode_body(event_text& line, const profile_record& record) const override {
        // First words: category, component, event, type.
        constexpr std::uint32_t data_in = 0x04000003;
        constexpr std::uint32_t data_out = 0x04000103;
        switch (record.first_word()) {
            case data_in:
                return append_fields(line, record, talvor_data_in_rows);
            case data_out:
                return append_fields(line, record, talvor_data_out_rows);
            default:
                return profile_decoder::decode_body(line, record);
        }
    }
};

class interrupt_decoder : public naming_decoder {
public:
    consteval interrupt_decoder() : naming_decoder(interrupt_components, interrupt_events) {}
};

class uart_decoder : public naming_decoder {
public:
    consteval uart_decoder() : naming_decoder(uart_components, uart_events) {}
};

class scm_decoder : public naming_decoder {
public:
    consteval scm_decoder() : naming_decoder(scm_components, {}) {}
};

// Information records say what kept the coprocessor awake.
class wake_decoder : public naming_decoder {
public:
    consteval wake_decoder() : naming_decoder(wake_components, wake_events) {}

    void decode_body(event_text& line, const profile_record& record) const override {
        // First words. The type of a request has neither a name nor rows of its own.
        constexpr std::uint32_t request_info = 0x0a00010d;
        constexpr std::uint32_t event_info = 0x0a000203;
        switch (record.first_word()) {
            case request_info:
                return append_fields(line, record, wake_request_rows);
            case event_info:
                return append_fields(line, record, wake_event_rows);
            default:
                return profile_decoder::decode_body(line, record);
        }
    }
};

constinit const execution_decoder execution;
constinit const trace_decoder trace;
constinit const sensor_decoder sensor;
constinit const orrin_decoder orrin;
constinit const talvor_decoder talvor;
constinit const interrupt_decoder interrupt;
constinit const uart_decoder uart;
constinit const profile_decoder control;
constinit const scm_decoder scm;
constinit const wake_decoder wake;
constinit const profile_decoder default_category;

struct category_row {
    std::uint32_t category;
    const profile_decoder* decoder;
};
constexpr std::array decoders{
    category_row{0, &execution}, category_row{1, &trace},   category_row{2, &sensor},
    category_row{3, &orrin},     category_row{4, &talvor},  category_row{5, &interrupt},
    category_row{6, &uart},      category_row{8, &control}, category_row{9, &scm},
    category_row{10, &wake},
};

}  // namespace

const profile_decoder* decoder_for_category(std::uint32_t category) {
    const auto* row =
        std::find_if(decoders.begin(), decoders.end(),
                     [&](const category_row& entry) { return entry.category == category; });
    return row == decoders.end() ? nullptr : row->decoder;
}

const profile_decoder& default_decoder() {
    return default_category;
}

}  // namespace nrx
