#include "platform/text_box.hpp"

#include <algorithm>
#include <cmath>
#include <ranges>

#include "draw/windows_1252.hpp"

namespace quabble {
namespace {

constexpr Colour paper{249, 250, 255};
constexpr Colour selected{62, 105, 214};

}  // namespace

void TextBox::clear() {
    replace(0, text_.size(), {});
    moveCaret(0, false);
}

void TextBox::paint(Canvas& canvas, bool hasFocus) const {
    canvas.fill(area, paper);
    paintControlEdge(canvas, area, hasFocus);
    // The line is drawn on a canvas of its own, which cuts off what lies outside the box.
    const Rect window = inner();
    Canvas line({window.width(), window.height()}, canvas.scale());
    line.fill(line.bounds(), paper);
    const Rect place{-scroll_, 0, widthUpTo(text_.size()) - scroll_ + 1, window.height()};
    constexpr std::int32_t format = text_format::verticalCentre + text_format::singleLine;
    line.write(place, text_, format, font, controlInk);
    const auto [first, last] = std::minmax(caret_, anchor_);
    if (first != last) {
        const Rect marked{widthUpTo(first) - scroll_, 0, widthUpTo(last) - scroll_, window.height()};
        Canvas highlighted({window.width(), window.height()}, canvas.scale());
        highlighted.fill(highlighted.bounds(), selected);
        highlighted.write(place, text_, format, font, paper);
        line.copyPart(marked, highlighted.picture());
    }
    if (hasFocus) {
        const std::int32_t x = widthUpTo(caret_) - scroll_;
        line.fill({x, 1, x + 1, window.height() - 1}, controlInk);
    }
    canvas.copy(window, line.picture());
}

Task<> TextBox::mouseDown(Point at, bool extends) {
    moveCaret(characterAt(at), extends);
    co_return;
}

void TextBox::mouseDrag(Point at) {
    moveCaret(characterAt(at), true);
}

void TextBox::textInput(std::string_view utf8) {
    replaceSelection(windows1252Of(utf8));
}

void TextBox::edit(EditCommand command, bool extends) {
    const bool hasSelection = caret_ != anchor_;
    switch (command) {
        case EditCommand::Left:
            if (hasSelection && !extends)
                moveCaret(std::min(caret_, anchor_), false);
            else
                moveCaret(caret_ == 0 ? 0 : caret_ - 1, extends);
            break;
        case EditCommand::Right:
            if (hasSelection && !extends)
                moveCaret(std::max(caret_, anchor_), false);
            else
                moveCaret(std::min(caret_ + 1, text_.size()), extends);
            break;
        case EditCommand::WordLeft:
            moveCaret(wordLeft(), extends);
            break;
        case EditCommand::WordRight:
            moveCaret(wordRight(), extends);
            break;
        case EditCommand::Home:
            moveCaret(0, extends);
            break;
        case EditCommand::End:
            moveCaret(text_.size(), extends);
            break;
        case EditCommand::Backspace:
            if (!hasSelection && caret_ > 0)
                anchor_ = caret_ - 1;
            replaceSelection({});
            break;
        case EditCommand::Delete:
            if (!hasSelection && caret_ < text_.size())
                anchor_ = caret_ + 1;
            replaceSelection({});
            break;
        case EditCommand::SelectAll:
            anchor_ = 0;
            moveCaret(text_.size(), true);
            break;
        case EditCommand::Copy:
            copySelection();
            break;
        case EditCommand::Cut:
            copySelection();
            replaceSelection({});
            break;
        case EditCommand::Paste:
            replaceSelection(windows1252Of(frontEnd_.clipboardText()));
            break;
        case EditCommand::Up:
        case EditCommand::Down:
        case EditCommand::Click:
            break;
    }
}

std::int32_t TextBox::widthUpTo(std::size_t characters) const {
    return static_cast<std::int32_t>(std::floor(pens_[characters] + 0.5));
}

// The gap between characters nearest to a point.
std::size_t TextBox::characterAt(Point at) const {
    const std::int32_t x = at.x - inner().left + scroll_;
    const auto characters = std::views::iota(std::size_t{0}, text_.size());
    return *std::ranges::partition_point(characters, [&](std::size_t character) {
        return (widthUpTo(character) + widthUpTo(character + 1)) / 2 < x;
    });
}

std::size_t TextBox::wordLeft() const {
    std::size_t at = caret_;
    while (at > 0 && text_[at - 1] == ' ')
        --at;
    while (at > 0 && text_[at - 1] != ' ')
        --at;
    return at;
}

std::size_t TextBox::wordRight() const {
    std::size_t at = caret_;
    while (at < text_.size() && text_[at] != ' ')
        ++at;
    while (at < text_.size() && text_[at] == ' ')
        ++at;
    return at;
}

std::string TextBox::selection() const {
    const auto [first, last] = std::minmax(caret_, anchor_);
    return text_.substr(first, last - first);
}

void TextBox::replaceSelection(std::string_view with) {
    const auto [first, last] = std::minmax(caret_, anchor_);
    with = with.substr(0, maxLength - (text_.size() - (last - first)));
    replace(first, last, with);
    moveCaret(first + with.size(), false);
}

// Where the characters before the change lie stays known, so that typing at the end costs the same however
// long the text is.
void TextBox::replace(std::size_t first, std::size_t last, std::string_view with) {
    text_.replace(first, last - first, with);
    pens_.resize(first + 1);
    for (const char character : std::string_view(text_).substr(first))
        pens_.push_back(pens_.back() + advanceOf(character, font));
}

void TextBox::moveCaret(std::size_t to, bool extends) {
    caret_ = to;
    if (!extends)
        anchor_ = to;
    scrollToCaret();
}

void TextBox::copySelection() {
    if (caret_ != anchor_)
        frontEnd_.setClipboardText(utf8Of(selection()));
}

void TextBox::scrollToCaret() {
    const std::int32_t caretX = widthUpTo(caret_);
    const std::int32_t width = inner().width() - 1;
    const std::int32_t furthest = std::max(0, widthUpTo(text_.size()) - width);
    scroll_ = std::clamp(scroll_, std::max(0, caretX - width), std::max(caretX, 0));
    scroll_ = std::min(scroll_, std::max(furthest, caretX - width));
}

}  // namespace quabble
