#include "hosts/web/page_keys.hpp"

#include <gtest/gtest.h>

#include <string>

namespace quabble {
namespace {

std::string said(const PageKey& key) {
    const auto event = translate(key);
    if (!event)
        return "the browser's";
    if (event->kind == EventKind::KeyPress)
        return "press " + std::to_string(event->key);
    return "edit " + std::to_string(static_cast<int>(event->command)) + (event->extends ? " extended" : "");
}

std::string edit(EditCommand command) {
    return "edit " + std::to_string(static_cast<int>(command));
}

TEST(PageKeys, InTheGameWhatYieldsACharacterIsAPress) {
    EXPECT_EQ(said({.key = "p"}), "press 112");
    EXPECT_EQ(said({.key = "P", .shift = true}), "press 80");
    EXPECT_EQ(said({.key = " "}), "press 32");
    EXPECT_EQ(said({.key = "Enter"}), "press 13");
    EXPECT_EQ(said({.key = "Escape"}), "press 27");
    EXPECT_EQ(said({.key = "Backspace"}), "press 8");
    EXPECT_EQ(said({.key = "ü"}), "press 63");
    EXPECT_EQ(said({.key = "中"}), "press 63");
    EXPECT_EQ(said({.key = "😀"}), "press 63");
    EXPECT_EQ(said({.key = "€", .ctrl = true, .alt = true, .altGraph = true}), "press 63");
}

TEST(PageKeys, TheOthersAreTheBrowsers) {
    for (const char* key :
         {"Tab", "F5", "Shift", "Control", "Dead", "Process", "Unidentified", "AudioVolumeUp", ""})
        EXPECT_EQ(said({.key = key}), "the browser's") << key;
    EXPECT_EQ(said({.key = "r", .ctrl = true}), "the browser's");
    EXPECT_EQ(said({.key = "d", .alt = true}), "the browser's");
    EXPECT_EQ(said({.key = "p", .isRepeated = true}), "the browser's");
}

TEST(PageKeys, ArrowsMoveThePointerOfTheProgramAndSomeKeysClickThere) {
    EXPECT_EQ(said({.key = "ArrowUp", .isRepeated = true}), edit(EditCommand::Up));
    EXPECT_EQ(said({.key = "ArrowLeft"}), edit(EditCommand::Left));
    for (const char* key : {"Insert", "ContextMenu"})
        EXPECT_EQ(said({.key = key}), edit(EditCommand::Click)) << key;
    EXPECT_EQ(said({.key = "Enter", .ctrl = true}), edit(EditCommand::Click));
    EXPECT_EQ(said({.key = "Enter", .ctrl = true, .isRepeated = true}), "the browser's");
}

TEST(PageKeys, ATextIsEdited) {
    EXPECT_EQ(said({.key = "ArrowLeft", .editsText = true}), edit(EditCommand::Left));
    EXPECT_EQ(said({.key = "ArrowRight", .isRepeated = true, .editsText = true}), edit(EditCommand::Right));
    EXPECT_EQ(said({.key = "ArrowLeft", .ctrl = true, .editsText = true}), edit(EditCommand::WordLeft));
    EXPECT_EQ(said({.key = "ArrowRight", .shift = true, .ctrl = true, .editsText = true}),
              edit(EditCommand::WordRight) + " extended");
    EXPECT_EQ(said({.key = "End", .shift = true, .editsText = true}), edit(EditCommand::End) + " extended");
    EXPECT_EQ(said({.key = "a", .ctrl = true, .editsText = true}), edit(EditCommand::SelectAll));
    EXPECT_EQ(said({.key = "Tab", .editsText = true}), "press 9");
    EXPECT_EQ(said({.key = "ArrowLeft", .alt = true, .editsText = true}), "the browser's");  // one page back
    EXPECT_EQ(said({.key = "c", .ctrl = true, .editsText = true}), "the browser's");  // which reports a copy
    // A press that is held goes on deleting.
    EXPECT_EQ(said({.key = "Backspace", .editsText = true}), "press 8");
    EXPECT_EQ(said({.key = "Backspace", .isRepeated = true, .editsText = true}),
              edit(EditCommand::Backspace));
}

}  // namespace
}  // namespace quabble
