#pragma once

#include <string>

#include "hosts/windows/registry/win32.hpp"

namespace quabble {

// Runs a disabled test of this program in a process of its own, and gives its exit status.
inline DWORD runInChild(const wchar_t* test) {
    std::wstring command =
        std::wstring(GetCommandLineW()) + L" --gtest_also_run_disabled_tests --gtest_filter=*" + test;
    STARTUPINFOW start{};
    start.cb = sizeof start;
    PROCESS_INFORMATION child{};
    CreateProcessW(nullptr, command.data(), nullptr, nullptr, FALSE, 0, nullptr, nullptr, &start, &child);
    WaitForSingleObject(child.hProcess, INFINITE);
    DWORD status = 0;
    GetExitCodeProcess(child.hProcess, &status);
    CloseHandle(child.hProcess), CloseHandle(child.hThread);
    return status;
}

}  // namespace quabble
