#include <malloc.h>

#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <string>

#include "app/program.hpp"
#include "hosts/desktop/registry/registry_file.hpp"
#include "hosts/desktop/registry/sqlite_registry.hpp"
#include "hosts/desktop/sdl_front_end.hpp"

int main() {
    constexpr int largeBlock = 256 * 1024;  // bytes
    mallopt(M_MMAP_THRESHOLD, largeBlock);  // pictures that go leave their memory to the system
    std::signal(SIGXFSZ, SIG_IGN);          // a file that may not grow is a write that fails
    std::string problem;
    const auto frontEnd = quabble::SdlFrontEnd::open(problem);
    if (!frontEnd) {
        std::fprintf(stderr, "Quabble needs a graphical display to open its window on (%s).\n",
                     problem.c_str());
        return EXIT_FAILURE;
    }
    const auto clock = std::chrono::system_clock::now().time_since_epoch().count();
    const std::string registryPath = quabble::userRegistryPath("quabble");
    quabble::SqliteRegistryStore registry(registryPath);
    quabble::Program program(*frontEnd, registry, static_cast<std::uint64_t>(clock));
    const std::string folder = registryPath.substr(0, registryPath.find_last_of('/'));
    const quabble::VisitFile record(program, folder + "/last_game.visit");
    frontEnd->run(program, record);
    return EXIT_SUCCESS;
}
