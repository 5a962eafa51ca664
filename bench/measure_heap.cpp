// How many heap blocks more the program has after something was done than before, on the machine without a
// screen.

#include <array>
#include <functional>
#include <string>

#include "../tests/support/files.hpp"
#include "app/program.hpp"
#include "heap_count.hpp"
#include "hosts/headless/memory_blob.hpp"
#include "hosts/headless/scripted_user.hpp"
#include "measure_rooms.hpp"
#include "report.hpp"

namespace quabble::bench {
namespace {

using namespace std::chrono_literals;

// The program on its main menu, with high scores that are out of reach. Buttons are counted from 1.
struct Machine {
    explicit Machine(const std::string& programFolder) : frontEnd(picturesIn(programFolder)) {
        program.start();
        user.wait(1min);
        for (std::int16_t table = 1; table <= highScoreTables; ++table)
            app.highScores.table(table).scores.fill(1'000'000'000);
    }

    void clickMenu(int button) { user.click(337, static_cast<float>(52.5 * button + 15)); }
    void clickPanel(int entry) { user.click(95, static_cast<float>(65 + 40 * entry)); }
    // Ends the game that runs, if one does, and starts the mode's same game each time.
    void start(int mode, int endEntry) {
        if (!app.game.mainMenuActive) {
            clickPanel(endEntry);
            user.press(keys::enter);  // closes the result
        }
        app.random = SeededRandom(1);
        clickMenu(mode);
    }
    // Clicks so many cells, row by row from the bottom.
    void clickCells(int count) {
        for (int i = 0; i < count; ++i) {
            user.click(static_cast<float>(246 + i % 12 * 28), static_cast<float>(465 - i / 12 * 28));
            user.wait(1s);
        }
    }
    // Moves the pointer all over the topmost window.
    void pointAtAll() {
        const Size size = user.top().traits.clientSize;
        for (int y = 0; y < size.height; y += 10) {
            for (int x = 0; x < size.width; x += 20)
                user.movePointer(static_cast<float>(x), static_cast<float>(y));
        }
    }

    HeadlessFrontEnd frontEnd;
    MemoryBlob kept;
    BlobRegistryStore registry{kept};
    Program program{frontEnd, registry, 1};
    ScriptedUser<Program> user{frontEnd, program};
    AppState& app = program.state();
};

// Does a thing three times, each time in the state that `prepare` makes, and counts what the third leaves
// behind.
void count(const std::string& what, const std::function<void()>& prepare, const std::function<void()>& act) {
    std::int64_t before = 0;
    for (int i = 0; i < 3; ++i) {
        prepare();
        before = heapBlocks();
        act();
    }
    report("heap blocks left by: " + what, static_cast<double>(heapBlocks() - before), 0, "", {});
}

}  // namespace

void measureHeap(const std::string& programFolder) {
    Machine machine(programFolder);
    const auto nothing = [] {};
    const auto hover = [&] { machine.pointAtAll(); };

    count("main menu drawn", nothing, [&] { machine.program.frmQuabble().showMainMenu(); });
    count("pointer over the main menu", nothing, hover);
    machine.clickMenu(4);
    count("pointer over the score view", nothing, hover);
    machine.user.press(keys::enter);

    const auto startTraining = [&] { machine.start(1, 8); };
    count("48 clicks on a Training board", startTraining, [&] { machine.clickCells(48); });
    startTraining();
    count("pointer over the classic panel", nothing, hover);
    count("pause and resume", nothing, [&] {
        machine.clickPanel(6);
        machine.user.click(10, 10);
    });
    machine.clickPanel(8);
    count("pointer over the result dialog", nothing, hover);
    machine.user.press(keys::enter);

    const auto startTimed = [&] { machine.start(2, 10); };
    count("30 ticks of a Timed game, two rows", startTimed, [&] { machine.user.wait(7500ms); });
    count("pointer over the arcade panel", startTimed, hover);
    count("12 clicks on a Strategy board", [&] { machine.start(3, 10); }, [&] { machine.clickCells(12); });
}

}  // namespace quabble::bench
