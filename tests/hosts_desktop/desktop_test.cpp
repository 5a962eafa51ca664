#include <gtest/gtest.h>
#include <sys/stat.h>
#include <sys/wait.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <thread>

#include "../support/files.hpp"
#include "hosts/desktop/detached_process.hpp"
#include "hosts/desktop/program_folder.hpp"
#include "hosts/desktop/x11/held_keys.hpp"

namespace quabble {
namespace {

TEST(DetachedProcess, GetsOneArgumentInItsFolderAndLeavesNothingBehind) {
    const TemporaryFolder temporary;
    const auto& folder = temporary.path;
    std::ofstream(folder / "tell")
        << "#!/bin/sh\nprintf '%s|%s|' \"$#\" \"$1\" >told.new\npwd >>told.new\nmv told.new told\n";
    std::filesystem::permissions(folder / "tell", std::filesystem::perms::owner_all);
    const std::string nasty = "a b;touch x $(touch y) \"'*\n";
    startDetached({(folder / "tell").string(), nasty}, folder.string());
    for (int i = 0; i < 500 && !std::filesystem::exists(folder / "told"); ++i)
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    EXPECT_EQ(bytesOf(folder / "told"), "1|" + nasty + "|" + folder.string() + "\n");
    EXPECT_FALSE(std::filesystem::exists(folder / "x") || std::filesystem::exists(folder / "y"));

    startDetached({"no-such-program", "x"}, folder.string());
    startDetached({(folder / "tell").string()}, "/no/such/folder");
    EXPECT_TRUE(waitpid(-1, nullptr, WNOHANG) == -1 && errno == ECHILD) << "a child is left to wait for";
}

TEST(ProgramFolder, HasFilesThatAreReadWholeAndPipesThatAreNotWaitedFor) {
    const std::filesystem::path folder = programFolder(), pipe = folder / "pipe_of_a_test";
    const std::string sheet = bytesOf(folder / "ALLPICDATA.BMP");
    ASSERT_FALSE(sheet.empty());
    EXPECT_TRUE(std::ranges::equal(readProgramFile("ALLPICDATA.BMP"), std::as_bytes(std::span(sheet))));
    EXPECT_TRUE(readProgramFile("no such file").empty());
    std::filesystem::remove(pipe);
    ASSERT_EQ(mkfifo(pipe.c_str(), 0600), 0);
    EXPECT_TRUE(readProgramFile("pipe_of_a_test").empty());
    std::filesystem::remove(pipe);
    EXPECT_EQ(pathOrAddress("QB_HELP.HTM"), folder / "QB_HELP.HTM");
    EXPECT_EQ(pathOrAddress("https://quabble.example/"), "https://quabble.example/");
}

TEST(HeldKeys, AKeyHeldSinceAnotherWindowHadTheKeyboardIsNotHeard) {
    constexpr unsigned enter = 36, letter = 38;
    HeldKeys keys;
    const auto hears = [&keys](unsigned key) {
        keys.press(key);
        return keys.isMeant();
    };
    EXPECT_TRUE(hears(enter)) << "where nobody tells what is held";

    keys.changeWindow();
    keys.areDown(HeldKeys::Keys().set(enter));
    EXPECT_FALSE(hears(enter));
    EXPECT_TRUE(hears(letter)) << "another key";
    EXPECT_FALSE(hears(enter)) << "it is still held";
    keys.release(enter);
    EXPECT_TRUE(hears(enter)) << "it was let go and pressed again";

    keys.areDown(HeldKeys::Keys().set(enter));  // as is told when the pointer enters the window, too
    EXPECT_TRUE(hears(enter)) << "it repeats in its own window";
}

}  // namespace
}  // namespace quabble
