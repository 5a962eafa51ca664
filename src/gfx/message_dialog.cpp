#include "gfx/message_dialog.hpp"

#include <algorithm>
#include <utility>

#include "gfx/painters.hpp"

namespace quabble {
namespace {

constexpr Font messageFont{Typeface::SansBold, 12};
constexpr Font buttonFont{Typeface::Sans, 11};
constexpr std::int32_t margin = 30;
constexpr std::int32_t leastWidth = 260;
constexpr std::int32_t height = 128;
constexpr Size button{90, 30};

}  // namespace

MessageDialog::MessageDialog(MessageLoop& loop, Window* owner, std::string title, std::string text)
    : Window(loop, owner), title_(std::move(title)), text_(std::move(text)) {
    OKButton_.caption = "OK";
    OKButton_.font = buttonFont;
    OKButton_.visible = true;
    OKButton_.onClick = [this] { return OKButton_Click(); };
    addControl(OKButton_);
}

void MessageDialog::Form_Load() {
    const std::int32_t width = std::max(leastWidth, measureText(text_, messageFont).width + 2 * margin);
    setCaption(title_);
    setClientSize({width, height});
    const ScreenButton label{.surface = &canvas(),
                             .left = margin,
                             .top = margin,
                             .width = width - 2 * margin,
                             .height = 24,
                             .textColour = palette::valueColour};
    OKButton_.area =
        Rect::ofSize((width - button.width) / 2, height - button.height - 20, button.width, button.height);
    canvas().picture.fill(canvas().picture.bounds(), palette::backgroundColour);
    canvas().font = messageFont;
    drawShadowText(label, 1, text_, text_format::centre);
    setFocus(&OKButton_);
}

Task<> MessageDialog::Form_KeyPress(std::int16_t key) {
    if (key == keys::enter || key == keys::escape)
        unload();
    co_return;
}

Task<> MessageDialog::OKButton_Click() {
    unload();
    co_return;
}

}  // namespace quabble
