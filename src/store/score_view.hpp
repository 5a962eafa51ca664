#pragma once

#include <array>
#include <cstdint>

#include "engine/high_scores.hpp"
#include "gfx/screen_button.hpp"
#include "platform/window.hpp"

namespace quabble {

// The view of one table of high scores, which can also clear it.
class ScoreView final : public Window {
 public:
    // The loop, the owner and the tables must outlive the view.
    ScoreView(MessageLoop& loop, Window& owner, HighScores& highScores, std::int16_t layoutUnit);

    std::int16_t modeNum = 0;  // the table to show, 1 to 3; set it before the view is shown

 private:
    void Form_Load() override;
    void Form_Paint() override;
    bool isClickable(float x, float y) const override {
        return hitTest(buttons_[0], x, y) || hitTest(buttons_[1], x, y);
    }
    std::vector<Place> places() const override;
    Task<> Form_MouseDown(float x, float y) override;
    Task<> Form_MouseMove(float x, float y) override;
    Task<> Form_KeyPress(std::int16_t key) override;
    void closeStats() { unload(); }
    void clearScores();

    void layOut();
    ScreenButton layOutButton(std::int32_t leftUnits) const;
    std::string_view title() const;
    Rect rowArea(std::int32_t place) const;
    void drawTitle();
    void drawRow(std::size_t place);
    void drawButton(std::size_t i);
    static std::string_view captionOf(std::size_t button);

    HighScores& highScores_;
    std::int32_t unit_;
    ScreenButton title_;
    std::array<ScreenButton, 2> buttons_;
    std::array<bool, 2> isHighlighted_{};  // as they are drawn
};

}  // namespace quabble
