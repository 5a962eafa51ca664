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
            auto root = kept->openKey("R");
            auto key = root->createKey("A\\b", "CLASS");
            EXPECT_FALSE(key->query("name", buffer)) << "there is none yet";
            EXPECT_TRUE(key->set("name", ValueType::Binary, bytes("first")));
            EXPECT_TRUE(key->set("NAME", ValueType::String, bytes("12345")));
            EXPECT_TRUE(key->set("Long", ValueType::Binary, bytes("123456")));
            EXPECT_TRUE(key->set("Empty", ValueType::String, {}));
        }
        auto root = kept->openKey("r");
        auto key = root->createKey("a\\B", "OTHER");
        const auto found = key->query("Name", buffer);
        ASSERT_TRUE(found);
        EXPECT_TRUE(found->type == ValueType::String && found->size == 5);
        EXPECT_EQ(std::memcmp(buffer.data(), "12345", 5), 0);
        EXPECT_FALSE(key->query("long", buffer));
        EXPECT_EQ(std::memcmp(buffer.data(), "12345", 5), 0) << "what does not fit leaves the buffer alone";
        EXPECT_EQ(key->query("empty", buffer)->size, 0U);
    }
    EXPECT_EQ(sql("SELECT group_concat(path || class, ' ') FROM keys"), "R R\\A R\\A\\bCLASS\n");
}

TEST_F(RegistryTest, IsTheUsersAloneAndOneTransaction) {
    const mode_t before = umask(0);
    auto root = registry.openKey("Software");
    umask(before);
    auto key = root->createKey("A", "");
    key->set("x", ValueType::Binary, bytes("1"));
    EXPECT_EQ(sql("SELECT count(*) FROM sqlite_schema"), "0\n")
        << "nothing is seen before the root key closes";
    key.reset();
    root.reset();
    EXPECT_EQ(stored("x"), "31\n");
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
