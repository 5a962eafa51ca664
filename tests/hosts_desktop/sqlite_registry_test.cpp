#include "hosts/desktop/registry/sqlite_registry.hpp"

#include <pwd.h>
#include <sys/stat.h>

#include <cstdlib>
#include <functional>

#include "../support/registry_store_suite.hpp"
#include "hosts/desktop/registry/registry_file.hpp"
#include "sqlite_fixture.hpp"

namespace quabble {
namespace {

struct SqlitePlace : SqliteFixture {
    void TestBody() override {}

    std::unique_ptr<RegistryStore> open() const {
        return std::make_unique<SqliteRegistryStore>(file.string());
    }
    std::string content() const { return bytesOf(file); }

    static std::vector<std::pair<const char*, std::function<void(SqlitePlace&)>>> damages() {
        const auto write = [](SqlitePlace& place, const std::string& bytes) {
            std::ofstream(place.file, std::ios::binary) << bytes;
        };
        const auto replace = [](SqlitePlace& place, const char* sql) {
            std::filesystem::remove(place.file);
            place.sql(sql);
        };
        return {{"garbage",
                 [=](SqlitePlace& place) {
                     write(place, "something else, and longer than a header is" + std::string(100, '.'));
                 }},
                {"cut off", [=](SqlitePlace& place) { write(place, place.content().substr(0, 5000)); }},
                {"damaged",
                 [=](SqlitePlace& place) {
                     const std::string sound = place.content();
                     write(place, sound.substr(0, 4096) + std::string(sound.size() - 4096, 'x'));
                 }},
                {"from a later version", [](SqlitePlace& place) { place.sql("PRAGMA user_version = 2"); }},
                {"empty, of a later version",
                 [=](SqlitePlace& place) { replace(place, "PRAGMA user_version = 2"); }},
                {"someone else's with our tables",
                 [](SqlitePlace& place) { place.sql("PRAGMA user_version = 0"); }},
                {"someone else's",
                 [=](SqlitePlace& place) {
                     replace(place, "CREATE TABLE notes (text); INSERT INTO notes VALUES (1)");
                 }},
                {"someone else's of our version",
                 [=](SqlitePlace& place) {
                     replace(place, "CREATE TABLE notes (text); PRAGMA user_version = 1");
                 }},
                {"a folder", [](SqlitePlace& place) {
                     std::filesystem::remove(place.file);
                     std::filesystem::create_directory(place.file);
                 }}};
    }
};
INSTANTIATE_TYPED_TEST_SUITE_P(Sqlite, RegistryStoreSuite, SqlitePlace);

class SqliteTest : public SqliteFixture {};

TEST_F(SqliteTest, IsTheUsersAlone) {
    const mode_t before = umask(0);
    Kept().save(registry);
    umask(before);
    struct stat status{};
    stat(file.c_str(), &status);
    EXPECT_EQ(status.st_mode & 0777U, 0600U);
    stat(file.parent_path().c_str(), &status);
    EXPECT_EQ(status.st_mode & 0777U, 0700U);
}

// The file was written by another program, as the first version leaves it on its users' disks.
TEST_F(SqliteTest, AStoreOfTheFirstVersionLoadsAndIsKeptUp) {
    std::filesystem::create_directories(file.parent_path());
    std::filesystem::copy_file(QUABBLE_GOLDEN_STORE, file);
    Kept kept;
    EXPECT_EQ(kept.load(registry), StoreResult::Done);
    EXPECT_EQ(kept.settings.solvingData.scoreTableIndex(), 2);
    EXPECT_EQ(kept.settings.soundOptions, (std::array<std::int16_t, 7>{1, 1, 0, 1, 1, 1, 1}));
    EXPECT_TRUE(kept.table(3).names[7].starts_with("Zo\xEB \x80"));
    EXPECT_EQ(kept.table(3).scores[7], 30035);
    kept.table(3).scores[7] = 30036;
    kept.save(registry);
    EXPECT_EQ(stored("3STATS").substr(56), "54750000\n");
    EXPECT_EQ(sql("SELECT count(*) FROM entries"), "30\n");
    EXPECT_EQ(sql("SELECT group_concat(class, '/') FROM keys"), "///USERDATA\n");
}

TEST_F(SqliteTest, LiesInTheUsersDataFolder) {
    const std::string account = getpwuid(getuid())->pw_dir;
    struct Case {
        const char *home, *dataHome;
        std::string expected;
    };
    const Case cases[] = {
        {"/home/x", nullptr, "/home/x/.local/share"},  {"/home/x", "", "/home/x/.local/share"},
        {"/home/x", "data", "/home/x/.local/share"},   {"/home/x", "/data", "/data"},
        {nullptr, nullptr, account + "/.local/share"}, {"", "", account + "/.local/share"},
        {"x", "./data", account + "/.local/share"}};
    const auto put = [](const char* name, const char* value) {
        value == nullptr ? unsetenv(name) : setenv(name, value, 1);
    };
    for (const Case& c : cases) {
        put("HOME", c.home);
        put("XDG_DATA_HOME", c.dataHome);
        EXPECT_EQ(userRegistryPath("q"), c.expected + "/q/registry.db");
    }
    const auto isAtTheTop = [] { return userRegistryPath("q") == "//.local/share/q/registry.db"; };
    EXPECT_TRUE(getuid() != 0 || inChild([&] { return setuid(4'000'000) == 0 && isAtTheTop(); }) == 1)
        << "a user without a name";
}

// Somebody else's connection, which begins what it is told to and does not end it.
struct OtherProgram {
    OtherProgram(const std::filesystem::path& file, const char* begin) {
        sqlite3_open(file.c_str(), &connection);
        EXPECT_EQ(sqlite3_exec(connection, begin, nullptr, nullptr, nullptr), SQLITE_OK);
    }
    ~OtherProgram() { sqlite3_close(connection); }
    OtherProgram(const OtherProgram&) = delete;
    OtherProgram& operator=(const OtherProgram&) = delete;

    sqlite3* connection = nullptr;
};

TEST_F(SqliteTest, IsReadWhileOthersWriteAndWrittenWhileOthersRead) {
    Kept first;
    first.table(1).names[0] = "first";
    first.save(registry);
    {
        const OtherProgram reader(file, "BEGIN; SELECT * FROM entries");
        Kept second;
        second.table(1).names[0] = "second";
        EXPECT_EQ(second.save(registry), StoreResult::Done);
    }
    {
        const OtherProgram writer(file, "BEGIN IMMEDIATE; DELETE FROM entries");
        Kept loaded;
        EXPECT_EQ(loaded.load(registry), StoreResult::Done);
        EXPECT_EQ(loaded.table(1).names[0], "second");
        EXPECT_EQ(loaded.save(registry), StoreResult::NotOpened) << "only one can write";
    }
    Kept kept;
    EXPECT_EQ(kept.load(registry), StoreResult::Done);
    EXPECT_EQ(kept.table(1).names[0], "second");
}

// What lies in a file is never carried out, and what is no file is never waited for.
TEST_F(SqliteTest, RefusesWhatWouldHoldItUp) {
    Kept().save(registry);
    sql("CREATE TRIGGER endless AFTER INSERT ON entries BEGIN "
        "INSERT OR REPLACE INTO keys WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n) "
        "SELECT i, '' FROM n; END");
    EXPECT_EQ(Kept().load(registry), StoreResult::NotOpened);

    for (const char* ending : {"", "-journal", "-wal", "-shm"}) {
        std::filesystem::remove_all(file.parent_path());
        std::filesystem::create_directories(file.parent_path());
        ASSERT_EQ(mkfifo((file.string() + ending).c_str(), 0600), 0);
        EXPECT_EQ(Kept().load(registry), StoreResult::NotOpened) << ending;
        EXPECT_EQ(Kept().save(registry), StoreResult::NotOpened) << ending;
    }
    SqliteRegistryStore device("/dev/zero");
    EXPECT_EQ(Kept().save(device), StoreResult::NotOpened);
}

TEST_F(SqliteTest, SaysThatAPathIsTooLongForIt) {
    for (const std::size_t length : {400U, 480U, 500U, 520U, 1000U}) {
        std::string path = folder.string();
        while (path.size() < length)
            path += "/" + std::string(std::min<std::size_t>(100, length - path.size()), 'x');
        SqliteRegistryStore deep(path + "/registry.db");
        const StoreResult saved = Kept().save(deep);
        EXPECT_EQ(Kept().load(deep), saved) << length;
        EXPECT_TRUE(saved == StoreResult::Done || saved == StoreResult::NotOpened) << length;
        EXPECT_EQ(saved == StoreResult::Done, length < 490) << length;
    }
}

// Root may do everything, so somebody else tries.
TEST_F(SqliteTest, LeavesWhatItMayNotReadOrWriteAlone) {
    struct Case {
        const char* name;
        mode_t folderMode, fileMode;  // no file when 0
    };
    const Case cases[] = {{"unreadable", 0777, 0200},
                          {"read-only", 0777, 0444},
                          {"in a read-only folder", 0555, 0666},
                          {"missing from a read-only folder", 0555, 0}};
    for (const Case& c : cases) {
        Kept first;
        first.table(1).names[0] = "first";
        first.save(registry);
        if (c.fileMode == 0)
            std::filesystem::remove(file);
        const std::string before = bytesOf(file);
        chmod(file.c_str(), c.fileMode);
        chmod(folder.c_str(), 0777), chmod(file.parent_path().parent_path().c_str(), 0755);
        chmod(file.parent_path().c_str(), c.folderMode);
        const int wrong = inChild([&] {
            if (getuid() == 0 && (setgid(65534) != 0 || setuid(65534) != 0))
                return -1;
            Kept loaded;
            const bool isLoaded = loaded.load(registry) != StoreResult::NotOpened;
            const bool isSaved = Kept().save(registry) != StoreResult::NotOpened;
            return (isLoaded ? 1 : 0) | (isSaved ? 2 : 0) | (loaded.table(1).names[0].empty() ? 0 : 4);
        });
        EXPECT_EQ(wrong, 0) << c.name;
        chmod(file.parent_path().c_str(), 0700), chmod(file.c_str(), 0600);
        EXPECT_EQ(bytesOf(file), before) << c.name;
        EXPECT_EQ(std::filesystem::exists(file), c.fileMode != 0) << c.name;
        std::filesystem::remove_all(file.parent_path());
    }
}

}  // namespace
}  // namespace quabble
