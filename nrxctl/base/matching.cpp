#include "nrxctl/base/matching.h"

#include <string>
#include <utility>

namespace nrx {

platform::dictionary match_service_id(std::int32_t id) {
    platform::dictionary matching = platform::matching_class(interface_class);
    matching.set(platform::property_match_key,
                 platform::dictionary{{std::string(service_id_key), id}});
    return matching;
}

platform::dictionary match_service_name(std::string_view name) {
    platform::dictionary matching = platform::matching_class(interface_class);
    matching.set(platform::name_match_key, name);
    return matching;
}

platform::dictionary match_name(std::string_view name) {
    return {{std::string(platform::name_match_key), name}};
}

platform::dictionary match_hid_device(const platform::property& location) {
    platform::dictionary matching = platform::matching_class(hid_device_class);
    matching.set(platform::location_id_key, location);
    return matching;
}

platform::dictionary usage_pair(std::int32_t page, std::int32_t usage) {
    return {{std::string(platform::usage_page_key), page},
            {std::string(platform::usage_key), usage}};
}

platform::dictionary match_usage_pairs(platform::array pairs) {
    return {{std::string(platform::usage_pairs_key), std::move(pairs)}};
}

}  // namespace nrx
