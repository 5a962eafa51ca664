#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <string>

#include "app/program.hpp"
#include "hosts/desktop/sdl_front_end.hpp"

int main() {
    std::signal(SIGXFSZ, SIG_IGN);  // a file that may not grow is a write that fails
    std::string problem;
    const auto frontEnd = quabble::SdlFrontEnd::open(problem);
    if (!frontEnd) {
        std::fprintf(stderr, "Quabble needs a graphical display to open its window on (%s).\n",
                     problem.c_str());
        return EXIT_FAILURE;
    }
    const auto clock = std::chrono::system_clock::now().time_since_epoch().count();
    quabble::MessageLoop loop(*frontEnd);
    quabble::Registry registry(quabble::userRegistryPath("quabble"));
    quabble::AppState app(loop, registry, static_cast<std::uint64_t>(clock));
    quabble::Task<> program = quabble::runProgram(app);
    program.start();
    frontEnd->run(loop);
    return EXIT_SUCCESS;
}
