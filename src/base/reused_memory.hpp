#pragma once

#include <memory_resource>

namespace quabble {

// Memory for what comes and goes all the time: what is given back is kept for the next of about its size, so
// that a program that goes on doing what it has done before asks the heap for nothing. For one thread.
std::pmr::memory_resource& reusedMemory();

}  // namespace quabble
