#pragma once

#include <string>

#include "platform/control.hpp"
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
    Task<> Form_KeyPress(std::int16_t key) override;
    Task<> OKButton_Click();

    std::string title_;  // UTF-8
    std::string text_;   // Windows-1252
    PushButton OKButton_;
};

}  // namespace quabble
