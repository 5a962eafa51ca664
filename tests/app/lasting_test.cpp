#include <gtest/gtest.h>

#include <functional>

#include "machine.hpp"
#include "store/name_entry.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

TEST(NameEntry, AcceptsNineteenCharactersAndNeverNone) {
    EXPECT_EQ(acceptedName(""), "-");
    EXPECT_EQ(acceptedName(" "), " ");
    EXPECT_EQ(acceptedName("abcdefghijklmnopqrst"), "abcdefghijklmnopqrs");
}

// The program after a Training game of one move, in front of the name entry.
struct MachineWithAScore : Machine {
    MachineWithAScore() {
        app.highScores.table(1) = {{500, 6, 3, 0, 0, 0, 0, 0},
                                   {"first", "second", "third", "", "", "", "", ""}};
        start(1, "....111");
        clickCell(5, 16);
        user.wait(1s);
        closeDialog();
    }
    const std::string& caption() { return user.top().traits.caption; }
};

TEST(NameEntry, TakesTheNameHoweverItIsClosedAndShowsTheTable) {
    const std::pair<const char*, std::function<void(ScriptedUser<Program>&)>> ways[] = {
        {"Enter", [](ScriptedUser<Program>& user) { user.press(keys::enter); }},
        {"Esc", [](ScriptedUser<Program>& user) { user.press(keys::escape); }},
        {"the frame", [](ScriptedUser<Program>& user) { user.clickCloseButton(); }},
        {"OK", [](ScriptedUser<Program>& user) { user.click(180, 171); }},
        {"Tab and space",
         [](ScriptedUser<Program>& user) {
             user.press(keys::tab);
             user.press(keys::space);
         }},
        {"Tab all the way round", [](ScriptedUser<Program>& user) {
             user.press(keys::tab);
             user.press(keys::tab);
             user.type("!");
             user.press(keys::backspace);
             user.press(keys::enter);
         }}};
    for (const auto& [name, close] : ways) {
        MachineWithAScore machine;
        ASSERT_EQ(machine.caption(), "Best Score") << name;
        machine.user.press('x');  // a key is no text by itself
        machine.user.type("Zo\u00EB!");
        machine.user.edit(EditCommand::Left, true);
        machine.user.edit(EditCommand::Delete);
        machine.user.drag(180, 171, 20, 171);  // a press that is taken back
        machine.user.drag(20, 171, 180, 171);
        ASSERT_EQ(machine.caption(), "Best Score") << name;
        machine.user.press(keys::tab);
        close(machine.user);
        EXPECT_EQ(machine.caption(), "Best Scores - Quabble") << name;
        const HighScoreTable& table = machine.app.highScores.table(1);
        EXPECT_EQ(table.names[2], "Zo\xEB") << name << ": it ranks below the equal score";
        EXPECT_EQ(table.names[1], "second") << name;
        EXPECT_EQ(table.names[3], "third") << name;
        EXPECT_EQ(table.scores[2], 6) << name;
        machine.closeDialog();
        EXPECT_TRUE(machine.game.mainMenuActive) << name;
        EXPECT_FALSE(machine.hasDialog()) << name;
    }
}

TEST(NameEntry, AsksForTheNameOfTheScoreThatTakesTheLastPlace) {
    for (const std::int32_t eighth : {5, 6}) {
        Machine machine;
        machine.app.highScores.table(1).scores = {70, 60, 50, 40, 30, 20, 10, eighth};
        machine.start(1, "....111");
        machine.clickCell(5, 16);
        machine.user.wait(1s);
        machine.closeDialog();
        EXPECT_EQ(machine.hasDialog(), eighth < 6) << "against " << eighth;
    }
}

TEST(ScoreView, ClearsTheTableThatItShows) {
    Machine machine;
    machine.clickMenu(5);
    const Surface before = machine.user.top().picture;
    for (const auto& [x, y] : {std::pair{270.F, 420.F}, {405.F, 420.F}, {300.F, 405.F}, {300.F, 435.F}})
        machine.user.click(x, y);  // the borders of "Clear Scores"
    EXPECT_TRUE(machine.user.top().picture == before);
    machine.user.movePointer(300, 420);
    machine.user.click(300, 420);
    EXPECT_FALSE(isFlat(machine.user.top().picture, {280, 410, 400, 430}));
    EXPECT_NE(machine.user.pixel(270, 420), palette::highlightColour) << "the button is drawn at rest";
    machine.user.movePointer(301, 420);
    EXPECT_NE(machine.user.pixel(270, 420), palette::highlightColour) << "and counts as highlighted still";
    for (std::int16_t table = 1; table <= 3; ++table) {
        EXPECT_EQ(machine.app.highScores.table(table).names[7], table == 2 ? "Anonoymous" : "Anononymous");
        EXPECT_EQ(machine.app.highScores.table(table).scores[7], table == 2 ? 0 : 1'000'000'000);
    }
    machine.user.movePointer(10, 10);
    const Surface cleared = machine.user.top().picture;
    machine.user.click(100, 420);
    EXPECT_FALSE(machine.hasDialog());
    machine.clickMenu(5);
    EXPECT_TRUE(machine.user.top().picture == cleared) << "all of it was painted anew";
    machine.user.press('q');
    EXPECT_TRUE(machine.hasDialog());
    machine.user.press(keys::escape);
    EXPECT_FALSE(machine.hasDialog());
}

TEST(Splash, ClosesOnItsSecondTickWhateverIsClicked) {
    HeadlessFrontEnd frontEnd;
    MemoryBlob kept;
    BlobRegistryStore registry(kept);
    Program program(frontEnd, registry, 1);
    ScriptedUser user(frontEnd, program);
    program.start();
    EXPECT_TRUE(user.top().traits.borderless);
    EXPECT_EQ(user.top().traits.clientSize, (Size{680, 450}));
    user.wait(1900ms);
    for (const auto& [x, y] :
         {std::pair{350.F, 420.F}, {550.F, 420.F}, {400.F, 400.F}, {400.F, 440.F}, {10.F, 10.F}})
        user.click(x, y);
    user.press(keys::enter);
    EXPECT_TRUE(frontEnd.openedDocuments.empty());
    user.click(351, 401);
    EXPECT_EQ(frontEnd.openedDocuments, std::vector<std::string>{"https://quabble.example/"});
    user.wait(99ms);
    EXPECT_TRUE(user.top().traits.borderless);
    user.wait(1ms);
    EXPECT_EQ(user.top().traits.caption, "Quabble  Ver 1.0");
    user.click(337, 383);
    EXPECT_EQ(frontEnd.openedDocuments.back(), "QB_HELP.HTM");
}

// Where the registry should be lies something else, which stays as it is.
struct MachineWithoutARegistry : Machine {
    MachineWithoutARegistry() : Machine(MemoryBlob(std::vector<std::byte>(100))) {}
};

TEST(Program, TellsOfARegistryThatCannotBeOpenedAndGoesOn) {
    MachineWithoutARegistry machine;
    EXPECT_EQ(machine.user.top().traits.caption, "Quabble") << "nothing else is there before it is read";
    EXPECT_FALSE(machine.user.top().traits.borderless);
    EXPECT_EQ(machine.frontEnd.windows().size(), 1U);
    machine.closeDialog();
    EXPECT_TRUE(machine.user.top().traits.borderless) << "the splash";
    machine.user.wait(2s);
    machine.clickMenu(2);
    machine.user.clickCloseButton();
    EXPECT_EQ(machine.user.top().traits.caption, "Quabble");
    EXPECT_TRUE(machine.hasDialog()) << "the main window is seen behind it";
    machine.user.wait(1h);
    EXPECT_EQ(machine.game.rowsEntered, 0) << "the game goes no further";
    EXPECT_FALSE(machine.program.ended());
    machine.closeDialog();
    EXPECT_TRUE(machine.program.ended());
    EXPECT_TRUE(machine.frontEnd.windows().empty());
}

TEST(Program, EndsInFrontOfItsMessageWhenItIsAskedTo) {
    MachineWithoutARegistry atStart;
    EXPECT_TRUE(atStart.program.keep() && atStart.program.requestEnd())
        << "nothing has happened yet that should last";
    EXPECT_TRUE(atStart.program.ended());
    MachineWithoutARegistry atClose;
    atClose.closeDialog();
    atClose.user.wait(2s);
    atClose.clickMenu(8);
    ASSERT_TRUE(atClose.hasDialog());
    EXPECT_FALSE(atClose.program.requestEnd()) << "and the program can say so";
    EXPECT_TRUE(atClose.program.ended());
}

// However the program ends after it has shown its main window, the settings are kept; before, they are not.
TEST(Program, KeepsTheScoresWhenItEndsAndNotBefore) {
    for (const std::string by : {"the desktop", "the close button", "Exit", "a page that is hidden"}) {
        SCOPED_TRACE(by);
        MachineWithAScore machine;
        machine.user.type("Zo\u00EB \u20AC");
        machine.user.press(keys::enter);
        const Surface seen = machine.user.top().picture;
        const auto kept = [&] {
            Settings settings;
            HighScores scores;
            SettingsStore(machine.registry).loadSettings(settings, scores);
            return std::to_string(settings.solvingData.scoreTableIndex()) +
                   std::to_string(std::to_integer<int>(settings.solvingData.bytes[4])) +
                   scores.table(1).names[2];
        };
        EXPECT_EQ(kept(), "00Anononymous");
        if (by == "the close button" || by == "Exit")  // the others do not wait for the dialog
            machine.closeDialog();
        if (by == "a page that is hidden")
            EXPECT_TRUE(machine.program.keep());
        else if (by == "Exit")
            machine.clickMenu(8);
        else if (by == "the close button")
            machine.user.clickCloseButton();
        else
            EXPECT_TRUE(machine.program.requestEnd());
        EXPECT_EQ(machine.program.ended(), by != "a page that is hidden");
        EXPECT_EQ(kept(), "11Zo\xEB \x80");
        Machine next(machine.kept);
        next.clickMenu(4);
        EXPECT_TRUE(next.user.top().picture == seen);
    }
}

}  // namespace
}  // namespace quabble
