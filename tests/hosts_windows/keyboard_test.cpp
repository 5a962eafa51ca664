#include "hosts/windows/keyboard.hpp"

#include <gtest/gtest.h>

#include <array>

#include "hosts/windows/registry/win32.hpp"

namespace quabble {
namespace {

constexpr std::intptr_t firstTime = 0x1E0001;  // a scan code, and that it is pressed once
constexpr std::intptr_t repeated = firstTime | 0x40000000;

class KeyboardTest : public testing::Test {
 protected:
    ~KeyboardTest() override { hold({}); }

    static void hold(std::initializer_list<int> keys) {
        std::array<BYTE, 256> state{};
        for (const int key : keys)
            state.at(static_cast<std::size_t>(key)) = 0x80;
        SetKeyboardState(state.data());
    }
    // What a character is reported as, in short: k for a key press, b for a backspace, and texts.
    std::string report(wchar_t unit, std::intptr_t details) {
        std::string all;
        for (const InputEvent& event : keyboard.character(unit, details))
            all += event.kind == EventKind::KeyPress ? "k" : event.kind == EventKind::Edit ? "b" : event.text;
        return all;
    }
    std::string press(int key, wchar_t unit, std::intptr_t details) {
        keyboard.press(static_cast<std::uintptr_t>(key), details);
        return report(unit, details);
    }

    Keyboard keyboard;
};

TEST_F(KeyboardTest, AKeyThatIsHeldIsOnePressAndTypesOn) {
    EXPECT_EQ(press('A', L'\u00E4', firstTime), "k\u00E4");
    EXPECT_EQ(press('A', L'\u00E4', repeated), "\u00E4");
    EXPECT_EQ(press(VK_BACK, 8, firstTime), "k");
    EXPECT_EQ(press(VK_BACK, 8, repeated), "b");
    EXPECT_EQ(press(VK_RETURN, 13, firstTime), "k");
    EXPECT_EQ(press(VK_RETURN, 13, repeated), "");
}

TEST_F(KeyboardTest, AKeyThatWasPressedElsewhereIsNotHeard) {
    EXPECT_EQ(press('A', 'a', repeated), "");
    EXPECT_FALSE(keyboard.press(VK_LEFT, repeated));
    press('A', 'a', firstTime);
    keyboard.begin();
    EXPECT_EQ(press('A', 'a', repeated), "");
    EXPECT_EQ(press('A', 'a', firstTime), "ka");
}

TEST_F(KeyboardTest, TwoUnitsAreOneTextAndNoKey) {
    EXPECT_EQ(report(0xD83D, firstTime), "");
    EXPECT_EQ(report(0xDE00, firstTime), "\U0001F600");
}

TEST_F(KeyboardTest, CtrlMakesCommandsAndAltGrCharacters) {
    hold({VK_CONTROL});
    EXPECT_EQ(press('H', 8, firstTime), "") << "is no backspace";
    EXPECT_EQ(press(VK_BACK, 0x7F, firstTime), "");
    EXPECT_EQ(keyboard.press('V', firstTime)->command, EditCommand::Paste);
    EXPECT_EQ(keyboard.press(VK_RIGHT, firstTime)->command, EditCommand::WordRight);
    EXPECT_EQ(keyboard.press(VK_INSERT, firstTime)->command, EditCommand::Copy);
    hold({VK_CONTROL, VK_SHIFT});
    EXPECT_TRUE(keyboard.press(VK_LEFT, firstTime)->extends);
    hold({VK_CONTROL, VK_MENU});
    EXPECT_EQ(press('Q', '@', firstTime), "k@");
    EXPECT_FALSE(keyboard.press('V', firstTime));
    hold({VK_SHIFT});
    EXPECT_EQ(keyboard.press(VK_INSERT, firstTime)->command, EditCommand::Paste);
    EXPECT_EQ(keyboard.press(VK_DELETE, firstTime)->command, EditCommand::Cut);
    EXPECT_FALSE(keyboard.press(VK_F5, firstTime));
}

}  // namespace
}  // namespace quabble
