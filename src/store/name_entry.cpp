#include "store/name_entry.hpp"

#include <utility>

#include "gfx/ok_button.hpp"
#include "gfx/painters.hpp"

namespace quabble {
namespace {

constexpr std::size_t longestName = 19;
constexpr Size dialogSize{360, 206};
constexpr std::int32_t margin = 30;
constexpr Font messageFont{Typeface::SansBold, 12};
constexpr Font font{Typeface::Sans, 11};
constexpr const char* congratulation = " Congratulations ! \r\n Your Score is among High scores ";

}  // namespace

std::string acceptedName(const std::string& typed) {
    if (typed.empty())
        return "-";
    return typed.substr(0, longestName);
}

NameEntry::NameEntry(MessageLoop& loop, Window& owner)
    : Window(loop, &owner), txtName_(loop.frontEnd()), OKButton_([this] { return OKButton_Click(); }) {
    txtName_.font = font;
    txtName_.area = Rect::ofSize(margin, 108, dialogSize.width - 2 * margin, 28);
    txtName_.visible = true;
    OKButton_.visible = true;
    addControl(txtName_);
    addControl(OKButton_);
}

void NameEntry::Form_Load() {
    setCaption("Best Score");
    setClientSize(dialogSize);
    okBox_ = layOutOkButton((dialogSize.width - okButtonSize.width) / 2, 156);
    OKButton_.area = okBox_.rect();
    txtName_.clear();
    setFocus(&txtName_);
}

void NameEntry::Form_Paint() {
    const auto label = [](std::int32_t top, std::int32_t height, Colour colour, const Font& labelFont) {
        return ScreenButton{.left = margin,
                            .top = top,
                            .width = dialogSize.width - 2 * margin,
                            .height = height,
                            .textColour = colour,
                            .font = labelFont};
    };
    canvas().fill(canvas().bounds(), palette::backgroundColour);
    drawShadowText(canvas(), label(22, 44, palette::valueColour, messageFont), 1, congratulation,
                   text_format::centre);
    drawShadowText(canvas(), label(84, 22, palette::highlightColour, font), 1, "Enter Your Name",
                   defaultTextFormat);
    drawOkButton(canvas(), okBox_);
}

void NameEntry::Form_Unload() {
    nameEntered_ = acceptedName(txtName_.text());
}

Task<> NameEntry::Form_KeyPress(std::int16_t key) {
    if (key == keys::enter || key == keys::escape)
        unload();
    co_return;
}

Task<> NameEntry::OKButton_Click() {
    unload();
    co_return;
}

}  // namespace quabble
