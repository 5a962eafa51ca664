// Does to the windows what desktops and hasty people do to them: windows PROGRAM.

#include "window_stories.hpp"

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
    quabble::WindowStories({argv[1]}).aDestroyedDialogWasClosedAndADestroyedMainWindowEndsTheProgram();
    return 0;
}
