#include "store/score_view.hpp"

#include <string>

#include "base/round_half_even.hpp"
#include "gfx/painters.hpp"
#include "gfx/spoken_words.hpp"
#include "gfx/string_table.hpp"
#include "store/version.hpp"

namespace quabble {
namespace {

constexpr Size viewSize{473, 473};
constexpr Font font{Typeface::SerifBold, 14.25};
constexpr const char* clearedName = "Anonoymous";

}  // namespace

ScoreView::ScoreView(MessageLoop& loop, Window& owner, HighScores& highScores, std::int16_t layoutUnit)
    : Window(loop, &owner), highScores_(highScores), unit_(layoutUnit) {}

void ScoreView::Form_Load() {
    setCaption("Best Scores - " + std::string(applicationTitle));
    setClientSize(viewSize);
    layOut();
    isHighlighted_ = {};
}

void ScoreView::Form_Paint() {
    canvas().fill(canvas().bounds(), palette::viewBrush.colour);
    for (std::size_t place = 0; place < highScorePlaces; ++place)
        drawRow(place);
    drawTitle();
    for (std::size_t i = 0; i < buttons_.size(); ++i)
        drawButton(i);
}

void ScoreView::layOut() {
    const auto [width, height] = outerSize();
    title_ = {.left = roundHalfEven(width / 2.0 - 2 * unit_),
              .top = roundHalfEven(unit_ / 2.0),
              .width = 4 * unit_,
              .height = 20,
              .fillBrush = palette::viewBrush,
              .textColour = palette::labelColour,
              .font = font};
    buttons_ = {layOutButton(2), layOutButton(6)};
}

ScreenButton ScoreView::layOutButton(std::int32_t leftUnits) const {
    return {.left = leftUnits * unit_,
            .top = 9 * unit_,
            .width = 3 * unit_,
            .height = 30,
            .fillBrush = palette::backgroundBrush,
            .framePen = palette::lightPen,
            .textColour = palette::panelTextColour,
            .font = font};
}

Rect ScoreView::rowArea(std::int32_t place) const {
    return Rect::ofSize(unit_, unit_ * (place + 1), 9 * unit_, unit_);
}

void ScoreView::drawTitle() {
    drawLabelledBox(canvas(), title_, BoxStyle::Plain, false, 2, title());
}

std::string_view ScoreView::title() const {
    return loadString(static_cast<std::uint16_t>(string_ids::mainMenuBase + modeNum));
}

void ScoreView::drawRow(std::size_t place) {
    const HighScoreTable& table = highScores_.table(modeNum);
    ScreenButton box{.left = unit_,
                     .top = unit_ * static_cast<std::int32_t>(place + 1),
                     .width = 6 * unit_,
                     .height = unit_,
                     .fillBrush = palette::viewBrush,
                     .textColour = palette::highlightColour,
                     .font = font};
    drawShadowText(canvas(), box, 1, table.names[place], defaultTextFormat);
    box.left = 8 * unit_;
    box.width = 2 * unit_;
    drawShadowText(canvas(), box, 1, std::to_string(table.scores[place]), defaultTextFormat);
}

void ScoreView::drawButton(std::size_t i) {
    const bool highlighted = isHighlighted_[i];
    drawLabelledBox(canvas(), buttons_[i], highlighted ? BoxStyle::Framed : BoxStyle::Plain, highlighted,
                    highlighted ? 6 : 4, captionOf(i));
}

std::string_view ScoreView::captionOf(std::size_t button) {
    return loadString(static_cast<std::uint16_t>(string_ids::scoreViewBase + 1 + button));
}

std::vector<Place> ScoreView::places() const {
    std::vector<Place> places{{title_.rect(), Place::Role::Text, std::string(title())}};
    const HighScoreTable& table = highScores_.table(modeNum);
    for (std::int32_t place = 0; place < highScorePlaces; ++place) {
        const auto i = static_cast<std::size_t>(place);
        places.push_back(
            {rowArea(place), Place::Role::TableRow,
             std::to_string(place + 1) + ". " + table.names[i] + ", " + std::to_string(table.scores[i])});
    }
    for (std::size_t i = 0; i < buttons_.size(); ++i)
        places.push_back({buttons_[i].rect(), Place::Role::Button, std::string(captionOf(i))});
    return places;
}

Task<> ScoreView::Form_MouseMove(float x, float y) {
    for (std::size_t i = 0; i < buttons_.size(); ++i) {
        const bool over = hitTest(buttons_[i], x, y);
        if (over == buttons_[i].hovered)
            continue;
        buttons_[i].hovered = isHighlighted_[i] = over;
        drawButton(i);
        refresh();
    }
    co_return;
}

Task<> ScoreView::Form_MouseDown(float x, float y) {
    if (hitTest(buttons_[0], x, y))
        closeStats();
    else if (hitTest(buttons_[1], x, y))
        clearScores();
    co_return;
}

Task<> ScoreView::Form_KeyPress(std::int16_t key) {
    if (key == keys::enter || key == keys::escape)
        closeStats();
    co_return;
}

// There is no question first. Which button is hovered stays as it was, though both are drawn at rest.
void ScoreView::clearScores() {
    HighScoreTable& table = highScores_.table(modeNum);
    table.names.fill(clearedName);
    table.scores.fill(0);
    isHighlighted_ = {};
    Form_Paint();
    refresh();
    loop().frontEnd().say(spoken::scoresCleared);
}

}  // namespace quabble
