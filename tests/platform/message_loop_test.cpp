#include <gtest/gtest.h>

#include "hosts/headless/scripted_user.hpp"
#include "platform/timer.hpp"
#include "platform/window.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

// What a window does at a click, one step after another.
enum class Step { Pause, RunMessages, ShowDialog, ChangeScreen, Refresh, Minimise };
constexpr milliseconds stepPause = 100ms;

// A window that writes down what happens to it.
class Page final : public Window {
 public:
    Page(MessageLoop& loop, std::string& log, std::string name, Window* owner, Window* dialog)
        : Window(loop, owner), log_(log), name_(std::move(name)), dialog_(dialog) {}

    std::vector<Step> atNextClick;

 private:
    // Writes down the end of a handler, also when it does not come to it.
    struct Ending {
        Page& page;
        explicit Ending(Page& of) : page(of) {}
        Ending(const Ending&) = delete;
        Ending& operator=(const Ending&) = delete;
        ~Ending() { page.note("done"); }
    };

    std::string screenName() const override { return screen_; }
    void Form_Load() override { setClientSize({10, 10}); }
    void Form_Unload() override { note("unload"); }
    Task<> Form_MouseDown(float, float) override {
        note("click");
        const Ending ending(*this);
        for (const Step step : std::exchange(atNextClick, {})) {
            switch (step) {
                case Step::Pause:
                    co_await loop().pause(stepPause);
                    break;
                case Step::RunMessages:
                    co_await loop().runPendingMessages();
                    break;
                case Step::ShowDialog:
                    co_await loop().showModal(*dialog_);
                    break;
                case Step::ChangeScreen:
                    screen_ = "another";
                    break;
                case Step::Refresh:
                    refresh();
                    break;
                case Step::Minimise:
                    minimise();
                    break;
            }
        }
    }
    Task<> Form_MouseMove(float x, float) override {
        note("pointer-" + std::to_string(static_cast<int>(x)));
        co_return;
    }
    Task<> Form_KeyPress(std::int16_t key) override {
        note(std::string("key-") + static_cast<char>(key));
        co_return;
    }
    void Form_Resize() override { note(state() == State::Minimised ? "minimised" : "restored"); }
    void note(const std::string& what) { log_ += name_ + ":" + what + " "; }

    std::string& log_;
    std::string name_;
    Window* dialog_;
    std::string screen_ = "first";
};

class MessageLoopTest : public testing::Test {
 protected:
    MessageLoopTest() {
        main.show();
        root.start();
    }
    void click(Page& page, std::vector<Step> steps) {
        page.atNextClick = std::move(steps);
        loop.post({page.id(), EventKind::MouseDown});
        loop.wake();
    }
    std::string logAfter(milliseconds duration) {
        user.wait(duration);
        return std::exchange(log, {});
    }
    Task<> tick() {
        log += "tick-" + std::to_string(frontEnd.now().time_since_epoch() / 1ms) + " ";
        return loop.runPendingMessages();
    }

    std::string log;
    HeadlessFrontEnd frontEnd;
    MessageLoop loop{frontEnd};
    ScriptedUser<MessageLoop> user{frontEnd, loop};
    Page main{loop, log, "main", nullptr, &dialog};
    Page dialog{loop, log, "dialog", &main, nullptr};
    Timer timer{loop, [this] { return tick(); }};
    Task<> root = loop.run();
};

TEST_F(MessageLoopTest, RunsMessagesWhereItLetsThemAndNotInPauses) {
    click(main, {Step::Pause, Step::RunMessages, Step::Pause});
    click(main, {Step::Pause, Step::RunMessages});
    user.movePointer(1, 0);
    user.movePointer(2, 0);
    user.press('a');
    EXPECT_EQ(logAfter(99ms), "main:click ");
    EXPECT_EQ(logAfter(1ms), "main:click ") << "the second click, which pauses in its turn";
    user.press('b');
    EXPECT_EQ(logAfter(100ms), "main:pointer-2 main:key-a main:key-b main:done ");
    user.press('c');
    root.reset();
    EXPECT_EQ(logAfter(1h), "main:done ");
}

TEST_F(MessageLoopTest, ADialogTakesItsOwnersInputAndNoneOfAnEarlierShowing) {
    click(main, {Step::ShowDialog, Step::ShowDialog});
    for (const auto kind : {EventKind::KeyPress, EventKind::CloseButton, EventKind::MouseDown})
        loop.post({main.id(), kind});
    user.press('a');
    click(dialog, {Step::Pause});
    user.clickCloseButton();
    user.clickCloseButton();
    EXPECT_EQ(logAfter(stepPause), "main:click dialog:key-a dialog:click dialog:done dialog:unload ");
    user.press('c');
    user.clickCloseButton();
    user.clickCloseButton();
    EXPECT_EQ(logAfter(0ms), "dialog:key-c dialog:unload main:done main:unload ");
}

TEST_F(MessageLoopTest, AHandlerGoesOnWhenItsWindowHasClosed) {
    click(main, {Step::ShowDialog});
    click(dialog, {Step::Pause, Step::RunMessages, Step::Refresh, Step::Minimise});
    user.clickCloseButton();
    EXPECT_EQ(logAfter(stepPause), "main:click dialog:click dialog:unload dialog:done main:done ");
    EXPECT_EQ(frontEnd.windows().size(), 1U);
}

TEST_F(MessageLoopTest, WhatHappensInsideACallOfTheFrontEndIsDeliveredAfterwards) {
    click(main, {Step::Minimise, Step::Refresh});
    EXPECT_EQ(logAfter(0ms), "main:click main:done main:minimised ");
}

TEST_F(MessageLoopTest, TheSecondPressOfADoubleClickIsNotMeantForWhatTheFirstOneBrought) {
    user.doubleClick(5, 5);
    EXPECT_EQ(logAfter(0ms), "main:click main:done main:click main:done ") << "nothing came";
    main.atNextClick = {Step::ChangeScreen};
    user.doubleClick(5, 5);
    EXPECT_EQ(logAfter(0ms), "main:click main:done ") << "another screen came";
    main.atNextClick = {Step::ShowDialog};
    user.doubleClick(5, 5);
    EXPECT_EQ(logAfter(0ms), "main:click ") << "a dialog came";
    user.click(5, 5);
    EXPECT_EQ(logAfter(0ms), "dialog:click dialog:done ") << "a click of its own";
}

TEST_F(MessageLoopTest, EndsHoweverDeepItWaits) {
    click(main, {Step::Pause, Step::RunMessages, Step::Pause});
    click(main, {Step::ShowDialog, Step::Pause});
    user.wait(stepPause);
    click(dialog, {Step::RunMessages, Step::Pause});
    loop.end();
    click(dialog, {});
    EXPECT_EQ(logAfter(1h), "main:click main:click dialog:click ");
    EXPECT_TRUE(loop.ended());
    EXPECT_FALSE(loop.nextDeadline());
    root.reset();
    EXPECT_EQ(logAfter(1h), "dialog:done main:done main:done ");
}

TEST_F(MessageLoopTest, ATimerKeepsItsStepAndNeverTicksInABurst) {
    timer.setInterval(100ms);
    timer.setEnabled(true);
    EXPECT_EQ(logAfter(250ms), "tick-100 tick-200 ");
    timer.setEnabled(true);
    click(main, {Step::Pause, Step::Pause, Step::RunMessages});
    EXPECT_EQ(logAfter(280ms), "main:click tick-450 main:done tick-500 ") << "one for the two of the pauses";
    timer.setInterval(60ms);
    EXPECT_EQ(logAfter(130ms), "tick-590 tick-650 ");
    timer.setEnabled(false);
    EXPECT_EQ(logAfter(100ms), "");
    timer.setEnabled(true);
    EXPECT_EQ(logAfter(60ms), "tick-820 ");
    timer.setInterval(0ms);
    EXPECT_EQ(logAfter(1h), "");
}

}  // namespace
}  // namespace quabble
