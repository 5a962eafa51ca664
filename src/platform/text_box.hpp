#pragma once

#include <functional>
#include <string>
#include <vector>

#include "platform/control.hpp"
#include "platform/front_end.hpp"

namespace quabble {

// A box in which one line of text is edited, with a caret, a selection and the desktop's clipboard. The text
// is Windows-1252; what is typed or pasted and the code page lacks becomes "?" at once. A line longer than
// the box scrolls so that the caret is in sight.
class TextBox final : public Control {
 public:
    // The front end, which must outlive the box, has the clipboard.
    explicit TextBox(FrontEnd& frontEnd) : frontEnd_(frontEnd) {}

    Font font;         // set before there is a text
    std::string name;  // what is to be typed, Windows-1252

    // The most characters that the box holds; what is typed or pasted beyond them is left out.
    static constexpr std::size_t maxLength = 32767;

    const std::string& text() const { return text_; }
    void clear();

    // The caret's place and the other end of the selection, in characters from the start.
    std::size_t caret() const { return caret_; }
    std::size_t anchor() const { return anchor_; }

    Place place() const override { return {area, Place::Role::TextField, name}; }
    void paint(Canvas& canvas, bool hasFocus) const override;
    Task<> mouseDown(Point at, bool extends) override;
    void mouseDrag(Point at) override;
    bool takesFocus() const override { return true; }
    bool takesText() const override { return true; }
    void textInput(std::string_view utf8) override;
    void edit(EditCommand command, bool extends) override;
    std::optional<EditedText> editedText() const override { return EditedText{text_, caret_, anchor_}; }

 private:
    Rect inner() const { return area.shrunkBy(4); }
    std::int32_t widthUpTo(std::size_t characters) const;
    std::size_t characterAt(Point at) const;
    std::size_t wordLeft() const;
    std::size_t wordRight() const;
    std::string selection() const;
    void replaceSelection(std::string_view with);
    void replace(std::size_t first, std::size_t last, std::string_view with);
    void moveCaret(std::size_t to, bool extends);
    void copySelection();
    void scrollToCaret();

    FrontEnd& frontEnd_;
    std::string text_;
    std::vector<double> pens_{0};  // where each character begins and the last one ends, in pixels
    std::size_t caret_ = 0;
    std::size_t anchor_ = 0;
    std::int32_t scroll_ = 0;  // pixels of the line that lie left of the box
};

}  // namespace quabble
