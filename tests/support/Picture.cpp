#include "support/Picture.h"

#include <algorithm>
#include <cstdlib>
#include <filesystem>

#include <Evas.h>
#include <Evas_Engine_Buffer.h>

namespace {

/**
 * @brief A canvas of its own, to read and write files with.
 *
 * Without a window: one more of the buffer engine would take the keys of the face with it when it
 * goes, as both have the same number.
 */
class Bench {
public:
    Bench() : _canvas(evas_new()) {
        evas_output_method_set(_canvas, evas_render_method_lookup("buffer"));
        auto* const engine =
            reinterpret_cast<Evas_Engine_Info_Buffer*>(evas_engine_info_get(_canvas));
        engine->info.depth_type = EVAS_ENGINE_BUFFER_DEPTH_ARGB32;
        engine->info.dest_buffer = &_pixel;
        engine->info.dest_buffer_row_bytes = sizeof _pixel;
        evas_engine_info_set(_canvas, reinterpret_cast<Evas_Engine_Info*>(engine));
        evas_output_size_set(_canvas, 1, 1);
    }
    ~Bench() { evas_free(_canvas); }
    Bench(const Bench&) = delete;
    Bench& operator=(const Bench&) = delete;
    Evas_Object* image() const { return evas_object_image_add(_canvas); }

private:
    Evas* _canvas;
    std::uint32_t _pixel = 0;
};

int channel(std::uint32_t pixel, int shift) {
    return static_cast<int>((pixel >> shift) & 0xFF);
}

std::uint32_t pixelAt(const Picture& picture, int x, int y) {
    return picture.pixels[static_cast<std::size_t>(y) * static_cast<std::size_t>(picture.width) +
                          static_cast<std::size_t>(x)];
}

/** What a channel may be half a pixel around a place. */
struct Span {
    int least = 255;
    int most = 0;
};

Span spanAround(const Picture& picture, int x, int y, int shift) {
    const int middle = channel(pixelAt(picture, x, y), shift);
    Span span;
    for (int row = std::max(0, y - 1); row <= std::min(picture.height - 1, y + 1); ++row) {
        for (int column = std::max(0, x - 1); column <= std::min(picture.width - 1, x + 1);
             ++column) {
            const int between = (middle + channel(pixelAt(picture, column, row), shift)) / 2;
            span.least = std::min(span.least, between);
            span.most = std::max(span.most, between);
        }
    }
    return span;
}

/** True when a pixel of one picture is no mix of what another has around the same place. */
bool isUnlike(std::uint32_t pixel, const Picture& other, int x, int y, int tolerance) {
    for (const int shift : {0, 8, 16}) {
        const Span span = spanAround(other, x, y, shift);
        const int value = channel(pixel, shift);
        if (value < span.least - tolerance || value > span.most + tolerance)
            return true;
    }
    return false;
}

bool differs(const Picture& a, const Picture& b, int x, int y, int tolerance) {
    const std::uint32_t one = pixelAt(a, x, y);
    const std::uint32_t other = pixelAt(b, x, y);
    return one != other && isUnlike(one, b, x, y, tolerance) && isUnlike(other, a, x, y, tolerance);
}

} // namespace

bool Picture::save(const std::string& path) const {
    std::filesystem::create_directories(std::filesystem::path(path).parent_path());
    const Bench bench;
    Evas_Object* const image = bench.image();
    evas_object_image_alpha_set(image, EINA_FALSE);
    evas_object_image_size_set(image, width, height);
    evas_object_image_data_copy_set(image, const_cast<std::uint32_t*>(pixels.data()));
    return evas_object_image_save(image, path.c_str(), nullptr, "compress=9") != EINA_FALSE;
}

Picture Picture::load(const std::string& path) {
    const Bench bench;
    Evas_Object* const image = bench.image();
    evas_object_image_file_set(image, path.c_str(), nullptr);
    if (evas_object_image_load_error_get(image) != EVAS_LOAD_ERROR_NONE) {
        return {};
    }
    Picture picture;
    evas_object_image_size_get(image, &picture.width, &picture.height);
    const auto* const data =
        static_cast<const std::uint32_t*>(evas_object_image_data_get(image, EINA_FALSE));
    if (data != nullptr) {
        picture.pixels.assign(data, data + static_cast<std::size_t>(picture.width) *
                                               static_cast<std::size_t>(picture.height));
    }
    return picture;
}

PictureDifference comparePictures(const Picture& actual, const Picture& approved, int tolerance) {
    if (actual.empty() || actual.width != approved.width || actual.height != approved.height) {
        return {1, actual};
    }
    PictureDifference result{0, actual};
    std::size_t count = 0;
    for (std::size_t i = 0; i < actual.pixels.size(); ++i) {
        const int x = static_cast<int>(i) % actual.width;
        const int y = static_cast<int>(i) / actual.width;
        if (differs(actual, approved, x, y, tolerance)) {
            ++count;
            result.picture.pixels[i] = 0xFFFF0000;
        } else {
            result.picture.pixels[i] = 0xFF000000 | ((actual.pixels[i] >> 2) & 0x3F3F3F);
        }
    }
    result.fraction = static_cast<double>(count) / static_cast<double>(actual.pixels.size());
    return result;
}
