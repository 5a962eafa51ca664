#pragma once

#include <string>

#include "app/program.hpp"

namespace quabble {

// Writes what was done since the last game began into a file of the user's own, "last_game.visit" in the
// folder "Quabble" of his local application data: when it is told to and when the process aborts, as it does
// when an assertion fails. There is one at a time.
class VisitFile {
 public:
    // The program must outlive it.
    explicit VisitFile(const Program& program);
    ~VisitFile();
    VisitFile(const VisitFile&) = delete;
    VisitFile& operator=(const VisitFile&) = delete;

    // False when it could not be written; an older file is there then as before.
    bool write() const;
    const std::wstring& folder() const { return folder_; }

 private:
    static void onAbort(int);

    const Program& program_;
    std::wstring folder_;  // empty when the system names none
    std::wstring path_;
    std::wstring unfinishedPath_;
};

}  // namespace quabble
