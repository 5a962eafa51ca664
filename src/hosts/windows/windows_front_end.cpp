#include "hosts/windows/windows_front_end.hpp"

#include <algorithm>
#include <cstdlib>
#include <utility>

#include "hosts/windows/clipboard.hpp"
#include "hosts/windows/documents.hpp"
#include "hosts/windows/program_folder.hpp"
#include "hosts/windows/registry/win32.hpp"
#include "hosts/windows/wide_text.hpp"

namespace quabble {

void WindowsFrontEnd::run(Program& program, const VisitFile& record) {
    program_ = &program;
    program.start();
    while (!program.ended()) {
        leaving_.reset();
        waitForMessages();
        program.wake();
        if (std::exchange(isRecordWanted_, false))
            saveRecord(record);
    }
    program_ = nullptr;
}

// Sleeps until something has happened or the program's wait is over, then lets the windows report it. The
// program is woken only when that is done: what it is told of, it is told of from inside calls of the
// system's. Some of those, as for a menu of the frame, come back only when the user is done with it, and the
// program's time stands still meanwhile.
void WindowsFrontEnd::waitForMessages() {
    for (const WindowId window : std::exchange(unopened_, {}))
        program_->post({.window = window, .kind = EventKind::CloseButton});
    const auto deadline = program_->nextDeadline();
    messageWait_.sleep(deadline ? std::optional(std::max(*deadline - now(), Clock::duration::zero()))
                                : std::nullopt);
    MSG message{};
    while (PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE) != 0) {
        TranslateMessage(&message);
        DispatchMessageW(&message);
    }
}

// The user is shown the folder, to send the file to whom he likes.
void WindowsFrontEnd::saveRecord(const VisitFile& record) const {
    if (record.write())
        openByShell(record.folder());
    else if (!windows_.empty())
        MessageBoxW(windows_.begin()->second->handle(), L"The record could not be written.", L"Quabble",
                    MB_OK | MB_ICONWARNING);
}

void WindowsFrontEnd::report(const InputEvent& event) {
    if (program_ == nullptr)
        return;
    InputEvent reported = event;
    reported.continuesClick = event.kind == EventKind::MouseDown && continuesClick();
    program_->post(reported);
}

// Whether a press follows another as in a double click, be it in another window.
bool WindowsFrontEnd::continuesClick() {
    const DWORD at = GetMessagePos();
    const Press press{GetMessageTime(), {static_cast<short>(LOWORD(at)), static_cast<short>(HIWORD(at))}};
    const auto before = std::exchange(latestPress_, press);
    return before && press.time - before->time <= static_cast<long>(GetDoubleClickTime()) &&
           std::abs(press.place.x - before->place.x) <= GetSystemMetrics(SM_CXDOUBLECLK) / 2 &&
           std::abs(press.place.y - before->place.y) <= GetSystemMetrics(SM_CYDOUBLECLK) / 2;
}

// An owner comes before its dialogs.
void WindowsFrontEnd::screensHaveChanged() {
    for (const auto& [id, window] : windows_) {
        if (window->followScale())
            report({.window = id, .kind = EventKind::Rescaled, .scale = window->scale()});
    }
}

void WindowsFrontEnd::sessionEnds() {
    if (program_ != nullptr && !program_->requestEnd())
        OutputDebugStringW(L"Quabble could not save its settings and high scores.\n");
}

Scale WindowsFrontEnd::createWindow(WindowId window, const NativeWindow& traits) {
    WindowListener& listener = *this;
    auto made = std::make_unique<Win32Window>(window, traits, find(traits.owner), listener);
    if (made->handle() == nullptr) {
        unopened_.push_back(window);
        return {};
    }
    const Scale scale = made->scale();
    windows_[window] = std::move(made);
    return scale;
}

void WindowsFrontEnd::showPixels(WindowId window, const Surface& picture) {
    if (Win32Window* shown = find(window))
        shown->show(picture);
}

// Between its windows the program would not be the one that the user works with, and the next window would
// come up behind those of others: the last window leaves when the next one is there.
void WindowsFrontEnd::closeWindow(WindowId window) {
    auto closed = windows_.extract(window);
    if (!closed.empty() && !closed.mapped()->isDialog())
        leaving_ = std::move(closed.mapped());
}

void WindowsFrontEnd::minimiseWindow(WindowId window) {
    if (const Win32Window* shown = find(window))
        shown->minimise();
}

void WindowsFrontEnd::setPointer(WindowId window, PointerShape shape) {
    if (Win32Window* shown = find(window))
        shown->setPointer(shape);
}

void WindowsFrontEnd::setTextInput(WindowId window, std::optional<Rect> area) {
    if (Win32Window* shown = find(window))
        shown->setTextInput(area);
}

Size WindowsFrontEnd::screenSize() {
    return {GetSystemMetrics(SM_CXSCREEN), GetSystemMetrics(SM_CYSCREEN)};
}

FileBytes WindowsFrontEnd::programFile(std::string_view name) {
    return readProgramFile(name);
}

void WindowsFrontEnd::openDocument(std::string_view document) {
    const bool isAddress = document.find("://") != std::string_view::npos;
    const std::wstring target = isAddress ? wideOf(document) : programPath(document);
    openByShell(target);
}

std::string WindowsFrontEnd::clipboardText() {
    return windows_.empty() ? std::string() : clipboardTextFor(windows_.begin()->second->handle());
}

void WindowsFrontEnd::setClipboardText(const std::string& text) {
    if (!windows_.empty())
        putOnClipboard(windows_.begin()->second->handle(), text);
}

Win32Window* WindowsFrontEnd::find(WindowId window) {
    const auto found = windows_.find(window);
    return found == windows_.end() ? nullptr : found->second.get();
}

}  // namespace quabble
