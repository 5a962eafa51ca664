#include <pwd.h>
#include <sys/stat.h>

#include <array>
#include <cstdlib>
#include <cstring>
#include <functional>

#include "store_fixture.hpp"

namespace quabble {
namespace {

std::span<const std::byte> bytes(std::string_view text) {
    return std::as_bytes(std::span(text));
}

class RegistryTest : public StoreFixture {};

TEST_F(RegistryTest, KeepsValuesUnderNamesWithoutRegardToCase) {
    Registry inMemory = Registry::inMemory();
    for (Registry* kept : {&registry, &inMemory}) {
        std::array<std::byte, 5> buffer{};
        {
            RegistryKey key = kept->openKey("R", Access::Write)->createKey("A\\b", "CLASS");
            EXPECT_FALSE(key.query("name", buffer)) << "there is none yet";
            EXPECT_TRUE(key.set("name", ValueType::Binary, bytes("first")));
            EXPECT_TRUE(key.set("NAME", ValueType::String, bytes("12345")));
            EXPECT_TRUE(key.set("Long", ValueType::Binary, bytes("123456")));
            EXPECT_TRUE(key.set("Empty", ValueType::String, {}));
            EXPECT_TRUE(key.commit());
        }
        const RegistryKey key = kept->openKey("r", Access::Read)->createKey("a\\B", "OTHER");
        const auto found = key.query("Name", buffer);
        ASSERT_TRUE(found);
        EXPECT_EQ(found->type, ValueType::String);
        EXPECT_EQ(found->size, 5U);
        EXPECT_EQ(std::memcmp(buffer.data(), "12345", 5), 0);
        EXPECT_FALSE(key.query("long", buffer));
        EXPECT_EQ(std::memcmp(buffer.data(), "12345", 5), 0) << "what does not fit leaves the buffer alone";
        EXPECT_EQ(key.query("empty", buffer)->size, 0U);
    }
    EXPECT_EQ(sql("SELECT group_concat(path || class, ' ') FROM keys"), "R R\\A R\\A\\bCLASS\n");
}

TEST_F(RegistryTest, IsTheUsersAloneAndOneTransaction) {
    const mode_t before = umask(0);
    {
        RegistryKey key = registry.openKey("Software", Access::Write)->createKey("A", "");
        umask(before);
        key.set("x", ValueType::Binary, bytes("1"));
        EXPECT_EQ(sql("SELECT count(*) FROM sqlite_schema"), "0\n") << "nothing is seen before the commit";
        key.commit();
    }
    EXPECT_EQ(stored("x"), "31\n");
    registry.openKey("Software", Access::Write)->createKey("A", "").set("x", ValueType::Binary, bytes("2"));
    EXPECT_EQ(stored("x"), "31\n") << "what is not committed is not kept";
    struct stat status{};
    stat(file.c_str(), &status);
    EXPECT_EQ(status.st_mode & 0777U, 0600U);
    stat(file.parent_path().c_str(), &status);
    EXPECT_EQ(status.st_mode & 0777U, 0700U);
}

TEST_F(RegistryTest, LiesInTheUsersDataFolder) {
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

TEST_F(RegistryTest, IsReadWhileOthersWriteAndWrittenWhileOthersRead) {
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
    Registry fresh(file.string());
    EXPECT_EQ(kept.load(fresh), StoreResult::Done);
    EXPECT_EQ(kept.table(1).names[0], "second");
}

// What lies in a file is never carried out, and what is no file is never waited for.
TEST_F(RegistryTest, RefusesWhatWouldHoldItUp) {
    Kept().save(registry);
    sql("CREATE TRIGGER endless AFTER INSERT ON entries BEGIN "
        "INSERT OR REPLACE INTO keys WITH RECURSIVE n(i) AS (SELECT 1 UNION ALL SELECT i + 1 FROM n) "
        "SELECT i, '' FROM n; END");
    Registry withTrigger(file.string());
    EXPECT_EQ(Kept().load(withTrigger), StoreResult::NotOpened);

    for (const char* ending : {"", "-journal", "-wal", "-shm"}) {
        std::filesystem::remove_all(file.parent_path());
        std::filesystem::create_directories(file.parent_path());
        ASSERT_EQ(mkfifo((file.string() + ending).c_str(), 0600), 0);
        Registry withPipe(file.string());
        EXPECT_EQ(Kept().load(withPipe), StoreResult::NotOpened) << ending;
        Registry again(file.string());
        EXPECT_EQ(Kept().save(again), StoreResult::NotOpened) << ending;
    }
    Registry device("/dev/zero");
    EXPECT_EQ(Kept().save(device), StoreResult::NotOpened);
}

TEST_F(RegistryTest, SaysThatAPathIsTooLongForIt) {
    for (const std::size_t length : {400U, 480U, 500U, 520U, 1000U}) {
        std::string path = folder.string();
        while (path.size() < length)
            path += "/" + std::string(std::min<std::size_t>(100, length - path.size()), 'x');
        Registry deep(path + "/registry.db");
        const StoreResult saved = Kept().save(deep);
        Registry again(path + "/registry.db");
        EXPECT_EQ(Kept().load(again), saved) << length;
        EXPECT_TRUE(saved == StoreResult::Done || saved == StoreResult::NotOpened) << length;
        EXPECT_EQ(saved == StoreResult::Done, length < 490) << length;
    }
}

// Whatever lies where the registry should be is the user's: it is left as it is, and the game plays on.
TEST_F(RegistryTest, LeavesWhatIsNoRegistryAlone) {
    Kept first;
    first.save(registry);
    const std::string sound = bytesOf(file);
    const std::pair<const char*, std::function<void()>> cases[] = {
        {"garbage", [&] { std::ofstream(file) << "something else entirely, and longer than a header is"; }},
        {"cut off", [&] { std::ofstream(file, std::ios::binary) << sound.substr(0, 5000); }},
        {"damaged",
         [&] {
             std::ofstream(file, std::ios::binary)
                 << sound.substr(0, 4096) + std::string(sound.size() - 4096, 'x');
         }},
        {"from a later version", [&] { sql("PRAGMA user_version = 2"); }},
        {"empty, of a later version", [&] { std::filesystem::remove(file), sql("PRAGMA user_version = 2"); }},
        {"someone else's with our tables", [&] { sql("PRAGMA user_version = 0"); }},
        {"someone else's",
         [&] {
             std::filesystem::remove(file), sql("CREATE TABLE notes (text); INSERT INTO notes VALUES (1)");
         }},
        {"someone else's of our version",
         [&] { std::filesystem::remove(file), sql("CREATE TABLE notes (text); PRAGMA user_version = 1"); }},
        {"a folder", [&] { std::filesystem::remove(file), std::filesystem::create_directory(file); }}};
    for (const auto& [name, damage] : cases) {
        std::filesystem::remove_all(file);
        std::ofstream(file, std::ios::binary) << sound;
        damage();
        const std::string before = bytesOf(file);
        Registry fresh(file.string());
        Kept loaded;
        EXPECT_EQ(loaded.load(fresh), StoreResult::NotOpened) << name;
        EXPECT_EQ(loaded.table(1).names[0] + loaded.table(3).names[7], "") << name;
        EXPECT_EQ(loaded.settings.soundOptions[0], 0) << name;
        Kept saved;
        Registry another(file.string());
        EXPECT_EQ(saved.save(another), StoreResult::NotOpened) << name;
        EXPECT_EQ(bytesOf(file), before) << name;
        std::filesystem::remove_all(file);
        std::ofstream(file, std::ios::binary) << sound;
        EXPECT_EQ(loaded.save(fresh), StoreResult::NotOpened) << name;
        EXPECT_EQ(bytesOf(file), sound) << name << ": what was never read is not overwritten";
    }
}

// Root may do everything, so somebody else tries.
TEST_F(RegistryTest, LeavesWhatItMayNotReadOrWriteAlone) {
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
