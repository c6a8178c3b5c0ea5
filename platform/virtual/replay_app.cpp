#include "platform/virtual/replay_app.h"

#include <algorithm>

#include "platform/virtual/little_endian.h"
#include "platform/virtual/return_codes.h"

namespace platform::simulated {

namespace {

constexpr std::size_t entry_size = 12;
constexpr std::size_t header_size = 20;

// Highest completion policy; lowest and highest location.
constexpr std::uint32_t last_completion = 3;
constexpr std::uint32_t first_location = 1;
constexpr std::uint32_t last_location = 2;

bool is_header(byte_view request) {
    if (request.size() < header_size) return false;
    const std::uint32_t completion = get_u32(request, 4);
    const std::uint32_t location = get_u32(request, 8);
    const std::uint32_t filter = get_u32(request, 12);
    const std::uint32_t byte_count = get_u32(request, 16);
    return completion <= last_completion && location >= first_location &&
           location <= last_location && filter <= 1 && byte_count == request.size() - header_size;
}

// At least one record, and nothing but whole ones.
bool are_records(byte_view bytes, std::uint32_t record_size) {
    if (bytes.empty() || bytes.size() % record_size != 0) return false;
    for (std::size_t offset = 0; offset < bytes.size(); offset += record_size) {
        if (get_u32(bytes, offset) != record_size) return false;
    }
    return true;
}

}  // namespace

replay_app::replay_app(const std::vector<replay_service>& services) {
    for (const replay_service& service : services)
        services_.push_back({service, 0, inactive});
}

replay_app::service_state* replay_app::find(std::uint32_t id) {
    const auto found = std::find_if(
        services_.begin(), services_.end(),
        [&](const service_state& one) { return static_cast<std::uint32_t>(one.service.id) == id; });
    return found == services_.end() ? nullptr : &*found;
}

byte_list replay_app::states() const {
    byte_list report(services_.size() * entry_size);
    std::size_t offset = 0;
    for (const service_state& one : services_) {
        put_le(report, offset, 4, static_cast<std::uint32_t>(one.service.id));
        put_le(report, offset + 4, 4, one.delay);
        put_le(report, offset + 8, 4, one.state);
        offset += entry_size;
    }
    return report;
}

return_code replay_app::set_state(std::uint32_t id, std::uint32_t delay, std::uint32_t state) {
    service_state* one = find(id);
    if (one == nullptr) return not_found;
    if (state != loaded && state != enabled) return bad_argument;
    if (one->state == inactive) return not_ready;
    one->delay = delay;
    one->state = state;
    return success;
}

return_code replay_app::set_states(byte_view entries) {
    if (entries.empty() || entries.size() % entry_size != 0) return bad_argument;
    const std::vector<service_state> before = services_;
    for (std::size_t offset = 0; offset < entries.size(); offset += entry_size) {
        const return_code result = set_state(get_u32(entries, offset), get_u32(entries, offset + 4),
                                             get_u32(entries, offset + 8));
        if (result == success) continue;
        services_ = before;
        return result;
    }
    return success;
}

return_code replay_app::load(byte_view request) {
    if (!is_header(request)) return bad_argument;
    service_state* one = find(get_u32(request, 0));
    if (one == nullptr) return not_found;
    if (!are_records(request.subspan(header_size), one->service.record_size)) return bad_argument;
    if (one->state != inactive) return not_ready;
    one->state = loaded;
    return success;
}

return_code replay_app::unload(byte_view request) {
    if (request.size() != sizeof(std::uint32_t)) return bad_argument;
    service_state* one = find(get_u32(request, 0));
    if (one == nullptr) return not_found;
    if (one->state == inactive) return not_ready;
    one->state = inactive;
    one->delay = 0;
    return success;
}

}  // namespace platform::simulated
