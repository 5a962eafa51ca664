#include <gtest/gtest.h>
#include <sys/wait.h>

#include <cerrno>
#include <chrono>
#include <thread>

#include "../support/files.hpp"
#include "platform/sdl/detached_process.hpp"
#include "platform/sdl/held_keys.hpp"

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

TEST(HeldKeys, AKeyHeldSinceAnotherWindowHadTheFocusIsNotHeard) {
    HeldKeys keys;
    EXPECT_TRUE(keys.isMeantFor(1, 40, 5000));
    EXPECT_TRUE(keys.isMeantFor(1, 40, 5600)) << "it repeats in its own window";
    keys.release(40);  // the first window has lost the focus
    EXPECT_FALSE(keys.isMeantFor(2, 40, 6200));
    for (std::uint32_t time = 6240; time < 9000; time += 40)
        EXPECT_FALSE(keys.isMeantFor(2, 40, time));
    keys.release(40);
    EXPECT_TRUE(keys.isMeantFor(2, 40, 9100)) << "it was let go and pressed again";
    EXPECT_TRUE(keys.isMeantFor(3, 40, 10200)) << "too long ago to be held";
    EXPECT_TRUE(keys.isMeantFor(4, 41, 10300)) << "another key";
    EXPECT_TRUE(keys.isMeantFor(4, 40, 10400)) << "the other key has ended the repetition";
}

}  // namespace
}  // namespace quabble
