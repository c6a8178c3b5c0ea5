#include "platform/virtual/wrist_device.h"

namespace platform::simulated {

std::unique_ptr<machine> make_wrist_device() {
    return std::make_unique<machine>();
}

}  // namespace platform::simulated
