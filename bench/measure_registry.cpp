// How long it takes to keep settings and scores in the Windows registry, each time others than before.

#include <chrono>
#include <vector>

#include "../tests/support/kept.hpp"
#include "hosts/windows/registry/win32.hpp"
#include "hosts/windows/registry/windows_registry.hpp"
#include "report.hpp"

int main() {
    using Clock = std::chrono::steady_clock;
    quabble::WindowsRegistryStore registry(HKEY_CURRENT_USER, "Software\\Vorlane\\Quabble\\1.0");
    std::vector<double> times;
    for (std::int16_t i = 0; i < 200; ++i) {
        const auto start = Clock::now();
        if (quabble::saveNumber(registry, i) != quabble::StoreResult::Done)
            return EXIT_FAILURE;
        times.push_back(std::chrono::duration<double, std::milli>(Clock::now() - start).count());
    }
    quabble::bench::report("a save in the Windows registry | 5 ms", quabble::bench::median(times), 5, "ms",
                           {.times = 1});
    return EXIT_SUCCESS;
}
