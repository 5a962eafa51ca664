// Takes the screenshots of the documentation from the program itself, on a machine without a screen, so that
// they are the same wherever they are taken, and films a bomb: take_screenshots PROGRAM_FOLDER PICTURE_FOLDER
// FILM_FOLDER

#include <stb/stb_image_write.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <optional>
#include <string>
#include <vector>

#include "../../tests/support/files.hpp"
#include "app/program.hpp"
#include "hosts/headless/memory_blob.hpp"
#include "hosts/headless/scripted_user.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

bool writePicture(const std::string& file, const Surface& picture) {
    std::vector<unsigned char> bytes;
    for (std::int32_t y = 0; y < picture.height(); ++y) {
        for (const std::uint32_t pixel : picture.row(y)) {
            const Colour colour = colourOf(pixel);
            bytes.insert(bytes.end(), {colour.red, colour.green, colour.blue});
        }
    }
    return stbi_write_png(file.c_str(), picture.width(), picture.height(), 3, bytes.data(),
                          picture.width() * 3) != 0;
}

constexpr Scale scale = Scale::ofQuarters(8);

// A player who always takes the largest cluster, and someone with a camera.
class Photographer {
 public:
    Photographer(const std::string& programFolder, std::string pictureFolder, std::uint64_t seed)
        : pictureFolder_(std::move(pictureFolder)),
          frontEnd_(picturesIn(programFolder)),
          program_(frontEnd_, registry_, seed) {
        frontEnd_.scale = scale;
        program_.start();
        user_.wait(3s);  // the splash has gone
    }

    void chooseFromMenu(int button) { user_.click(337, static_cast<float>(52.5 * button + 15)); }
    void press(std::int16_t key) { user_.press(key); }
    void wait(milliseconds duration) { user_.wait(duration); }
    void pointAt(float x, float y) { user_.movePointer(x, y); }
    void startAtLevel(int button, std::int16_t level) {
        chooseFromMenu(button);
        app_.game.stats.level = static_cast<std::int16_t>(level - 1);
        while (app_.game.stats.level < level) {  // the waiting rows complete the level that was skipped
            app_.game.rowsEntered = 1000;
            user_.click(400, 515);
            user_.press(keys::enter);
        }
    }

    // Plays the largest clusters, up to a number of moves; false when there is none left.
    bool play(int moves, std::int16_t smallest) {
        for (int i = 0; i < moves; ++i) {
            const auto place = largestCluster(smallest);
            if (!place)
                return false;
            click(*place);
            if (i + 1 < moves)
                user_.wait(1s);
        }
        return true;
    }

    bool take(const std::string& name) {
        return writePicture(pictureFolder_ + "/" + name + ".png", user_.top().picture);
    }

    // Clicks a bomb and films what comes of it, with a moment of rest before and after: numbered pictures,
    // and beside each a text that tells apngasm how long it is shown.
    bool filmBomb(const std::string& folder) {
        std::optional<CellPosition> bomb;
        app_.game.grid.forEachCell([&](CellPosition place, const GridCell& cell) {
            if (cell.kind == CellKind::Bomb)
                bomb = place;
        });
        if (!bomb)
            return false;
        constexpr milliseconds clicked = 1s;
        constexpr milliseconds end = 4s;
        constexpr milliseconds step = 25ms;
        bool isGood = true;
        int number = 10;  // of two digits, so that the names are in order
        milliseconds since{};
        Surface shown = boardPicture();
        for (milliseconds time{}; time <= end; time += step) {
            if (time == clicked)
                click(*bomb);
            if (boardPicture() != shown || time == end) {
                const std::string file = folder + "/" + std::to_string(number++);
                isGood &= writePicture(file + ".png", shown);
                std::ofstream(file + ".txt") << "delay=" << (time - since).count() << "/1000\n";
                shown = boardPicture();
                since = time;
            }
            user_.wait(step);
        }
        return isGood;
    }

 private:
    void click(CellPosition place) {
        const int top = app_.game.gameMode == GameMode::Training ? 37 : 31;
        user_.click(static_cast<float>(232 + 28 * (place.column - 1) + 14),
                    static_cast<float>(top + 28 * (place.row - 1) + 14));
    }

    // The lower part of the arcade board, and the waiting row.
    Surface boardPicture() const {
        const Rect part = scale.device(Rect::ofSize(200, 165, 400, 375));
        Surface picture(part.width(), part.height());
        picture.copy(picture.bounds(), user_.top().picture, {part.left, part.top});
        return picture;
    }

    std::optional<CellPosition> largestCluster(std::int16_t smallest) const {
        std::optional<CellPosition> best;
        std::int16_t size = smallest;
        app_.game.grid.forEachCell([&](CellPosition place, const GridCell& cell) {
            PlayGrid tried = app_.game.grid;
            if (cell.kind != CellKind::Block || cell.colour == 0 || !tried.clusterAtLeast(place, size))
                return;
            size = static_cast<std::int16_t>(tried.removeMarked() + 1);
            best = place;
        });
        return best;
    }

    std::string pictureFolder_;
    HeadlessFrontEnd frontEnd_;
    MemoryBlob kept_;
    BlobRegistryStore registry_{kept_};
    Program program_;
    ScriptedUser<Program> user_{frontEnd_, program_};
    AppState& app_ = program_.state();
};

bool takeAll(const std::string& programFolder, const std::string& pictureFolder,
             const std::string& filmFolder) {
    bool isGood = true;
    {
        Photographer menu(programFolder, pictureFolder, 1);
        menu.pointAt(337, 120);
        isGood &= menu.take("menu");
    }
    {
        Photographer training(programFolder, pictureFolder, 2);
        training.chooseFromMenu(1);
        training.play(9, 2);
        isGood &= training.take("training_game");
        training.wait(1s);
        while (training.play(1, 2))
            training.wait(1s);
        training.wait(1s);
        isGood &= training.take("result");
    }
    {
        Photographer timed(programFolder, pictureFolder, 3);
        timed.chooseFromMenu(2);
        for (int i = 0; i < 14; ++i) {
            timed.play(1, 3);
            timed.wait(2150ms);
        }
        isGood &= timed.take("timed_game");
    }
    Photographer strategy(programFolder, pictureFolder, 4);
    strategy.startAtLevel(3, 5);
    strategy.play(4, 3);
    strategy.wait(1s);
    isGood &= strategy.take("strategy_game");
    return strategy.filmBomb(filmFolder) && isGood;
}

}  // namespace
}  // namespace quabble

int main(int count, char** arguments) {
    if (count != 4 || !quabble::takeAll(arguments[1], arguments[2], arguments[3])) {
        std::fputs(
            "take_screenshots PROGRAM_FOLDER PICTURE_FOLDER FILM_FOLDER: could not write the pictures\n",
            stderr);
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
