// Does to the windows what desktops and hasty people do to them: windows PROGRAM.

#include <X11/keysym.h>
#include <sys/wait.h>

#include <chrono>
#include <csignal>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <thread>

#include "../support/files.hpp"
#include "hosts/headless/visit_player.hpp"
#include "window_stories.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

// Of the record that the program is about to write, when it has been played to its end as it says.
Surface replayedPicture(const std::filesystem::path& pictures) {
    const std::filesystem::path file =
        std::filesystem::path(std::getenv("XDG_DATA_HOME")) / "quabble/last_game.visit";
    std::string text;
    waitUntil("a whole record",
              [&] { return (text = bytesOf(file)).find("expect level") != std::string::npos; });
    std::filesystem::remove(file);
    const auto read = parseVisit(text);
    require(std::holds_alternative<Visit>(read), "a record that can be read");
    const Visit& visit = std::get<Visit>(read);
    VisitPlayer player(visit, picturesIn(pictures));
    for (const VisitStep& step : visit.steps) {
        player.play(step);
        require(step.kind != VisitStep::Kind::Expect || player.isAsExpected(step), "the same figures");
    }
    return player.picture();
}

// What was done here is done again without a screen, and the same is seen.
void theRecordOfAGameIsPlayedAnywhere(const std::string& program) {
    const std::filesystem::path folder = std::filesystem::path(program).parent_path();
    WindowStories story({program});
    story.game().begin(GameMode::Strategy);
    for (int move = 0; move < 3; ++move) {
        story.beginMove();
        std::this_thread::sleep_for(1s);
    }
    story.desktop().press(XK_Down);
    std::this_thread::sleep_for(300ms);
    const pid_t process = story.game().process();
    kill(process, SIGUSR1);
    require(replayedPicture(folder) == story.game().look(), "the very picture");
    story.beginMove();
    kill(process, SIGABRT);
    int status = 0;
    waitpid(process, &status, 0);
    require(WIFSIGNALED(status) && WTERMSIG(status) == SIGABRT, "an end by SIGABRT");
    require(!replayedPicture(folder).bounds().isEmpty(), "a record of the end, too");
}

}  // namespace
}  // namespace quabble

int main(int argc, char** argv) {
    using quabble::GameMode;
    quabble::require(argc == 2, "usage: windows PROGRAM");
    quabble::WindowStories story({argv[1]});
    story.aMinimisedGameStaysAwayAndComesBackPaused(GameMode::Strategy);
    story.aMinimisedGameStaysAwayAndComesBackPaused(GameMode::Timed);
    story.aKeyInMidMoveHidesTheGame();
    story.theKeyboardComesBackFromAnotherWorkspace();
    story.aDialogKeepsTheKeyboard();
    story.enterClosesOneDialogAPress();
    story.aDoubleClickBeginsATrainingGameAndNoMore();
    story.anOfferToDropSomethingUnknownDoesNoHarm();
    story.aRestoredWindowHasItsPictureAtOnce();
    story.close();
    quabble::theRecordOfAGameIsPlayedAnywhere(argv[1]);
    quabble::WindowStories({argv[1]}).aDestroyedDialogWasClosedAndADestroyedMainWindowEndsTheProgram();
    return 0;
}
