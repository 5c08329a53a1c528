#include "FacePicture.h"

#include <algorithm>
#include <cerrno>
#include <charconv>
#include <cmath>
#include <cstdio>
#include <cstring>
#include <memory>

#include <png.h>

namespace simulator {

namespace {

constexpr std::size_t PIXEL_BYTES = 4;
constexpr std::size_t OPACITY = 3;

int numberIn(const std::string& text) {
    int number = 0;
    std::from_chars(text.data(), text.data() + text.size(), number);
    return number;
}

/** Windows without transparency leave the fourth byte as it comes. */
void makeOpaque(FacePicture& picture) {
    for (std::size_t at = OPACITY; at < picture.bytes.size(); at += PIXEL_BYTES)
        picture.bytes[at] = '\xFF';
}

struct FileCloser {
    void operator()(std::FILE* file) const { std::fclose(file); }
};

} // namespace

std::string takePicture(Device& device, FacePicture& picture) {
    const Reply reply = device.askFront({"picture"});
    if (!reply.problem.empty())
        return reply.problem;
    if (reply.values.size() != 3)
        return "the application answered with something else than a picture";
    picture = {numberIn(reply.values[0]), numberIn(reply.values[1]), reply.values[2]};
    const auto pixels =
        static_cast<std::size_t>(picture.width) * static_cast<std::size_t>(picture.height);
    if (picture.width <= 0 || picture.height <= 0 || picture.bytes.size() != pixels * PIXEL_BYTES)
        return "the application answered with a broken picture";
    makeOpaque(picture);
    return "";
}

void cutRound(FacePicture& picture) {
    const double centreX = picture.width / 2.0;
    const double centreY = picture.height / 2.0;
    const double radius = std::min(centreX, centreY);
    for (int y = 0; y < picture.height; ++y) {
        for (int x = 0; x < picture.width; ++x) {
            const double distance = std::hypot(x + 0.5 - centreX, y + 0.5 - centreY);
            const double cover = std::clamp(radius + 0.5 - distance, 0.0, 1.0);
            const auto pixel =
                static_cast<std::size_t>(y) * static_cast<std::size_t>(picture.width) +
                static_cast<std::size_t>(x);
            picture.bytes[pixel * PIXEL_BYTES + OPACITY] =
                static_cast<char>(std::lround(255 * cover));
        }
    }
}

std::string writePng(const std::string& file, const FacePicture& picture) {
    const std::unique_ptr<std::FILE, FileCloser> stream(std::fopen(file.c_str(), "wbe"));
    if (!stream)
        return file + " cannot be written: " + std::strerror(errno);
    png_image image{};
    image.version = PNG_IMAGE_VERSION;
    image.width = static_cast<png_uint_32>(picture.width);
    image.height = static_cast<png_uint_32>(picture.height);
    image.format = PNG_FORMAT_BGRA;
    if (png_image_write_to_stdio(&image, stream.get(), 0, picture.bytes.data(), 0, nullptr) == 0)
        return file + " cannot be written: " + image.message;
    return std::fflush(stream.get()) == 0 ? ""
                                          : file + " cannot be written: " + std::strerror(errno);
}

} // namespace simulator
