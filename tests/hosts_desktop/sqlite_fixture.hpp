#pragma once

#include <gtest/gtest.h>
#include <sqlite3.h>
#include <sys/wait.h>
#include <unistd.h>

#include <string>

#include "../support/files.hpp"
#include "../support/kept.hpp"
#include "hosts/desktop/registry/sqlite_registry.hpp"

namespace quabble {

// A folder of its own for each test, and a look into the file that is independent of the registry.
class SqliteFixture : public ::testing::Test {
 protected:
    // Runs SQL on the file; the first column of what it returns, in hexadecimal, a line a row.
    std::string sql(const std::string& statements) const {
        sqlite3* database = nullptr;
        sqlite3_open(file.c_str(), &database);
        std::string rows;
        const auto collect = [](void* all, int, char** row, char**) {
            *static_cast<std::string*>(all) += std::string(row[0] == nullptr ? "NULL" : row[0]) + "\n";
            return 0;
        };
        char* problem = nullptr;
        sqlite3_exec(database, statements.c_str(), collect, &rows, &problem);
        EXPECT_EQ(problem, nullptr) << problem;
        sqlite3_close(database);
        return rows;
    }
    std::string stored(const std::string& name) const {
        return sql("SELECT hex(data) FROM entries WHERE name = '" + name + "'");
    }

    // Runs work in a process of its own; what it returned, -1 when it crashed.
    template <typename Work>
    static int inChild(Work work) {
        const pid_t child = fork();
        if (child == 0)
            _exit(work());
        int status = 0;
        waitpid(child, &status, 0);
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    }

    const TemporaryFolder temporary;
    const std::filesystem::path& folder = temporary.path;
    const std::filesystem::path file = folder / "data" / "quabble" / "registry.db";
    SqliteRegistryStore registry{file.string()};
};

}  // namespace quabble
