#include "hosts/headless/visit_player.hpp"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdlib>
#include <iterator>
#include <utility>

#include "draw/fingerprint.hpp"
#include "gfx/painters.hpp"
#include "visits/words.hpp"

namespace quabble {
namespace {

std::string hexOf(std::uint64_t number) {
    std::array<char, 16> digits{};
    const auto [end, problem] = std::to_chars(digits.data(), digits.data() + digits.size(), number, 16);
    const std::string text(digits.data(), end);
    return std::string(digits.size() - text.size(), '0') + text;
}

PlayGrid boardOf(std::string_view text) {
    PlayGrid grid;
    grid.recreate(maxGridCols, maxGridRows);
    CellPosition place{1, static_cast<std::int16_t>(maxGridRows - std::ranges::count(text, '/'))};
    for (const char letter : text) {
        if (letter == '/') {
            place = {1, static_cast<std::int16_t>(place.row + 1)};
            continue;
        }
        if (letter == 'S')
            grid.at(place) = GridCell::stone();
        else if (letter >= 'a')
            grid.at(place) = GridCell::bomb(static_cast<std::int16_t>(letter - 'a' + 1));
        else if (letter != '.')
            grid.at(place) = GridCell::block(static_cast<std::int16_t>(letter - '0'));
        ++place.column;
    }
    return grid;
}

Scale scaleOf(const HeadlessFrontEnd::Shown& window) {
    for (std::int32_t quarters = 4; quarters <= 16; ++quarters) {
        const Scale scale = Scale::ofQuarters(quarters);
        if (scale.device(window.traits.clientSize).width == window.picture.width())
            return scale;
    }
    return {};
}

}  // namespace

VisitPlayer::VisitPlayer(const Visit& visit, HeadlessFrontEnd::Files files, std::optional<Scale> scale)
    : visit_(visit),
      frontEnd_(std::move(files)),
      program_(frontEnd_, registry_, visit.seed),
      start_(frontEnd_.now()) {
    frontEnd_.scale = scale.value_or(visit.scale);
    program_.state().random.skip(visit.drawn);
    program_.start();
    for (std::int16_t table = 1; table <= highScoreTables; ++table)
        program_.state().highScores.table(table).scores = visit.scores[static_cast<std::size_t>(table - 1)];
}

void VisitPlayer::play(const VisitStep& step) {
    if (step.kind == VisitStep::Kind::Expect)
        return;
    advanceTo(step.at);
    if (step.kind == VisitStep::Kind::End)
        program_.requestEnd();
    else if (step.kind == VisitStep::Kind::Event && !frontEnd_.windows().empty())
        act(step);
    else if (step.kind == VisitStep::Kind::Given && program_.state().game.isGameActive())
        give(step);
    program_.wake();
}

// Only while no move is under way, for nothing tells it.
void VisitPlayer::give(const VisitStep& step) {
    AppState& app = program_.state();
    GameState& game = app.game;
    if (step.what == givens::board) {
        game.grid = boardOf(step.value);
        MainWindow& window = program_.frmQuabble();
        const CellBox box{game.boardArea.left, game.boardArea.top, game.boardArea.cellSize};
        drawBoard(window.canvas(), box, app.pictures.sprites(window.canvas().scale()), game.grid);
        window.refresh();
        return;
    }
    const std::int32_t number = std::atoi(step.value.c_str());
    if (step.what == givens::level)
        game.stats.level = static_cast<std::int16_t>(std::clamp<std::int32_t>(number, 1, lastLevel));
    else
        game.rowsEntered = number;
}

void VisitPlayer::advanceTo(microseconds time) {
    if (visit_.areWakesWritten)
        frontEnd_.advanceTo(start_ + time);
    else
        user_.wait(start_ + time - frontEnd_.now());
}

void VisitPlayer::act(const VisitStep& step) {
    const auto& windows = frontEnd_.windows();
    const bool isBelow = step.isBelow && windows.size() > 1;
    const auto window = isBelow ? std::prev(windows.end(), 2) : std::prev(windows.end());
    InputEvent event = step.event;
    event.window = window->first;
    if (event.kind == EventKind::Minimised)
        frontEnd_.minimiseWindow(event.window);
    else if (event.kind == EventKind::Restored)
        frontEnd_.restoreWindow(event.window);
    else if (event.kind == EventKind::Rescaled)
        frontEnd_.rescale(event.scale);
    else if (event.kind != EventKind::TextInput || window->second.takesText)
        program_.post(event);
}

std::string VisitPlayer::seen(const VisitStep& expectation) {
    using namespace expectations;
    const GameState& game = program_.state().game;
    if (expectation.what == score)
        return std::to_string(game.stats.score);
    if (expectation.what == level)
        return std::to_string(game.stats.level);
    if (expectation.what == rows)
        return std::to_string(game.rowsEntered);
    if (expectation.what == ended)
        return program_.ended() ? "" : "not yet";
    if (frontEnd_.windows().empty())
        return {};
    const HeadlessFrontEnd::Shown& top = frontEnd_.windows().rbegin()->second;
    if (expectation.what == window)
        return top.traits.caption;
    return std::string(wordOf(scaleOf(top))) + " " + hexOf(fingerprintOf(top.picture));
}

bool VisitPlayer::isAsExpected(const VisitStep& expectation) {
    const std::string now = seen(expectation);
    if (expectation.what != expectations::picture)
        return now == expectation.value;
    const auto expected = wordsIn(expectation.value);
    const auto found = wordsIn(now);
    for (std::size_t i = 0; i + 1 < expected.size() && found.size() == 2; i += 2) {
        if (expected[i] == found[0])
            return expected[i + 1] == found[1];
    }
    return found.size() == 2;
}

const Surface& VisitPlayer::picture() const {
    static const Surface none;
    return frontEnd_.windows().empty() ? none : frontEnd_.windows().rbegin()->second.picture;
}

std::optional<VisitDifference> playVisit(const Visit& visit, const HeadlessFrontEnd::Files& files,
                                         std::optional<Scale> scale) {
    VisitPlayer player(visit, files, scale);
    for (const VisitStep& step : visit.steps) {
        player.play(step);
        if (step.kind == VisitStep::Kind::Expect && !player.isAsExpected(step))
            return VisitDifference{step, player.seen(step)};
    }
    return std::nullopt;
}

}  // namespace quabble
