#pragma once

#include <set>

#include "../engine/board_notation.hpp"
#include "app/program.hpp"
#include "draw/bitmap_file.hpp"
#include "gfx/painters.hpp"
#include "hosts/headless/memory_blob.hpp"
#include "hosts/headless/scripted_user.hpp"

namespace quabble {

// The sprite sheet of the tests: every area is flat and has a colour of its own.
constexpr Colour maskColour{0x55, 0x33, 0x0F};
constexpr Colour fullGaugeColour{250, 251, 252};
inline Colour tileColour(std::int16_t tile) {
    const int mixed = 0x0AF000 + tile * 0x11F035;
    return {static_cast<std::uint8_t>(mixed >> 16), static_cast<std::uint8_t>(mixed >> 8),
            static_cast<std::uint8_t>(mixed)};
}

inline bool isFlat(const Surface& picture, const Rect& area) {
    std::set<std::uint32_t> colours;
    for (std::int32_t i = 0; i < area.width() * area.height(); ++i)
        colours.insert(pixelOf(picture.at(area.left + i % area.width(), area.top + i / area.width())));
    return colours.size() == 1;
}

inline HeadlessFrontEnd::Files makeProgramFiles() {
    Surface picture(400, 838);
    for (std::int16_t tile = 0; tile < tiles::count; ++tile)
        picture.fill(Rect::ofSize(tile * 28, 0, 28, 28), tileColour(tile));
    picture.fill(Rect::ofSize(0, 28, 28, 28), maskColour);
    picture.fill(Rect::ofSize(274, 29, 30, 241), fullGaugeColour);
    picture.fill(Rect::ofSize(0, 338, 400, 500), {90, 10, 130});
    return {{"ALLPICDATA.BMP", encodeBitmap(picture)}};
}
inline const HeadlessFrontEnd::Files programFiles = makeProgramFiles();

// The visit that does again what was done since the last game began.
inline std::string recordOf(const Program& program) {
    std::string text;
    program.writeVisit([&](std::string_view line) { text += line; });
    return text;
}

// The program on its main menu, with high scores that are out of reach. Buttons are counted from 1.
struct Machine {
    HeadlessFrontEnd frontEnd{programFiles};
    MemoryBlob kept;
    BlobRegistryStore registry{kept};
    Program program;
    ScriptedUser<Program> user{frontEnd, program};
    AppState& app = program.state();
    GameState& game = app.game;

    explicit Machine(std::uint64_t seed = 1, Scale scale = {}) : Machine(MemoryBlob(), seed, scale) {
        for (std::int16_t table = 1; table <= highScoreTables; ++table)
            app.highScores.table(table).scores.fill(1'000'000'000);
    }
    // With the high scores that an earlier run has left.
    explicit Machine(MemoryBlob ofEarlier, std::uint64_t seed = 1, Scale scale = {})
        : kept(std::move(ofEarlier)), program(frontEnd, registry, seed) {
        frontEnd.scale = scale;
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
        MainWindow& window = program.frmQuabble();
        drawBoard(window.canvas(), {232, cell(1, 1).top, 28}, app.pictures.sprites(window.canvas().scale()),
                  game.grid);
        window.refresh();
    }

    bool hasDialog() const { return frontEnd.windows().size() > 1; }
    bool isPaused() { return program.frmQuabble().isPaused(); }
    const auto& shown() { return frontEnd.windows().at(program.frmQuabble().id()); }
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
