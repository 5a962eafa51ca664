// The least that a program with a window can be: bare_window WIDTH HEIGHT. It shows one solid picture,
// another one after a click, and ends when it is asked to.

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
    SDL_Event event{};
    while (event.type != SDL_QUIT && SDL_WaitEvent(&event) != 0) {
        const bool clicked = event.type == SDL_MOUSEBUTTONDOWN;
        if (clicked)
            SDL_FillRect(screen, nullptr, colour ^= 0xFFFF);
        if (clicked || (event.type == SDL_WINDOWEVENT && event.window.event == SDL_WINDOWEVENT_EXPOSED))
            SDL_UpdateWindowSurface(window);
    }
    SDL_DestroyWindow(window);
    SDL_Quit();
    return EXIT_SUCCESS;
}
