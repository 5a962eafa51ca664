#include "hosts/windows/documents.hpp"

#include "hosts/windows/registry/win32.hpp"
// after it
#include <objbase.h>
#include <shellapi.h>

namespace quabble {
namespace {

// The system's libraries for this take as long to load as all others together, and are seldom needed.
template <typename Function>
Function* functionOf(const wchar_t* library, const char* name) {
    const HMODULE loaded = LoadLibraryExW(library, nullptr, LOAD_LIBRARY_SEARCH_SYSTEM32);
    return loaded == nullptr
               ? nullptr
               : reinterpret_cast<Function*>(reinterpret_cast<void*>(GetProcAddress(loaded, name)));
}

}  // namespace

void openByShell(const std::wstring& target) {
    static const auto initialize = functionOf<decltype(CoInitializeEx)>(L"ole32.dll", "CoInitializeEx");
    static const auto execute = functionOf<decltype(ShellExecuteExW)>(L"shell32.dll", "ShellExecuteExW");
    if (initialize == nullptr || execute == nullptr)
        return;
    initialize(nullptr, COINIT_APARTMENTTHREADED | COINIT_DISABLE_OLE1DDE);
    SHELLEXECUTEINFOW request{};
    request.cbSize = sizeof request;
    request.fMask = SEE_MASK_ASYNCOK | SEE_MASK_FLAG_NO_UI;
    request.lpFile = target.c_str();
    request.nShow = SW_SHOWNORMAL;
    execute(&request);
}

}  // namespace quabble
