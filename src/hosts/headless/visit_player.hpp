#pragma once

#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "app/program.hpp"
#include "hosts/headless/headless_front_end.hpp"
#include "hosts/headless/memory_blob.hpp"
#include "hosts/headless/scripted_user.hpp"
#include "hosts/headless/visit_steps.hpp"
#include "visits/visit.hpp"

namespace quabble {

// Does what a visit tells, on a machine without a screen, as fast as it can.
class VisitPlayer {
 public:
    // Pictures are made at the visit's scale or, with one given, at that one from the start.
    VisitPlayer(const Visit& visit, HeadlessFrontEnd::Files files, std::optional<Scale> scale = std::nullopt);

    // Lets time pass up to the step and does what it says; an expectation is only looked at by `seen`.
    void play(const VisitStep& step);

    std::string seen(const VisitStep& expectation) const { return steps_.seen(expectation); }
    bool isAsExpected(const VisitStep& expectation) const { return steps_.isAsExpected(expectation); }

    // Of the topmost window, as it is shown; without pixels when there is none.
    const Surface& picture() const { return machine_.picture(); }

 private:
    struct ScreenlessMachine final : VisitMachine {
        HeadlessFrontEnd frontEnd;

        explicit ScreenlessMachine(HeadlessFrontEnd::Files files) : frontEnd(std::move(files)) {}
        std::vector<ShownWindow> windows() const override;
        const Surface& picture() const override;
        void minimise(WindowId window) override { frontEnd.minimiseWindow(window); }
        void restore(WindowId window) override { frontEnd.restoreWindow(window); }
        void rescale(Scale scale) override { frontEnd.rescale(scale); }
    };

    bool areWakesWritten_;
    ScreenlessMachine machine_;
    MemoryBlob kept_;
    BlobRegistryStore registry_{kept_};
    Program program_;
    ScriptedUser<Program> user_{machine_.frontEnd, program_};
    VisitSteps steps_{program_, machine_};
    TimePoint start_;
};

}  // namespace quabble
