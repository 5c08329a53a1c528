/**
 * @file
 * @brief One file on its way to the sound card.
 */
#pragma once

#include <atomic>
#include <functional>
#include <memory>
#include <optional>
#include <string>

#include "Gst.h"

namespace host {

/**
 * @brief Decodes a file and plays it.
 *
 * Opening a sound card may take its time: all but setGain() is for a thread that may wait.
 */
class ToneStream {
public:
    /** Receives why the sound has ended: nothing when the file was played to its end. Called on
     *  threads of GStreamer's, once for each play() and rewind(). */
    using Ended = std::function<void(const std::optional<std::string>& problem)>;

    /**
     * @param sink What the sound goes to, in the words of gst-launch; empty for this machine's
     *             sound card.
     * @param[out] problem Set when null is returned.
     */
    static std::unique_ptr<ToneStream> open(const std::string& path, const std::string& sink,
                                            Ended ended, std::string& problem);
    /** Stops; Ended is not called any more. */
    ~ToneStream();
    ToneStream(const ToneStream&) = delete;
    ToneStream& operator=(const ToneStream&) = delete;

    void play();
    /** Plays from the beginning what has ended. @return False when this file has to be opened
     *  again. */
    bool rewind();
    /** Sets the factor of every sample, 0 to 1. Any thread may, at any time. */
    void setGain(double gain);

private:
    explicit ToneStream(Ended ended);

    bool build(const std::string& path, const std::string& sinkWords, std::string& problem);
    bool addAndLink(GstElement* source, GstElement* decoder, GstElement* resampler,
                    GstElement* sink);
    void end(const std::optional<std::string>& problem);
    static void _padAddedCb(GstElement* decoder, GstPad* pad, gpointer data);
    static GstBusSyncReply _messageCb(GstBus* bus, GstMessage* message, gpointer data);
    static void _elementAddedCb(GstBin* pipeline, GstBin* parent, GstElement* element, gpointer);

    Ended _ended;
    std::atomic<bool> _hasEnded = false;
    GstPtr<GstElement> _pipeline;
    /** The pipeline's own. */
    GstElement* _converter = nullptr;
    GstElement* _volume = nullptr;
};

} // namespace host
