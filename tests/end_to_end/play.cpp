// Plays all three modes on the desktop, at several scales: play PROGRAM.

#include <cstdlib>
#include <string>

#include "robot.hpp"

namespace {

// Lets the program keep its scores elsewhere from now on.
void forgetScores(int place) {
    const std::string data = std::getenv("XDG_DATA_HOME") + ("/" + std::to_string(place));
    setenv("XDG_DATA_HOME", data.c_str(), 1);
}

}  // namespace

int main(int argc, char** argv) {
    quabble::require(argc == 2, "usage: play PROGRAM");
    quabble::Robot robot({argv[1]});
    robot.startProgram();
    robot.play(quabble::GameMode::Training, 1000);
    robot.play(quabble::GameMode::Strategy, 12);
    robot.play(quabble::GameMode::Timed, 4);
    robot.closeAndCheckExit();
    robot.startProgram();
    robot.checkTable(quabble::GameMode::Timed);
    robot.closeAndCheckExit();
    for (const int quarters : {6, 8}) {
        robot.desktop().setScale(quabble::Scale::ofQuarters(quarters));
        forgetScores(quarters);
        robot.startProgram();
        robot.play(quabble::GameMode::Training, quarters == 6 ? 4 : 8);
        robot.closeAndCheckExit();
    }
    return 0;
}
