#include <gtest/gtest.h>

#include <functional>

#include "machine.hpp"

namespace quabble {
namespace {

using namespace std::chrono_literals;

constexpr Scale scales[] = {Scale::ofQuarters(5), Scale::ofQuarters(6), Scale::ofQuarters(7),
                            Scale::ofQuarters(8), Scale::ofQuarters(12)};

std::string nameOf(Scale scale) {
    return std::to_string(scale.quarters() * 25);
}

// Every screen there is, each a story of its own.
struct Screen {
    const char* name;
    std::function<void(Machine&)> show;
};
const Screen screens[] = {
    {"menu", [](Machine& machine) { machine.pointAtMenu(3); }},
    {"training",
     [](Machine& machine) { machine.start(1, "..12/.112.31.3/12112311333"), machine.clickCell(3, 16); }},
    {"timed",
     [](Machine& machine) {
         machine.clickMenu(2);
         machine.user.wait(5250ms);
         machine.user.movePointer(95, 425);
     }},
    {"strategy", [](Machine& machine) { machine.start(3, "....2/...31Sa14"); }},
    {"paused", [](Machine& machine) { machine.clickMenu(3), machine.clickPanel(8); }},
    {"result", [](Machine& machine) { machine.clickMenu(1), machine.clickPanel(8); }},
    {"name",
     [](Machine& machine) {
         machine.app.highScores.table(1) = {};
         machine.start(1, "....11");
         machine.clickCell(5, 16);
         machine.user.wait(1s);
         machine.closeDialog();
         machine.user.type("Zo\u00EB");
         machine.user.edit(EditCommand::Left, true);
     }},
    {"scores", [](Machine& machine) { machine.clickMenu(6), machine.user.movePointer(300, 420); }}};

// How far the colours of a picture at a scale are from those at scale 1, in the mean over all of the
// program's pixels: 0 to 255.
double meanDifference(const Surface& scaled, Scale scale, const Surface& plain) {
    double sum = 0;
    for (std::int32_t i = 0; i < plain.width() * plain.height(); ++i) {
        const std::int32_t x = i % plain.width(), y = i / plain.width();
        const Rect part = scale.device(Rect::ofSize(x, y, 1, 1));
        double red = 0, green = 0, blue = 0;
        for (std::int32_t j = 0; j < part.width() * part.height(); ++j) {
            const Colour colour = scaled.at(part.left + j % part.width(), part.top + j / part.width());
            red += colour.red, green += colour.green, blue += colour.blue;
        }
        const double count = part.width() * part.height();
        const Colour expected = plain.at(x, y);
        sum += std::abs(red / count - expected.red) + std::abs(green / count - expected.green) +
               std::abs(blue / count - expected.blue);
    }
    return sum / (3.0 * plain.width() * plain.height());
}

// Letters and lines have finer edges there, and lie up to half a pixel aside.
TEST(Scales, ShowEveryScreenAsItIsAtScaleOne) {
    for (const auto& [name, show] : screens) {
        Machine plain;
        show(plain);
        for (const Scale scale : scales) {
            Machine machine(1, scale);
            show(machine);
            const Surface& seen = machine.user.top().picture;
            ASSERT_EQ(seen.bounds(), scale.device(plain.user.top().picture.bounds())) << name;
            EXPECT_LT(meanDifference(seen, scale, plain.user.top().picture), 2.5) << name << nameOf(scale);
        }
    }
}

}  // namespace
}  // namespace quabble
