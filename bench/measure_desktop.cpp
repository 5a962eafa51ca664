// What the program costs seen from outside, against a bare window: measure_desktop PROGRAM BARE_WINDOW. It
// needs a desktop that nobody else uses. With the word wine before them they are programs for Windows, and
// only their start is measured.

#include <X11/Xlib.h>
#include <X11/Xutil.h>
#include <X11/extensions/XTest.h>
#include <X11/keysym.h>
#include <signal.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <filesystem>
#include <fstream>
#include <functional>
#include <set>
#include <sstream>
#include <string>
#include <thread>
#include <vector>

#include "../tests/support/files.hpp"
#include "desktop.hpp"
#include "gfx/sprites.hpp"
#include "report.hpp"

namespace quabble::bench {
namespace {

using namespace std::chrono_literals;
using Clock = std::chrono::steady_clock;
using Milliseconds = std::chrono::duration<double, std::milli>;

constexpr const char* mainCaption = "Quabble  Ver 1.0";
constexpr const char* bareCaption = "Bare window";
constexpr auto period = 10s;
constexpr int clicks = 15;
constexpr int starts = 25;
constexpr Point boardAt{232, 37};  // in a Training game

// A program being run, with the kernel's notes about it.
class Process {
 public:
    explicit Process(const std::vector<std::string>& command) {
        std::vector<char*> arguments;
        for (const std::string& argument : command)
            arguments.push_back(const_cast<char*>(argument.c_str()));
        arguments.push_back(nullptr);
        pid_ = vfork();
        if (pid_ == 0) {
            execvp(arguments[0], arguments.data());
            _exit(127);
        }
    }
    ~Process() {
        kill(pid_, SIGTERM);
        waitpid(pid_, nullptr, 0);
    }
    Process(const Process&) = delete;
    Process& operator=(const Process&) = delete;

    // Kibibytes of memory, what is shared with other processes counted in proportion.
    double proportionalSetSize() const { return field(folder() + "smaps_rollup", "Pss:"); }

    std::size_t sharedLibraries() const {
        std::set<std::string> files;
        std::ifstream maps(folder() + "maps");
        for (std::string line; std::getline(maps, line);) {
            const std::size_t path = line.find('/');
            if (path != std::string::npos && line.find(".so", path) != std::string::npos)
                files.insert(line.substr(path));
        }
        return files.size();
    }

    // How often the process went to sleep by itself, and its processor time in milliseconds.
    struct Activity {
        double sleeps = 0;
        double processorTime = 0;
    };
    Activity during(Clock::duration time) const {
        const Activity before = soFar();
        std::this_thread::sleep_for(time);
        const Activity after = soFar();
        return {after.sleeps - before.sleeps, after.processorTime - before.processorTime};
    }

 private:
    std::string folder() const { return "/proc/" + std::to_string(pid_) + "/"; }

    static double field(const std::filesystem::path& file, const std::string& name) {
        std::ifstream stream(file);
        for (std::string word; stream >> word;) {
            double value = 0;
            if (word == name && stream >> value)
                return value;
        }
        require(false, name + " in " + file.string());
        return 0;
    }

    Activity soFar() const {
        Activity sum;
        for (const auto& thread : std::filesystem::directory_iterator(folder() + "task")) {
            double nanoseconds = 0;
            std::ifstream(thread.path() / "schedstat") >> nanoseconds;
            sum.processorTime += nanoseconds / 1e6;
            sum.sleeps += field(thread.path() / "status", "voluntary_ctxt_switches:");
        }
        return sum;
    }

    pid_t pid_ = 0;
};

// The screen's pixels and pointer, without the patience of a person.
class Screen {
 public:
    Screen() : display_(XOpenDisplay(nullptr)) {
        require(display_ != nullptr, "a display");
        root_ = DefaultRootWindow(display_);
        XSetWindowBackground(display_, root_, groundColour);
        XClearWindow(display_, root_);
        XSync(display_, False);
    }
    ~Screen() { XCloseDisplay(display_); }
    Screen(const Screen&) = delete;
    Screen& operator=(const Screen&) = delete;

    unsigned long pixel(Point at) {
        XImage* image = XGetImage(display_, root_, at.x, at.y, 1, 1, AllPlanes, ZPixmap);
        const unsigned long value = XGetPixel(image, 0, 0) & 0xFFFFFF;
        XDestroyImage(image);
        return value;
    }
    Point middle() const {
        return {DisplayWidth(display_, DefaultScreen(display_)) / 2,
                DisplayHeight(display_, DefaultScreen(display_)) / 2};
    }
    // A window without a picture shows the root's colour or black.
    bool isPainted(Point at) {
        const unsigned long seen = pixel(at);
        return seen != groundColour && seen != 0;
    }
    Point placeOf(WindowOnScreen window) {
        Point at;
        ::Window child = None;
        XTranslateCoordinates(display_, window, root_, 0, 0, &at.x, &at.y, &child);
        return at;
    }
    void movePointer(Point to) {
        XTestFakeMotionEvent(display_, -1, to.x, to.y, CurrentTime);
        XSync(display_, False);
    }
    void pressButton() {
        XTestFakeButtonEvent(display_, 1, True, CurrentTime);
        XTestFakeButtonEvent(display_, 1, False, CurrentTime);
        XSync(display_, False);
    }
    static constexpr unsigned long groundColour = 0xFF00FF;

 private:
    Display* display_;
    ::Window root_ = None;
};

// Looks ten times a millisecond.
double millisecondsUntil(const std::function<bool()>& isSo, Clock::time_point since) {
    while (!isSo()) {
        require(Clock::now() - since < 10s, "no picture came");
        std::this_thread::sleep_for(100us);
    }
    return Milliseconds(Clock::now() - since).count();
}

class DesktopBench {
 public:
    DesktopBench(std::string program, std::string bareWindow, std::vector<std::string> runner = {})
        : program_(std::move(program)), bareWindow_(std::move(bareWindow)), runner_(std::move(runner)) {}

    void measureStart(Scale scale, Goal goal) {
        const Size splash = scale.device(Size{680, 450});
        const auto startedBy = [this](std::vector<std::string> command) {
            command.insert(command.begin(), runner_.begin(), runner_.end());
            return command;
        };
        const auto command = startedBy({program_});
        const auto bareCommand =
            startedBy({bareWindow_, std::to_string(splash.width), std::to_string(splash.height)});
        desktop_.setScale(scale);
        timeToFirstPixel(command);  // makes the user's registry
        std::vector<double> ours;
        std::vector<double> bare;
        for (int i = 0; i < starts; ++i) {
            ours.push_back(timeToFirstPixel(command));
            bare.push_back(timeToFirstPixel(bareCommand));
        }
        desktop_.setScale(Scale());
        report("exec to the splash's first pixel" + atScale(scale) + " | bare window", median(ours),
               median(bare), "ms", goal);
    }

    // Against what it takes at scale 1 and the pixels that are more, of the window and of the sprites, and a
    // mebibyte for the glyphs.
    void measureMemoryAt(Scale scale) {
        desktop_.setScale(scale);
        const Process process({program_});
        desktop_.waitForWindow(mainCaption);
        std::this_thread::sleep_for(3s);
        desktop_.setScale(Scale());
        const auto pixels = [](Size size) { return static_cast<double>(size.width) * size.height; };
        double added = 0;
        for (const Size size : {Size{675, 562}, Size{400, 500}, Size{28 * 28, 28}, Size{60, 241}})
            added += pixels(scale.device(size)) - pixels(size);
        report("memory (Pss) at the main menu" + atScale(scale) + " | at scale 1",
               process.proportionalSetSize() / 1024, plainSize_ / 1024, "MiB",
               {.more = 1 + 1.3 * added * sizeof(std::uint32_t) / (1 << 20)});
    }

    void measureBareWindow() {
        const Process process({bareWindow_, "675", "562"});
        main_ = desktop_.waitForWindow(bareCaption);
        std::this_thread::sleep_for(3s);
        bareSize_ = process.proportionalSetSize();
        bareLibraries_ = static_cast<double>(process.sharedLibraries());
        bareIdle_ = process.during(period);
        std::vector<double> times;
        for (int i = 0; i < clicks; ++i)
            times.push_back(timeOfClick(boardAt));
        bareClick_ = median(times);
    }

    void measureProgram() {
        const Process process({program_});
        main_ = desktop_.waitForWindow(mainCaption);
        std::this_thread::sleep_for(3s);
        plainSize_ = process.proportionalSetSize();
        report("memory (Pss) at the main menu | bare window", plainSize_ / 1024, bareSize_ / 1024, "MiB",
               {.more = 8});
        report("shared libraries | bare window", static_cast<double>(process.sharedLibraries()),
               bareLibraries_, "", {.more = 3});
        reportIdle("main menu", process);
        clickMenu(1);
        measureMoves();
        reportIdle("Training", process);
        desktop_.click(main_, 95, 305);
        reportIdle("paused", process);
        desktop_.click(main_, 95, 305);
        desktop_.press(XK_a);
        reportIdle("minimised", process);
    }

    void measureTimedGame() {
        const Process process({program_});
        main_ = desktop_.waitForWindow(mainCaption);
        clickMenu(2);
        std::this_thread::sleep_for(1s);
        constexpr double ticks = 40;  // in ten seconds of the first level
        report("10 s of a Timed game: sleeps | its timer's ticks", process.during(period).sleeps, ticks, "",
               {.times = 1.2});
    }

    void measureInstalledSize() const {
        double size = static_cast<double>(std::filesystem::file_size(program_));
        for (const auto& file :
             std::filesystem::directory_iterator(std::filesystem::path(program_).parent_path())) {
            const bool isProgram = access(file.path().c_str(), X_OK) == 0;
            size += isProgram ? 0 : static_cast<double>(file.file_size());
        }
        constexpr double mebibyte = 1 << 20;
        report("installed size | bare window", size / mebibyte,
               static_cast<double>(std::filesystem::file_size(bareWindow_)) / mebibyte, "MiB", {.more = 4});
    }

 private:
    double timeToFirstPixel(const std::vector<std::string>& command) {
        millisecondsUntil([&] { return screen_.pixel(screen_.middle()) == Screen::groundColour; },
                          Clock::now());
        std::this_thread::sleep_for(50ms);
        const auto start = Clock::now();
        const Process process(command);
        return millisecondsUntil([&] { return screen_.isPainted(screen_.middle()); }, start);
    }

    void clickMenu(int button) {
        desktop_.click(main_, 337, 15 + button * 52 + 2);
        std::this_thread::sleep_for(1s);
    }

    void reportIdle(const std::string& state, const Process& process) {
        std::this_thread::sleep_for(2s);
        const auto activity = process.during(period);
        report("10 s idle, " + state + ": processor time | bare window", activity.processorTime,
               bareIdle_.processorTime, "ms", {});
        report("10 s idle, " + state + ": sleeps | bare window", activity.sleeps, bareIdle_.sleeps, "", {});
    }

    // The time from a click on a cell of the window until its picture changes there.
    double timeOfClick(Point cell) {
        const Point corner{screen_.placeOf(main_).x + cell.x, screen_.placeOf(main_).y + cell.y};
        screen_.movePointer({corner.x + 14, corner.y + 14});
        std::this_thread::sleep_for(200ms);
        const Point seen{corner.x + 5, corner.y + 14};
        const unsigned long before = screen_.pixel(seen);
        const auto start = Clock::now();
        screen_.pressButton();
        const double time = millisecondsUntil([&] { return screen_.pixel(seen) != before; }, start);
        std::this_thread::sleep_for(1s);
        return time;
    }

    // The time from a click on a cluster until its cells have changed.
    void measureMoves() {
        const Surface sheet = readPicture(std::filesystem::path(program_).parent_path() / "ALLPICDATA.BMP");
        std::vector<double> times;
        for (int i = 0; i < clicks; ++i)
            times.push_back(timeOfClick(cellOfCluster(sheet)));
        report("click to the first picture of a move | bare window", median(times), bareClick_, "ms",
               {.more = 2});
    }

    // The window's pixel at which a block begins that has one of its kind to its right.
    Point cellOfCluster(const Surface& sheet) {
        const Surface seen = desktop_.look(main_);
        const int size = sheet_map::tileSize;
        for (int row = 15; row >= 0; --row) {
            for (int column = 0; column < 11; ++column) {
                const Point cell{boardAt.x + column * size, boardAt.y + row * size};
                for (std::int16_t tile = 1; tile <= 3; ++tile) {
                    const Point from{tile * size, 0};
                    if (isSame(seen, cell, sheet, from) && isSame(seen, {cell.x + size, cell.y}, sheet, from))
                        return cell;
                }
            }
        }
        require(false, "a cluster on the board");
        return {};
    }
    static bool isSame(const Surface& seen, Point at, const Surface& sheet, Point from) {
        for (int y = 0; y < sheet_map::tileSize; ++y) {
            for (int x = 0; x < sheet_map::tileSize; ++x) {
                if (seen.at(at.x + x, at.y + y) != sheet.at(from.x + x, from.y + y))
                    return false;
            }
        }
        return true;
    }

    std::string program_;
    std::string bareWindow_;
    std::vector<std::string> runner_;  // what starts both
    Desktop desktop_;
    Screen screen_;
    WindowOnScreen main_ = 0;
    double plainSize_ = 0;  // kibibytes
    double bareSize_ = 0;
    double bareLibraries_ = 0;
    double bareClick_ = 0;  // milliseconds
    Process::Activity bareIdle_;
};

}  // namespace
}  // namespace quabble::bench

int main(int argc, char** argv) {
    if (argc == 4 && std::string(argv[1]) == "wine") {
        quabble::bench::DesktopBench(argv[2], argv[3], {"wine"})
            .measureStart(quabble::Scale(), {.times = 1.25});
        return 0;
    }
    quabble::require(argc == 3, "usage: measure_desktop PROGRAM BARE_WINDOW");
    quabble::bench::DesktopBench bench(argv[1], argv[2]);
    bench.measureStart(quabble::Scale(), {.times = 1.2});
    bench.measureStart(quabble::Scale::ofQuarters(8), {.times = 1.35});
    bench.measureBareWindow();
    bench.measureProgram();
    bench.measureMemoryAt(quabble::Scale::ofQuarters(8));
    bench.measureTimedGame();
    bench.measureInstalledSize();
    return 0;
}
