// Plays visits and says where one differs from what it expects:
//
//   quabble-visit [--files FOLDER] [--scale SCALE] [--pictures FOLDER] [--no-pictures] [--refresh] VISIT...
//
// docs/visits.md tells more.

#include <cstdio>
#include <cstdlib>
#include <string>
#include <utility>
#include <vector>

#include "draw/bitmap_file.hpp"
#include "hosts/headless/visit_player.hpp"
#include "visits/words.hpp"

namespace quabble {
namespace {

struct Options {
    std::string files;     // the folder of the program's files
    std::string pictures;  // the folder that pictures are written to, if any
    std::optional<Scale> scale;
    bool comparesPictures = true;
    bool refreshes = false;
    std::vector<std::string> visits;
};

std::optional<std::string> readFile(const std::string& path) {
    std::FILE* file = std::fopen(path.c_str(), "rb");
    if (file == nullptr)
        return std::nullopt;
    std::string content;
    std::vector<char> part(65536);
    while (std::feof(file) == 0 && std::ferror(file) == 0)
        content.append(part.data(), std::fread(part.data(), 1, part.size(), file));
    const bool isWhole = std::ferror(file) == 0;
    std::fclose(file);
    return isWhole ? std::optional(content) : std::nullopt;
}

bool writeFile(const std::string& path, const void* bytes, std::size_t size) {
    std::FILE* file = std::fopen(path.c_str(), "wb");
    if (file == nullptr)
        return false;
    const bool isWhole = std::fwrite(bytes, 1, size, file) == size;
    return std::fclose(file) == 0 && isWhole;
}

HeadlessFrontEnd::Files readFiles(const std::string& folder) {
    HeadlessFrontEnd::Files files;
    for (const char* name : {"ALLPICDATA.BMP", "ALLPICDATA.BIG", "BGIMG.BMP", "BGIMG.BIG"}) {
        const auto content = readFile(folder + "/" + name);
        if (!content)
            continue;
        const auto bytes = std::as_bytes(std::span(*content));
        files[name].assign(bytes.begin(), bytes.end());
    }
    return files;
}

std::string folderOf(const std::string& path) {
    const std::size_t end = path.find_last_of("/\\");
    return end == std::string::npos ? "." : path.substr(0, end);
}

std::string nameOf(const std::string& path) {
    const std::string name = path.substr(path.find_last_of("/\\") + 1);
    return name.substr(0, name.find_last_of('.'));
}

// Nothing when they cannot be understood.
std::optional<Options> readOptions(int argc, char** argv) {
    Options options;
    options.files = folderOf(argv[0]);
    for (int i = 1; i < argc; ++i) {
        const std::string word = argv[i];
        const bool takesValue = word == "--files" || word == "--scale" || word == "--pictures";
        if (takesValue && ++i == argc)
            return std::nullopt;
        if (word == "--files") {
            options.files = argv[i];
        } else if (word == "--pictures") {
            options.pictures = argv[i];
        } else if (word == "--scale") {
            options.scale = scaleOf(std::string_view(argv[i]));
            if (!options.scale)
                return std::nullopt;
        } else if (word == "--no-pictures") {
            options.comparesPictures = false;
        } else if (word == "--refresh") {
            options.refreshes = true;
        } else if (word.starts_with("--")) {
            return std::nullopt;
        } else {
            options.visits.push_back(word);
        }
    }
    return options.visits.empty() ? std::nullopt : std::optional(options);
}

// Plays one visit.
class Play {
 public:
    Play(const Options& options, const HeadlessFrontEnd::Files& files, std::string path)
        : options_(options), files_(files), path_(std::move(path)) {}

    // False when something differs, or when a file cannot be read or written.
    bool run() {
        const auto text = readFile(path_);
        if (!text)
            return complain(0, "it cannot be read");
        const auto read = parseVisit(*text);
        if (const auto* problem = std::get_if<VisitProblem>(&read))
            return complain(problem->line, problem->what);
        splitLines(*text);
        const auto* visit = std::get_if<Visit>(&read);
        VisitPlayer player(*visit, files_, options_.scale);
        for (const VisitStep& step : visit->steps) {
            player.play(step);
            if (step.kind == VisitStep::Kind::Expect && !look(player, step))
                return false;
        }
        return !options_.refreshes || keepLines();
    }

 private:
    bool complain(std::size_t line, const std::string& what) {
        std::printf("%s:%zu: %s\n", path_.c_str(), line, what.c_str());
        return false;
    }

    bool look(VisitPlayer& player, const VisitStep& step) {
        const bool isPicture = step.what == expectations::picture;
        if (isPicture && !options_.pictures.empty() && !writePicture(player.picture(), step.line))
            return complain(step.line, "its picture cannot be written");
        if (options_.refreshes)
            lines_[step.line - 1] = "expect " + step.what + refreshed(step, player.seen(step));
        else if ((!isPicture || options_.comparesPictures) && !player.isAsExpected(step))
            return complain(step.line, differenceOf(step, player.seen(step)));
        return true;
    }

    // What an expectation becomes: a picture keeps what it was at other scales.
    static std::string refreshed(const VisitStep& step, const std::string& seen) {
        if (step.what != expectations::picture)
            return seen.empty() ? "" : " " + seen;
        const auto now = wordsIn(seen);
        const auto before = wordsIn(step.value);
        std::string value;
        bool isNew = true;
        for (std::size_t i = 0; i + 1 < before.size(); i += 2) {
            const bool isThis = !now.empty() && before[i] == now[0];
            isNew = isNew && !isThis;
            value += " " + std::string(before[i]) + " " + std::string(isThis ? now[1] : before[i + 1]);
        }
        return isNew ? value + " " + seen : value;
    }

    bool writePicture(const Surface& picture, std::size_t line) {
        const std::string path =
            options_.pictures + "/" + nameOf(path_) + "-" + std::to_string(line) + ".bmp";
        const auto bytes = encodeBitmap(picture);
        return writeFile(path, bytes.data(), bytes.size());
    }

    void splitLines(std::string_view text) {
        while (!text.empty()) {
            const std::size_t end = std::min(text.find('\n'), text.size());
            lines_.emplace_back(text.substr(0, end));
            text.remove_prefix(std::min(end + 1, text.size()));
        }
    }

    bool keepLines() {
        std::string text;
        for (const std::string& line : lines_)
            text += line + "\n";
        return writeFile(path_, text.data(), text.size()) || complain(0, "it cannot be written");
    }

    const Options& options_;
    const HeadlessFrontEnd::Files& files_;
    std::string path_;
    std::vector<std::string> lines_;
};

}  // namespace
}  // namespace quabble

int main(int argc, char** argv) {
    const auto options = quabble::readOptions(argc, argv);
    if (!options) {
        std::puts(
            "usage: quabble-visit [--files FOLDER] [--scale SCALE] [--pictures FOLDER] [--no-pictures] "
            "[--refresh] VISIT...");
        return 2;
    }
    const auto files = quabble::readFiles(options->files);
    if (files.empty())
        std::puts("The program's pictures are not there; numbered tiles stand in for them.");
    int failed = 0;
    for (const std::string& visit : options->visits)
        failed += quabble::Play(*options, files, visit).run() ? 0 : 1;
    std::printf("%zu visits, %d of them other than expected\n", options->visits.size(), failed);
    return failed == 0 ? EXIT_SUCCESS : EXIT_FAILURE;
}
