#include "support/TextFaults.h"

#include <algorithm>
#include <string_view>
#include <utility>

#include <Evas.h>
#include <unicode/uchar.h>
#include <unicode/unistr.h>

#include "support/TextInk.h"

namespace {

bool isA(const FoundText& found, std::string_view type) {
    return evas_object_type_get(found.object) == type;
}

/** The width of a line that has all the room it wants. */
int fullWidth(const FoundText& found) {
    const char* font = nullptr;
    int size = 0;
    evas_object_text_font_get(found.object, &font, &size);
    Evas_Object* const copy = evas_object_text_add(evas_object_evas_get(found.object));
    evas_object_text_font_set(copy, font, size);
    evas_object_text_text_set(copy, found.text.c_str());
    int width = 0;
    evas_object_geometry_get(copy, nullptr, nullptr, &width, nullptr);
    evas_object_del(copy);
    return width;
}

/** One screen must not mix two forms of digits. */
bool hasOtherDigits(const std::string& text) {
    const auto unicode = icu::UnicodeString::fromUTF8(text);
    for (int32_t at = 0; at < unicode.length(); at = unicode.moveIndex32(at, 1))
        if (u_isdigit(unicode.char32At(at)) && unicode.char32At(at) > u'9')
            return true;
    return false;
}

/** How much of a line its clips leave, before a row near the rim is drawn smaller as a whole. */
int shownWidth(const FoundText& found) {
    int left = 0;
    int width = 0;
    evas_object_geometry_get(found.object, &left, nullptr, &width, nullptr);
    int right = left + width;
    for (const Evas_Object* clip = evas_object_clip_get(found.object); clip;
         clip = evas_object_clip_get(clip)) {
        int x = 0;
        evas_object_geometry_get(clip, &x, nullptr, &width, nullptr);
        left = std::max(left, x);
        right = std::min(right, x + width);
    }
    return right - left;
}

} // namespace

bool isCut(const FoundText& found) {
    return isA(found, "text") && fullWidth(found) > shownWidth(found);
}

bool isTooLow(const FoundText& found) {
    if (!isA(found, "textblock"))
        return false;
    int height = 0;
    int place = 0;
    evas_object_textblock_size_formatted_get(found.object, nullptr, &height);
    evas_object_geometry_get(found.object, nullptr, nullptr, nullptr, &place);
    return height > place;
}

std::vector<std::string> faultsOf(const std::vector<FoundText>& texts) {
    std::vector<std::string> faults;
    for (const FoundText& found : texts) {
        if (found.text.find("IDS_") != std::string::npos)
            faults.push_back(found.text + " has no translation");
        else if (hasOtherDigits(found.text))
            faults.push_back(found.text + " has other digits");
        else if (isCut(found))
            faults.push_back(found.text + " is cut");
        else if (isTooLow(found))
            faults.push_back(found.text + " is too low");
        else if (endsInDots(found))
            faults.push_back(found.text + " ends in dots");
    }
    for (std::string& fault : inkFaultsOf(texts))
        faults.push_back(std::move(fault));
    return faults;
}
