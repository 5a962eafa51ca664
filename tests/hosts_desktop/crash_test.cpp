#include <sys/wait.h>
#include <unistd.h>

#include <functional>

#include "sqlite_fixture.hpp"

namespace quabble {
namespace {

// SQLite's way to the disk, with a fault at the n-th step that changes something there: the process ends,
// half of what it writes written, or the step fails.
struct Faults {
    int step = 0;
    int at = 0;                 // none when 0
    int error = 0;              // ends the process when 0
    bool unsynced[2] = {};      // of the database and of its log: written to since the disk had it all
    bool isOutOfOrder = false;  // a power cut could have left neither the old settings nor the new

    int take(const std::function<int()>& act, const std::function<void()>& actByHalf = [] {}) {
        if (++step != at)
            return act();
        actByHalf();
        if (error == 0)
            _exit(1);
        return error;
    }
};
Faults faults;
sqlite3_vfs* realVfs;

// The journal and the write-ahead log are both written before the database.
template <bool isLog>
struct FaultyFile {
    static inline const sqlite3_io_methods* real;
    static inline sqlite3_io_methods methods;

    static int write(sqlite3_file* file, const void* data, int size, sqlite3_int64 offset) {
        faults.isOutOfOrder |= !isLog && faults.unsynced[true];
        faults.unsynced[isLog] = true;
        return faults.take([&] { return real->xWrite(file, data, size, offset); },
                           [&] { real->xWrite(file, data, size / 2, offset); });
    }
    static int truncate(sqlite3_file* file, sqlite3_int64 size) {
        return faults.take([&] { return real->xTruncate(file, size); });
    }
    static int sync(sqlite3_file* file, int how) {
        faults.unsynced[isLog] = false;
        return faults.take([&] { return real->xSync(file, how); });
    }
    static void wrap(sqlite3_file* file) {
        real = file->pMethods;
        methods = *real;
        methods.xWrite = write;
        methods.xTruncate = truncate;
        methods.xSync = sync;
        file->pMethods = &methods;
    }
};

int openFile(sqlite3_vfs*, const char* name, sqlite3_file* file, int flags, int* outFlags) {
    const bool isLog = (flags & (SQLITE_OPEN_MAIN_JOURNAL | SQLITE_OPEN_WAL)) != 0;
    const auto open = [&] { return realVfs->xOpen(realVfs, name, file, flags, outFlags); };
    file->pMethods = nullptr;
    const int result = isLog ? faults.take(open) : open();
    if (result == SQLITE_OK && file->pMethods != nullptr)
        isLog ? FaultyFile<true>::wrap(file) : FaultyFile<false>::wrap(file);
    return result;
}

// A journal that comes back undoes what was done; a write-ahead log that does says the same once more.
int deleteFile(sqlite3_vfs*, const char* name, int syncFolder) {
    const bool mayComeBack = std::string_view(name).ends_with("-wal");
    faults.isOutOfOrder |= faults.error == 0 && (faults.unsynced[false] || (syncFolder == 0 && !mayComeBack));
    return faults.take([&] { return realVfs->xDelete(realVfs, name, syncFolder); });
}

void injectFaults() {
    realVfs = sqlite3_vfs_find(nullptr);
    static sqlite3_vfs vfs = *realVfs;
    vfs.zName = "faulty";
    vfs.pNext = nullptr;
    vfs.xOpen = openFile;
    vfs.xDelete = deleteFile;
    sqlite3_vfs_register(&vfs, 1);
}

using CrashTest = SqliteFixture;

TEST_F(CrashTest, ASaveThatIsCutOffAnywhereLeavesTheOldSettingsOrTheNew) {
    for (const auto& [old, error] : {std::pair<std::int16_t, int>{1, 0},
                                     {1, SQLITE_FULL},
                                     {1, SQLITE_IOERR},
                                     {0, 0},
                                     {0, SQLITE_FULL}}) {
        enum { Untouched, Died, OutOfOrder, WentOn };
        int steps = 0;
        int status = WentOn;
        for (int at = 1; status != Untouched; ++at, ++steps) {
            ASSERT_LT(at, 1000);
            if (old == 0)
                std::filesystem::remove_all(file.parent_path());
            else
                saveNumber(registry, old);
            status = inChild([&] {
                injectFaults();
                faults = {.at = at, .error = error};
                saveNumber(registry, 2);
                if (faults.isOutOfOrder)
                    return OutOfOrder;
                return faults.step < at ? Untouched : WentOn;
            });
            SCOPED_TRACE(testing::Message() << "step " << at << ", error " << error);
            if (status != Untouched) {
                EXPECT_EQ(status, error == 0 ? Died : WentOn);
            }
            const int kept = loadNumber(registry);
            if (status == Untouched || kept != old) {
                EXPECT_EQ(kept, 2);
            }
        }
        EXPECT_GT(steps, 5) << "error " << error;
    }
}

TEST_F(CrashTest, OfTwoThatSaveAtOnceTheLastWins) {
    for (int pair = 0; pair < 100; ++pair) {
        saveNumber(registry, 3);
        const pid_t other = fork();
        if (other == 0)
            _exit(saveNumber(registry, 1) == StoreResult::Done ? 0 : 1);
        EXPECT_EQ(inChild([&] { return saveNumber(registry, 2) == StoreResult::Done ? 0 : 1; }), 0);
        int status = -1;
        waitpid(other, &status, 0);
        EXPECT_EQ(status, 0);
        const int kept = loadNumber(registry);
        EXPECT_TRUE(kept == 1 || kept == 2) << kept;
    }
}

}  // namespace
}  // namespace quabble
