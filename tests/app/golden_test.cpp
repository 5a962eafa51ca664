#include <gtest/gtest.h>
#include <stb/stb_image.h>
#include <stb/stb_image_write.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <memory>
#include <string>

#include "machine.hpp"

namespace quabble {
namespace {

constexpr int tolerance =
    8;  // per channel: letters are smoothed a little differently from machine to machine

struct FreePixels {
    void operator()(unsigned char* pixels) const { stbi_image_free(pixels); }
};

// Compares a picture with the one kept under that name, which QUABBLE_REFRESH_GOLDEN=1 writes anew.
void expectGolden(const Surface& seen, const std::string& name) {
    const std::vector<unsigned char> bytes = bytesOf(seen);
    const std::string kept = QUABBLE_GOLDEN_FOLDER + name;
    const auto write = [&](const std::string& file) {
        return stbi_write_png(file.c_str(), seen.width(), seen.height(), 3, bytes.data(), 0) != 0;
    };
    const bool refreshed = std::getenv("QUABBLE_REFRESH_GOLDEN") == nullptr || write(kept);
    EXPECT_TRUE(refreshed) << "cannot write " << kept;
    int width = 0;
    int height = 0;
    const std::unique_ptr<unsigned char, FreePixels> golden(
        stbi_load(kept.c_str(), &width, &height, nullptr, 3));
    const bool same = golden && width == seen.width() && height == seen.height() &&
                      std::equal(bytes.begin(), bytes.end(), golden.get(),
                                 [](int left, int right) { return std::abs(left - right) <= tolerance; });
    const std::string written = QUABBLE_SEEN_FOLDER + ("seen_" + name);
    EXPECT_TRUE(same || !write(written)) << "differs from " << kept << "; see " << written;
    EXPECT_TRUE(same);
}

TEST(Golden, MenuWithAHighlightedButton) {
    Machine machine;
    machine.pointAtMenu(3);
    expectGolden(machine.mainPicture(), "menu.png");
}

TEST(Golden, TrainingGameWithPointsShowing) {
    Machine machine;
    machine.start(1, "..12........ .112.31.3... 12112311333.");
    machine.clickCell(10, 16);
    machine.user.wait(std::chrono::seconds(2));
    machine.clickCell(3, 16);
    machine.user.wait(milliseconds(250));
    expectGolden(machine.mainPicture(), "training_game.png");
}

TEST(Golden, ResultOfACompletedLevel) {
    Machine machine;
    machine.start(2, "...3113.....");
    machine.game.stats = {
        .score = 1234, .blocksCleared = 345, .largestCluster = 27, .level = 4, .bestScore = 9};
    machine.game.rowsEntered = 56;
    machine.clickStrip();
    machine.user.movePointer(230, 220);
    expectGolden(machine.user.top().picture, "level_completed.png");
}

}  // namespace
}  // namespace quabble
