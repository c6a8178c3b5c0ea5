// Connections of the virtual host.

#include <string>

#include "platform/connection.h"
#include "platform/virtual/current_machine.h"

namespace platform {

using simulated::current_machine;
using simulated::entry_ref;
using simulated::failure;
using simulated::lent_connection;
using simulated::lent_service;
using simulated::machine;

namespace {

// At least so many digits.
std::string hexadecimal(std::uint64_t value, std::size_t least) {
    constexpr std::string_view digits = "0123456789abcdef";
    std::string text;
    for (; value != 0 || text.size() < least; value /= 16) {
        text.insert(text.begin(), digits[value % 16]);
    }
    return text;
}

// The call in the words of the log: "call NAME SELECTOR scalars [..] in [..] results N room N".
std::string describe_call(const entry_ref& provider, std::uint32_t selector,
                          const call_inputs& inputs, const call_outputs& outputs) {
    std::string text = "call " + name_of(provider) + " " + std::to_string(selector) + " scalars [";
    for (const std::uint64_t scalar : inputs.scalars) {
        if (text.back() != '[') text += ' ';
        text += "0x" + hexadecimal(scalar, 1);
    }
    text += "] in [";
    for (const std::uint8_t byte : inputs.structure) {
        if (text.back() != '[') text += ' ';
        text += hexadecimal(byte, 2);
    }
    return text + "] results " + std::to_string(outputs.scalars.size()) + " room " +
           std::to_string(outputs.structure.size());
}

}  // namespace

void connection_kind::release(handle_id id) {
    machine& host = current_machine();
    host.note([&] { return "close " + name_of(host.provider<lent_connection>(id)); });
    host.take_back(id);
}

return_code open(const service& provider, std::uint32_t type, connection& opened) {
    machine& host = current_machine();
    const entry_ref entry = host.provider<lent_service>(provider.id());
    const auto how =
        host.begin_call([&] { return "open " + name_of(entry) + " type " + std::to_string(type); });
    if (how) return code_of(*how);
    if (!entry || !entry->present) return not_found;
    if (!entry->unit) return unsupported;
    const return_code result = entry->unit->open(type);
    if (result == success) opened = connection(host.lend(lent_connection{entry}));
    return result;
}

return_code call(const connection& connected, std::uint32_t selector, const call_inputs& inputs,
                 call_outputs& outputs) {
    machine& host = current_machine();
    const entry_ref provider = host.provider<lent_connection>(connected.id());
    const auto how =
        host.begin_call([&] { return describe_call(provider, selector, inputs, outputs); });
    if (how) {
        if (*how == failure::nothing) outputs = {};
        return code_of(*how);
    }
    if (!provider || !provider->present) return not_found;
    return provider->unit->call(selector, inputs, outputs);
}

}  // namespace platform
