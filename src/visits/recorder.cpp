#include "visits/recorder.hpp"

#include <algorithm>
#include <charconv>
#include <concepts>

#include "visits/words.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

// When a record that begins at the menu has its first act: the menu is there after two seconds.
constexpr microseconds firstActAtMenu = 3s;

// One line of text, made without asking for memory. What does not fit is left out.
class Line {
 public:
    Line& operator<<(std::string_view text) {
        text = text.substr(0, characters_.size() - size_);
        std::ranges::copy(text, characters_.begin() + static_cast<std::ptrdiff_t>(size_));
        size_ += text.size();
        return *this;
    }
    Line& operator<<(std::integral auto number) {
        std::array<char, 24> digits;
        const auto [end, problem] = std::to_chars(digits.data(), digits.data() + digits.size(), number);
        return *this << std::string_view(digits.data(), end);
    }
    std::string_view text() const { return {characters_.data(), size_}; }

 private:
    std::array<char, 256> characters_;
    std::size_t size_ = 0;
};

std::int16_t codeOf(const InputEvent& event) {
    switch (event.kind) {
        case EventKind::KeyPress:
            return event.key;
        case EventKind::Edit:
            return static_cast<std::int16_t>(event.command);
        case EventKind::Rescaled:
            return static_cast<std::int16_t>(event.scale.quarters());
        case EventKind::TextInput: {
            const auto isNoContinuation = [](char byte) { return (byte & 0xC0) != 0x80; };
            const auto letters = std::ranges::count_if(event.text, isNoContinuation);
            return static_cast<std::int16_t>(std::min<std::ptrdiff_t>(letters, 99));
        }
        default:
            return 0;
    }
}

// When a visit starts that has its first act now, in whole microseconds.
TimePoint baseOf(const Recorder::Start& start, TimePoint now) {
    return std::chrono::floor<microseconds>(now) - (start.isAtMenu ? firstActAtMenu : microseconds(0));
}

}  // namespace

void Recorder::begin(const Start& start, TimePoint now) {
    start_ = start;
    base_ = baseOf(start, now);
    acts_.clear();
    mark_.reset();
    isFull_ = false;
}

void Recorder::mark(const Start& start, TimePoint now) {
    if (acts_.size() > mostActs) {
        acts_.resize(mostActs);
        isFull_ = true;
    }
    mark_ = {start, baseOf(start, now), acts_.size()};
}

void Recorder::beginAtMark() {
    if (!mark_)
        return;
    acts_.erase(acts_.begin(), acts_.begin() + static_cast<std::ptrdiff_t>(mark_->firstAct));
    for (Act& act : acts_)
        act.at -= std::chrono::floor<microseconds>(mark_->base - base_);
    start_ = mark_->start;
    base_ = mark_->base;
    mark_.reset();
    isFull_ = false;
}

void Recorder::add(const InputEvent& event, bool isBelow, TimePoint now, std::uint64_t picturesShown) {
    const bool wasNothing = !acts_.empty() && !acts_.back().isWake && acts_.back().isBelow == isBelow &&
                            acts_.back().kind == EventKind::MouseMove && picturesShown == picturesShown_;
    if (!hasRoom())
        return;
    if (event.kind == EventKind::MouseMove && wasNothing)
        acts_.pop_back();
    if (mark_)
        mark_->firstAct = std::min(mark_->firstAct, acts_.size());
    picturesShown_ = picturesShown;
    acts_.push_back({.at = std::chrono::floor<microseconds>(now - base_),
                     .x = static_cast<std::int16_t>(event.x),
                     .y = static_cast<std::int16_t>(event.y),
                     .code = codeOf(event),
                     .kind = event.kind,
                     .isBelow = isBelow,
                     .extends = event.extends,
                     .continuesClick = event.continuesClick});
}

void Recorder::addWake(TimePoint now) {
    if (hasRoom())
        acts_.push_back({.at = std::chrono::floor<microseconds>(now - base_), .isWake = true});
}

// Once it is full it stays so, for what comes later means nothing without what was left out. Only the acts
// that begin the next game have a place beyond.
bool Recorder::hasRoom() {
    const bool hasRoom =
        acts_.size() < mostActs || (mark_ && acts_.size() < mark_->firstAct + mostActsOfABeginning);
    isFull_ = isFull_ || !hasRoom;
    return hasRoom;
}

void Recorder::write(const Figures& figures, const Output& output) const {
    writeStart(output);
    const std::size_t written = isFull_ ? std::min(acts_.size(), mostActs) : acts_.size();
    for (std::size_t i = 0; i < written; ++i)
        writeAct(acts_[i], output);
    if (isFull_) {
        output("# There was more.\n");
        return;
    }
    Line line;
    line << "expect score " << figures.score << "\nexpect level " << figures.level << "\n";
    if (figures.rows > 0)
        line << "expect rows " << figures.rows << "\n";
    output(line.text());
}

void Recorder::writeStart(const Output& output) const {
    Line line;
    line << "# What was done since the last game began. Every letter that was typed is an x.\nvisit 1\nseed "
         << start_.seed << "\ndrawn " << start_.drawn << "\nscale " << wordOf(start_.scale) << "\n";
    output(line.text());
    for (std::size_t table = 0; table < start_.scores.size(); ++table) {
        Line scores;
        scores << "scores " << table + 1;
        for (const std::int32_t score : start_.scores[table])
            scores << " " << score;
        output((scores << "\n").text());
    }
    output("wakes as written\n");
    if (!start_.isAtMenu)
        return;
    output("at 1s\nat 2s\n");
    const Act pointer{.at = 2500ms,
                      .x = static_cast<std::int16_t>(start_.pointer.x),
                      .y = static_cast<std::int16_t>(start_.pointer.y)};
    if (start_.pointer != Point{-1, -1})
        writeAct(pointer, output);
    if (start_.isRingShown)
        output("at 2500ms edit up\n");
}

void Recorder::writeAct(const Act& act, const Output& output) {
    Line line;
    line << "at " << act.at.count() << "us";
    if (act.isWake) {
        output((line << "\n").text());
        return;
    }
    line << " " << wordOf(act.kind);
    switch (act.kind) {
        case EventKind::MouseDown:
        case EventKind::MouseMove:
        case EventKind::MouseUp:
            line << " " << act.x << " " << act.y << (act.extends ? " shift" : "")
                 << (act.continuesClick ? " again" : "");
            break;
        case EventKind::KeyPress:
            line << " " << wordOfKey(act.code);
            break;
        case EventKind::Edit:
            line << " " << wordOf(static_cast<EditCommand>(act.code)) << (act.extends ? " shift" : "");
            break;
        case EventKind::Rescaled:
            line << " " << wordOf(Scale::ofQuarters(act.code));
            break;
        case EventKind::TextInput:
            line << " ";
            for (int i = 0; i < act.code; ++i)
                line << "x";
            break;
        default:
            break;
    }
    output((line << (act.isBelow ? " below\n" : "\n")).text());
}

}  // namespace quabble
