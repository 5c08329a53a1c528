#include "AnimatedPicture.h"

#include <cerrno>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstring>

#include <webp/encode.h>
#include <webp/mux.h>

namespace simulator {

namespace {

int milliseconds(double seconds) {
    constexpr double MILLISECONDS = 1000;
    return static_cast<int>(std::lround(seconds * MILLISECONDS));
}

/** A picture as the encoder wants it. */
class Frame {
public:
    explicit Frame(const FacePicture& picture) {
        _ready = WebPPictureInit(&_frame) != 0;
        if (!_ready)
            return;
        constexpr int PIXEL_BYTES = 4;
        _frame.width = picture.width;
        _frame.height = picture.height;
        _frame.use_argb = 1;
        _ready = WebPPictureImportBGRA(&_frame,
                                       reinterpret_cast<const std::uint8_t*>(picture.bytes.data()),
                                       picture.width * PIXEL_BYTES) != 0;
    }
    ~Frame() { WebPPictureFree(&_frame); }
    Frame(const Frame&) = delete;
    Frame& operator=(const Frame&) = delete;

    WebPPicture* get() { return _ready ? &_frame : nullptr; }

private:
    WebPPicture _frame{};
    bool _ready = false;
};

} // namespace

struct AnimatedPicture::Encoder {
    Encoder(int width, int height) {
        WebPAnimEncoderOptions options;
        WebPAnimEncoderOptionsInit(&options);
        encoder = WebPAnimEncoderNew(width, height, &options);
        // The fastest: pictures come while they are written.
        WebPConfigInit(&config);
        WebPConfigLosslessPreset(&config, 0);
    }
    ~Encoder() { WebPAnimEncoderDelete(encoder); }
    Encoder(const Encoder&) = delete;
    Encoder& operator=(const Encoder&) = delete;
    std::string problem() const {
        return std::string("the recording failed: ") + WebPAnimEncoderGetError(encoder);
    }

    WebPAnimEncoder* encoder = nullptr;
    WebPConfig config{};
};

AnimatedPicture::AnimatedPicture(int width, int height)
    : _encoder(std::make_unique<Encoder>(width, height)) {}

AnimatedPicture::~AnimatedPicture() = default;

std::string AnimatedPicture::add(const FacePicture& picture, double seconds) {
    Frame frame(picture);
    if (_encoder->encoder == nullptr || frame.get() == nullptr)
        return "the recording failed: no memory";
    return WebPAnimEncoderAdd(_encoder->encoder, frame.get(), milliseconds(seconds),
                              &_encoder->config) != 0
               ? ""
               : _encoder->problem();
}

std::string AnimatedPicture::write(const std::string& file, double seconds) {
    WebPData data;
    WebPDataInit(&data);
    if (_encoder->encoder == nullptr ||
        WebPAnimEncoderAdd(_encoder->encoder, nullptr, milliseconds(seconds), nullptr) == 0 ||
        WebPAnimEncoderAssemble(_encoder->encoder, &data) == 0)
        return _encoder->problem();
    std::string problem;
    std::FILE* stream = std::fopen(file.c_str(), "wbe");
    if (stream == nullptr || std::fwrite(data.bytes, 1, data.size, stream) != data.size)
        problem = file + " cannot be written: " + std::strerror(errno);
    if (stream != nullptr && std::fclose(stream) != 0 && problem.empty())
        problem = file + " cannot be written: " + std::strerror(errno);
    WebPDataClear(&data);
    return problem;
}

} // namespace simulator
