#pragma once

// The system's interface, without its macros for the smallest and the largest.
#define WIN32_LEAN_AND_MEAN
#ifndef NOMINMAX  // as g++'s own headers do, too
#define NOMINMAX
#endif
#include <windows.h>
