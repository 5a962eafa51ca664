#pragma once

#include <string>
#include <string_view>

#include "platform/front_end.hpp"

namespace quabble {

// The path of a file that lies in the program's folder.
std::wstring programPath(std::string_view name);

// The whole of a file in it; empty when there is none, it is larger than any of ours, or it cannot be read.
FileBytes readProgramFile(std::string_view name);

}  // namespace quabble
