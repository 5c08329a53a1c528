#define LOG_TAG "alarm-ui-common"
#include "AlarmToneItem.h"

#include <cstdlib>
#include <cstring>
#include <memory>
#include <string_view>

#include <Ecore_File.h>

#include <base/Log.h>
#include <base/Text.h>
#include <clock/ClockText.h>
#include <device/metadata_extractor.h>

#include "NullData.h"
#include "rules/ToneName.h"

namespace {

constexpr std::size_t PATH_SIZE = 4096;
constexpr std::size_t NAME_SIZE = 512;

using Text = std::unique_ptr<char, decltype(&std::free)>;

struct ExtractorDestroy {
    void operator()(metadata_extractor_h extractor) const { metadata_extractor_destroy(extractor); }
};
using Extractor = std::unique_ptr<metadata_extractor_s, ExtractorDestroy>;

Extractor createExtractor() {
    metadata_extractor_h extractor = nullptr;
    const int result = metadata_extractor_create(&extractor);
    return Extractor(result == METADATA_EXTRACTOR_ERROR_NONE ? extractor : nullptr);
}

// Null for a file without a title to show.
Text titleOf(const char* path, metadata_extractor_h extractor) {
    Text title(nullptr, &std::free);
    if (metadata_extractor_set_path(extractor, path) != METADATA_EXTRACTOR_ERROR_NONE) {
        LOG_WARNING("metadata() set_path failed");
        return title;
    }
    char* value = nullptr;
    if (metadata_extractor_get_metadata(extractor, METADATA_TITLE, &value) !=
        METADATA_EXTRACTOR_ERROR_NONE) {
        LOG_WARNING("metadata() get failed");
        return title;
    }
    title.reset(value);
    if (title && !*title) {
        LOG_WARNING("metadata() title_length is 0");
        title.reset();
    }
    return title;
}

} // namespace

AlarmToneItem::AlarmToneItem(ClockAlarmDbData& alarm) : _alarm(alarm) {}

AlarmToneItem::~AlarmToneItem() = default;

Elm_Genlist_Item_Class* AlarmToneItem::getItemClassNew() {
    Elm_Genlist_Item_Class* itemClass = elm_genlist_item_class_new();
    itemClass->item_style = "2line.top";
    itemClass->func.text_get = _getToneItemText;
    itemClass->func.del = deleteCb;
    return itemClass;
}

void AlarmToneItem::onSelect(Elm_Object_Item*) {
    if (_selected)
        _selected();
}

void AlarmToneItem::setSelectedCb(const std::function<void()>& selected) {
    _selected = selected;
}

char* AlarmToneItem::_getToneItemText(void* data, Evas_Object*, const char* part) {
    RETURN_IF_NULL(data, nullptr);
    const std::string_view name(part ? part : "");
    if (name == "elm.text.main.left.top")
        return strdup(clockText("IDS_CLOCK_TMBODY_ALARM_TONE"));
    if (name == "elm.text.sub.left.bottom")
        return static_cast<AlarmToneItem*>(data)->toneText();
    return nullptr;
}

char* AlarmToneItem::toneText() {
    // What is shown is what rings, so the record follows.
    if (!ecore_file_exists(_alarm.soundPath.c_str())) {
        LOG_ERROR("There is no Tone File !! Set default Tone File(Alarm_Impatient)");
        _alarm.soundPath = CLOCK_ALARM_DEFAULT_TONE;
    }
    char path[PATH_SIZE] = {};
    char name[NAME_SIZE] = {};
    base::copyUtf8(path, sizeof path, _alarm.soundPath);
    _getToneName(path, name, sizeof name);
    return elm_entry_utf8_to_markup(name);
}

void AlarmToneItem::_getToneName(char* path, char* name, int size) {
    if (!path || !name || size <= 0) {
        LOG_WARNING("Param value invalid, return");
        return;
    }
    const Extractor extractor = createExtractor();
    if (!extractor) {
        LOG_WARNING("metadata() create failed");
        return;
    }
    const auto room = static_cast<std::size_t>(size);
    std::memset(name, 0, room);
    if (const Text title = titleOf(path, extractor.get()))
        base::copyUtf8(name, room, title.get());
    else
        base::copyUtf8(name, room, rules::toneFileName(path));
}
