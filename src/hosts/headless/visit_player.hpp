#pragma once

#include <optional>
#include <string>

#include "app/program.hpp"
#include "hosts/headless/headless_front_end.hpp"
#include "hosts/headless/memory_blob.hpp"
#include "hosts/headless/scripted_user.hpp"
#include "visits/visit.hpp"

namespace quabble {

// Does what a visit tells, on a machine without a screen, as fast as it can.
class VisitPlayer {
 public:
    // The visit must outlive the player. Pictures are made at the visit's scale or, with one given, at that
    // one from the start.
    VisitPlayer(const Visit& visit, HeadlessFrontEnd::Files files, std::optional<Scale> scale = std::nullopt);

    // Lets time pass up to the step and does what it says; an expectation is only looked at by `seen`.
    void play(const VisitStep& step);

    // What is to be seen of the thing that an expectation is about, written as in a visit; nothing when the
    // program has ended or there is no such thing.
    std::string seen(const VisitStep& expectation);
    // Whether that is as expected. A picture at a scale that the expectation does not name is.
    bool isAsExpected(const VisitStep& expectation);

    // Of the topmost window, as it is shown; without pixels when there is none.
    const Surface& picture() const;

 private:
    void advanceTo(microseconds time);
    void act(const VisitStep& step);
    void give(const VisitStep& step);

    const Visit& visit_;
    HeadlessFrontEnd frontEnd_;
    MemoryBlob kept_;
    BlobRegistryStore registry_{kept_};
    Program program_;
    ScriptedUser<Program> user_{frontEnd_, program_};
    TimePoint start_;
};

// The first expectation of a visit that is not met, and what is seen instead.
struct VisitDifference {
    VisitStep step;
    std::string seen;
};
std::optional<VisitDifference> playVisit(const Visit& visit, const HeadlessFrontEnd::Files& files,
                                         std::optional<Scale> scale = std::nullopt);

}  // namespace quabble
