#include <gtest/gtest.h>

#include "../engine/board_notation.hpp"
#include "../support/large_picture_file.hpp"
#include "draw/bitmap_file.hpp"
#include "gfx/message_template.hpp"
#include "gfx/painters.hpp"
#include "gfx/pictures.hpp"
#include "gfx/result_dialog.hpp"
#include "gfx/spoken_words.hpp"
#include "gfx/string_table.hpp"
#include "hosts/headless/headless_front_end.hpp"

namespace quabble {
namespace {

class Painters : public testing::Test {
 protected:
    Painters() {
        for (std::uint32_t i = 0; i < 838 * 400; ++i)
            sheet.row(static_cast<std::int32_t>(i / 400))[i % 400] = i | pixel_layout::opaque;
    }
    Surface sheet{400, 838};  // every pixel is another one
    Canvas drawn{{360, 470}, Scale()};
    Surface expected{360, 470};
};

TEST_F(Painters, FillTheGaugeFromTheTopAndCopyNoMoreThanThereIs) {
    const Sprites sprites = spritesOf(sheet, Scale());
    for (const auto& [part, full] : {std::pair{150., 241}, {99.8, 241}, {99.7, 240}, {50., 120}, {0., 0}}) {
        expected.copy({20, 10, 50, 10 + 241}, sheet, {246, 29});
        expected.copy({20, 10, 50, 10 + full}, sheet, {274, 29});
        drawGauge(drawn, {20, 10, 50, 34}, sprites, part);
        EXPECT_TRUE(drawn.picture() == expected) << part;
    }
    expected.fill({20, 10, 25, 15}, {});
    drawn.copy(Rect::ofSize(20, 10, 70, 24), Surface(5, 5));
    EXPECT_TRUE(drawn.picture() == expected) << "a picture smaller than its box";
}

TEST_F(Painters, HaveAStandInForASheetThatCannotBeUsed) {
    const auto good = encodeBitmap(sheet), aRowLess = encodeBitmap(Surface(400, 837));
    const auto cutOff = std::vector(good.begin(), good.end() - 1);
    for (const auto& file : {good, aRowLess, cutOff, {}}) {
        HeadlessFrontEnd frontEnd({{"ALLPICDATA.BMP", file}});
        const auto tiles = Pictures(frontEnd).sprites(Scale()).tiles;
        EXPECT_EQ(tiles[13].at(4, 4) == colourOf(4 * 400 + 13 * 28 + 4), file == good);
        for (std::size_t i = 0; i < tiles.size(); ++i) {
            for (std::size_t j = 0; j < i; ++j)
                EXPECT_NE(tiles[i].at(4, 4), tiles[j].at(4, 4)) << i << " and " << j;
        }
    }
}

// Every part of this sheet has a colour of its own.
Surface flatSheet(std::int32_t factor) {
    Surface sheet(400 * factor, 838 * factor);
    const auto fill = [&](const Rect& part, Colour colour) {
        sheet.fill({part.left * factor, part.top * factor, part.right * factor, part.bottom * factor},
                   colour);
    };
    for (std::int32_t tile = 0; tile < 14; ++tile)
        fill(sheet_map::tile(tile), {static_cast<std::uint8_t>(10 * tile + 5), 200, 99});
    fill(sheet_map::veil, {0x0F, 0xF0, 0x3C});
    fill(sheet_map::emptyGauge, {1, 2, 3});
    fill(sheet_map::playPanel, {90, 10, 130});
    return sheet;
}

TEST(Sprites, TakeNoColourFromTheirNeighboursOnTheSheet) {
    const auto isFlat = [](const Surface& sprite, Colour colour) {
        Surface expected(sprite.width(), sprite.height());
        expected.fill(expected.bounds(), colour);
        return sprite == expected;
    };
    const auto file = largePictureFile(flatSheet(4), 4, flatSheet(1));
    auto large = LargePicture::of(file);
    for (int quarters = 4; quarters <= 16; ++quarters) {
        const Scale scale = Scale::ofQuarters(quarters);
        for (const Sprites& sprites : {spritesOf(flatSheet(1), scale), spritesOf(*large, scale)}) {
            for (std::size_t i = 0; i < 14; ++i) {
                const auto red = static_cast<std::uint8_t>(10 * i + 5);
                EXPECT_EQ(sprites.tiles[i].bounds(), (Rect{0, 0, 7 * quarters, 7 * quarters}));
                EXPECT_TRUE(isFlat(sprites.tiles[i], {red, 200, 99})) << i << " at " << quarters;
                const auto veiledRed = static_cast<std::uint8_t>(red & 0x0F);
                EXPECT_TRUE(isFlat(sprites.veiledTiles[i], {veiledRed, 200 & 0xF0, 99 & 0x3C})) << i;
            }
            EXPECT_TRUE(isFlat(sprites.emptyGauge, {1, 2, 3})) << quarters;
            EXPECT_TRUE(isFlat(sprites.playPanel, {90, 10, 130})) << quarters;
        }
    }
}

TEST(Sprites, AreMadeFromALargeVersionThatIsWholeAndBelongsToTheSheet) {
    const Surface sheet = flatSheet(1);
    Surface other = sheet;
    other.fill({0, 0, 28, 28}, {250, 250, 250});
    Surface finer = flatSheet(4);
    finer.fill({0, 0, 50, 50}, {250, 250, 250});  // which shows what the sprites were made from
    const Scale scale = Scale::ofQuarters(6);
    const auto isFine = [&](const Surface& plain, const std::vector<std::byte>& file) {
        HeadlessFrontEnd frontEnd({{"ALLPICDATA.BMP", encodeBitmap(plain)}, {"ALLPICDATA.BIG", file}});
        Pictures pictures(frontEnd);
        const Sprites sprites = pictures.sprites(scale);
        EXPECT_TRUE(pictures.sprites(Scale()).tiles[0] == spritesOf(plain, Scale()).tiles[0]);
        const bool isPlain = sprites.tiles[0] == spritesOf(plain, scale).tiles[0] &&
                             sprites.playPanel == spritesOf(plain, scale).playPanel;
        return !isPlain;
    };
    const auto whole = largePictureFile(finer, 4, sheet);
    EXPECT_TRUE(isFine(sheet, whole));
    EXPECT_FALSE(isFine(other, whole));
    auto damaged = whole;
    damaged.erase(damaged.end() - 100, damaged.end() - 50);  // in the last band, which is the panel's
    EXPECT_FALSE(isFine(sheet, damaged));
    EXPECT_FALSE(isFine(sheet, largePictureFile(finer, 3, sheet)));
    EXPECT_FALSE(isFine(sheet, {}));
}

TEST(SpokenWords, TellWhatIsInACellAndHowManyAClickWouldTake) {
    const auto places = boardPlaces({200, 30, 28}, board("..S/.1a1/221.4"));
    ASSERT_EQ(places.size(), 192U);
    const std::tuple<std::size_t, std::size_t, const char*> cells[] = {{3, 14, "stone"},
                                                                       {3, 15, "bomb for every coral disc"},
                                                                       {4, 15, "coral disc, cluster of 4"},
                                                                       {1, 16, "mint diamond, cluster of 2"},
                                                                       {4, 16, "empty"},
                                                                       {5, 16, "violet cross, cluster of 1"}};
    for (const auto& [column, row, words] : cells) {
        const Place& place = places[12 * (row - 1) + column - 1];
        EXPECT_EQ(place.words,
                  "column " + std::to_string(column) + ", row " + std::to_string(row) + ": " + words);
        EXPECT_EQ(place.area.left, 200 + 28 * static_cast<std::int32_t>(column - 1));
    }
}

TEST(Texts, KeysAreReplacedPairByPair) {
    EXPECT_EQ(fillText("|1-|1|", {"|1", 7}), "7-7|");
    EXPECT_EQ(fillText("|1 |2", {"|1", "|2", "|2", 5}), "5 5");
    EXPECT_EQ(fillText("|1 |2", {"|1", -120, "|2"}), "-120 -120");
    EXPECT_EQ(fillText("a|1b ||22", {"|1", "", "|2"}), "ab ");
    EXPECT_EQ(loadString(38), "Exit");
    EXPECT_EQ(loadString(73), "Best Val");
    EXPECT_EQ(loadString(90), "End game");
}

std::string textOf(GameMode mode, std::int16_t level, bool goNextLevel) {
    GameState game;
    game.gameMode = mode;
    game.stats = {120, 14, 6, level, 999};
    return resultText(game, goNextLevel);
}

TEST(Result, TellsHowTheGameOrLevelEnded) {
    const std::string done = "Congrats ! You have finished all levels !", over = "Game Over";
    const std::string figures = "  Number of Blocks Cleared 14 \n  Largest Cluster 6 \n";
    const std::string score = "\r\nscore : 120 \n", level = score + " Current Level 10 \n" + figures;
    const std::string completed = "Level Completed\r\nAdvance to  Level 10 \n score : 120 \n" + figures;
    const std::tuple<std::int16_t, bool, std::string, std::string> cases[] = {
        {10, false, over + level, over + level},
        {9, true, completed, completed},
        {10, true, done, done + level},
        {11, false, done, done + score + " Current Level 11 \n" + figures}};
    for (const auto& [number, goNextLevel, timed, strategy] : cases) {
        EXPECT_EQ(textOf(GameMode::Timed, number, goNextLevel), timed);
        EXPECT_EQ(textOf(GameMode::Strategy, number, goNextLevel), strategy);
    }
    EXPECT_EQ(textOf(GameMode::Training, 1, false), over + score + figures);
}

}  // namespace
}  // namespace quabble
