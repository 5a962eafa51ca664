// What the page's program has only for its tests: it plays a visit in the page. visits.mjs makes time pass,
// and hands over what the page shows.

#include "hosts/headless/visit_steps.hpp"
#include "hosts/web/running.hpp"

namespace quabble {
namespace {

// The page as it is: the program's windows are those of its front end, what they show comes from the page.
class PageMachine final : public VisitMachine {
 public:
    std::vector<ShownWindow> windows() const override {
        std::vector<ShownWindow> windows;
        for (const auto& [id, frame] : running->frontEnd.windows())
            windows.push_back(
                {id, frame.traits.clientSize, frame.traits.caption, frame.textArea.has_value()});
        if (!windows.empty())
            windows.back().caption = text;
        return windows;
    }
    const Surface& picture() const override { return shown; }
    void minimise(WindowId window) override { running->frontEnd.minimiseWindow(window); }
    void restore(WindowId window) override { running->frontEnd.setMinimised(window, false); }
    // The page becomes one with this scale, and with room enough.
    void rescale(Scale scale) override {
        running->frontEnd.resize({.size = {4000, 4000}, .ratio = scale.quarters() / 8.0});
    }

    Surface shown;
};

// A visit that is being played.
struct Playing {
    Visit visit;
    std::size_t next = 0;  // step
    PageMachine machine;
    VisitSteps steps{running->program, machine};
    std::string difference;

    const VisitStep& step() const { return visit.steps[next]; }
};
std::unique_ptr<Playing> playing;

}  // namespace

// False while the page does not have all pictures.
QUABBLE_EXPORT(canVisit) bool canVisit() {
    return !running->frontEnd.programFile("BGIMG.BIG").empty();
}
// The visit is the text that was handed over.
QUABBLE_EXPORT(beginVisit) void beginVisit() {
    auto read = parseVisit(text);
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
// Room for the picture that is shown, to be handed over as red, green, blue and 255 for each pixel.
QUABBLE_EXPORT(pictureBuffer) void* pictureBuffer(std::int32_t width, std::int32_t height) {
    playing->machine.shown = Surface(width, height);
    return playing->machine.shown.row(0).data();
}
// Does the next step. When something else is seen than it expects this is told, as a text that a zero ends.
QUABBLE_EXPORT(takeStep) const char* takeStep() {
    const VisitStep& step = playing->visit.steps[playing->next++];
    if (step.kind == VisitStep::Kind::Expect) {
        const bool isCompared = QUABBLE_COMPARES_PICTURES != 0 || step.what != expectations::picture;
        if (!isCompared || playing->steps.isAsExpected(step))
            return nullptr;
        const std::string line = "line " + std::to_string(step.line) + ": ";
        playing->difference = line + differenceOf(step, playing->steps.seen(step));
        return playing->difference.c_str();
    }
    playing->steps.act(step);
    running->program.wake();
    return nullptr;
}

}  // namespace quabble
