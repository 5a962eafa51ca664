#pragma once

#include <string>
#include <vector>

#include "app/program.hpp"
#include "visits/visit.hpp"

namespace quabble {

// The machine that a visit is played on: what a visit does to it and not to the program, and what it shows.
class VisitMachine {
 public:
    struct ShownWindow {
        WindowId id;
        Size clientSize;
        std::string caption;
        bool takesText = false;
    };

    virtual ~VisitMachine() = default;

    virtual std::vector<ShownWindow> windows() const = 0;  // the topmost last
    virtual const Surface& picture() const = 0;            // the topmost window's, as it is shown
    virtual void minimise(WindowId window) = 0;
    virtual void restore(WindowId window) = 0;
    virtual void rescale(Scale scale) = 0;
};

// Does what a visit tells to a program on any machine, and says what is then to be seen. Time passes outside
// of it.
class VisitSteps {
 public:
    VisitSteps(Program& program, VisitMachine& machine) : program_(program), machine_(machine) {}

    // What the visit says of the start. The program has just started.
    void begin(const Visit& visit);

    // Does what the step says; the program is to be woken then. An expectation does nothing.
    void act(const VisitStep& step);

    // What is to be seen of the thing that an expectation is about, written as in a visit; nothing when the
    // program has ended or there is no such thing.
    std::string seen(const VisitStep& expectation) const;
    // Whether that is as expected. A picture at a scale that the expectation does not name is.
    bool isAsExpected(const VisitStep& expectation) const;

 private:
    void happen(const VisitStep& step);
    void give(const VisitStep& step);

    Program& program_;
    VisitMachine& machine_;
};

// What to tell of an expectation when something else is seen.
std::string differenceOf(const VisitStep& expectation, const std::string& seen);

}  // namespace quabble
