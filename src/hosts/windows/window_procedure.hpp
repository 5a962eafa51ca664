#pragma once

namespace quabble {

// The class of all our windows, and its making, which is to be done once; false when the system refuses.
constexpr const wchar_t* windowClassName = L"Quabble";
bool registerWindowClass();

}  // namespace quabble
