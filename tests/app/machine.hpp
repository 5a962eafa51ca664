#pragma once

#include <stb/stb_image_write.h>

#include <set>

#include "../engine/board_notation.hpp"
#include "../support/files.hpp"
#include "app/program.hpp"
#include "gfx/painters.hpp"
#include "hosts/headless/scripted_user.hpp"

namespace quabble {

// The sprite sheet of the tests: every area is flat and has a colour of its own.
constexpr Colour maskColour{0x55, 0x33, 0x0F};
constexpr Colour fullGaugeColour{250, 251, 252};
inline Colour tileColour(std::int16_t tile) {
    return colourOf(static_cast<std::uint32_t>(0x0AF000 + tile * 0x11F035));
}

inline std::vector<unsigned char> bytesOf(const Surface& picture) {
    std::vector<unsigned char> bytes;
    for (std::int32_t y = 0; y < picture.height(); ++y) {
        for (const std::uint32_t pixel : picture.row(y))
            bytes.insert(bytes.end(), {colourOf(pixel).red, colourOf(pixel).green, colourOf(pixel).blue});
    }
    return bytes;
}

inline bool isFlat(const Surface& picture, const Rect& area) {
    std::set<std::uint32_t> colours;
    for (std::int32_t i = 0; i < area.width() * area.height(); ++i)
        colours.insert(pixelOf(picture.at(area.left + i % area.width(), area.top + i / area.width())));
    return colours.size() == 1;
}

// The program's folder with the sheet in it; it goes with the process.
struct ProgramFolder : TemporaryFolder {
    ProgramFolder() {
        Surface picture(400, 838);
        for (std::int16_t tile = 0; tile < tiles::count; ++tile)
            picture.fill(Rect::ofSize(tile * 28, 0, 28, 28), tileColour(tile));
        picture.fill(Rect::ofSize(0, 28, 28, 28), maskColour);
        picture.fill(Rect::ofSize(274, 29, 30, 241), fullGaugeColour);
        picture.fill(Rect::ofSize(0, 338, 400, 500), {90, 10, 130});
        stbi_write_bmp((path / "ALLPICDATA.BMP").c_str(), 400, 838, 3, bytesOf(picture).data());
    }
};
inline const ProgramFolder programFolder;

// The program on its main menu, with high scores that are out of reach. Buttons are counted from 1.
struct Machine {
    HeadlessFrontEnd frontEnd{programFolder.path.string()};
    MessageLoop loop{frontEnd};
    Registry registry;
    AppState app;
    ScriptedUser user{frontEnd, loop};
    GameState& game = app.game;
    Task<> program = runProgram(app);

    explicit Machine(std::uint64_t seed = 1) : Machine(Registry::inMemory(), seed) {
        for (std::int16_t table = 1; table <= highScoreTables; ++table)
            app.highScores.table(table).scores.fill(1'000'000'000);
    }
    // With the high scores that an earlier run has left.
    explicit Machine(Registry kept, std::uint64_t seed = 1)
        : registry(std::move(kept)), app(loop, registry, seed) {
        frontEnd.connect(loop);
        program.start();
        user.wait(std::chrono::minutes(1));  // until the main menu is there
    }

    void pointAtMenu(int button) { user.movePointer(337, static_cast<float>(52.5 * button + 15)); }
    void clickMenu(int button) { user.click(337, static_cast<float>(52.5 * button + 15)); }
    void clickPanel(int entry) { user.click(95, static_cast<float>(65 + 40 * entry)); }
    void clickStrip() { user.click(400, 515); }
    void clickCell(int column, int row) {
        const Rect square = cell(column, row);
        user.click(static_cast<float>(square.left + 14), static_cast<float>(square.top + 14));
    }
    void closeDialog() { user.press(keys::enter); }

    // Starts a game on a board of ours.
    void start(int button, std::string_view rows) {
        clickMenu(button);
        setBoard(rows);
    }
    void setBoard(std::string_view rows) {
        game.grid = board(rows);
        ScreenButton box{.surface = &app.frmQuabble().canvas(), .left = 232, .top = cell(1, 1).top};
        box.cellSize = 28;
        drawBoard(box, app.pictures.spriteSheet, game.grid);
        app.frmQuabble().refresh();
    }

    bool hasDialog() const { return frontEnd.windows().size() > 1; }
    bool isPaused() { return app.frmQuabble().isPaused(); }
    const auto& shown() { return frontEnd.windows().at(app.frmQuabble().id()); }
    const Surface& picture() { return shown().picture; }
    Rect cell(int column, int row) const {
        const int above = game.gameMode == GameMode::Training ? 9 : 3;
        return Rect::ofSize(204 + column * 28, above + row * 28, 28, 28);
    }
    // The board as it is read from the pixels, 12 letters a row; '?' is no tile.
    std::string seenLetters() {
        std::string seen;
        for (int i = 0; i < 192; ++i) {
            const Rect square = cell(i % 12 + 1, i / 12 + 1);
            std::int16_t tile = 0;
            while (tile < tiles::count && tileColour(tile) != picture().at(square.left, square.bottom - 1))
                ++tile;
            seen += tile < tiles::count ? tileLetters[static_cast<std::size_t>(tile)] : '?';
        }
        return seen;
    }
    std::string seenBoard() { return boardText(seenLetters()); }
};

}  // namespace quabble
