#include "platform/text_box.hpp"

#include <gtest/gtest.h>

#include "platform/headless/headless_front_end.hpp"

namespace quabble {
namespace {

using enum EditCommand;

// What a user does in the box: types a text, or a command with or without Shift.
struct Act {
    Act(const char* utf8) : text(utf8) {}
    Act(EditCommand asked, bool withShift = false) : command(asked), extends(withShift) {}
    const char* text = nullptr;
    EditCommand command = Left;
    bool extends = false;
};

TEST(TextBox, EditsALine) {
    struct Case {
        std::vector<Act> acts;
        std::string text;
        std::size_t anchor, caret;
        const char* clipboard;
    };
    const Case cases[] = {
        {{"ab", Left, "x"}, "axb", 2, 2, ""},
        {{"ab", Home, Delete, Backspace, "c"}, "cb", 1, 1, ""},
        {{"ab", Backspace, Backspace, Backspace, Delete}, "", 0, 0, ""},
        {{"ab", Left, {Left, true}, Right}, "ab", 1, 1, ""},
        {{"ab", {Home, true}, Left}, "ab", 0, 0, ""},
        {{"ab", Home, {Right, true}, "x"}, "xb", 1, 1, ""},
        {{"one two  three", WordLeft, WordLeft, {End, true}}, "one two  three", 4, 14, ""},
        {{"one two  three", Home, WordRight, WordRight, {WordLeft, true}, Delete}, "one three", 4, 4, ""},
        {{"ab", SelectAll, Copy, End, Paste}, "abab", 4, 4, "ab"},
        {{"abc", {Left, true}, Cut, Home, Paste}, "cab", 1, 1, "c"},
        {{"ab", Copy, Cut}, "ab", 2, 2, ""},
        {{"Zo\u00EB \u20AC \u0141 \U0001F600"}, "Zo\xEB \x80 ? ?", 9, 9, ""},
        {{"\xC3", "a\xFF\xE2\x82", "\xC0\x80\xED"},
         "?a????"
         "??",
         8,
         8,
         ""},
        {{"\u00E9\u2122", SelectAll, Cut, Paste, Paste}, "\xE9\x99\xE9\x99", 4, 4, "\u00E9\u2122"},
        {{"a\r\nb\tc\u0085"}, "abc", 3, 3, ""}};
    for (const Case& c : cases) {
        HeadlessFrontEnd frontEnd("");
        TextBox box(frontEnd);
        box.area = Rect::ofSize(0, 0, 200, 28);
        for (const Act& act : c.acts)
            act.text == nullptr ? box.edit(act.command, act.extends) : box.textInput(act.text);
        EXPECT_EQ(box.text(), c.text);
        EXPECT_EQ(box.anchor(), c.anchor) << c.text;
        EXPECT_EQ(box.caret(), c.caret) << c.text;
        EXPECT_EQ(frontEnd.clipboard, c.clipboard) << c.text;
    }
}

// The column of the caret, the one dark line of full height; -1 when it is not to be seen.
int caretColumn(const TextBox& box) {
    Surface seen(box.area.right, box.area.bottom);
    box.paint(seen, true);
    for (int x = 4; x < seen.width() - 4; ++x) {
        bool isCaret = true;
        for (int y = 6; y < seen.height() - 6; ++y)
            isCaret = isCaret && seen.at(x, y) == controlInk;
        if (isCaret)
            return x;
    }
    return -1;
}

TEST(TextBox, KeepsTheCaretOfALongTextInSightAndFollowsTheMouse) {
    HeadlessFrontEnd frontEnd("");
    TextBox box(frontEnd);
    box.font = {Typeface::Sans, 11, false};
    box.area = Rect::ofSize(0, 0, 100, 28);
    EXPECT_EQ(caretColumn(box), 4);
    box.textInput("oooooooooooooooooooooooooooooo");
    EXPECT_EQ(caretColumn(box), 95);
    for (int i = 0; i < 30; ++i) {
        box.edit(Left, false);
        EXPECT_GE(caretColumn(box), 4) << i;
    }
    EXPECT_EQ(caretColumn(box), 4);
    Task<> press = box.mouseDown({50, 14}, false);
    press.start();
    EXPECT_NEAR(caretColumn(box), 50, 4);
    const std::size_t from = box.caret();
    box.mouseDrag({500, 14});
    EXPECT_EQ(box.anchor(), from);
    EXPECT_GT(box.caret(), from + 4) << "to the end of what is seen, and beyond";
    box.textInput("!");
    EXPECT_EQ(box.caret(), from + 1);
}

}  // namespace
}  // namespace quabble
