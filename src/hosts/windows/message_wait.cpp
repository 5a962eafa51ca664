#include "hosts/windows/message_wait.hpp"

#include <ratio>

#include "hosts/windows/registry/win32.hpp"

namespace quabble {

MessageWait::MessageWait() {
    constexpr DWORD highResolution = 2;  // CREATE_WAITABLE_TIMER_HIGH_RESOLUTION, which not all headers know
    timer_ = CreateWaitableTimerExW(nullptr, nullptr, highResolution, TIMER_ALL_ACCESS);
    if (timer_ == nullptr)
        timer_ = CreateWaitableTimerW(nullptr, FALSE, nullptr);
}

MessageWait::~MessageWait() {
    CloseHandle(timer_);
}

void MessageWait::sleep(std::optional<Clock::duration> longest) const {
    if (longest) {
        using SystemTicks = std::chrono::duration<LONGLONG, std::ratio<1, 10'000'000>>;
        LARGE_INTEGER due{};
        due.QuadPart = -std::chrono::ceil<SystemTicks>(*longest).count();  // from now on, when negative
        SetWaitableTimer(timer_, &due, 0, nullptr, nullptr, FALSE);
    }
    MsgWaitForMultipleObjectsEx(longest ? 1 : 0, &timer_, INFINITE, QS_ALLINPUT, MWMO_INPUTAVAILABLE);
}

}  // namespace quabble
