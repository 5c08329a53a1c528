// The comparison of pictures itself: what has moved is seen, another rasteriser's edges are not.

#include <algorithm>
#include <cstdint>
#include <functional>

#include <gtest/gtest.h>

#include "support/Picture.h"
#include "support/ScreenTest.h"

namespace {

class PictureComparisonTest : public ScreenTest {
protected:
    void SetUp() override {
        ScreenTest::SetUp();
        approved = Picture::load(CLOCK_SOURCE_DIR "/tests/screens/approved/editor-volume.png");
        ASSERT_FALSE(approved.empty());
    }
    std::size_t indexOf(int x, int y) const {
        return static_cast<std::size_t>(y) * static_cast<std::size_t>(approved.width) +
               static_cast<std::size_t>(x);
    }
    std::uint32_t at(int x, int y) const {
        x = std::clamp(x, 0, approved.width - 1);
        y = std::clamp(y, 0, approved.height - 1);
        return approved.pixels[indexOf(x, y)];
    }
    using Shade = std::function<std::uint32_t(int x, int y)>;
    /** The approved picture with some rows of pixels drawn otherwise. */
    Picture drawn(int top, int bottom, const Shade& shade) const {
        Picture picture = approved;
        for (int y = top; y < bottom; ++y) {
            for (int x = 0; x < picture.width; ++x)
                picture.pixels[indexOf(x, y)] = shade(x, y);
        }
        return picture;
    }
    bool isLike(const Picture& picture) const {
        return comparePictures(picture, approved, PICTURE_TOLERANCE).fraction <= PICTURE_FRACTION;
    }
    static std::uint32_t mix(std::uint32_t a, std::uint32_t b) {
        std::uint32_t mixed = 0xFF000000;
        for (const unsigned shift : {0U, 8U, 16U})
            mixed |= (((a >> shift & 0xFF) + (b >> shift & 0xFF)) / 2) << shift;
        return mixed;
    }

    Picture approved;
};

TEST_F(PictureComparisonTest, APictureIsLikeItself) {
    EXPECT_EQ(comparePictures(approved, approved, 0).fraction, 0);
}

TEST_F(PictureComparisonTest, AShiftOfThePictureIsSeen) {
    for (const int by : {1, 2}) {
        EXPECT_FALSE(isLike(drawn(0, 360, [&](int x, int y) { return at(x, y - by); }))) << by;
        EXPECT_FALSE(isLike(drawn(0, 360, [&](int x, int y) { return at(x - by, y); }))) << by;
    }
}

TEST_F(PictureComparisonTest, AShiftOfEachRowIsSeen) {
    // The title, the buttons, and the rows that the list shows.
    const std::pair<int, int> bands[] = {{0, 36}, {36, 84}, {88, 150}, {152, 222}, {224, 300}};
    for (const auto& [top, bottom] : bands) {
        for (const int by : {-2, -1, 1, 2}) {
            EXPECT_FALSE(isLike(drawn(top, bottom, [&](int x, int y) { return at(x, y - by); })))
                << top << " moved down by " << by;
            EXPECT_FALSE(isLike(drawn(top, bottom, [&](int x, int y) { return at(x - by, y); })))
                << top << " moved to the right by " << by;
        }
    }
}

TEST_F(PictureComparisonTest, EdgesOfAnotherRasteriserAreNotSeen) {
    EXPECT_TRUE(isLike(drawn(0, 360, [&](int x, int y) { return mix(at(x, y), at(x + 1, y)); })));
    EXPECT_TRUE(isLike(drawn(0, 360, [&](int x, int y) { return mix(at(x, y), at(x, y - 1)); })));
}

TEST_F(PictureComparisonTest, AShadeIsNotSeen) {
    const auto shade = [&](int x, int y) {
        const std::uint32_t pixel = at(x, y);
        std::uint32_t shaded = 0xFF000000;
        for (const unsigned shift : {0U, 8U, 16U}) {
            const int noise = (x * 7 + y * 13) % 31 - 15;
            const int value = std::clamp(static_cast<int>(pixel >> shift & 0xFF) + noise, 0, 255);
            shaded |= static_cast<std::uint32_t>(value) << shift;
        }
        return shaded;
    };
    EXPECT_TRUE(isLike(drawn(0, 360, shade)));
}

TEST_F(PictureComparisonTest, AnotherSizeIsSeen) {
    Picture smaller = approved;
    smaller.height -= 1;
    smaller.pixels.resize(smaller.pixels.size() - static_cast<std::size_t>(smaller.width));
    EXPECT_FALSE(isLike(smaller));
}

} // namespace
