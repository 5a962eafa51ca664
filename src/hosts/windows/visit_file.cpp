#include "hosts/windows/visit_file.hpp"

#include <csignal>

#include "hosts/windows/registry/win32.hpp"

namespace quabble {
namespace {

// What a signal can reach.
const VisitFile*& current() {
    static const VisitFile* file = nullptr;
    return file;
}

// The shell, which knows the folder, too, takes long to load and must not be asked when the program fails.
std::wstring localAppData() {
    std::wstring path(GetEnvironmentVariableW(L"LOCALAPPDATA", nullptr, 0), L'\0');
    path.resize(GetEnvironmentVariableW(L"LOCALAPPDATA", path.data(), static_cast<DWORD>(path.size())));
    return path;
}

}  // namespace

VisitFile::VisitFile(const Program& program) : program_(program), folder_(localAppData()) {
    if (!folder_.empty()) {
        folder_ += L"\\Quabble";
        path_ = folder_ + L"\\last_game.visit";
        unfinishedPath_ = folder_ + L"\\last_game.new";
    }
    current() = this;
    std::signal(SIGABRT, &VisitFile::onAbort);
}

VisitFile::~VisitFile() {
    std::signal(SIGABRT, SIG_DFL);
    current() = nullptr;
}

// The program stands still where it has failed, and to write its record takes no memory. Then the process
// ends as it would have.
void VisitFile::onAbort(int) {
    std::signal(SIGABRT, SIG_DFL);
    if (current() != nullptr)
        current()->write();
    std::raise(SIGABRT);
}

bool VisitFile::write() const {
    if (folder_.empty())
        return false;
    CreateDirectoryW(folder_.c_str(), nullptr);
    const HANDLE file = CreateFileW(unfinishedPath_.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS,
                                    FILE_ATTRIBUTE_NORMAL, nullptr);
    if (file == INVALID_HANDLE_VALUE)
        return false;
    bool isWhole = true;
    program_.writeVisit([&](std::string_view lines) {
        DWORD written = 0;
        isWhole = isWhole &&
                  WriteFile(file, lines.data(), static_cast<DWORD>(lines.size()), &written, nullptr) != 0 &&
                  written == lines.size();
    });
    isWhole = FlushFileBuffers(file) != 0 && isWhole;
    CloseHandle(file);
    isWhole = isWhole && MoveFileExW(unfinishedPath_.c_str(), path_.c_str(), MOVEFILE_REPLACE_EXISTING) != 0;
    if (!isWhole)
        DeleteFileW(unfinishedPath_.c_str());
    return isWhole;
}

}  // namespace quabble
