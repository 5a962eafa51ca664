#include "machine.hpp"

#include <stb/stb_image_write.h>

#include <algorithm>
#include <filesystem>
#include <random>

#include "app/program.hpp"
#include "gfx/painters.hpp"

namespace quabble {
namespace {

constexpr std::int32_t cellSize = 28;

Surface testSheet() {
    Surface picture(400, 838);
    for (std::int16_t tile = 0; tile < 14; ++tile)
        picture.fill(Rect::ofSize(tile * cellSize, 0, cellSize, cellSize), sheet::tile(tile));
    picture.fill(Rect::ofSize(0, 28, cellSize, cellSize), sheet::mask);
    picture.fill(Rect::ofSize(246, 29, 28, 241), sheet::emptyGauge);
    picture.fill(Rect::ofSize(274, 29, 30, 241), sheet::fullGauge);
    picture.fill(Rect::ofSize(0, 338, 400, 500), sheet::panel);
    return picture;
}

// A folder that holds the sheet and goes with the process.
class ProgramFolder {
 public:
    ProgramFolder()
        : path_(std::filesystem::temp_directory_path() /
                ("quabble_app_tests_" + std::to_string(std::random_device{}()))) {
        std::filesystem::create_directory(path_);
        const Surface picture = testSheet();
        stbi_write_bmp((path_ / "ALLPICDATA.BMP").c_str(), picture.width(), picture.height(), 3,
                       bytesOf(picture).data());
    }
    ~ProgramFolder() { std::filesystem::remove_all(path_); }
    ProgramFolder(const ProgramFolder&) = delete;
    ProgramFolder& operator=(const ProgramFolder&) = delete;

    static std::string path() {
        static const ProgramFolder folder;
        return folder.path_.string();
    }

 private:
    std::filesystem::path path_;
};

}  // namespace

Colour sheet::tile(std::int16_t number) {
    return {static_cast<std::uint8_t>(10 + 18 * number), static_cast<std::uint8_t>(240 - 16 * number),
            static_cast<std::uint8_t>(number * 53)};
}

std::vector<unsigned char> bytesOf(const Surface& picture) {
    std::vector<unsigned char> bytes;
    for (std::int32_t y = 0; y < picture.height(); ++y) {
        for (const std::uint32_t pixel : picture.row(y)) {
            const Colour colour = colourOf(pixel);
            bytes.insert(bytes.end(), {colour.red, colour.green, colour.blue});
        }
    }
    return bytes;
}

Machine::Machine(std::uint64_t seed)
    : frontEnd(ProgramFolder::path()),
      loop(frontEnd),
      app(loop, seed),
      user(frontEnd, loop),
      game(app.game),
      program_(runProgram(app)) {
    frontEnd.connect(loop);
    program_.start();
    for (int i = 0; i < 300 && (!game.mainMenuActive || hasDialog()); ++i)
        user.wait(milliseconds(100));
    for (std::int16_t table = 1; table <= highScoreTables; ++table)
        app.highScores.table(table).scores.fill(1'000'000'000);
}

void Machine::clickMenu(int button) {
    user.click(337, static_cast<float>(52.5 * button + 15));
}

void Machine::pointAtMenu(int button) {
    user.movePointer(337, static_cast<float>(52.5 * button + 15));
}

void Machine::clickPanel(int entry) {
    user.click(95, static_cast<float>(65 + 40 * entry));
}

void Machine::clickCell(int column, int row) {
    const Rect cell = cellArea(column, row);
    user.click(static_cast<float>(cell.left + 14), static_cast<float>(cell.top + 14));
}

void Machine::start(int button, std::string_view rows) {
    clickMenu(button);
    setBoard(rows);
}

void Machine::setBoard(std::string_view rows) {
    game.grid.recreate(12, 16);
    auto row = static_cast<std::int16_t>(16 - std::count(rows.begin(), rows.end(), ' '));
    std::int16_t column = 1;
    for (const char letter : rows) {
        if (letter == ' ') {
            ++row;
            column = 1;
            continue;
        }
        const auto tile = static_cast<std::int16_t>(tileLetters.find(letter));
        GridCell& cell = game.grid.at({column++, row});
        if (tile == tiles::stone)
            cell = GridCell::stone();
        else if (tile > tiles::bombOffset)
            cell = GridCell::bomb(static_cast<std::int16_t>(tile - tiles::bombOffset));
        else if (tile != tiles::empty)
            cell = GridCell::block(tile);
    }
    MainWindow& window = app.frmQuabble();
    drawBoard({.surface = &window.canvas(), .left = 232, .top = boardTop(), .cellSize = cellSize},
              app.pictures.spriteSheet, game.grid);
    window.refresh();
}

std::string Machine::seenRows(int rows) {
    std::string seen;
    for (int row = 17 - rows; row <= 16; ++row) {
        for (int column = 1; column <= 12; ++column) {
            const Rect cell = cellArea(column, row);
            const Colour colour = mainPicture().at(cell.left, cell.bottom - 1);
            std::int16_t tile = 0;
            while (tile < tiles::count && sheet::tile(tile) != colour)
                ++tile;
            seen += tile < tiles::count ? tileLetters[static_cast<std::size_t>(tile)] : '?';
        }
        seen += row < 16 ? " " : "";
    }
    return seen;
}

bool Machine::isWrittenOn(int column, int row) {
    const Rect cell = cellArea(column, row);
    for (std::int32_t y = cell.top; y < cell.bottom; ++y) {
        for (std::int32_t x = cell.left; x < cell.right; ++x) {
            if (mainPicture().at(x, y) != mainPicture().at(cell.left, cell.top))
                return true;
        }
    }
    return false;
}

// A message to no window is taken at once unless the program waits for a time.
bool Machine::isIdle() {
    loop.post({WindowId::none, EventKind::MouseMove});
    const bool idle = loop.nextDeadline() == frontEnd.now();
    loop.wake();
    return idle;
}

Rect Machine::cellArea(int column, int row) const {
    return Rect::ofSize(232 + (column - 1) * cellSize, boardTop() + (row - 1) * cellSize, cellSize, cellSize);
}

}  // namespace quabble
