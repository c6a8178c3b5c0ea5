#include "nrxctl/decoders/decoder_registry.h"

#include <array>

#include "nrxctl/decoders/category_decoders.h"
#include "nrxctl/decoders/talvor_decoder.h"
#include "nrxctl/decoders/wake_decoder.h"

namespace nrx {

namespace {

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
constinit const profile_decoder other;

constexpr std::array<const profile_decoder*, 11> decoders{
    &execution, &trace, &sensor, &orrin, &talvor, &interrupt, &uart, nullptr, &control, &scm, &wake,
};

}  // namespace

const profile_decoder* decoder_for_category(std::uint32_t category) {
    return category < decoders.size() ? decoders[category] : nullptr;
}

const profile_decoder& default_decoder() {
    return other;
}

}  // namespace nrx
