#include <gtest/gtest.h>
#include <malloc.h>

#include <filesystem>
#include <memory>

#include "../end_to_end/player.hpp"
#include "machine.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

// Someone who plays one game after the other for hours, keeps an own record of the scores and compares.
class LongDay {
 public:
    TimePoint now() { return elapsed_ + (machine_->frontEnd.now() - TimePoint{}); }
    int games() const { return games_; }
    std::string record() const { return recordOf(machine_->program); }

    void playGame() {
        ++games_;
        const int mode = 1 + games_ % 3;
        machine_->clickMenu(mode);
        std::int32_t score = 0;
        const int moves = 20 + games_ % 80;
        for (int i = 0; i < moves && isPlaying(); ++i)
            score += move(mode == 1 ? 2 : 3);
        if (isPlaying())
            machine_->clickPanel(mode == 1 ? 8 : 10);
        machine_->user.wait(2s);
        ASSERT_EQ(caption(), "Game Statistics");
        machine_->closeDialog();
        enterScore(mode, score);
        ASSERT_TRUE(machine_->game.mainMenuActive);
        ASSERT_FALSE(machine_->hasDialog());
        if (games_ % 50 == 0)
            startAgain();
    }

    // Ends the program and starts it anew with what it has kept.
    void startAgain() {
        machine_->clickMenu(8);
        ASSERT_TRUE(machine_->program.ended());
        elapsed_ = now();
        machine_ = std::make_unique<Machine>(machine_->kept, games_);
    }

 private:
    using Entry = std::pair<std::int32_t, std::string>;

    const std::string& caption() { return machine_->user.top().traits.caption; }
    bool isPlaying() const { return machine_->game.isGameActive(); }

    // The points that the move is worth; a level that it completes is acknowledged.
    std::int32_t move(int smallest) {
        const auto [place, size] = choose(model::read(machine_->seenLetters()));
        const int event = games_ + moves_++;
        if (event % 29 == 0) {
            machine_->clickPanel(machine_->game.classicActive ? 6 : 8);
            EXPECT_TRUE(machine_->isPaused());
            machine_->user.wait(10s);
            machine_->user.click(300, 300);
        }
        if (size >= smallest)
            machine_->clickCell(place.first, place.second);
        else
            machine_->clickStrip();
        machine_->user.wait(700ms);
        while (isPlaying() && machine_->hasDialog())
            machine_->closeDialog();
        return size >= smallest ? size * (size + 1) / 2 : 0;
    }

    void enterScore(int mode, std::int32_t score) {
        std::vector<Entry>& expected = tables_[static_cast<std::size_t>(mode)];
        if (score > expected.back().first) {
            ASSERT_EQ(caption(), "Best Score") << score;
            const std::string name = "player " + std::to_string(games_);
            machine_->user.type(name);
            machine_->closeDialog();
            machine_->closeDialog();
            const auto place = std::ranges::upper_bound(expected, score, std::greater(), &Entry::first);
            expected.insert(place, {score, name});
            expected.pop_back();
        }
        const HighScoreTable& kept = machine_->app.highScores.table(static_cast<std::int16_t>(mode));
        for (std::size_t i = 0; i < expected.size(); ++i)
            EXPECT_EQ((Entry{kept.scores[i], kept.names[i]}), expected[i]) << "game " << games_;
    }

    std::unique_ptr<Machine> machine_ = std::make_unique<Machine>(MemoryBlob());
    std::vector<std::vector<Entry>> tables_{4, std::vector<Entry>(8, {0, unknownName})};
    TimePoint elapsed_{};
    int games_ = 0;
    int moves_ = 0;
};

// Large blocks are counted apart.
std::size_t heapInUse() {
    const struct mallinfo2 heap = mallinfo2();
    return heap.uordblks + heap.hblkhd;
}

std::ptrdiff_t openFiles() {
    const std::filesystem::directory_iterator files("/proc/self/fd");
    return std::distance(begin(files), end(files));
}

// QUABBLE_PLAY_HOURS=8 makes it a whole day.
TEST(LongDay, EveryScoreIsKeptAndNothingIsLeftBehind) {
    const char* wished = std::getenv("QUABBLE_PLAY_HOURS");
    const auto hours =
        std::chrono::duration<double, std::ratio<3600>>(wished == nullptr ? 1 : std::atof(wished));
    const auto filesBefore = openFiles();
    LongDay day;
    std::size_t memory = 0;
    while (day.now() - TimePoint{} < hours) {
        day.playGame();
        ASSERT_FALSE(HasFailure()) << "game " << day.games() << "\n" << day.record();
        if (day.games() == 12)
            memory = heapInUse();
    }
    day.startAgain();
    EXPECT_GT(day.games(), 12);
    EXPECT_LE(heapInUse(), memory + 64 * 1024) << "after " << day.games() << " games";
    EXPECT_EQ(openFiles(), filesBefore);
    RecordProperty("games", day.games());
}

}  // namespace
}  // namespace quabble
