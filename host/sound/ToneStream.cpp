#include "ToneStream.h"

#include <utility>

#define LOG_TAG "device-host"
#include "base/Log.h"

namespace host {

namespace {

// Microseconds. What is already on its way to the sound card keeps its level, so a new level is
// heard after this time; the usual 200 ms would lag behind the finger on a slider.
constexpr gint64 BUFFER_TIME = 80'000;

std::string textOf(GErrorPtr error) {
    return error && error->message ? error->message : "unknown problem";
}

/** Empty, or why this machine has no GStreamer. The first call ever on a machine takes long. */
const std::string& problemOfLibrary() {
    static const std::string problem = [] {
        GError* error = nullptr;
        return gst_init_check(nullptr, nullptr, &error) ? std::string() : textOf(GErrorPtr(error));
    }();
    return problem;
}

/** The owner of a new element, which nobody owned so far. */
GstPtr<GstElement> own(GstElement* element) {
    return GstPtr<GstElement>(element ? GST_ELEMENT(gst_object_ref_sink(element)) : nullptr);
}

GstPtr<GstElement> make(const char* kind, std::string& problem) {
    auto element = own(gst_element_factory_make(kind, nullptr));
    if (!element)
        problem = std::string("GStreamer has no ") + kind;
    return element;
}

GstPtr<GstElement> makeSink(const std::string& words, std::string& problem) {
    if (words.empty())
        return make("autoaudiosink", problem);
    GError* error = nullptr;
    auto sink = own(gst_parse_bin_from_description(words.c_str(), TRUE, &error));
    const GErrorPtr owner(error);
    if (!error && sink)
        return sink;
    problem = "the sink \"" + words + "\": " + (error ? error->message : "nothing is there");
    return nullptr;
}

bool isAudio(GstPad* pad) {
    const GstCapsPtr caps(gst_pad_query_caps(pad, nullptr));
    if (!caps || gst_caps_is_empty(caps.get()) || gst_caps_is_any(caps.get()))
        return false;
    return g_str_has_prefix(gst_structure_get_name(gst_caps_get_structure(caps.get(), 0)),
                            "audio/");
}

} // namespace

std::unique_ptr<ToneStream> ToneStream::open(const std::string& path, const std::string& sink,
                                             Ended ended, std::string& problem) {
    problem = problemOfLibrary();
    if (!problem.empty())
        return nullptr;
    std::unique_ptr<ToneStream> stream(new ToneStream(std::move(ended)));
    if (!stream->build(path, sink, problem))
        return nullptr;
    return stream;
}

ToneStream::ToneStream(Ended ended) : _ended(std::move(ended)) {}

ToneStream::~ToneStream() {
    if (!_pipeline)
        return;
    _hasEnded = true;
    gst_element_set_state(_pipeline.get(), GST_STATE_NULL);
    const GstPtr<GstBus> bus(gst_element_get_bus(_pipeline.get()));
    gst_bus_set_sync_handler(bus.get(), nullptr, nullptr, nullptr);
}

bool ToneStream::build(const std::string& path, const std::string& sinkWords,
                       std::string& problem) {
    _pipeline = own(gst_pipeline_new(nullptr));
    const GstPtr<GstBus> bus(gst_element_get_bus(_pipeline.get()));
    gst_bus_set_sync_handler(bus.get(), _messageCb, this, nullptr);
    // The sink of somebody who chose one is left as it is.
    if (sinkWords.empty())
        g_signal_connect(_pipeline.get(), "deep-element-added", G_CALLBACK(_elementAddedCb),
                         nullptr);

    const auto source = make("filesrc", problem);
    const auto decoder = make("decodebin", problem);
    const auto converter = make("audioconvert", problem);
    const auto resampler = make("audioresample", problem);
    const auto volume = make("volume", problem);
    const auto sink = makeSink(sinkWords, problem);
    if (!source || !decoder || !converter || !resampler || !volume || !sink)
        return false;
    g_object_set(source.get(), "location", path.c_str(), nullptr);
    _converter = converter.get();
    _volume = volume.get();
    if (addAndLink(source.get(), decoder.get(), resampler.get(), sink.get()))
        return true;
    problem = "the sink takes no sound";
    return false;
}

bool ToneStream::addAndLink(GstElement* source, GstElement* decoder, GstElement* resampler,
                            GstElement* sink) {
    gst_bin_add_many(GST_BIN(_pipeline.get()), source, decoder, _converter, resampler, _volume,
                     sink, nullptr);
    // What the decoder gives out is known only when it has seen the file.
    g_signal_connect(decoder, "pad-added", G_CALLBACK(_padAddedCb), _converter);
    return gst_element_link(source, decoder) &&
           gst_element_link_many(_converter, resampler, _volume, sink, nullptr);
}

void ToneStream::play() {
    _hasEnded = false;
    if (gst_element_set_state(_pipeline.get(), GST_STATE_PLAYING) == GST_STATE_CHANGE_FAILURE)
        end("it cannot be started");
}

bool ToneStream::rewind() {
    _hasEnded = false;
    return gst_element_seek_simple(_pipeline.get(), GST_FORMAT_TIME, GST_SEEK_FLAG_FLUSH, 0);
}

void ToneStream::setGain(double gain) {
    g_object_set(_volume, "volume", gain, nullptr);
}

void ToneStream::end(const std::optional<std::string>& problem) {
    if (!_hasEnded.exchange(true))
        _ended(problem);
}

void ToneStream::_padAddedCb(GstElement* /*decoder*/, GstPad* pad, gpointer data) {
    // A second sound track, or a picture, goes nowhere.
    const GstPtr<GstPad> input(gst_element_get_static_pad(GST_ELEMENT(data), "sink"));
    if (!gst_pad_is_linked(input.get()) && isAudio(pad))
        gst_pad_link(pad, input.get());
}

GstBusSyncReply ToneStream::_messageCb(GstBus* /*bus*/, GstMessage* message, gpointer data) {
    auto* self = static_cast<ToneStream*>(data);
    GError* error = nullptr;
    switch (GST_MESSAGE_TYPE(message)) {
    case GST_MESSAGE_EOS:
        self->end(std::nullopt);
        break;
    case GST_MESSAGE_ERROR:
        gst_message_parse_error(message, &error, nullptr);
        self->end(textOf(GErrorPtr(error)));
        break;
    case GST_MESSAGE_WARNING:
        gst_message_parse_warning(message, &error, nullptr);
        LOG_WARNING("%s", textOf(GErrorPtr(error)).c_str());
        break;
    default:
        break;
    }
    // Nobody reads the bus.
    gst_message_unref(message);
    return GST_BUS_DROP;
}

void ToneStream::_elementAddedCb(GstBin* /*pipeline*/, GstBin* /*parent*/, GstElement* element,
                                 gpointer /*data*/) {
    GParamSpec* property = g_object_class_find_property(G_OBJECT_GET_CLASS(element), "buffer-time");
    if (property && property->value_type == G_TYPE_INT64)
        g_object_set(element, "buffer-time", BUFFER_TIME, nullptr);
}

} // namespace host
