// Plays the program for Windows under Wine: play_windows_game STORY PROGRAM. A story is what main lists.

#include <X11/keysym.h>

#include <chrono>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <functional>
#include <iomanip>
#include <map>
#include <string>
#include <thread>
#include <vector>

#include "draw/fingerprint.hpp"
#include "robot.hpp"
#include "window_stories.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;
using Command = std::vector<std::string>;

constexpr const char* ownKey = "'HKCU\\Software\\Vorlane\\Quabble\\1.0'";

void run(const std::string& command) {
    require(std::system((command + " >&2").c_str()) == 0, command);
}

// Games to their ends, and what is left of them when the program is started again.
void games(const Command& command) {
    Robot robot(command);
    robot.startProgram();
    robot.play(GameMode::Training, 1000);
    const auto start = std::chrono::steady_clock::now();
    robot.play(GameMode::Timed, 1000, 60s);
    require(std::chrono::steady_clock::now() - start > 60s, "a minute of a Timed game");
    robot.closeAndCheckExit();
    robot.startProgram();
    robot.checkTable(GameMode::Timed);
    robot.game().choose(5);
    robot.desktop().waitForFocus(robot.desktop().waitForWindow("Best Scores - Quabble"));
    robot.desktop().pressWith(XK_Alt_L, XK_F4);
    waitUntil("the dialog's end", [&] { return !robot.desktop().hasWindow("Best Scores - Quabble"); });
    robot.desktop().waitForFocus(robot.game().window());
    robot.desktop().pressWith(XK_Alt_L, XK_F4);
    robot.game().waitForExit();
}

void windows(const Command& command) {
    WindowStories story(command);
    story.aMinimisedGameStaysAwayAndComesBackPaused(GameMode::Strategy);
    story.aMinimisedGameStaysAwayAndComesBackPaused(GameMode::Timed);
    story.aKeyInMidMoveHidesTheGame();
    story.aDialogKeepsTheKeyboard();
    story.enterClosesOneDialogAPress();
    story.aDoubleClickBeginsATrainingGameAndNoMore();
    story.close();
}

void scales(const Command& command) {
    for (const int quarters : {6, 8}) {
        run("wine reg add 'HKCU\\Control Panel\\Desktop' /v LogPixels /t REG_DWORD /f /d " +
            std::to_string(24 * quarters));
        run("wineserver --wait");  // so that all of Windows starts anew
        Robot robot(command);
        robot.desktop().setScale(Scale::ofQuarters(quarters));
        robot.startProgram();
        robot.play(GameMode::Training, quarters);
        robot.closeAndCheckExit();
        run(std::string("wine reg delete ") + ownKey + " /f");
    }
}

// A few moves, to see that the program works where it lies.
void shortGame(const Command& command) {
    Robot robot(command);
    robot.startProgram();
    robot.play(GameMode::Training, 3);
    robot.closeAndCheckExit();
}

std::filesystem::path recordIn(const std::filesystem::path& users) {
    for (const auto& user : std::filesystem::directory_iterator(users)) {
        const auto file = user.path() / "AppData/Local/Quabble/last_game.visit";
        if (std::filesystem::exists(file))
            return file;
    }
    return {};
}

// The user saves a record by the window's menu, and whoever gets it sees what he has seen.
void record(const Command& command) {
    const std::filesystem::path settings = std::filesystem::path(std::getenv("XDG_CONFIG_HOME")) / "openbox";
    std::filesystem::create_directories(settings);
    std::ofstream(settings / "rc.xml") << "<openbox_config xmlns=\"http://openbox.org/3.4/rc\"/>";
    run("openbox --reconfigure");  // which else has a menu of its own for Alt+Space
    WindowStories story(command);
    story.game().begin(GameMode::Strategy);
    for (int move = 0; move < 3; ++move) {
        story.beginMove();
        std::this_thread::sleep_for(1s);
    }
    const std::uint64_t seen = fingerprintOf(story.game().look());
    story.desktop().pressWith(XK_Alt_L, XK_space);
    std::this_thread::sleep_for(500ms);
    story.desktop().press(XK_l);
    std::filesystem::path file;
    waitUntil("a record", [&] {
        return !(file = recordIn(std::filesystem::path(std::getenv("WINEPREFIX")) / "drive_c/users")).empty();
    });
    std::ofstream(file, std::ios::app)
        << "expect picture 1 " << std::hex << std::setfill('0') << std::setw(16) << seen << "\n";
    const auto player = std::filesystem::path(command.back()).parent_path() / "quabble-visit.exe";
    run("wine '" + player.string() + "' '" + file.string() + "'");
    story.close();
}

// The user logs off in the midst of a game, with a new score in the table.
void logOff(const Command& command) {
    Robot robot(command);
    robot.startProgram();
    robot.play(GameMode::Training, 4);
    robot.game().begin(GameMode::Timed);
    run("wineboot --end-session");
    robot.game().waitForExit();
    run(std::string("wine reg query ") + ownKey + " /v 1STATS1 | grep robot");
}

}  // namespace
}  // namespace quabble

int main(int argc, char** argv) {
    const std::map<std::string, std::function<void(const quabble::Command&)>> stories{
        {"games", quabble::games},          {"windows", quabble::windows}, {"scales", quabble::scales},
        {"short_game", quabble::shortGame}, {"record", quabble::record},   {"log_off", quabble::logOff}};
    quabble::require(argc == 3 && stories.contains(argv[1]), "usage: play_windows_game STORY PROGRAM");
    stories.at(argv[1])({"wine", argv[2]});
    return 0;
}
