// The machine that the platform functions operate on.
#pragma once

#include "platform/virtual/machine.h"

namespace platform::simulated {

// Returns the installed machine. If none is installed, returns the embedded wrist device, which is
// created on first use.
machine& current_machine();

// Installs a machine for the lifetime of this object.
class installed_machine {
public:
    explicit installed_machine(machine& device);
    ~installed_machine();
    installed_machine(const installed_machine&) = delete;
    installed_machine& operator=(const installed_machine&) = delete;

private:
    machine* previous_;
};

}  // namespace platform::simulated
