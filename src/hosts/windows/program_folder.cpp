#include "hosts/windows/program_folder.hpp"

#include "hosts/windows/registry/win32.hpp"
#include "hosts/windows/wide_text.hpp"

namespace quabble {
namespace {

constexpr LONGLONG largestFile = 64 << 20;  // bytes

std::wstring programFolder() {
    std::wstring path(MAX_PATH, L'\0');
    DWORD length = 0;
    while ((length = GetModuleFileNameW(nullptr, path.data(), static_cast<DWORD>(path.size()))) ==
           path.size())
        path.resize(2 * path.size());
    path.resize(length);
    return path.substr(0, path.rfind(L'\\') + 1);
}

// A path that is too long for most functions is read as it is when it begins like this.
std::wstring asLongPath(const std::wstring& path) {
    if (path.size() < MAX_PATH || path.starts_with(L"\\\\?\\"))
        return path;
    return path.starts_with(L"\\\\") ? L"\\\\?\\UNC" + path.substr(1) : L"\\\\?\\" + path;
}

}  // namespace

std::wstring programPath(std::string_view name) {
    return programFolder() + wideOf(name);
}

FileBytes readProgramFile(std::string_view name) {
    FileBytes bytes;
    const HANDLE file = CreateFileW(asLongPath(programPath(name)).c_str(), GENERIC_READ, FILE_SHARE_READ,
                                    nullptr, OPEN_EXISTING, 0, nullptr);
    if (file == INVALID_HANDLE_VALUE)
        return bytes;
    LARGE_INTEGER size{};
    if (GetFileType(file) == FILE_TYPE_DISK && GetFileSizeEx(file, &size) != 0 &&
        size.QuadPart <= largestFile) {
        bytes.resize(static_cast<std::size_t>(size.QuadPart));
        DWORD read = 0;
        if (ReadFile(file, bytes.data(), static_cast<DWORD>(bytes.size()), &read, nullptr) == 0 ||
            read != bytes.size())
            bytes.clear();
    }
    CloseHandle(file);
    return bytes;
}

}  // namespace quabble
