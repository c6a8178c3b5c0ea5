#include "platform/registry.h"

namespace platform {

dictionary matching_class(std::string_view class_name) {
    return {{std::string(provider_class_key), class_name}};
}

}  // namespace platform
