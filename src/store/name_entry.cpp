#include "store/name_entry.hpp"

#include <utility>

#include "gfx/ok_button.hpp"
#include "gfx/painters.hpp"
#include "gfx/spoken_words.hpp"
#include "gfx/string_table.hpp"

namespace quabble {
namespace {

constexpr std::size_t longestName = 19;
constexpr Size dialogSize{360, 206};
constexpr std::int32_t margin = 30;
constexpr Rect congratulationArea{margin, 22, dialogSize.width - margin, 66};
constexpr Rect promptArea{margin, 84, dialogSize.width - margin, 106};
constexpr Font messageFont{Typeface::SansBold, 12};
constexpr Font font{Typeface::Sans, 11};
constexpr const char* prompt = "Enter Your Name";
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
    txtName_.name = prompt;
    txtName_.area = Rect::ofSize(margin, 108, dialogSize.width - 2 * margin, 28);
    txtName_.visible = true;
    OKButton_.caption = loadString(string_ids::ok);
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

std::vector<Place> NameEntry::places() const {
    return textPlaces(congratulationArea, congratulation);
}

void NameEntry::Form_Paint() {
    const auto label = [](const Rect& area, Colour colour, const Font& labelFont) {
        return ScreenButton{.left = area.left,
                            .top = area.top,
                            .width = area.width(),
                            .height = area.height(),
                            .textColour = colour,
                            .font = labelFont};
    };
    canvas().fill(canvas().bounds(), palette::backgroundColour);
    drawShadowText(canvas(), label(congratulationArea, palette::valueColour, messageFont), 1, congratulation,
                   text_format::centre);
    drawShadowText(canvas(), label(promptArea, palette::highlightColour, font), 1, prompt, defaultTextFormat);
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
