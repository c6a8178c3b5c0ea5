// Which machine the platform functions work on.
#pragma once

#include "platform/virtual/machine.h"

namespace platform::simulated {

// The machine that is installed, else the embedded wrist device, which is made at its first use.
machine& current_machine();

// Installs a machine for as long as this object lives.
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
