// The only place where the library exits.
#pragma once

#include <functional>

namespace nrx {

// Ends the process with status 1, or the action of run_to_completion that is running.
[[noreturn]] void end_process();

// Runs an action. Returns false if it called end_process, which then ends the action alone: by an
// exception, so that what the action holds is released. For a program that has more to do or to say
// before it ends. For one thread at a time.
bool run_to_completion(const std::function<void()>& action);

}  // namespace nrx
