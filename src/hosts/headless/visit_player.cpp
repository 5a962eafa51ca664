#include "hosts/headless/visit_player.hpp"

#include <utility>

namespace quabble {

std::vector<VisitMachine::ShownWindow> VisitPlayer::ScreenlessMachine::windows() const {
    std::vector<ShownWindow> windows;
    for (const auto& [id, shown] : frontEnd.windows())
        windows.push_back({id, shown.traits.clientSize, shown.traits.caption, shown.takesText});
    return windows;
}

const Surface& VisitPlayer::ScreenlessMachine::picture() const {
    static const Surface none;
    return frontEnd.windows().empty() ? none : frontEnd.windows().rbegin()->second.picture;
}

VisitPlayer::VisitPlayer(const Visit& visit, HeadlessFrontEnd::Files files, std::optional<Scale> scale)
    : areWakesWritten_(visit.areWakesWritten),
      machine_(std::move(files)),
      kept_(std::vector<std::byte>(visit.isStoreDamaged ? 1 : 0)),
      program_(machine_.frontEnd, registry_, visit.seed),
      start_(machine_.frontEnd.now()) {
    machine_.frontEnd.scale = scale.value_or(visit.scale);
    program_.start();
    steps_.begin(visit);
}

void VisitPlayer::play(const VisitStep& step) {
    if (step.kind == VisitStep::Kind::Expect)
        return;
    HeadlessFrontEnd& frontEnd = machine_.frontEnd;
    if (areWakesWritten_)
        frontEnd.advanceTo(start_ + step.at);
    else
        user_.wait(start_ + step.at - frontEnd.now());
    steps_.act(step);
    program_.wake();
}

}  // namespace quabble
