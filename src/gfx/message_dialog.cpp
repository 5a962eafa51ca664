#include "gfx/message_dialog.hpp"

#include <algorithm>
#include <utility>

#include "gfx/ok_button.hpp"
#include "gfx/painters.hpp"

namespace quabble {
namespace {

constexpr Font messageFont{Typeface::SansBold, 12};
constexpr std::int32_t margin = 30;
constexpr std::int32_t lineHeight = 24;
constexpr std::int32_t leastWidth = 260;

}  // namespace

MessageDialog::MessageDialog(MessageLoop& loop, Window* owner, std::string title, std::string text)
    : OkDialog(loop, owner), title_(std::move(title)) {
    text_ = std::move(text);
}

void MessageDialog::Form_Load() {
    const std::int32_t width = std::max(leastWidth, measureText(text_, messageFont).width + 2 * margin);
    const std::int32_t buttonTop = 2 * margin + lineHeight;
    setCaption(title_);
    setClientSize({width, buttonTop + okButtonSize.height + margin});
    textBox_ = {.left = margin,
                .top = margin,
                .width = width - 2 * margin,
                .height = lineHeight,
                .textColour = palette::valueColour,
                .font = messageFont};
    okBox_ = layOutOkButton((width - okButtonSize.width) / 2, buttonTop);
}

void MessageDialog::Form_Paint() {
    canvas().fill(canvas().bounds(), palette::backgroundColour);
    drawShadowText(canvas(), textBox_, 1, text_, text_format::centre);
    drawOkButton(canvas(), okBox_);
}

}  // namespace quabble
