// The least that a program with a window can be: bare_window WIDTH HEIGHT [MILLISECONDS]. It shows one solid
// picture, another one after a click and, with a period, the same one again at every tick of it. It ends when
// it is asked to.

#include <SDL2/SDL.h>

#include <cstdlib>

int main(int argc, char** argv) {
    if (argc < 3)
        return EXIT_FAILURE;
    SDL_SetHint(SDL_HINT_FRAMEBUFFER_ACCELERATION, "0");
    if (SDL_Init(SDL_INIT_VIDEO) != 0)
        return EXIT_FAILURE;
    SDL_Window* window = SDL_CreateWindow("Bare window", SDL_WINDOWPOS_CENTERED, SDL_WINDOWPOS_CENTERED,
                                          std::atoi(argv[1]), std::atoi(argv[2]), SDL_WINDOW_BORDERLESS);
    SDL_Surface* screen = SDL_GetWindowSurface(window);
    if (screen == nullptr)
        return EXIT_FAILURE;
    Uint32 colour = SDL_MapRGB(screen->format, 62, 105, 214);
    SDL_FillRect(screen, nullptr, colour);
    SDL_UpdateWindowSurface(window);
    const int period = argc > 3 ? std::atoi(argv[3]) : -1;
    for (SDL_Event event{}; event.type != SDL_QUIT;) {
        const bool happened = SDL_WaitEventTimeout(&event, period) != 0;
        const bool uncovered = event.type == SDL_WINDOWEVENT && event.window.event == SDL_WINDOWEVENT_EXPOSED;
        const bool clicked = happened && event.type == SDL_MOUSEBUTTONDOWN;
        if (clicked)
            SDL_FillRect(screen, nullptr, colour ^= 0xFFFF);
        if (!happened || uncovered || clicked)
            SDL_UpdateWindowSurface(window);
    }
    SDL_DestroyWindow(window);
    SDL_Quit();
    return EXIT_SUCCESS;
}
