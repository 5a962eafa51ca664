#pragma once

#include <string>

#include "gfx/screen_button.hpp"
#include "platform/window.hpp"

namespace quabble {

// A dialog that tells the user one sentence, titled with the name of the program. The OK button, Enter and
// Esc close it.
class MessageDialog final : public Window {
 public:
    // The loop must outlive the dialog; so must the owner, if there is one.
    MessageDialog(MessageLoop& loop, Window* owner, std::string title, std::string text);

 private:
    void Form_Load() override;
    bool isClickable(float x, float y) const override { return hitTest(okBox_, x, y); }
    Task<> Form_MouseDown(float x, float y) override;
    Task<> Form_MouseMove(float x, float y) override;
    Task<> Form_KeyPress(std::int16_t key) override;

    std::string title_;  // UTF-8
    std::string text_;   // Windows-1252
    ScreenButton okBox_;
};

}  // namespace quabble
