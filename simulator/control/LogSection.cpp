#include "LogSection.h"

#include <utility>

#include <Elementary.h>

#include "ControlWidgets.h"
#include "TimeText.h"
#include "device/dlog.h"

namespace simulator::control {
namespace {

const char* styleOf(const LogLine& line) {
    if (line.text.starts_with("Toast: "))
        return "toast";
    switch (line.priority) {
    case DLOG_ERROR:
        return "error";
    case DLOG_WARN:
        return "warning";
    case DLOG_INFO:
        return "info";
    default:
        return "debug";
    }
}

std::string markupOfLine(const LogLine& line) {
    const std::string style = styleOf(line);
    return "<time>" + line.time + "</time>  <" + style + ">" + markupOf(line.text) + "</" + style +
           ">";
}

} // namespace

LogSection::LogSection(Evas_Object* column, std::shared_ptr<const LogLines> lines)
    : _lines(std::move(lines)), _scroller(elm_scroller_add(column)),
      _text(elm_layout_add(_scroller)) {
    prepare(_scroller, "Log");
    elm_object_style_set(_scroller, PLAIN);
    elm_scroller_bounce_set(_scroller, EINA_FALSE, EINA_FALSE);
    elm_scroller_content_min_limit(_scroller, EINA_FALSE, EINA_FALSE);
    evas_object_size_hint_weight_set(_scroller, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
    evas_object_size_hint_align_set(_scroller, EVAS_HINT_FILL, EVAS_HINT_FILL);
    evas_object_show(_scroller);
    elm_box_pack_end(column, _scroller);
    elm_layout_theme_set(_text, "simulator", "control", "log");
    evas_object_size_hint_weight_set(_text, EVAS_HINT_EXPAND, 0);
    evas_object_size_hint_align_set(_text, EVAS_HINT_FILL, 0);
    evas_object_name_set(_text, "Log lines");
    elm_object_content_set(_scroller, _text);
    elm_object_part_text_set(_text, "log.text", "<debug>Toasts and log lines come here.</debug>");
    refresh();
}

bool LogSection::showsEnd() const {
    int y = 0;
    int height = 0;
    int whole = 0;
    elm_scroller_region_get(_scroller, nullptr, &y, nullptr, &height);
    evas_object_geometry_get(_text, nullptr, nullptr, nullptr, &whole);
    constexpr int NEAR = 24;
    return y + height >= whole - NEAR;
}

void LogSection::refresh() {
    const std::size_t count = _lines->count();
    if (count == _shown)
        return;
    const bool follow = _shown == 0 || showsEnd();
    _shown = count;
    std::string markup;
    for (const LogLine& line : _lines->lines())
        markup += (markup.empty() ? "" : "<br/>") + markupOfLine(line);
    elm_object_part_text_set(_text, "log.text", markup.c_str());
    elm_layout_sizing_eval(_text);
    if (!follow)
        return;
    // The new height is known a turn later.
    _toEnd.reset(ecore_job_add(_toEndCb, this));
}

void LogSection::_toEndCb(void* data) {
    auto* self = static_cast<LogSection*>(data);
    // The main loop deletes a job that runs.
    static_cast<void>(self->_toEnd.release());
    int height = 0;
    evas_object_geometry_get(self->_text, nullptr, nullptr, nullptr, &height);
    elm_scroller_region_show(self->_scroller, 0, height - 1, 1, 1);
}

} // namespace simulator::control
