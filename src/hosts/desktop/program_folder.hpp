#pragma once

#include <string>
#include <string_view>

#include "platform/front_end.hpp"

namespace quabble {

// The folder that the program lies in, with the files that come with it.
std::string programFolder();

// The whole of a file in it; empty when there is none, it is larger than any of ours, or it cannot be read.
FileBytes readProgramFile(std::string_view name);

// A web address as it is, and a file's name with the folder before it.
std::string pathOrAddress(std::string_view document);

}  // namespace quabble
