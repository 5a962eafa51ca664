#include <sys/wait.h>
#include <unistd.h>

#include <cstring>

#include "store_fixture.hpp"

namespace quabble {
namespace {

// SQLite's way to the disk, with a fault at the n-th step that changes something there: the process ends at
// once, or the step fails.
struct Faults {
    int step = 0;
    int at = 0;     // none when 0
    int error = 0;  // ends the process when 0

    int next() {
        if (++step != at)
            return SQLITE_OK;
        if (error == 0)
            _exit(1);
        return error;
    }
};
Faults faults;
const sqlite3_io_methods* realMethods;
sqlite3_io_methods methods;
sqlite3_vfs* realVfs;

int openFile(sqlite3_vfs*, const char* name, sqlite3_file* file, int flags, int* outFlags) {
    if (const int fault = (flags & SQLITE_OPEN_MAIN_JOURNAL) != 0 ? faults.next() : SQLITE_OK) {
        file->pMethods = nullptr;
        return fault;
    }
    const int result = realVfs->xOpen(realVfs, name, file, flags, outFlags);
    if (result == SQLITE_OK && file->pMethods != nullptr) {
        realMethods = file->pMethods;
        methods = *realMethods;
        methods.xWrite = [](sqlite3_file* f, const void* data, int size, sqlite3_int64 offset) {
            const int fault = faults.next();
            return fault != SQLITE_OK ? fault : realMethods->xWrite(f, data, size, offset);
        };
        methods.xTruncate = [](sqlite3_file* f, sqlite3_int64 size) {
            const int fault = faults.next();
            return fault != SQLITE_OK ? fault : realMethods->xTruncate(f, size);
        };
        methods.xSync = [](sqlite3_file* f, int how) {
            const int fault = faults.next();
            return fault != SQLITE_OK ? fault : realMethods->xSync(f, how);
        };
        file->pMethods = &methods;
    }
    return result;
}

int deleteFile(sqlite3_vfs*, const char* name, int syncFolder) {
    const int fault = faults.next();
    return fault != SQLITE_OK ? fault : realVfs->xDelete(realVfs, name, syncFolder);
}

void injectFaults() {
    static sqlite3_vfs vfs;
    realVfs = sqlite3_vfs_find(nullptr);
    vfs = *realVfs;
    vfs.zName = "faulty";
    vfs.pNext = nullptr;
    vfs.xOpen = openFile;
    vfs.xDelete = deleteFile;
    sqlite3_vfs_register(&vfs, 1);
}

class CrashTest : public StoreFixture {
 protected:
    // Everything that is kept says the same number.
    static void fill(Kept& kept, std::int16_t number) {
        kept.settings.solvingData.setScoreTableIndex(number);
        for (std::int16_t table = 1; table <= 3; ++table) {
            kept.table(table).scores.fill(number);
            kept.table(table).names.fill("player " + std::to_string(number));
        }
    }
    void saveNumber(std::int16_t number) {
        Kept kept;
        fill(kept, number);
        kept.save(registry);
    }
    // The number, or -1 when not everything says the same.
    int loadNumber() {
        Kept kept;
        kept.load(registry);
        const std::int16_t number = kept.settings.solvingData.scoreTableIndex();
        Kept expected;
        fill(expected, number);
        for (std::int16_t table = 1; table <= 3; ++table) {
            if (kept.table(table).scores != expected.table(table).scores ||
                kept.table(table).names != expected.table(table).names)
                return -1;
        }
        return number;
    }
    // Runs work in a process of its own; its exit status.
    template <typename Work>
    static int inChild(Work work) {
        const pid_t child = fork();
        if (child == 0) {
            work();
            _exit(0);
        }
        int status = 0;
        waitpid(child, &status, 0);
        return WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    }
};

TEST_F(CrashTest, ASaveThatIsCutOffAnywhereLeavesTheOldSettingsOrTheNew) {
    for (const int error : {0, SQLITE_FULL, SQLITE_IOERR}) {
        saveNumber(1);
        int steps = 0;
        int kept = 1;
        for (int at = 1; kept != 2; ++at, ++steps) {
            ASSERT_LT(at, 1000);
            saveNumber(1);
            const int status = inChild([&] {
                injectFaults();
                faults = {0, at, error};
                saveNumber(2);
            });
            EXPECT_TRUE(status == 0 || (error == 0 && status == 1)) << "step " << at << ", error " << error;
            kept = loadNumber();
            EXPECT_TRUE(kept == 1 || kept == 2) << "step " << at << ", error " << error;
        }
        EXPECT_GT(steps, 5) << "error " << error;
    }
}

TEST_F(CrashTest, OfTwoThatSaveAtOnceTheLastWins) {
    for (int pair = 0; pair < 100; ++pair) {
        const pid_t other = fork();
        if (other == 0) {
            saveNumber(1);
            _exit(0);
        }
        EXPECT_EQ(inChild([&] { saveNumber(2); }), 0);
        int status = -1;
        waitpid(other, &status, 0);
        EXPECT_EQ(status, 0);
        const int kept = loadNumber();
        EXPECT_TRUE(kept == 1 || kept == 2) << kept;
    }
}

}  // namespace
}  // namespace quabble
