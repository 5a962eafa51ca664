#pragma once

#include <string>

#include "gfx/ok_dialog.hpp"

namespace quabble {

// A dialog that tells the user one sentence, titled with the name of the program. The OK button, Enter and
// Esc close it.
class MessageDialog final : public OkDialog {
 public:
    // The loop must outlive the dialog; so must the owner, if there is one.
    MessageDialog(MessageLoop& loop, Window* owner, std::string title, std::string text);

 private:
    void Form_Load() override;
    void Form_Paint() override;

    std::string title_;  // UTF-8
};

}  // namespace quabble
