#include "platform/text_box.hpp"

#include <gtest/gtest.h>

#include <cstdlib>

#include "hosts/headless/headless_front_end.hpp"

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
        {{"ab", {Left, true}, Copy, End, Copy, Cut}, "ab", 2, 2, "b"},
        {{"\u20AC\u201A\u0192\u201E\u2026\u2020\u2021\u02C6\u2030\u0160\u2039\u0152\u017D\u2018\u2019\u201C"
          "\u201D\u2022\u2013\u2014\u02DC\u2122\u0161\u203A\u0153\u017E\u0178\u00A0\u00FF"},
         "\x80\x82\x83\x84\x85\x86\x87\x88\x89\x8A\x8B\x8C\x8E\x91\x92\x93\x94\x95\x96\x97\x98\x99\x9A\x9B"
         "\x9C"
         "\x9E\x9F\xA0\xFF",
         29,
         29,
         ""},
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
        HeadlessFrontEnd frontEnd;
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
    Canvas canvas({box.area.right, box.area.bottom}, Scale());
    box.paint(canvas, true);
    const Surface& seen = canvas.picture();
    for (int x = 4; x < seen.width() - 4; ++x) {
        bool isCaret = true;
        for (int y = 6; y < seen.height() - 6; ++y)
            isCaret = isCaret && seen.at(x, y) == controlInk;
        if (isCaret)
            return x;
    }
    return -1;
}

void press(TextBox& box, int x, bool withShift) {
    Task<> pressed = box.mouseDown({x, 14}, withShift);
    pressed.start();
}

TEST(TextBox, KeepsTheCaretOfALongTextInSightAndFollowsTheMouse) {
    HeadlessFrontEnd frontEnd;
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
    box.edit(End, false);
    for (int x = 93; x > 6; --x) {
        press(box, x, false);
        EXPECT_LE(std::abs(caretColumn(box) - x), 5) << "the nearest gap, " << x;
    }
    press(box, 50, false);
    const std::size_t from = box.caret();
    box.mouseDrag({500, 14});
    EXPECT_EQ(box.anchor(), from);
    EXPECT_GT(box.caret(), from + 4) << "to the end of what is seen, and beyond";
    box.textInput("!");
    EXPECT_EQ(box.caret(), from + 1);
    box.mouseDrag({-500, 14});
    EXPECT_EQ(box.caret(), 0U);
    EXPECT_EQ(caretColumn(box), 4);
    box.edit(End, false);
    while (box.text().size() > 3)
        box.edit(Backspace, false);
    EXPECT_NEAR(caretColumn(box), 29, 3) << "what fits is seen from its start";
}

TEST(TextBox, LeavesOutWhatItCannotHold) {
    HeadlessFrontEnd frontEnd;
    TextBox box(frontEnd);
    box.textInput("0123456789");
    for (int i = 0; i < 40; ++i) {
        for (const EditCommand command : {SelectAll, Copy, End, Paste})
            box.edit(command, false);
    }
    EXPECT_EQ(box.text().size(), TextBox::maxLength);
    box.edit(Left, true);
    box.textInput("ab");
    EXPECT_EQ(box.text().size(), TextBox::maxLength);
    EXPECT_EQ(box.text().back(), 'a') << "in the place of the one marked";
}

TEST(TextBox, MarksWhatIsSelected) {
    HeadlessFrontEnd frontEnd;
    TextBox box(frontEnd);
    box.font = {Typeface::Sans, 11, false};
    box.area = Rect::ofSize(0, 0, 100, 28);
    box.textInput("oooooooo");
    press(box, 60, false);
    const int end = caretColumn(box);
    press(box, 30, true);
    const int start = caretColumn(box);
    Canvas canvas({100, 28}, Scale());
    box.paint(canvas, false);
    const Surface& seen = canvas.picture();
    for (int x = 6; x < 94; ++x)
        EXPECT_EQ(seen.at(x, 6) != seen.at(95, 6), x >= start && x < end) << x;
    EXPECT_TRUE(start > 20 && start < 40 && end > 50 && end < 70);
}

}  // namespace
}  // namespace quabble
