#pragma once

#include "app/app_state.hpp"
#include "base/task.hpp"

namespace quabble {

// The program from its start to its end: Main, then the windows' handlers until the main window unloads.
Task<> runProgram(AppState& app);

}  // namespace quabble
