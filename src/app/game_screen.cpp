#include "app/game_screen.hpp"

#include <algorithm>
#include <iterator>
#include <utility>

#include "app/layout.hpp"
#include "gfx/message_template.hpp"
#include "gfx/painters.hpp"
#include "gfx/spoken_words.hpp"
#include "gfx/string_table.hpp"

namespace quabble {
namespace {

constexpr Font pointsFont{Typeface::SansBold, 8};
constexpr std::int32_t buttonShadow = 6;

}  // namespace

GameScreen::GameScreen(MessageLoop& loop, Window& window, AppState& app, Handlers handlers)
    : loop_(loop),
      window_(window),
      app_(app),
      handlers_(std::move(handlers)),
      timerBlocks_(loop, handlers_.blockTimerTick),
      diagWow_(loop, window, app.game, layout::layoutUnit),
      diagUN_(loop, window),
      frmStats_(loop, window, app.highScores, layout::layoutUnit),
      standardBtns_(layout::initStandardBtns(), string_ids::classicPanelBase, buttonShadow),
      arcadeBtns_(layout::initArcadeBtns(), string_ids::arcadePanelBase, buttonShadow) {}

void GameScreen::setPaused(bool paused) {
    gamePaused_ = paused;
    switchBlockTimer(app_.game.arcadeActive && app_.game.gameMode == GameMode::Timed);
}

ButtonPanel& GameScreen::panel() {
    return shown_ == Shown::ClassicGame ? standardBtns_ : arcadeBtns_;
}

const ButtonPanel& GameScreen::panel() const {
    return shown_ == Shown::ClassicGame ? standardBtns_ : arcadeBtns_;
}

std::optional<PanelButton> GameScreen::buttonAt(float x, float y) const {
    const auto button = panel().buttonAt(x, y);
    return button ? std::optional(static_cast<PanelButton>(*button)) : std::nullopt;
}

bool GameScreen::isOnPreview(float x, float y) const {
    return app_.game.arcadeActive && hitTest(strip(), x, y);
}

Rect GameScreen::strip() const {
    return {previewBox_.left, previewBox_.top, previewBox_.cell(12, 0).left, previewBox_.cell(0, 1).top};
}

std::vector<Place> GameScreen::places() const {
    std::vector<Place> places{panel().valuePlace(layout::scoreBox, figures_.score),
                              panel().valuePlace(layout::bestScoreBox, figures_.bestScore)};
    const bool isArcade = shown_ == Shown::ArcadeGame;
    if (isArcade) {
        places.push_back(panel().valuePlace(layout::levelBox, figures_.level));
        places.push_back({gaugeBox_, Place::Role::Text, rowsInWords()});
        places.push_back({strip(), Place::Role::Text, waitingRowInWords()});
    }
    std::ranges::move(panel().places(), std::back_inserter(places));
    std::ranges::move(boardPlaces(boardBox_, app_.game.grid), std::back_inserter(places));
    if (isArcade)
        places.push_back({strip(), Place::Role::Button, std::string(spoken::bringRow)});
    return places;
}

std::string GameScreen::rowsInWords() const {
    const std::int16_t level = std::clamp<std::int16_t>(app_.game.stats.level, 1, lastLevel);
    return fillText(spoken::rows, {"|1", app_.game.rowsEntered, "|2", app_.levelTable[level].rowsToComplete});
}

std::string GameScreen::waitingRowInWords() const {
    std::string cells;
    for (const GridCell& cell : app_.game.nextRow)
        cells += (cells.empty() ? "" : ", ") + wordsFor(cell);
    return fillText(spoken::waitingRow, {"|1", revealed_ + 1, "|2", cells});
}

// What the first of several cells that are drawn alike tells of all of them.
void GameScreen::sayOf(CellPosition place, std::int16_t tile) {
    if (tile == tiles::explosion.front())
        say(fillText(spoken::explosion, {"|1", blockWords(app_.game.grid.at(place).colour)}));
    else if (tile == tiles::releasedStone)
        say(spoken::release);
}

void GameScreen::say(std::string_view words) {
    loop_.frontEnd().say(words);
}

void GameScreen::highlightUnderPointer(float x, float y) {
    while (panel().highlightNext(window_.canvas(), x, y))
        window_.refresh();
}

void GameScreen::paint() {
    clear();
    panel().drawAgain(window_.canvas());
    drawValues();
    drawPlayPanel();
    const auto points = points_;
    drawBoard();
    if (points)
        drawPoints(points->place, points->points);
    if (shown_ == Shown::ArcadeGame) {
        drawPreviewRow(revealed_);
        drawGauge(percentage_);
    }
}

BoardArea GameScreen::layOutClassic() {
    return layOutOn(layout::classicPlayPanel());
}

BoardArea GameScreen::layOutArcade() {
    const BoardArea area = layOutOn(layout::arcadePlayPanel());
    previewBox_ = layout::preview(boardBox_);
    gaugeBox_ = layout::gauge(playPanelBox_, boardBox_);
    return area;
}

BoardArea GameScreen::layOutOn(const Rect& playPanel) {
    playPanelBox_ = playPanel;
    boardBox_ = layout::board(playPanel);
    return {boardBox_.left, boardBox_.top, boardBox_.cellSize};
}

void GameScreen::clearWindow() {
    shown_ = Shown::Nothing;
    clear();
}

void GameScreen::clear() {
    window_.canvas().fill(window_.canvas().bounds(), palette::backgroundColour);
}

void GameScreen::drawClassicPanel() {
    shown_ = Shown::ClassicGame;
    drawPanel();
}

void GameScreen::drawArcadePanel() {
    shown_ = Shown::ArcadeGame;
    drawPanel();
}

void GameScreen::drawPanel() {
    const GameStats& stats = app_.game.stats;
    figures_ = {stats.bestScore, stats.score, stats.level, false};
    panel().draw(window_.canvas());
    drawValues();
}

void GameScreen::drawValues() {
    panel().drawValue(window_.canvas(), layout::bestScoreBox, figures_.bestScore, false);
    panel().drawValue(window_.canvas(), layout::scoreBox, figures_.score, false);
    if (shown_ == Shown::ArcadeGame)
        panel().drawValue(window_.canvas(), layout::levelBox, figures_.level, figures_.isLevelHighlighted);
}

void GameScreen::drawPlayPanel() {
    quabble::drawPlayPanel(window_.canvas(), playPanelBox_, sprites());
}

void GameScreen::drawBoard() {
    points_.reset();
    drawnTile_ = -1;
    quabble::drawBoard(window_.canvas(), boardBox_, sprites(), app_.game.grid);
}

void GameScreen::drawCell(CellPosition place, std::int16_t tile) {
    quabble::drawCell(window_.canvas(), boardBox_, sprites(), static_cast<std::int16_t>(place.column - 1),
                      static_cast<std::int16_t>(place.row - 1), tile);
    if (std::exchange(drawnTile_, tile) != tile)
        sayOf(place, tile);
}

void GameScreen::drawPoints(CellPosition place, std::int32_t points) {
    points_ = {place, points};
    const Rect cell = boardBox_.cell(place.column - 1, place.row - 1);
    const ScreenButton label{.left = cell.left,
                             .top = cell.top,
                             .width = cell.width(),
                             .height = cell.height(),
                             .textColour = palette::panelTextColour,
                             .font = pointsFont};
    drawLabelledBox(window_.canvas(), label, BoxStyle::Plain, false, 2, std::to_string(points));
}

void GameScreen::updateScore() {
    if (!app_.game.isGameActive())
        return;
    say(fillText(spoken::points, {"|1", app_.game.stats.score - figures_.score}));
    figures_.score = app_.game.stats.score;
    panel().drawValue(window_.canvas(), layout::scoreBox, figures_.score, false);
}

void GameScreen::displayLevel() {
    figures_.level = app_.game.stats.level;
    figures_.isLevelHighlighted = true;
    panel().drawValue(window_.canvas(), layout::levelBox, figures_.level, true);
    say(fillText(spoken::level, {"|1", figures_.level}));
}

void GameScreen::drawPreviewRow(std::int16_t revealed) {
    revealed_ = revealed;
    quabble::drawPreviewRow(window_.canvas(), previewBox_, sprites(), app_.game.nextRow, revealed);
}

void GameScreen::drawGauge(double percentage) {
    if (percentage > percentage_)
        say(rowsInWords());
    percentage_ = percentage;
    quabble::drawGauge(window_.canvas(), gaugeBox_, sprites(), percentage);
}

void GameScreen::present() {
    window_.refresh();
}

Task<> GameScreen::pause(std::chrono::milliseconds duration) {
    co_await loop_.pause(duration);
}

Task<> GameScreen::runPendingMessages() {
    return loop_.runPendingMessages();
}

void GameScreen::switchBlockTimer(bool on) {
    timerBlocks_.setEnabled(on && !gamePaused_);
}

void GameScreen::setBlockTimerInterval(std::chrono::milliseconds interval) {
    timerBlocks_.setInterval(interval);
}

Task<> GameScreen::showResult(bool goNextLevel) {
    diagWow_.goNextLevel = goNextLevel;
    co_await loop_.showModal(diagWow_);
    diagWow_.goNextLevel = false;
}

Task<std::string> GameScreen::enterName() {
    const std::int16_t place = app_.highScores.rankOf(app_.game.scoreTableIndex, app_.game.stats.score);
    say(fillText(spoken::place, {"|1", place}));
    co_await loop_.showModal(diagUN_);
    co_return diagUN_.nameEntered();
}

Task<> GameScreen::showHighScores(std::int16_t tableIndex) {
    frmStats_.modeNum = tableIndex;
    co_await loop_.showModal(frmStats_);
}

}  // namespace quabble
