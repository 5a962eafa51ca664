#include <string>

#include "app/app_state.hpp"
#include "app/main_window.hpp"
#include "gfx/painters.hpp"
#include "gfx/string_table.hpp"

namespace quabble {
namespace {

constexpr double restingPoints = 10;

std::string_view captionOf(std::uint16_t captionBase, std::size_t i) {
    return loadString(static_cast<std::uint16_t>(captionBase + i + 1));
}

}  // namespace

void MainWindow::showMainMenu() {
    gamePaused_ = false;
    lblPause_.visible = false;
    app_.game.mainMenuActive = true;
    fillBox(backgroundBox_);
    playPanelBox_ = layOutPlayPanel(canvas(), backgroundBox_);
    for (std::size_t i = 0; i < mmBtns_.size(); ++i) {
        canvas().font.points = captionPoints;
        drawLabelledBox(mmBtns_[i], BoxStyle::Plain, false, 3, captionOf(string_ids::mainMenuBase, i));
    }
    refresh();
}

// Buttons are counted from 1, as in the tables of captions.
Task<> MainWindow::mainMenuClick(std::size_t clickedBtnNum) {
    const auto number = static_cast<std::int16_t>(clickedBtnNum);
    switch (clickedBtnNum) {
        case 1:
            app_.game.gameMode = GameMode::Training;
            app_.game.scoreTableIndex = number;
            game_.startStandardGame();
            break;
        case 2:
        case 3:
            app_.game.gameMode = static_cast<GameMode>(number);
            app_.game.scoreTableIndex = number;
            co_await game_.startArcadeGame();
            break;
        case 4:
        case 5:
        case 6:
            co_await showHighScores(static_cast<std::int16_t>(number - 3));
            break;
        case 7:
            openHelp();
            break;
        case 8:
            co_await Form_QueryUnload();
            break;
        default:
            break;
    }
}

void MainWindow::openHelp() {
    app_.openDocument(app_.programFolder + "QB_HELP.HTM");
}

Task<> MainWindow::standardMenuClick(std::size_t clickedBtnNum) {
    switch (clickedBtnNum) {
        case 6:
            enablePause(true);
            break;
        case 7:
            openHelp();
            break;
        case 8:
            co_await game_.endGame();
            break;
        default:
            break;
    }
}

Task<> MainWindow::arcadeMenuClick(std::size_t clickedBtnNum) {
    switch (clickedBtnNum) {
        case 8:
            enablePause(true);
            break;
        case 9:
            openHelp();
            break;
        case 10:
            co_await game_.endGame();
            break;
        default:
            break;
    }
}

void MainWindow::highlightUnderPointer(ButtonSet& buttons, std::uint16_t captionBase, float x, float y) {
    for (std::size_t i = 0; i < buttons.size(); ++i) {
        ScreenButton& button = buttons[i];
        const bool over = hitTest(button, x, y);
        if (button.active != BoxKind::Button || over == button.hovered)
            continue;
        canvas().font.points = captionPoints;
        drawLabelledBox(button, over ? BoxStyle::Framed : BoxStyle::Plain, over, over ? 6 : 3,
                        captionOf(captionBase, i));
        button.hovered = over;
        canvas().font.points = restingPoints;
        refresh();
    }
}

void MainWindow::drawPanel(ButtonSet& entries, std::uint16_t captionBase) {
    canvas().font.points = captionPoints;
    for (std::size_t i = 0; i < entries.size(); ++i) {
        if (entries[i].active == BoxKind::ValueBox)
            continue;
        const std::int32_t shadowOffset = entries[i].active == BoxKind::Button ? 6 : 2;
        drawLabelledBox(entries[i], BoxStyle::Plain, false, shadowOffset, captionOf(captionBase, i));
    }
    drawValue(entries[panel_boxes::bestScore], app_.game.stats.bestScore, false);
    drawValue(entries[panel_boxes::score], app_.game.stats.score, false);
}

void MainWindow::drawValue(ScreenButton& box, std::int32_t value, bool highlighted) {
    canvas().font.points = captionPoints;
    drawLabelledBox(box, BoxStyle::Plain, highlighted, 2, std::to_string(value));
}

}  // namespace quabble
