#include "golden.hpp"

#include <gtest/gtest.h>
#include <stb/stb_image.h>
#include <stb/stb_image_write.h>

#include <algorithm>
#include <cstdlib>
#include <memory>
#include <vector>

namespace quabble {

void expectGolden(const Surface& seen, const std::string& name) {
    const std::string kept = QUABBLE_GOLDEN_FOLDER + name;
    const std::string written = std::getenv("QUABBLE_REFRESH_GOLDEN") ? kept : QUABBLE_SEEN_FOLDER + name;
    std::vector<unsigned char> bytes;
    for (std::int32_t y = 0; y < seen.height(); ++y) {
        for (const std::uint32_t pixel : seen.row(y))
            bytes.insert(bytes.end(), {colourOf(pixel).red, colourOf(pixel).green, colourOf(pixel).blue});
    }
    stbi_write_png(written.c_str(), seen.width(), seen.height(), 3, bytes.data(), 0);
    if (!QUABBLE_GOLDEN_TYPEFACE)
        GTEST_SKIP() << "the pictures kept show other typefaces";
    int width = 0, height = 0;
    stbi_uc* read = stbi_load(kept.c_str(), &width, &height, nullptr, 3);
    const std::unique_ptr<stbi_uc, void (*)(void*)> golden(read, stbi_image_free);
    const auto isNear = [](int left, int right) { return std::abs(left - right) <= 8; };
    ASSERT_TRUE(golden) << kept;
    ASSERT_EQ((Size{width, height}), (Size{seen.width(), seen.height()})) << kept;
    EXPECT_TRUE(std::equal(bytes.begin(), bytes.end(), golden.get(), isNear)) << "see " << written;
}

}  // namespace quabble
