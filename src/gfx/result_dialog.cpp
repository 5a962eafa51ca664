#include "gfx/result_dialog.hpp"

#include "base/round_half_even.hpp"
#include "engine/level_table.hpp"
#include "gfx/message_template.hpp"
#include "gfx/ok_button.hpp"
#include "gfx/painters.hpp"
#include "gfx/string_table.hpp"

namespace quabble {
namespace {

constexpr Size designedSize{457, 265};
constexpr Font textFont{Typeface::Sans, 12};

std::string figures(std::uint16_t templateId, const GameStats& stats, std::int32_t level) {
    return fillTemplate(
        templateId, {"|1", stats.score, "|2", level, "|3", stats.blocksCleared, "|4", stats.largestCluster});
}

std::string titled(std::uint16_t titleId, const std::string& body) {
    return std::string(loadString(titleId)) + "\r\n" + body;
}

}  // namespace

std::string resultText(const GameState& game, bool goNextLevel) {
    const GameStats& stats = game.stats;
    if (game.gameMode == GameMode::Training)
        return titled(string_ids::gameOver, figures(string_ids::trainingResult, stats, stats.level));
    const bool allCompleted = stats.level > lastLevel || (stats.level == lastLevel && goNextLevel);
    if (allCompleted && game.gameMode == GameMode::Timed)
        return std::string(loadString(string_ids::allLevelsFinished));
    if (allCompleted)
        return titled(string_ids::allLevelsFinished, figures(string_ids::arcadeResult, stats, stats.level));
    if (goNextLevel)
        return titled(string_ids::levelCompleted, figures(string_ids::levelResult, stats, stats.level + 1));
    return titled(string_ids::gameOver, figures(string_ids::arcadeResult, stats, stats.level));
}

ResultDialog::ResultDialog(MessageLoop& loop, Window& owner, const GameState& game, std::int16_t layoutUnit)
    : OkDialog(loop, &owner), game_(game), layoutUnit_(layoutUnit) {}

void ResultDialog::Form_Load() {
    setCaption("Game Statistics");
    setClientSize(designedSize);
    layOut();
    text_ = resultText(game_, goNextLevel);
}

void ResultDialog::Form_Paint() {
    canvas().fill(canvas().bounds(), palette::blackBrush.colour);
    drawShadowText(canvas(), textBox_, 2, text_, text_format::centre);
    drawOkButton(canvas(), okBox_);
}

void ResultDialog::layOut() {
    const std::int32_t u = layoutUnit_;
    const auto [width, height] = outerSize();
    textBox_ = {.left = u,
                .top = u,
                .width = width - 2 * u,
                .height = height - 4 * u,
                .textColour = palette::panelTextColour,
                .font = textFont};
    okBox_ = layOutOkButton(roundHalfEven((width - okButtonSize.width) / 2.0), height - 2 * u);
}

}  // namespace quabble
