#include "support/Picture.h"

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <memory>

#include <Ecore_Evas.h>
#include <Evas.h>

namespace {

/** A canvas of its own, to read and write files with. */
class Bench {
public:
    Bench() : _canvas(ecore_evas_buffer_new(1, 1)) {}
    ~Bench() { ecore_evas_free(_canvas); }
    Bench(const Bench&) = delete;
    Bench& operator=(const Bench&) = delete;
    Evas_Object* image() const { return evas_object_image_add(ecore_evas_get(_canvas)); }

private:
    Ecore_Evas* _canvas;
};

bool differs(std::uint32_t a, std::uint32_t b, int tolerance) {
    for (const int shift : {0, 8, 16}) {
        const int one = static_cast<int>((a >> shift) & 0xFF);
        const int other = static_cast<int>((b >> shift) & 0xFF);
        if (std::abs(one - other) > tolerance) {
            return true;
        }
    }
    return false;
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
        if (differs(actual.pixels[i], approved.pixels[i], tolerance)) {
            ++count;
            result.picture.pixels[i] = 0xFFFF0000;
        } else {
            result.picture.pixels[i] = 0xFF000000 | ((actual.pixels[i] >> 2) & 0x3F3F3F);
        }
    }
    result.fraction = static_cast<double>(count) / static_cast<double>(actual.pixels.size());
    return result;
}
