#pragma once

#include <string>

#include "app/program.hpp"

namespace quabble {

// Writes what was done since the last game began into a file beside the registry: when the process gets
// SIGUSR1 and when it aborts, as it does when an assertion fails. There is one at a time.
class VisitFile {
 public:
    // The program must outlive it. The folder of the file is there once the program has started.
    VisitFile(const Program& program, std::string path);
    ~VisitFile();
    VisitFile(const VisitFile&) = delete;
    VisitFile& operator=(const VisitFile&) = delete;

    // To be called now and then, for SIGUSR1 only leaves a note.
    void writeIfAsked() const;

 private:
    void write() const;
    static void onAbort(int);

    const Program& program_;
    std::string path_;
    std::string unfinishedPath_;
};

}  // namespace quabble
