#pragma once

#include <cstdint>
#include <string>

#include "engine/game_state.hpp"
#include "gfx/ok_dialog.hpp"

namespace quabble {

// What the result dialog says about a game that ended or, with `goNextLevel`, about a level that was
// completed: a title, then the figures on lines of their own.
std::string resultText(const GameState& game, bool goNextLevel);

// The dialog that reports the outcome of a game or of an arcade level. Closing it is its only result.
class ResultDialog final : public OkDialog {
 public:
    // The loop, the owner and the game must outlive the dialog.
    ResultDialog(MessageLoop& loop, Window& owner, const GameState& game, std::int16_t layoutUnit);

    bool goNextLevel = false;  // announce a completed level; set it before the dialog is shown

 private:
    void Form_Load() override;
    void Form_Paint() override;

    void layOut();

    const GameState& game_;
    std::int16_t layoutUnit_;
};

}  // namespace quabble
