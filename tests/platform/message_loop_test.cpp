#include <gtest/gtest.h>

#include "platform/headless/scripted_user.hpp"
#include "platform/timer.hpp"
#include "platform/window.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

// At a click it does the steps of its script: p pauses, m lets waiting messages run, d shows its dialog.
class Page : public Window {
 public:
    Page(MessageLoop& loop, std::string& log, char name, Window* owner, Window* dialog)
        : Window(loop, owner), log_(log), name_(name), dialog_(dialog) {}
    std::string script;

 private:
    void Form_Unload() override { note("unload"); }
    bool Form_Terminate() override { return note("terminate"), name_ == 'M'; }
    Task<> Form_MouseDown(float, float) override {
        note("down");
        const std::shared_ptr<void> unwound(nullptr, [this](void*) { note("end"); });
        for (const char step : std::exchange(script, {})) {
            if (step == 'p')
                co_await loop().pause(100ms);
            else if (step == 'm')
                co_await loop().runPendingMessages();
            else
                co_await loop().showModal(*dialog_);
        }
    }
    Task<> Form_MouseMove(float x, float) override { return note(char(x)), Window::Form_KeyPress(0); }
    Task<> Form_KeyPress(std::int16_t key) override { return note(char(key)), Window::Form_KeyPress(0); }
    void note(auto word) { ((log_ += ' ') += name_) += word; }
    std::string& log_;
    char name_;
    Window* dialog_;
};

class Program : public testing::Test {
 protected:
    Program() { main.show(), root.start(); }
    void click(Page& page, const char* script) {
        page.script = script;
        loop.post({page.id(), EventKind::MouseDown});
        loop.wake();
    }
    std::string logAfter(milliseconds duration) { return user.wait(duration), std::exchange(log, {}); }

    std::string log;
    HeadlessFrontEnd frontEnd{""};
    MessageLoop loop{frontEnd};
    ScriptedUser user{frontEnd, loop};
    Page main{loop, log, 'M', nullptr, &dialog}, dialog{loop, log, 'D', &main, nullptr};
    Timer timer{loop, [this] {
                    log += " " + std::to_string(frontEnd.now().time_since_epoch() / 1ms);
                    return loop.runPendingMessages();
                }};
    Task<> root = loop.run();
};

TEST_F(Program, RunsMessagesWhereItLetsThemAndNotInPauses) {
    click(main, "pmp");
    click(main, "pm");
    user.movePointer('1', 0);
    user.movePointer('2', 0);
    user.press('a');
    EXPECT_EQ(logAfter(99ms), " Mdown");
    EXPECT_EQ(logAfter(1ms), " Mdown");
    user.press('b');
    EXPECT_EQ(logAfter(100ms), " M2 Ma Mb Mend");
    user.press('c');
    root.reset();
    EXPECT_EQ(logAfter(1h), " Mend");
}

TEST_F(Program, ADialogTakesItsOwnersInputAndNoneOfAnEarlierShowing) {
    click(main, "dd");
    for (const auto kind : {EventKind::KeyPress, EventKind::CloseButton, EventKind::MouseDown})
        loop.post({main.id(), kind});
    user.press('a');
    click(dialog, "p");
    for (int i = 0; i < 2; ++i)
        user.clickCloseButton();
    EXPECT_EQ(logAfter(100ms), " Mdown Da Ddown Dend Dunload");
    user.press('c');
    for (int i = 0; i < 2; ++i)
        user.clickCloseButton();
    EXPECT_EQ(logAfter(0ms), " Dc Dunload Mend Munload");
}

TEST_F(Program, EndsHoweverDeepItWaits) {
    click(main, "pmp");
    click(main, "dp");
    user.wait(100ms);
    click(dialog, "mp");
    EXPECT_FALSE(loop.requestEnd()) << "the dialog could not keep everything";
    click(dialog, "");
    EXPECT_EQ(logAfter(1h), " Mdown Mdown Ddown Mterminate Dterminate");
    EXPECT_TRUE(loop.ended());
    EXPECT_FALSE(loop.nextDeadline());
    root.reset();
    EXPECT_EQ(logAfter(1h), " Dend Mend Mend");
}

TEST_F(Program, ATimerKeepsItsStepAndNeverTicksInABurst) {
    timer.setInterval(100ms);
    timer.setEnabled(true);
    EXPECT_EQ(logAfter(250ms), " 100 200");
    timer.setEnabled(true);
    click(main, "ppm");
    EXPECT_EQ(logAfter(280ms), " Mdown 450 Mend 500");
    timer.setInterval(60ms);
    EXPECT_EQ(logAfter(130ms), " 590 650");
    timer.setEnabled(false);
    EXPECT_EQ(logAfter(100ms), "");
    timer.setEnabled(true);
    EXPECT_EQ(logAfter(60ms), " 820");
    timer.setInterval(0ms);
    EXPECT_EQ(logAfter(1h), "");
}

}  // namespace
}  // namespace quabble
