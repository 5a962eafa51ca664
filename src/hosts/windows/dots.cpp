#include "hosts/windows/dots.hpp"

#include "hosts/windows/registry/win32.hpp"

namespace quabble {
namespace {

// A function that only newer systems have; null on the others.
template <typename Function>
Function* newerFunction(const char* name) {
    return reinterpret_cast<Function*>(
        reinterpret_cast<void*>(GetProcAddress(GetModuleHandleW(L"user32"), name)));
}

}  // namespace

unsigned dotsPerInchOf(HWND window) {
    static const auto ofWindow = newerFunction<decltype(GetDpiForWindow)>("GetDpiForWindow");
    if (ofWindow != nullptr)
        return ofWindow(window);
    const HDC screen = GetDC(nullptr);
    const int dots = GetDeviceCaps(screen, LOGPIXELSX);
    ReleaseDC(nullptr, screen);
    return static_cast<unsigned>(dots);
}

Size outerSizeAround(Size client, HWND window, unsigned dotsPerInch) {
    static const auto atDots = newerFunction<decltype(AdjustWindowRectExForDpi)>("AdjustWindowRectExForDpi");
    const auto style = static_cast<DWORD>(GetWindowLongPtrW(window, GWL_STYLE));
    const auto moreStyle = static_cast<DWORD>(GetWindowLongPtrW(window, GWL_EXSTYLE));
    RECT outer{0, 0, client.width, client.height};
    if (atDots != nullptr)
        atDots(&outer, style, FALSE, moreStyle, dotsPerInch);
    else
        AdjustWindowRectEx(&outer, style, FALSE, moreStyle);
    return {outer.right - outer.left, outer.bottom - outer.top};
}

Rect workAreaOf(HWND window) {
    MONITORINFO monitor{};
    monitor.cbSize = sizeof monitor;
    GetMonitorInfoW(MonitorFromWindow(window, MONITOR_DEFAULTTONEAREST), &monitor);
    const RECT& area = monitor.rcWork;
    return {area.left, area.top, area.right, area.bottom};
}

}  // namespace quabble
