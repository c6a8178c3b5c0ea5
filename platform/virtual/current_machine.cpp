#include "platform/virtual/current_machine.h"

#include <memory>
#include <utility>

#include "platform/host.h"
#include "platform/virtual/wrist_device.h"

namespace platform {

std::string host_description() {
    return simulated::current_machine().description();
}

namespace simulated {

namespace {

machine* installed = nullptr;

}  // namespace

machine& current_machine() {
    if (installed != nullptr) return *installed;
    static const std::unique_ptr<machine> embedded = make_wrist_device();
    return *embedded;
}

installed_machine::installed_machine(machine& device)
    : previous_(std::exchange(installed, &device)) {
}

installed_machine::~installed_machine() {
    installed = previous_;
}

}  // namespace simulated

}  // namespace platform
