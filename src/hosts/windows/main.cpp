#include <chrono>
#include <cstdlib>

#include "app/program.hpp"
#include "hosts/windows/registry/win32.hpp"
#include "hosts/windows/registry/windows_registry.hpp"
#include "hosts/windows/visit_file.hpp"
#include "hosts/windows/window_procedure.hpp"
#include "hosts/windows/windows_front_end.hpp"

int WINAPI wWinMain(HINSTANCE, HINSTANCE, LPWSTR, int) {
    if (!quabble::registerWindowClass())
        return EXIT_FAILURE;
    const auto clock = std::chrono::system_clock::now().time_since_epoch().count();
    quabble::WindowsFrontEnd frontEnd;
    quabble::WindowsRegistryStore registry(HKEY_CURRENT_USER, "Software\\Vorlane\\Quabble\\1.0");
    quabble::Program program(frontEnd, registry, static_cast<std::uint64_t>(clock));
    const quabble::VisitFile record(program);
    frontEnd.run(program, record);
    return EXIT_SUCCESS;
}
