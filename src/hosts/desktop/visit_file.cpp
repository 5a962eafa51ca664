#include "hosts/desktop/visit_file.hpp"

#include <fcntl.h>
#include <unistd.h>

#include <csignal>
#include <cstdio>
#include <utility>

namespace quabble {
namespace {

constexpr mode_t userOnlyFile = 0600;

// What signals can reach: the one file, and whether it was asked for.
const VisitFile*& current() {
    static const VisitFile* file = nullptr;
    return file;
}
volatile std::sig_atomic_t& isAsked() {
    static volatile std::sig_atomic_t asked = 0;
    return asked;
}

extern "C" void noteUserSignal(int) {
    isAsked() = 1;
}

}  // namespace

VisitFile::VisitFile(const Program& program, std::string path)
    : program_(program), path_(std::move(path)), unfinishedPath_(path_ + ".new") {
    current() = this;
    std::signal(SIGUSR1, noteUserSignal);
    std::signal(SIGABRT, &VisitFile::onAbort);
}

VisitFile::~VisitFile() {
    std::signal(SIGUSR1, SIG_DFL);
    std::signal(SIGABRT, SIG_DFL);
    current() = nullptr;
}

void VisitFile::writeIfAsked() const {
    if (isAsked() == 0)
        return;
    isAsked() = 0;
    write();
}

// The program stands still where it has failed, and to write its record takes no memory. Then the process
// ends as it would have.
void VisitFile::onAbort(int) {
    std::signal(SIGABRT, SIG_DFL);
    if (current() != nullptr)
        current()->write();
    std::raise(SIGABRT);
}

// Where it cannot be written whole an older one stays: there is nobody to tell.
void VisitFile::write() const {
    const int file =
        ::open(unfinishedPath_.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC | O_NONBLOCK, userOnlyFile);
    if (file < 0)
        return;
    bool isWhole = true;
    program_.writeVisit([&](std::string_view line) {
        isWhole = isWhole && ::write(file, line.data(), line.size()) == static_cast<ssize_t>(line.size());
    });
    isWhole = ::close(file) == 0 && isWhole;
    if (!isWhole || std::rename(unfinishedPath_.c_str(), path_.c_str()) != 0)
        ::unlink(unfinishedPath_.c_str());
}

}  // namespace quabble
