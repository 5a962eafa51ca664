#pragma once

#include <string>
#include <string_view>

namespace quabble {

// The file that the registry of this user and program lies in: in the folder of the program's name below
// $XDG_DATA_HOME or, when that is unset, empty or relative, below ~/.local/share.
std::string userRegistryPath(std::string_view programName);

// Makes the file, readable by the user alone, and the folders above it, when they are missing. False when
// something else lies there or beside it, or when it cannot be changed.
bool prepareRegistryFile(const std::string& path);

}  // namespace quabble
