#include <gtest/gtest.h>

#include "../support/kept.hpp"
#include "hosts/headless/memory_blob.hpp"

namespace quabble {
namespace {

class SettingsTest : public testing::Test {
 protected:
    static constexpr const char* key = R"(Software\Vorlane\Quabble\1.0)";

    void set(const std::string& name, std::string_view hex) {
        std::vector<std::byte> bytes;
        for (; !hex.empty(); hex.remove_prefix(2))
            bytes.push_back(static_cast<std::byte>(std::stoi(std::string(hex.substr(0, 2)), nullptr, 16)));
        const auto transaction = registry.begin(Access::Write);
        transaction->createKey(key, "");
        transaction->set(key, name, ValueType::Binary, bytes);
        transaction->commit();
    }
    // The type and the bytes of a value; empty when there is none.
    std::string stored(const std::string& name) {
        const auto value = registry.begin(Access::Read)->query(key, name);
        std::string text = value ? std::to_string(static_cast<int>(value->type)) + ":" : "";
        for (std::size_t i = 0; value && i < value->data.size(); ++i) {
            constexpr const char* digits = "0123456789ABCDEF";
            const auto byte = std::to_integer<unsigned>(value->data[i]);
            text += {digits[byte / 16], digits[byte % 16]};
        }
        return text;
    }

    MemoryBlob blob;
    BlobRegistryStore registry{blob};
};

TEST_F(SettingsTest, AFreshStoreHasItsDefaults) {
    Kept kept;
    EXPECT_EQ(kept.load(registry), StoreResult::Done);
    EXPECT_TRUE(blob.bytes.empty()) << "who reads writes nothing";
    for (std::int16_t table = 1; table <= 3; ++table) {
        for (std::size_t place = 0; place < 8; ++place) {
            EXPECT_EQ(kept.table(table).names[place], "Anononymous");
            EXPECT_EQ(kept.table(table).scores[place], 0);
        }
    }
    EXPECT_EQ(kept.settings.soundOptions, (std::array<std::int16_t, 7>{1, 1, 1, 1, 1, 1, 1}));
    EXPECT_EQ(kept.settings.solvingData.scoreTableIndex(), 0);
}

TEST_F(SettingsTest, EveryByteComesBackAsItWasStored) {
    Kept().save(registry);
    set("SOLVINGDATA", "00112233445566778899AABBCCDD");
    set("NUMWFSF", "DEADBEEF");
    set("SOUNDOPTIONS", "0000FFFF01000000000000000280");
    set("2STATS", "0F270000FFFFFFFF03000000020000000100000000000000FEFFFFFF00000080");
    set("2STATS5", "5A6FEB208000");
    Kept kept;
    kept.load(registry);
    EXPECT_EQ(kept.settings.solvingData.scoreTableIndex(), 0x3322);
    EXPECT_EQ(kept.settings.soundOptions, (std::array<std::int16_t, 7>{0, -1, 1, 0, 0, 0, -32766}));
    EXPECT_EQ(kept.table(2).scores[0], 9999);
    EXPECT_EQ(kept.table(2).scores[7], std::numeric_limits<std::int32_t>::min());
    EXPECT_EQ(kept.table(2).names[4], "Zo\xEB \x80");
    kept.settings.solvingData.setScoreTableIndex(3);
    kept.settings.solvingData.setSplashSeen();
    blob.bytes.clear();
    kept.save(registry);
    EXPECT_EQ(stored("SOLVINGDATA"), "3:00110300010066778899AABBCCDD");
    EXPECT_EQ(stored("NUMWFSF"), "3:DEADBEEF");
    EXPECT_EQ(stored("SOUNDOPTIONS"), "3:0000FFFF01000000000000000280");
    EXPECT_EQ(stored("2STATS"), "3:0F270000FFFFFFFF03000000020000000100000000000000FEFFFFFF00000080");
    EXPECT_EQ(stored("2STATS5"), "1:5A6FEB208000");
    EXPECT_EQ(stored("1STATS9") + stored("4STATS"), "");
}

TEST_F(SettingsTest, OneBadValueCostsNoOther) {
    struct Case {
        const char* name;
        std::string entry, value, expectedName;
        std::int32_t expectedScore;
    };
    const std::string of24 = "abcdefghijklmnopqrstuvwx";
    const std::string hexOf24 = "6162636465666768696A6B6C6D6E6F707172737475767778";
    const Case cases[] = {{"24 bytes", "1STATS3", hexOf24 + "00", of24, 30},
                          {"25 bytes", "1STATS3", hexOf24 + "7900", "Anononymous", 0},
                          {"no bytes at all", "1STATS3", "", "", 30},
                          {"scores of another size", "1STATS", std::string(66, '1'), "third", 0}};
    for (const Case& c : cases) {
        blob.bytes.clear();
        Kept written;
        written.table(1) = {{10, 20, 30, 40, 50, 60, 70, 80}, {"a", "b", "third", "d", "e", "f", "g", "h"}};
        written.save(registry);
        set(c.entry, c.value);
        Kept kept;
        kept.load(registry);
        EXPECT_EQ(kept.table(1).names[2], c.expectedName) << c.name;
        EXPECT_EQ(kept.table(1).scores[2], c.expectedScore) << c.name;
        EXPECT_EQ(kept.table(1).names[3], "d") << c.name;
        EXPECT_EQ(kept.table(1).scores[3], c.entry == "1STATS" ? 0 : 40) << c.name;
    }
    for (const auto& [value, expected] :
         {std::pair{"", 0}, {"0500", 5}, {"050000000000000000000000000000", 1}}) {
        Kept().save(registry);
        set("SOUNDOPTIONS", value);
        Kept kept;
        kept.load(registry);
        EXPECT_EQ(kept.settings.soundOptions[0], expected) << "sounds of another size: " << value;
    }
}

TEST_F(SettingsTest, AMissingNameCostsItsScore) {
    set("1STATS", "0A00000014000000");
    set("1STATS1", "6100");
    Kept kept;
    kept.load(registry);
    EXPECT_EQ(kept.table(1).names[0], "a");
    EXPECT_EQ(kept.table(1).scores[0], 10);
    EXPECT_EQ(kept.table(1).names[1], "Anononymous");
    EXPECT_EQ(kept.table(1).scores[1], 0);
}

// Values that were never read are not overwritten.
TEST_F(SettingsTest, ARegistryThatCouldNotBeReadIsLeftAlone) {
    Kept first;
    first.table(1).names[0] = "first";
    first.save(registry);
    const auto sound = blob.bytes;
    Kept kept;
    SettingsStore store(registry);
    blob.bytes.resize(50);
    EXPECT_EQ(store.loadSettings(kept.settings, kept.highScores), StoreResult::NotOpened);
    EXPECT_EQ(kept.table(1).names[0] + kept.table(3).names[7], "") << "everything is as it was";
    EXPECT_EQ(kept.settings.soundOptions[0], 0);
    blob.bytes = sound;
    EXPECT_EQ(store.saveSettings(kept.settings, kept.highScores), StoreResult::NotOpened);
    EXPECT_EQ(blob.bytes, sound);
}

// A page that is hidden is saved many times.
TEST_F(SettingsTest, ASaveThatFailsIsNotTheLast) {
    Kept kept;
    SettingsStore store(registry);
    EXPECT_EQ(store.loadSettings(kept.settings, kept.highScores), StoreResult::Done);
    blob.bytes.resize(50);
    EXPECT_EQ(store.saveSettings(kept.settings, kept.highScores), StoreResult::NotOpened);
    blob.bytes.clear();
    EXPECT_EQ(store.saveSettings(kept.settings, kept.highScores), StoreResult::Done);
}

}  // namespace
}  // namespace quabble
