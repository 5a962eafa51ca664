#include "store_fixture.hpp"

namespace quabble {
namespace {

class SettingsTest : public StoreFixture {};

TEST_F(SettingsTest, AFreshStoreHasItsDefaults) {
    Kept kept;
    EXPECT_EQ(kept.load(registry), StoreResult::Done);
    EXPECT_EQ(sql("SELECT count(*) FROM sqlite_schema"), "0\n") << "who reads writes nothing";
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
    sql("DELETE FROM entries");
    kept.save(registry);
    EXPECT_EQ(stored("SOLVINGDATA"), "00110300010066778899AABBCCDD\n");
    EXPECT_EQ(stored("NUMWFSF"), "DEADBEEF\n");
    EXPECT_EQ(stored("SOUNDOPTIONS"), "0000FFFF01000000000000000280\n");
    EXPECT_EQ(stored("2STATS"), "0F270000FFFFFFFF03000000020000000100000000000000FEFFFFFF00000080\n");
    EXPECT_EQ(stored("2STATS5"), "5A6FEB208000\n");
    EXPECT_EQ(sql("SELECT type FROM entries WHERE name IN ('NUMWFSF', '2STATS5') ORDER BY name"), "1\n3\n");
    EXPECT_EQ(sql("SELECT count(*) FROM entries"), "30\n");
}

TEST_F(SettingsTest, OneBadValueCostsNoOther) {
    struct Case {
        const char* name;
        std::string entry, value, expectedName;
        std::int32_t expectedScore;
    };
    const std::string of24 = "abcdefghijklmnopqrstuvwx";
    const std::string hexOf24 = "6162636465666768696A6B6C6D6E6F707172737475767778";
    const Case cases[] = {{"missing", "1STATS3", "", "Anononymous", 0},
                          {"24 bytes", "1STATS3", hexOf24 + "00", of24, 30},
                          {"25 bytes", "1STATS3", hexOf24 + "7900", "Anononymous", 0},
                          {"no bytes at all", "1STATS3", "EMPTY", "", 30},
                          {"scores of another size", "1STATS", std::string(66, '1'), "third", 0}};
    for (const Case& c : cases) {
        std::filesystem::remove_all(file);
        Kept written;
        written.table(1) = {{10, 20, 30, 40, 50, 60, 70, 80}, {"a", "b", "third", "d", "e", "f", "g", "h"}};
        written.save(registry);
        if (c.value.empty())
            sql("DELETE FROM entries WHERE name = '" + c.entry + "'");
        else
            set(c.entry, c.value == "EMPTY" ? "" : c.value);
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

// The file was written by another program, as the first version leaves it on its users' disks.
TEST_F(SettingsTest, AStoreOfTheFirstVersionLoadsAndIsKeptUp) {
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

}  // namespace
}  // namespace quabble
