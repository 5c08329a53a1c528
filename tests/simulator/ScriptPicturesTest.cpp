// Pictures and recordings of the face, as other programs read them.

#include "script/AnimatedPicture.h"
#include "script/FacePicture.h"

#include <cstdint>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <png.h>
#include <webp/demux.h>

using simulator::AnimatedPicture;
using simulator::cutRound;
using simulator::FacePicture;
using testing::HasSubstr;

namespace {

constexpr int SIZE = 60;

/** All of one colour: blue, green, red. */
FacePicture plain(const std::string& colour) {
    FacePicture picture{SIZE, SIZE, ""};
    for (int i = 0; i < SIZE * SIZE; ++i)
        picture.bytes += colour + "\xFF";
    return picture;
}

std::string output(const std::string& name) {
    const std::string folder = CLOCK_TEST_OUTPUT_DIR "/script";
    std::filesystem::create_directories(folder);
    std::filesystem::remove(folder + "/" + name);
    return folder + "/" + name;
}

std::string contentsOf(const std::string& file) {
    std::ifstream stream(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(stream), {}};
}

std::string pixel(const std::string& bytes, int x, int y) {
    return bytes.substr(4 * (static_cast<std::size_t>(y) * SIZE + static_cast<std::size_t>(x)), 4);
}

/** A device that shows what it is told to. */
class MadeUpFace : public simulator::Device {
public:
    simulator::Reply askFront(const simulator::Request& /*request*/) override { return reply; }
    simulator::Reply askWatch(const simulator::Request& /*request*/) override { return {}; }
    std::string waitStill(double /*seconds*/) override { return ""; }
    const std::string& folder() const override { return _folder; }
    void sleep(double /*seconds*/) override {}
    double now() override { return 0; }

    simulator::Reply reply;

private:
    std::string _folder;
};

} // namespace

TEST(ScriptPictures, OutsideTheCircleTheyAreTransparent) {
    FacePicture picture = plain("\x10\x20\x30");
    cutRound(picture);
    EXPECT_EQ(pixel(picture.bytes, 30, 30), "\x10\x20\x30\xFF");
    EXPECT_GT(static_cast<unsigned char>(pixel(picture.bytes, 0, 30).back()), 250)
        << "the rim touches the edge";
    EXPECT_LT(static_cast<unsigned char>(pixel(picture.bytes, 9, 8).back()), 255) << "a soft edge";
    EXPECT_EQ(pixel(picture.bytes, 0, 0), std::string("\x10\x20\x30\0", 4));
    EXPECT_EQ(pixel(picture.bytes, 59, 59), std::string("\x10\x20\x30\0", 4));
}

TEST(ScriptPictures, APngFileKeepsColoursAndTransparency) {
    const std::string file = output("round.png");
    FacePicture picture = plain("\x10\x20\x30");
    cutRound(picture);
    ASSERT_EQ(simulator::writePng(file, picture), "");
    png_image image{};
    image.version = PNG_IMAGE_VERSION;
    ASSERT_NE(png_image_begin_read_from_file(&image, file.c_str()), 0);
    image.format = PNG_FORMAT_BGRA;
    std::string bytes(PNG_IMAGE_SIZE(image), '\0');
    ASSERT_NE(png_image_finish_read(&image, nullptr, bytes.data(), 0, nullptr), 0);
    EXPECT_EQ(image.width, static_cast<png_uint_32>(SIZE));
    EXPECT_EQ(pixel(bytes, 30, 30), "\x10\x20\x30\xFF");
    EXPECT_EQ(pixel(bytes, 0, 0).back(), '\0');
}

TEST(ScriptPictures, AFileThatCannotBeWrittenIsNamed) {
    EXPECT_EQ(simulator::writePng("/nowhere/a.png", plain("abc")),
              "/nowhere/a.png cannot be written: No such file or directory");
    EXPECT_THAT(simulator::writePng("/dev/full", plain("abc")),
                HasSubstr("/dev/full cannot be written"));
}

TEST(ScriptPictures, ARecordingPlaysItsPicturesInTheirTime) {
    const std::string file = output("three.webp");
    AnimatedPicture animation(SIZE, SIZE);
    const std::vector<std::string> colours{"\x01\x02\xF3", "\x81\x82\x83", "\xF1\x02\x03"};
    double seconds = 0;
    for (const std::string& colour : colours) {
        ASSERT_EQ(animation.add(plain(colour), seconds), "");
        seconds += 0.25;
    }
    ASSERT_EQ(animation.write(file, seconds), "");

    const std::string bytes = contentsOf(file);
    const WebPData data{reinterpret_cast<const std::uint8_t*>(bytes.data()), bytes.size()};
    WebPAnimDecoderOptions options;
    WebPAnimDecoderOptionsInit(&options);
    options.color_mode = MODE_BGRA;
    WebPAnimDecoder* decoder = WebPAnimDecoderNew(&data, &options);
    ASSERT_NE(decoder, nullptr);
    std::vector<int> ends;
    std::vector<std::string> shown;
    std::uint8_t* pixels = nullptr;
    int end = 0;
    while (WebPAnimDecoderHasMoreFrames(decoder) != 0 &&
           WebPAnimDecoderGetNext(decoder, &pixels, &end) != 0) {
        ends.push_back(end);
        shown.emplace_back(reinterpret_cast<const char*>(pixels), 3);
    }
    WebPAnimDecoderDelete(decoder);
    EXPECT_EQ(shown, colours) << "without loss";
    EXPECT_THAT(ends, testing::ElementsAre(250, 500, 750));
}

TEST(ScriptPictures, ARecordingThatCannotBeWrittenIsNamed) {
    AnimatedPicture animation(SIZE, SIZE);
    ASSERT_EQ(animation.add(plain("abc"), 0), "");
    EXPECT_THAT(animation.write("/nowhere/a.webp", 1),
                HasSubstr("/nowhere/a.webp cannot be written: No such file or directory"));
}

TEST(ScriptPictures, AnAnswerThatIsNoPictureIsNotBelieved) {
    MadeUpFace face;
    FacePicture picture;
    face.reply = {"", {"2", "2", std::string(16, '\0')}};
    EXPECT_EQ(simulator::takePicture(face, picture), "");
    EXPECT_EQ(picture.bytes.at(3), '\xFF') << "windows are opaque";
    for (const std::vector<std::string>& values :
         std::vector<std::vector<std::string>>{{},
                                               {"2", "2"},
                                               {"2", "2", "short"},
                                               {"0", "0", ""},
                                               {"-2", "-2", std::string(16, '\0')},
                                               {"x", "2", std::string(16, '\0')},
                                               {"65536", "65536", ""}}) {
        face.reply = {"", values};
        EXPECT_THAT(simulator::takePicture(face, picture), HasSubstr("the application answered"));
    }
    face.reply = {"no window is shown", {}};
    EXPECT_EQ(simulator::takePicture(face, picture), "no window is shown");
}
