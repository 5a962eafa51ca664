// What the page's program has only for its tests: it reads the page's pictures, and plays visits in the page.
// Their scripts make time pass and hand over what the canvas shows.

#include <memory>
#include <string>

#include "hosts/headless/visit_steps.hpp"
#include "hosts/web/running.hpp"

namespace quabble {
namespace {

// The page as it is: the program's windows are those of its front end, what they show comes from the page.
class PageMachine final : public VisitMachine {
 public:
    std::vector<ShownWindow> windows() const override {
        std::vector<ShownWindow> windows;
        for (const auto& [id, frame] : runningNow().frontEnd.windows())
            windows.push_back(
                {id, frame.traits.clientSize, frame.traits.caption, frame.textArea.has_value()});
        if (!windows.empty())
            windows.back().caption = textHandedOver();
        return windows;
    }
    const Surface& picture() const override { return shown; }
    void minimise(WindowId window) override { runningNow().frontEnd.minimiseWindow(window); }
    void restore(WindowId window) override { runningNow().frontEnd.setMinimised(window, false); }
    // The page becomes one with this scale, and with room enough.
    void rescale(Scale scale) override {
        runningNow().frontEnd.resize({.size = {4000, 4000}, .ratio = scale.quarters() / 8.0});
    }

    Surface shown;
};

PageMachine machine;
std::string told;

// A visit that is being played.
struct Playing {
    Visit visit;
    std::size_t next = 0;  // step
    VisitSteps steps{runningNow().program, machine};

    const VisitStep& step() const { return visit.steps[next]; }
};
std::unique_ptr<Playing> playing;

}  // namespace

// Room for the picture that is shown, to be handed over as red, green, blue and 255 for each pixel.
QUABBLE_EXPORT(pictureBuffer) void* pictureBuffer(std::int32_t width, std::int32_t height) {
    machine.shown = Surface(width, height);
    return machine.shown.row(0).data();
}
// That picture in the words of a visit, as a text that a zero ends.
QUABBLE_EXPORT(seenPicture) const char* seenPicture() {
    told = VisitSteps(runningNow().program, machine).seen({.what = std::string(expectations::picture)});
    return told.c_str();
}

// False while the page does not have all pictures.
QUABBLE_EXPORT(canVisit) bool canVisit() {
    return !runningNow().frontEnd.programFile("BGIMG.BIG").empty();
}
// The visit is the text that was handed over.
QUABBLE_EXPORT(beginVisit) void beginVisit() {
    auto read = parseVisit(textHandedOver());
    playing = std::make_unique<Playing>(std::get<Visit>(std::move(read)));
    playing->steps.begin(playing->visit);
}
QUABBLE_EXPORT(areWakesWritten) bool areWakesWritten() {
    return playing->visit.areWakesWritten;
}

// Of the next step, in milliseconds since the start; negative when there is none.
QUABBLE_EXPORT(timeOfStep) double timeOfStep() {
    const bool isOver = playing->next == playing->visit.steps.size();
    return isOver ? -1 : std::chrono::duration<double, std::milli>(playing->step().at).count();
}
// What it needs of the page.
enum class Need { Nothing, Caption, Picture, Restoring };
QUABBLE_EXPORT(needOfStep) Need needOfStep() {
    const VisitStep& step = playing->step();
    if (step.kind == VisitStep::Kind::Expect && step.what == expectations::picture)
        return Need::Picture;
    if (step.kind == VisitStep::Kind::Expect)
        return Need::Caption;
    const bool restores = step.kind == VisitStep::Kind::Event && step.event.kind == EventKind::Restored;
    return restores ? Need::Restoring : Need::Nothing;
}
// Does the next step. When something else is seen than it expects this is told in the same way.
QUABBLE_EXPORT(takeStep) const char* takeStep() {
    const VisitStep& step = playing->visit.steps[playing->next++];
    if (step.kind == VisitStep::Kind::Expect) {
        const bool isCompared = QUABBLE_COMPARES_PICTURES != 0 || step.what != expectations::picture;
        if (!isCompared || playing->steps.isAsExpected(step))
            return nullptr;
        const std::string line = "line " + std::to_string(step.line) + ": ";
        told = line + differenceOf(step, playing->steps.seen(step));
        return told.c_str();
    }
    playing->steps.act(step);
    runningNow().program.wake();
    return nullptr;
}

}  // namespace quabble
