#include "hosts/windows/window_procedure.hpp"

#include "hosts/windows/registry/win32.hpp"
#include "hosts/windows/win32_window.hpp"

namespace quabble {

// The system's way to a window: it keeps the address that the window was made with.
struct WindowProcedure {
    static LRESULT CALLBACK call(HWND handle, UINT message, WPARAM first, LPARAM second) {
        if (message == WM_NCCREATE) {
            const auto& creation = *reinterpret_cast<const CREATESTRUCTW*>(second);
            SetWindowLongPtrW(handle, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(creation.lpCreateParams));
        }
        auto* window = reinterpret_cast<Win32Window*>(GetWindowLongPtrW(handle, GWLP_USERDATA));
        if (window != nullptr && window->handle() == handle) {  // which it has not until it is made
            if (const auto result = window->answer(message, first, second))
                return *result;
        }
        return DefWindowProcW(handle, message, first, second);
    }
};

bool registerWindowClass() {
    WNDCLASSEXW kind{};
    kind.cbSize = sizeof kind;
    kind.lpfnWndProc = WindowProcedure::call;
    kind.hInstance = GetModuleHandleW(nullptr);
    kind.lpszClassName = windowClassName;
    return RegisterClassExW(&kind) != 0;
}

}  // namespace quabble
