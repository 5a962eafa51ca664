#pragma once

#include <string>

#include "gfx/screen_button.hpp"
#include "platform/text_box.hpp"
#include "platform/window.hpp"

namespace quabble {

// The name that goes into a table for what was typed: at most 19 characters, and "-" for none at all.
std::string acceptedName(const std::string& typed);

// The dialog that asks the player of a high score for a name. However it is closed, the name is what then
// stands in its box.
class NameEntry final : public Window {
 public:
    NameEntry(MessageLoop& loop, Window& owner);

    const std::string& nameEntered() const { return nameEntered_; }

 private:
    void Form_Load() override;
    std::vector<Place> places() const override;
    void Form_Paint() override;
    void Form_Unload() override;
    Task<> Form_KeyPress(std::int16_t key) override;
    Task<> OKButton_Click();

    TextBox txtName_;
    PushButton OKButton_;
    ScreenButton okBox_;
    std::string nameEntered_;
};

}  // namespace quabble
