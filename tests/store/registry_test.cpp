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
            auto root = kept->openKey("Software");
            auto key = root->createKey("A\\b", "CLASS");
            EXPECT_FALSE(key->query("name", buffer)) << "there is none yet";
            EXPECT_TRUE(key->set("name", ValueType::Binary, bytes("first")));
            EXPECT_TRUE(key->set("NAME", ValueType::String, bytes("12345")));
            EXPECT_TRUE(key->set("Long", ValueType::Binary, bytes("123456")));
            EXPECT_TRUE(key->set("Empty", ValueType::String, {}));
        }
        auto root = kept->openKey("SOFTWARE");
        auto key = root->createKey("a\\B", "OTHER");
        const auto found = key->query("Name", buffer);
        ASSERT_TRUE(found);
        EXPECT_TRUE(found->type == ValueType::String && found->size == 5);
        EXPECT_EQ(std::memcmp(buffer.data(), "12345", 5), 0);
        EXPECT_FALSE(key->query("long", buffer));
        EXPECT_EQ(std::memcmp(buffer.data(), "12345", 5), 0) << "what does not fit leaves the buffer alone";
        EXPECT_EQ(key->query("empty", buffer)->size, 0U);
    }
    EXPECT_EQ(sql("SELECT class FROM keys WHERE path = 'Software\\A\\b'"), "CLASS\n");
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

TEST(UserRegistry, LiesInTheUsersDataFolder) {
    const std::string home = std::getenv("HOME") == nullptr ? "" : std::getenv("HOME");
    setenv("HOME", "/home/x", 1);
    const std::pair<const char*, std::string> cases[] = {{nullptr, "/home/x/.local/share/q/registry.db"},
                                                         {"", "/home/x/.local/share/q/registry.db"},
                                                         {"data", "/home/x/.local/share/q/registry.db"},
                                                         {"/data", "/data/q/registry.db"}};
    for (const auto& [dataHome, expected] : cases) {
        dataHome == nullptr ? unsetenv("XDG_DATA_HOME") : setenv("XDG_DATA_HOME", dataHome, 1);
        EXPECT_EQ(userRegistryPath("q"), expected);
    }
    setenv("HOME", home.c_str(), 1);
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
        {"someone else's", [&] { sql("PRAGMA user_version = 0"); }},
        {"a folder", [&] { std::filesystem::remove(file), std::filesystem::create_directory(file); }}};
    for (const auto& [name, damage] : cases) {
        std::filesystem::remove_all(file);
        std::ofstream(file, std::ios::binary) << sound;
        damage();
        const std::string before = bytesOf(file);
        Kept loaded;
        loaded.load(registry);
        EXPECT_TRUE(loaded.wasTold()) << name;
        EXPECT_EQ(loaded.table(1).names[0] + loaded.table(3).names[7], "") << name;
        EXPECT_EQ(loaded.settings.soundOptions[0], 0) << name;
        Kept saved;
        saved.save(registry);
        EXPECT_TRUE(saved.wasTold()) << name;
        EXPECT_EQ(bytesOf(file), before) << name;
    }
}

}  // namespace
}  // namespace quabble
