// What the program asks of Windows, measured against limits: how long settings and scores take to be kept,
// each time others than before, and how late a tick comes.

#include <chrono>
#include <vector>

#include "../tests/support/kept.hpp"
#include "hosts/windows/message_wait.hpp"
#include "hosts/windows/registry/win32.hpp"
#include "hosts/windows/registry/windows_registry.hpp"
#include "report.hpp"

namespace quabble::bench {
namespace {

using Milliseconds = std::chrono::duration<double, std::milli>;

bool measureRegistry() {
    const wchar_t* place = L"Software\\Quabble bench";  // so that the user's own stay as they are
    HKEY root = nullptr;
    HKEY first = nullptr;
    RegCreateKeyExW(HKEY_CURRENT_USER, place, 0, nullptr, 0, KEY_ALL_ACCESS, nullptr, &root, nullptr);
    RegCreateKeyExW(root, L"Software", 0, nullptr, 0, KEY_ALL_ACCESS, nullptr, &first, nullptr);
    RegCloseKey(first);
    WindowsRegistryStore registry(root, "Software\\Vorlane\\Quabble\\1.0");
    std::vector<double> times;
    for (std::int16_t i = 0; i < 200; ++i) {
        const auto start = Clock::now();
        if (saveNumber(registry, i) != StoreResult::Done)
            return false;
        times.push_back(Milliseconds(Clock::now() - start).count());
    }
    RegCloseKey(root);
    RegDeleteTreeW(HKEY_CURRENT_USER, place);
    report("a save in the Windows registry | 5 ms", median(times), 5, "ms", {.times = 1});
    return true;
}

// How late a wait for a tick is over.
template <typename Sleep>
double lateness(Sleep sleep) {
    using namespace std::chrono_literals;
    const TimePoint due = Clock::now() + 20ms;
    while (Clock::now() < due)
        sleep(due - Clock::now());
    return Milliseconds(Clock::now() - due).count();
}

// By turns, so that what else the machine does disturbs both alike.
void measureTicks() {
    const MessageWait wait;
    const HANDLE timer = CreateWaitableTimerW(nullptr, FALSE, nullptr);
    std::vector<double> ours, ofHost;
    for (int tick = 0; tick < 200; ++tick) {
        ours.push_back(lateness([&](Clock::duration duration) { wait.sleep(duration); }));
        ofHost.push_back(lateness([&](Clock::duration duration) {
            LARGE_INTEGER due{};
            due.QuadPart = -std::chrono::nanoseconds(duration).count() / 100 - 1;
            SetWaitableTimer(timer, &due, 0, nullptr, nullptr, FALSE);
            WaitForSingleObject(timer, INFINITE);
        }));
    }
    CloseHandle(timer);
    constexpr double worst = 0.99;
    report("lateness of 200 ticks, 99th percentile | a waitable timer", quantile(ours, worst),
           quantile(ofHost, worst), "ms", {.more = 2});
}

}  // namespace
}  // namespace quabble::bench

int main() {
    quabble::bench::measureTicks();
    return quabble::bench::measureRegistry() ? EXIT_SUCCESS : EXIT_FAILURE;
}
