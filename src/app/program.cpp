#include "app/program.hpp"

#include <filesystem>

#include "app/splash.hpp"

namespace quabble {
namespace {

constexpr char folderSeparator = static_cast<char>(std::filesystem::path::preferred_separator);

std::string withSeparator(std::string folder) {
    if (folder.empty() || folder.back() != folderSeparator)
        folder += folderSeparator;
    return folder;
}

Task<> Main(AppState& app) {
    app.programFolder = withSeparator(app.loop.frontEnd().executableFolder());
    if (app.load() == StoreResult::NotOpened)
        co_await app.tellStoreError(nullptr);
    app.pictures = loadGraphics(app.programFolder);
    Splash splash(app);
    co_await app.loop.showModal(splash);
    app.pictures.backdrop = {};  // only the splash shows it
    app.settings.solvingData.setSplashSeen();
    app.frmQuabble().show();
    app.frmQuabble().showMainMenu();
}

}  // namespace

Task<> runProgram(AppState& app) {
    co_await Main(app);
    co_await app.loop.run();
}

}  // namespace quabble
