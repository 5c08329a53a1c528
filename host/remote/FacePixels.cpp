#include "FacePixels.h"

#include <cstdint>
#include <memory>
#include <vector>

#include <Ecore_Evas.h>
#include <Ecore_X.h>

#include "FaceWindow.h"

namespace host {

namespace {

constexpr std::size_t PIXEL_BYTES = 4;

FacePixels copyOf(const void* pixels, int width, int height) {
    FacePixels copy;
    if (!pixels || width <= 0 || height <= 0)
        return copy;
    copy.width = width;
    copy.height = height;
    copy.bytes.assign(static_cast<const char*>(pixels), PIXEL_BYTES *
                                                            static_cast<std::size_t>(width) *
                                                            static_cast<std::size_t>(height));
    return copy;
}

struct ImageDeleter {
    void operator()(Ecore_X_Image* image) const { ecore_x_image_free(image); }
};

FacePixels shownBy(Ecore_X_Window window) {
    Ecore_X_Window_Attributes attributes{};
    if (!ecore_x_window_attributes_get(window, &attributes) || !attributes.viewable)
        return {};
    const int width = attributes.w;
    const int height = attributes.h;
    const std::unique_ptr<Ecore_X_Image, ImageDeleter> image(
        ecore_x_image_new(width, height, attributes.visual, attributes.depth));
    if (!image || !ecore_x_image_get(image.get(), window, 0, 0, 0, 0, width, height))
        return {};
    int lineBytes = 0;
    int rows = 0;
    int pixelSize = 0;
    void* data = ecore_x_image_data_get(image.get(), &lineBytes, &rows, &pixelSize);
    std::vector<std::uint32_t> pixels(static_cast<std::size_t>(width) *
                                      static_cast<std::size_t>(height));
    if (!data || !ecore_x_image_to_argb_convert(
                     data, pixelSize, lineBytes, attributes.colormap, attributes.visual, 0, 0,
                     width, height, pixels.data(), width * static_cast<int>(PIXEL_BYTES), 0, 0))
        return {};
    return copyOf(pixels.data(), width, height);
}

} // namespace

FacePixels facePixels() {
    Ecore_Evas* window = faceWindow();
    if (!window)
        return {};
    if (!isInMemory(window))
        return shownBy(static_cast<Ecore_X_Window>(ecore_evas_window_get(window)));
    int width = 0;
    int height = 0;
    ecore_evas_manual_render(window);
    ecore_evas_geometry_get(window, nullptr, nullptr, &width, &height);
    return copyOf(ecore_evas_buffer_pixels_get(window), width, height);
}

} // namespace host
