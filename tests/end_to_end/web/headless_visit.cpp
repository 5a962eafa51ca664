// Plays on the machine without a screen what was played in a page: headless_visit FOLDER SEED QUARTERS
// The folder has the program's pictures, the scale is in quarters. Each line of the standard input is an act;
// after each, the fingerprint of the topmost window's picture is printed, once nothing more happens by
// itself.

#include <cstdio>
#include <cstdlib>
#include <iostream>
#include <sstream>
#include <string>

#include "app/program.hpp"
#include "hosts/headless/memory_blob.hpp"
#include "hosts/headless/scripted_user.hpp"

namespace quabble {
namespace {

std::vector<std::byte> bytesOf(const std::string& path) {
    std::vector<std::byte> bytes;
    if (std::FILE* file = std::fopen(path.c_str(), "rb")) {
        std::fseek(file, 0, SEEK_END);
        bytes.resize(static_cast<std::size_t>(std::ftell(file)));
        std::rewind(file);
        bytes.resize(std::fread(bytes.data(), 1, bytes.size(), file));
        std::fclose(file);
    }
    return bytes;
}

HeadlessFrontEnd::Files filesIn(const std::string& folder) {
    HeadlessFrontEnd::Files files;
    for (const char* name : {"ALLPICDATA.BMP", "ALLPICDATA.BIG", "BGIMG.BMP", "BGIMG.BIG"})
        files[name] = bytesOf(folder + "/" + name);
    return files;
}

// FNV-1a of 32 bits over the pixels: a script has no larger whole numbers that are fast.
std::uint32_t fingerprint(const Surface& picture) {
    std::uint32_t hash = 0x811C9DC5;
    for (std::int32_t y = 0; y < picture.height(); ++y) {
        for (std::int32_t x = 0; x < picture.width(); ++x) {
            const Colour colour = picture.at(x, y);
            hash = (hash ^ static_cast<std::uint32_t>(colour.red << 16 | colour.green << 8 | colour.blue)) *
                   0x01000193;
        }
    }
    return hash;
}

void act(ScriptedUser<Program>& user, HeadlessFrontEnd& frontEnd, const std::string& line) {
    std::istringstream words(line);
    std::string what;
    words >> what >> std::ws;
    if (what == "click") {
        float x = 0;
        float y = 0;
        words >> x >> y;
        user.movePointer(x, y);
        user.click(x, y);
    } else if (what == "type") {
        std::string text;
        std::getline(words, text);
        user.type(text);
    } else if (what == "press") {
        std::int16_t key = 0;
        words >> key;
        user.press(key);
    } else if (what == "scale") {
        int quarters = 0;
        words >> quarters;
        frontEnd.rescale(Scale::ofQuarters(quarters));
    }
}

}  // namespace
}  // namespace quabble

int main(int argc, char** argv) {
    using namespace quabble;
    if (argc != 4)
        return 2;
    HeadlessFrontEnd frontEnd(filesIn(argv[1]));
    frontEnd.scale = Scale::ofQuarters(std::atoi(argv[3]));
    MemoryBlob kept;
    BlobRegistryStore registry(kept);
    Program program(frontEnd, registry, std::strtoull(argv[2], nullptr, 10));
    ScriptedUser<Program> user(frontEnd, program);
    program.start();
    user.wait(std::chrono::minutes(1));  // until the main menu is there
    for (std::string line; std::getline(std::cin, line);) {
        act(user, frontEnd, line);
        user.wait(std::chrono::minutes(1));
        std::cout << fingerprint(user.top().picture) << '\n';
    }
    return 0;
}
