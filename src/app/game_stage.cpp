#include <string>

#include "app/app_state.hpp"
#include "app/main_window.hpp"
#include "gfx/painters.hpp"
#include "gfx/string_table.hpp"

namespace quabble {
namespace {

constexpr std::int32_t panelLeft = 200;
constexpr std::int32_t arcadePanelTop = 5;
constexpr double pointsPoints = 8;

}  // namespace

BoardArea MainWindow::layOutClassic() {
    return layOutBoardAt(playPanelBox_.top);
}

BoardArea MainWindow::layOutArcade() {
    const BoardArea area = layOutBoardAt(arcadePanelTop);
    previewBox_ = layOutPreview(canvas(), boardBox_);
    gaugeBox_ = layOutGauge(canvas(), playPanelBox_, boardBox_);
    return area;
}

BoardArea MainWindow::layOutBoardAt(std::int32_t panelTop) {
    playPanelBox_.left = panelLeft;
    playPanelBox_.top = panelTop;
    boardBox_ = layOutBoard(canvas(), playPanelBox_);
    return {boardBox_.left, boardBox_.top, boardBox_.cellSize};
}

void MainWindow::clearWindow() {
    fillBox(backgroundBox_);
}

void MainWindow::drawClassicPanel() {
    drawPanel(standardBtns_, string_ids::classicPanelBase);
}

void MainWindow::drawArcadePanel() {
    drawPanel(arcadeBtns_, string_ids::arcadePanelBase);
    drawValue(arcadeBtns_[panel_boxes::level], app_.game.stats.level, false);
}

void MainWindow::drawPlayPanel() {
    quabble::drawPlayPanel(playPanelBox_, app_.pictures.spriteSheet);
}

void MainWindow::drawBoard() {
    quabble::drawBoard(boardBox_, app_.pictures.spriteSheet, app_.game.grid);
}

void MainWindow::drawCell(CellPosition place, std::int16_t tile) {
    quabble::drawCell(boardBox_, app_.pictures.spriteSheet, static_cast<std::int16_t>(place.column - 1),
                      static_cast<std::int16_t>(place.row - 1), tile);
}

void MainWindow::drawPoints(CellPosition place, std::int32_t points) {
    pointsBox_ = {.surface = &canvas(),
                  .left = (place.column - 1) * boardBox_.cellSize + boardBox_.left,
                  .top = (place.row - 1) * boardBox_.cellSize + boardBox_.top,
                  .width = boardBox_.cellSize,
                  .height = boardBox_.cellSize,
                  .textColour = palette::panelTextColour};
    canvas().font.points = pointsPoints;
    drawLabelledBox(pointsBox_, BoxStyle::Plain, false, 2, std::to_string(points));
    canvas().font.points = captionPoints;
}

// Both side panels have the score's box in the same place.
void MainWindow::updateScore() {
    if (app_.game.isGameActive())
        drawValue(standardBtns_[panel_boxes::score], app_.game.stats.score, false);
}

void MainWindow::displayLevel() {
    drawValue(arcadeBtns_[panel_boxes::level], app_.game.stats.level, true);
}

void MainWindow::drawPreviewRow(std::int16_t revealed) {
    quabble::drawPreviewRow(previewBox_, app_.pictures.spriteSheet, app_.game.nextRow, revealed);
}

void MainWindow::drawGauge(double percentage) {
    quabble::drawGauge(gaugeBox_, app_.pictures.spriteSheet, percentage);
}

void MainWindow::present() {
    refresh();
}

Task<> MainWindow::pause(std::chrono::milliseconds duration) {
    co_await loop().pause(duration);
}

Task<> MainWindow::runPendingMessages() {
    return loop().runPendingMessages();
}

// While the game is paused the timer stays off, whatever goes on beneath the notice.
void MainWindow::switchBlockTimer(bool on) {
    timerBlocks_.setEnabled(on && !gamePaused_);
}

void MainWindow::setBlockTimerInterval(std::chrono::milliseconds interval) {
    timerBlocks_.setInterval(interval);
}

Task<> MainWindow::showResult(bool goNextLevel) {
    ResultDialog& diagWow = app_.diagWow();
    diagWow.goNextLevel = goNextLevel;
    co_await loop().showModal(diagWow);
    diagWow.goNextLevel = false;
}

Task<std::string> MainWindow::enterName() {
    co_await loop().showModal(app_.diagUN());
    co_return app_.diagUN().nameEntered();
}

Task<> MainWindow::showHighScores(std::int16_t tableIndex) {
    app_.frmStats().modeNum = tableIndex;
    co_await loop().showModal(app_.frmStats());
}

}  // namespace quabble
