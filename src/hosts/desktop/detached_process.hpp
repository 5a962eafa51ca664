#pragma once

#include <string>
#include <vector>

namespace quabble {

// Starts a program with its arguments in a folder, on its own from then on: it is not waited for, and may
// live longer than this one. The program is looked for in $PATH, without a command interpreter. Nothing
// happens when it cannot be started.
void startDetached(const std::vector<std::string>& command, const std::string& folder);

}  // namespace quabble
