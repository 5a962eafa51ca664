#pragma once

#include <cstdint>
#include <memory>
#include <optional>

#include "app/app_state.hpp"
#include "app/main_window.hpp"
#include "base/task.hpp"
#include "platform/message_loop.hpp"
#include "registry/registry_store.hpp"
#include "visits/recorder.hpp"

namespace quabble {

// The program from its start to its end: what a host drives. The host makes one, starts it, and then, until
// it has ended, posts what happens, and wakes it after that and at the next deadline. All on one thread.
// It may be destroyed in any state, but not from inside its own calls; its windows close.
class Program {
 public:
    // The front end and the registry must outlive the program. The seed decides every board.
    Program(FrontEnd& frontEnd, RegistryStore& registry, std::uint64_t seed);

    // Runs the program up to its first wait. To be called once, before anything else.
    void start();

    // Something happened to a window. Nothing comes of it before the program is woken, so that this may be
    // called at any time, also from inside a call of the front end.
    void post(const InputEvent& event);

    // The program goes on until it has to wait again. Without an event and before the next deadline it does
    // nothing, and neither does it inside a call of the front end.
    void wake();

    // When to wake it at the latest, if nothing happens before; it may lie in the past. Nothing when it waits
    // for the user alone.
    std::optional<TimePoint> nextDeadline() const { return loop_.nextDeadline(); }

    // The window that takes all input, while the others take none; without one they all do.
    std::optional<WindowId> modalWindow() const;

    // The window that was opened last; null when none is there.
    const Window* topmostWindow() const;
    // How many pictures windows have shown up to now.
    std::uint64_t picturesShown() const { return loop_.picturesShown(); }

    // Saves what should last; nothing is shown and the program goes on. False when it could not be kept. For
    // machines that may stop the program without a word.
    bool keep();

    // The machine asks the program to end: it saves and has ended, whatever it was waiting for. Nothing is
    // shown. False when what should last could not be kept. It may be called from inside a call of the front
    // end, too.
    bool requestEnd();

    // From then on the program does nothing. The user ends it by closing the main window.
    bool ended() const { return loop_.ended(); }

    // Writes a visit (docs/visits.md) that does again what was done since the last game began or, before the
    // first, since the start. It asks for no memory, and a line at a time is given to the output. Typed texts
    // are not in it.
    void writeVisit(const Recorder::Output& output) const;

    // What tests, benchmarks and screenshots look at. The main window is there once the splash has closed.
    AppState& state() { return state_; }
    MainWindow& frmQuabble() { return *frmQuabble_; }

 private:
    Task<> run();
    Task<> Main();
    void beginRecord(bool isAtMenu);
    void record(const InputEvent& event);

    FrontEnd& frontEnd_;
    std::uint64_t seed_;
    MessageLoop loop_;
    Recorder recorder_;
    AppState state_;
    std::unique_ptr<MainWindow> frmQuabble_;
    Task<> task_;
};

}  // namespace quabble
