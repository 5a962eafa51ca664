#include "hosts/windows/registry/windows_registry.hpp"

#include <array>
#include <functional>

#include "../support/registry_store_suite.hpp"
#include "registry_fixture.hpp"

namespace quabble {
namespace {

struct WindowsPlace : RegistryPlace {
    std::unique_ptr<RegistryStore> open() const {
        return std::make_unique<WindowsRegistryStore>(root, "Software\\Quabble");
    }
    std::string content() const {
        std::string all;
        const auto tree = readRegistryTree(root, L"Software");
        for (const auto& [name, key] : tree->keys) {
            all += testing::PrintToString(name) + testing::PrintToString(key.classString);
            for (const auto& [valueName, value] : key.values)
                all += testing::PrintToString(valueName) + testing::PrintToString(value.data);
        }
        return all;
    }
    static std::vector<std::pair<const char*, std::function<void(WindowsPlace&)>>> damages() {
        return {{"gone with the key above it",
                 [](WindowsPlace& place) { RegDeleteTreeW(place.root, L"Software"); }}};
    }
};
INSTANTIATE_TYPED_TEST_SUITE_P(Windows, RegistryStoreSuite, WindowsPlace);

class WindowsRegistryTest : public WindowsRegistryFixture {
 protected:
    // The system's type of a value and its bytes, as any program sees them.
    std::pair<DWORD, std::string> stored(const wchar_t* name, const std::wstring& subkey = L"") const {
        DWORD type = 0;
        std::array<char, 100> bytes{};
        DWORD size = bytes.size();
        if (RegGetValueW(place.root, (key + subkey).c_str(), name, RRF_RT_ANY | RRF_NOEXPAND, &type,
                         bytes.data(), &size) != ERROR_SUCCESS)
            return {};
        return {type, std::string(bytes.data(), size)};
    }
    void store(const wchar_t* name, DWORD type, std::string_view bytes,
               const std::wstring& subkey = L"") const {
        RegSetKeyValueW(place.root, (key + subkey).c_str(), name, type, bytes.data(),
                        static_cast<DWORD>(bytes.size()));
    }
    static std::string wide(std::wstring_view text) {
        return {reinterpret_cast<const char*>(text.data()), 2 * text.size()};
    }
};

TEST_F(WindowsRegistryTest, KeepsWhatOtherProgramsCanRead) {
    Kept kept;
    kept.settings.solvingData.setScoreTableIndex(2);
    kept.table(3).names[7] = "Zo\xEB \x80\x81";
    kept.table(3).scores[7] = 30035;
    EXPECT_EQ(kept.save(registry), StoreResult::Done);
    using Stored = std::pair<DWORD, std::string>;
    EXPECT_EQ(stored(L"SOLVINGDATA"), (Stored{REG_BINARY, std::string("\0\0\2\0\0\0\0\0\0\0\0\0\0\0", 14)}));
    EXPECT_EQ(stored(L"3STATS").second.substr(28), std::string("\x53\x75\0\0", 4));
    EXPECT_EQ(stored(L"3STATS8"), (Stored{REG_SZ, wide(std::wstring_view(L"Zo\u00EB \u20AC\u0081\0", 7))}));
    const auto tree = readRegistryTree(place.root, key);
    EXPECT_EQ(tree->keys.at(L"").classString, L"USERDATA");
    EXPECT_EQ(tree->keys.at(L"").values.size(), 30);
    Kept loaded;
    EXPECT_EQ(loaded.load(registry), StoreResult::Done);
    EXPECT_EQ(loaded.highScores, kept.highScores);
}

TEST_F(WindowsRegistryTest, CarriesOverWhatOthersKeepThere) {
    Kept().save(registry);
    const std::string number("\1\0\0\0", 4);
    store(L"\u65E5\u672C", REG_DWORD, number);
    store(L"SOUNDOPTIONS", REG_SZ, "odd");
    store(L"text", REG_EXPAND_SZ, wide(std::wstring(L"%PATH%\0", 7)), L"\\Theirs\\Deeper");
    for (int time = 0; time < 2; ++time)
        EXPECT_EQ(Kept().save(registry), StoreResult::Done);
    EXPECT_EQ(stored(L"\u65E5\u672C"), std::pair(DWORD{REG_DWORD}, number));
    EXPECT_EQ(stored(L"text", L"\\Theirs\\Deeper").first, DWORD{REG_EXPAND_SZ});
    EXPECT_EQ(stored(L"SOUNDOPTIONS").first, DWORD{REG_BINARY}) << "which is ours";
}

TEST_F(WindowsRegistryTest, ASecondCopyThatEndsLastWins) {
    const auto other = std::make_unique<WindowsRegistryStore>(place.root, "Software\\Vorlane\\Quabble\\1.0");
    Kept first, second, loaded;
    first.load(registry), second.load(*other);
    first.table(1).names[0] = "first";
    second.table(1).names[0] = "second";
    EXPECT_EQ(first.save(registry), StoreResult::Done);
    EXPECT_EQ(second.save(*other), StoreResult::Done);
    loaded.load(registry);
    EXPECT_EQ(loaded.table(1).names[0], "second");
}

}  // namespace
}  // namespace quabble
