#include "nrxctl/base/end_process.h"

#include <cstdlib>

#include "nrxctl/base/output.h"

namespace nrx {

namespace {

struct action_ended {};

int running_actions = 0;

class running_action {
public:
    running_action() { ++running_actions; }
    ~running_action() { --running_actions; }
    running_action(const running_action&) = delete;
    running_action& operator=(const running_action&) = delete;
};

}  // namespace

void end_process() {
    flush_output();
    if (running_actions > 0) throw action_ended();
    std::exit(EXIT_FAILURE);
}

bool run_to_completion(const std::function<void()>& action) {
    const running_action running;
    try {
        action();
        return true;
    } catch (const action_ended&) {
        return false;
    }
}

}  // namespace nrx
