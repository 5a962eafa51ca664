// Plays all three modes on the desktop: play mouse|keys PROGRAM. With the mouse it does so at several scales.

#include <cstdlib>
#include <string>

#include "robot.hpp"

namespace quabble {
namespace {

// Lets the program keep its scores elsewhere from now on.
void forgetScores(int place) {
    const std::string data = std::getenv("XDG_DATA_HOME") + ("/" + std::to_string(place));
    setenv("XDG_DATA_HOME", data.c_str(), 1);
}

void playWithMouse(const std::string& program) {
    Robot robot({program});
    robot.startProgram();
    robot.play(GameMode::Training, 1000);
    robot.play(GameMode::Strategy, 12);
    robot.play(GameMode::Timed, 4);
    robot.closeAndCheckExit();
    robot.startProgram();
    robot.checkTable(GameMode::Timed);
    robot.closeAndCheckExit();
    for (const int quarters : {6, 8}) {
        robot.desktop().setScale(Scale::ofQuarters(quarters));
        forgetScores(quarters);
        robot.startProgram();
        robot.play(GameMode::Training, quarters == 6 ? 4 : 8);
        robot.closeAndCheckExit();
    }
}

void playWithKeys(const std::string& program) {
    Robot robot({program}, Robot::Hand::Keys);
    robot.startProgram();
    robot.play(GameMode::Training, 1000);
    robot.play(GameMode::Strategy, 6);
    robot.play(GameMode::Timed, 3);
    robot.closeAndCheckExit();
}

}  // namespace
}  // namespace quabble

int main(int argc, char** argv) {
    quabble::require(argc == 3, "usage: play mouse|keys PROGRAM");
    if (argv[1] == std::string("mouse"))
        quabble::playWithMouse(argv[2]);
    else
        quabble::playWithKeys(argv[2]);
    return 0;
}
