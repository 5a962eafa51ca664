// How long it takes to keep settings and scores in the Windows registry, each time others than before.

#include <chrono>
#include <vector>

#include "../tests/support/kept.hpp"
#include "hosts/windows/registry/win32.hpp"
#include "hosts/windows/registry/windows_registry.hpp"
#include "report.hpp"

int main() {
    using Clock = std::chrono::steady_clock;
    const wchar_t* place = L"Software\\Quabble bench";  // so that the user's own stay as they are
    HKEY root = nullptr;
    HKEY first = nullptr;
    RegCreateKeyExW(HKEY_CURRENT_USER, place, 0, nullptr, 0, KEY_ALL_ACCESS, nullptr, &root, nullptr);
    RegCreateKeyExW(root, L"Software", 0, nullptr, 0, KEY_ALL_ACCESS, nullptr, &first, nullptr);
    RegCloseKey(first);
    quabble::WindowsRegistryStore registry(root, "Software\\Vorlane\\Quabble\\1.0");
    std::vector<double> times;
    for (std::int16_t i = 0; i < 200; ++i) {
        const auto start = Clock::now();
        if (quabble::saveNumber(registry, i) != quabble::StoreResult::Done)
            return EXIT_FAILURE;
        times.push_back(std::chrono::duration<double, std::milli>(Clock::now() - start).count());
    }
    RegCloseKey(root);
    RegDeleteTreeW(HKEY_CURRENT_USER, place);
    quabble::bench::report("a save in the Windows registry | 5 ms", quabble::bench::median(times), 5, "ms",
                           {.times = 1});
    return EXIT_SUCCESS;
}
