#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "app/app_state.hpp"
#include "base/task.hpp"
#include "platform/headless/headless_front_end.hpp"
#include "platform/headless/scripted_user.hpp"
#include "platform/message_loop.hpp"

namespace quabble {

// The pictures that the tests run on: every area of the sheet is flat and has a colour of its own.
namespace sheet {
constexpr Colour mask{0x55, 0x33, 0x0F};
constexpr Colour emptyGauge{1, 2, 3};
constexpr Colour fullGauge{250, 251, 252};
constexpr Colour panel{90, 10, 130};
Colour tile(std::int16_t number);
}  // namespace sheet

// How a tile is written, by its number; rows of tiles are separated by blanks.
constexpr std::string_view tileLetters = ".1234#sabcWXYZ";

// The program's red, green and blue bytes of a picture, row by row.
std::vector<unsigned char> bytesOf(const Surface& picture);

// The program, started on a machine without a screen and left on its main menu. No score of the tests enters
// a table.
class Machine {
 public:
    explicit Machine(std::uint64_t seed = 1);

    HeadlessFrontEnd frontEnd;
    MessageLoop loop;
    AppState app;
    ScriptedUser user;
    GameState& game;

    // Buttons are counted from 1, panel entries likewise in the panel of the game being played.
    void clickMenu(int button);
    void pointAtMenu(int button);
    void clickPanel(int entry);
    void clickCell(int column, int row);
    void clickStrip() { user.click(400, 515); }
    void closeDialog() { user.press(keys::enter); }

    // Starts a game by its menu button and puts rows of tiles at the bottom of an otherwise empty board.
    void start(int button, std::string_view rows);
    void setBoard(std::string_view rows);

    bool hasDialog() const { return frontEnd.windows().size() > 1; }
    HeadlessFrontEnd::Shown mainWindow() { return frontEnd.windows().at(app.frmQuabble().id()); }
    const Surface& mainPicture() { return frontEnd.windows().at(app.frmQuabble().id()).picture; }
    std::int32_t boardTop() const { return game.gameMode == GameMode::Training ? 37 : 31; }
    // The board's last rows, read from the main window's pixels.
    std::string seenRows(int rows);
    // True when a cell shows more than its tile.
    bool isWrittenOn(int column, int row);
    // True when the program waits for something to happen, not for a time to pass.
    bool isIdle();

 private:
    Rect cellArea(int column, int row) const;

    Task<> program_;
};

}  // namespace quabble
