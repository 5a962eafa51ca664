#include "hosts/headless/visit_steps.hpp"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdlib>

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

Scale scaleOf(const Surface& picture, Size clientSize) {
    for (std::int32_t quarters = 4; quarters <= 16; ++quarters) {
        const Scale scale = Scale::ofQuarters(quarters);
        if (scale.device(clientSize).width == picture.width())
            return scale;
    }
    return {};
}

}  // namespace

void VisitSteps::begin(const Visit& visit) {
    program_.state().random.skip(visit.drawn);
    for (std::int16_t table = 1; table <= highScoreTables; ++table)
        program_.state().highScores.table(table).scores = visit.scores[static_cast<std::size_t>(table - 1)];
}

void VisitSteps::act(const VisitStep& step) {
    if (step.kind == VisitStep::Kind::End)
        program_.requestEnd();
    else if (step.kind == VisitStep::Kind::Event)
        happen(step);
    else if (step.kind == VisitStep::Kind::Given && program_.state().game.isGameActive())
        give(step);
}

void VisitSteps::happen(const VisitStep& step) {
    const auto windows = machine_.windows();
    if (windows.empty())
        return;
    const auto& window =
        windows[step.isBelow && windows.size() > 1 ? windows.size() - 2 : windows.size() - 1];
    InputEvent event = step.event;
    event.window = window.id;
    if (event.kind == EventKind::Minimised)
        machine_.minimise(window.id);
    else if (event.kind == EventKind::Restored)
        machine_.restore(window.id);
    else if (event.kind == EventKind::Rescaled)
        machine_.rescale(event.scale);
    else if (event.kind != EventKind::TextInput || window.takesText)
        program_.post(event);
}

// Only while no move is under way, for nothing tells it.
void VisitSteps::give(const VisitStep& step) {
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

std::string VisitSteps::seen(const VisitStep& expectation) const {
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
    const auto windows = machine_.windows();
    if (windows.empty())
        return {};
    if (expectation.what == window)
        return windows.back().caption;
    const Surface& shown = machine_.picture();
    return std::string(wordOf(scaleOf(shown, windows.back().clientSize))) + " " + hexOf(fingerprintOf(shown));
}

bool VisitSteps::isAsExpected(const VisitStep& expectation) const {
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

std::string differenceOf(const VisitStep& expectation, const std::string& seen) {
    return expectation.what + ": \"" + expectation.value + "\" was expected, \"" + seen + "\" is seen";
}

}  // namespace quabble
