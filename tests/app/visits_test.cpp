#include <gtest/gtest.h>

#include <functional>

#include "../end_to_end/player.hpp"
#include "hosts/headless/visit_player.hpp"
#include "machine.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

// What the topmost window shows when a recorded visit has been played, or why it could not be.
struct Replay {
    Surface picture;
    std::string problem;

    explicit Replay(const std::string& text) {
        const auto read = parseVisit(text);
        if (const auto* unreadable = std::get_if<VisitProblem>(&read)) {
            problem = "line " + std::to_string(unreadable->line) + ": " + unreadable->what;
            return;
        }
        const Visit& visit = std::get<Visit>(read);
        VisitPlayer player(visit, programFiles);
        for (const VisitStep& step : visit.steps) {
            player.play(step);
            if (step.kind == VisitStep::Kind::Expect && !player.isAsExpected(step))
                problem += step.what + " is " + player.seen(step) + ", not " + step.value + ". ";
        }
        picture = player.picture();
    }
};

void playSomeMoves(Machine& machine, int moves) {
    const int smallest = machine.game.gameMode == GameMode::Training ? 2 : 3;
    for (int move = 0; move < moves; ++move) {
        const auto [place, size] = choose(model::read(lettersOf(machine.game.grid)));
        machine.user.movePointer(static_cast<float>(20 + 11 * move), 425);
        if (size >= smallest)
            machine.clickCell(place.first, place.second);
        machine.user.wait(milliseconds(90 + 37 * move));
        if (move % 3 == 1)
            machine.clickStrip();
    }
}

// A game, and then another one of which there is a record.
TEST(Record, PlaysTheLastGameOnceMore) {
    const std::pair<const char*, std::function<void(Machine&)>> ends[] = {
        {"in mid-move", [](Machine& machine) { playSomeMoves(machine, 1); }},
        {"paused", [](Machine& machine) { machine.user.press('q'), machine.user.restore(); }},
        {"at another scale",
         [](Machine& machine) {
             machine.frontEnd.rescale(Scale::ofQuarters(7));
             machine.program.wake();
             machine.user.wait(1s);
         }},
        {"by keys",
         [](Machine& machine) {
             for (const EditCommand command : {EditCommand::Up, EditCommand::Right, EditCommand::Click})
                 machine.user.edit(command);
         }},
        {"at the menu again",
         [](Machine& machine) {
             machine.user.wait(1s);
             machine.clickPanel(machine.game.classicActive ? 8 : 10);
             for (int dialog = 0; dialog < 3; ++dialog)
                 machine.closeDialog();
             machine.clickMenu(5);
             machine.closeDialog();
             machine.pointAtMenu(2);
         }},
        {"at its table", [](Machine& machine) {
             machine.user.wait(1s);
             machine.clickPanel(machine.game.classicActive ? 8 : 10);
             machine.closeDialog();
             machine.user.press('j');
             machine.user.type("Jo");
             machine.closeDialog();
             machine.user.movePointer(300, 420);
         }}};
    for (int mode = 1; mode <= 3; ++mode) {
        for (const auto& [name, end] : ends) {
            SCOPED_TRACE(testing::Message() << "mode " << mode << ", " << name);
            Machine machine(MemoryBlob(), 11, Scale::ofQuarters(6));
            machine.clickMenu(3);
            playSomeMoves(machine, 5);
            machine.user.wait(1s);
            machine.clickPanel(10);
            for (int dialog = 0; dialog < 3; ++dialog)
                machine.closeDialog();
            machine.pointAtMenu(mode);
            machine.clickMenu(mode);
            playSomeMoves(machine, 8);
            end(machine);
            const std::string text = recordOf(machine.program);
            const Replay replay(text);
            EXPECT_EQ(replay.problem, "") << text;
            const bool hasName = std::string(name) == "at its table";
            EXPECT_EQ(replay.picture == machine.user.top().picture, !hasName)
                << "all is seen again but for the name";
            EXPECT_EQ(text.find("Jo"), std::string::npos);
            EXPECT_EQ(text.find("drawn 0\n"), std::string::npos) << "the game before is not in it";
        }
    }
}

TEST(Record, IsShortWhileNothingHappens) {
    Machine machine;
    machine.clickMenu(1);
    for (int i = 0; i < 10'000; ++i)
        machine.user.movePointer(static_cast<float>(250 + i % 300), static_cast<float>(50 + i % 400));
    EXPECT_LT(recordOf(machine.program).size(), 1000U) << "of moves over a board only the last one counts";
    for (int i = 0; i < 50'000; ++i)
        machine.user.edit(EditCommand::Home);
    const std::string text = recordOf(machine.program);
    EXPECT_LT(text.size(), 2'000'000U);
    EXPECT_TRUE(text.ends_with("# There was more.\n"));
    EXPECT_EQ(Replay(text).problem, "");
    machine.clickPanel(8);
    machine.closeDialog();
    for (int i = 0; i < 500; ++i)
        machine.pointAtMenu(1 + i % 8);
    EXPECT_EQ(recordOf(machine.program), text) << "and it is kept until another game begins";
    machine.clickMenu(2);
    EXPECT_EQ(Replay(recordOf(machine.program)).problem, "");
    EXPECT_TRUE(recordOf(machine.program).ends_with("expect level 1\n"));
}

TEST(Visit, TellsWhichLineCannotBeUnderstood) {
    const std::string start = "# a visit\nvisit 1\n\n";
    EXPECT_TRUE(std::holds_alternative<Visit>(parseVisit(start + "at 1s click 1 2\r\nexpect ended\n")));
    for (const char* line : {"at 1s click 1",
                             "at 1s click 1 2 3",
                             "at 1s click 1 70000",
                             "at 1s press 1 2 twice",
                             "at 1 key a",
                             "at -1s key a",
                             "at 99999999999s key a",
                             "at s",
                             "at",
                             "at 1s key",
                             "at 1s key ab",
                             "at 1s edit",
                             "at 1s edit up down",
                             "at 1s type",
                             "at 1s close it",
                             "at 1s scale 1.1",
                             "at 1s below",
                             "at 1s sing",
                             "seed",
                             "seed x",
                             "seed 99999999999999999999",
                             "drawn 100000001",
                             "scale 5",
                             "scores 0 1",
                             "scores 4 1",
                             "scores 1 1 2 3 4 5 6 7 8 9",
                             "scores 1 a",
                             "store new",
                             "wakes",
                             "expect",
                             "expect wonders",
                             "visit 1",
                             "anything"}) {
        const auto read = parseVisit(start + line + "\n");
        ASSERT_TRUE(std::holds_alternative<VisitProblem>(read)) << line;
        EXPECT_EQ(std::get<VisitProblem>(read).line, 4U) << line;
    }
    for (const char* text : {"", "# nothing\n", "visit 2\n", "at 1s\n"})
        EXPECT_TRUE(std::holds_alternative<VisitProblem>(parseVisit(text))) << text;
    EXPECT_EQ(std::get<VisitProblem>(parseVisit(start + "at 2s\nat 1s\n")).line, 5U);
    EXPECT_EQ(std::get<VisitProblem>(parseVisit(start + "at 2s\nseed 4\n")).line, 5U);
}

}  // namespace
}  // namespace quabble
