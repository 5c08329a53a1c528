/**
 * @file
 * @brief Owners of GStreamer's objects.
 */
#pragma once

#include <memory>

#include <gst/gst.h>

namespace host {

struct GstUnref {
    void operator()(void* object) const { gst_object_unref(object); }
};

/** A reference to an element, a pad or a bus. */
template <typename T>
using GstPtr = std::unique_ptr<T, GstUnref>;

struct GErrorFree {
    void operator()(GError* error) const { g_error_free(error); }
};
using GErrorPtr = std::unique_ptr<GError, GErrorFree>;

struct GFree {
    void operator()(void* memory) const { g_free(memory); }
};
using GText = std::unique_ptr<gchar, GFree>;

struct GstCapsUnref {
    void operator()(GstCaps* caps) const { gst_caps_unref(caps); }
};
using GstCapsPtr = std::unique_ptr<GstCaps, GstCapsUnref>;

} // namespace host
