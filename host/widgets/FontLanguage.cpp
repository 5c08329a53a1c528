#include "FontLanguage.h"

#include <array>
#include <cstdlib>
#include <set>
#include <string_view>
#include <vector>

#include <dlfcn.h>
#include <unistd.h>

#include <Ecore_Evas.h>
#include <Elementary.h>
#include <unicode/locid.h>

#include "EvasLists.h"
#include "device/export.h"

#define LOG_TAG "device-host"
#include "base/Log.h"

// The toolkit takes the language of a text from the C library's locale, which is often C alone.
// These functions come before its own and add the language of the device.

namespace {

constexpr std::string_view FONT_ATTRIBUTE = ":lang=";
constexpr std::string_view BLOCK_ATTRIBUTE = " lang=";
constexpr std::string_view BLOCK_START = "DEFAULT='";

/** As fontconfig writes it; empty where fonts need not know. */
std::string& language() {
    static std::string code;
    return code;
}

std::set<Evas_Textblock_Style*>& styles() {
    static std::set<Evas_Textblock_Style*> all;
    return all;
}

template <typename Function>
Function stockOf(Function, const char* name) {
    return reinterpret_cast<Function>(dlsym(RTLD_NEXT, name));
}

std::string codeOf(const std::string& name) {
    icu::Locale locale(name.c_str());
    UErrorCode status = U_ZERO_ERROR;
    locale.addLikelySubtags(status);
    const std::string_view code = locale.getLanguage();
    if (code == "zh")
        return std::string_view(locale.getScript()) == "Hant" ? "zh-tw" : "zh-cn";
    return code == "ja" || code == "ko" ? std::string(code) : "";
}

std::string plainFont(const std::string& font) {
    const auto from = font.find(FONT_ATTRIBUTE);
    if (from == std::string::npos)
        return font;
    const auto to = font.find(':', from + 1);
    return font.substr(0, from) + (to == std::string::npos ? "" : font.substr(to));
}

std::string fontWithLanguage(const std::string& font) {
    if (language().empty() || font.empty() || font.find(FONT_ATTRIBUTE) != std::string::npos)
        return font;
    return font + std::string(FONT_ATTRIBUTE) + language();
}

/** Where the first format of a style ends; npos when it has none. */
std::size_t endOfDefault(const std::string& style) {
    const auto start = style.find(BLOCK_START);
    if (start == std::string::npos)
        return start;
    std::size_t end = start + BLOCK_START.size();
    while (end < style.size() && style[end] != '\'')
        end += style[end] == '\\' ? 2 : 1;
    return end < style.size() ? end : std::string::npos;
}

std::string plainStyle(std::string style) {
    const auto end = endOfDefault(style);
    const auto from = end == std::string::npos ? end : style.rfind(BLOCK_ATTRIBUTE, end);
    if (from != std::string::npos)
        style.erase(from, end - from);
    return style;
}

std::string styleWithLanguage(std::string style) {
    const auto end = endOfDefault(style);
    if (end != std::string::npos && !language().empty() &&
        style.rfind(BLOCK_ATTRIBUTE, end) == std::string::npos)
        style.insert(end, std::string(BLOCK_ATTRIBUTE) + language());
    return style;
}

void drawTextAnew(Evas_Object* text) {
    const char* font = nullptr;
    Evas_Font_Size size = 0;
    evas_object_text_font_get(text, &font, &size);
    if (font)
        evas_object_text_font_set(text, plainFont(font).c_str(), size);
}

void drawTextsAnew(Evas_Object* object) {
    if (std::string_view(evas_object_type_get(object)) == "text")
        drawTextAnew(object);
    for (Evas_Object* member : host::membersOf(object))
        drawTextsAnew(member);
}

void drawWindowsAnew() {
    for (const Ecore_Evas* window : host::takeList<Ecore_Evas>(ecore_evas_ecore_evas_list_get())) {
        const Evas* canvas = ecore_evas_get(window);
        for (Evas_Object* object = evas_object_bottom_get(canvas); object;
             object = evas_object_above_get(object))
            if (!evas_object_smart_parent_get(object))
                drawTextsAnew(object);
    }
}

} // namespace

namespace host {

void chooseFonts(const std::string& folder) {
    const std::string file = folder + "/fonts.conf";
    // With a file that is missing there would be no fonts at all.
    if (access(file.c_str(), R_OK) == 0)
        setenv("FONTCONFIG_FILE", file.c_str(), 0);
    else
        LOG_WARNING("%s is missing, characters may have the forms of another language",
                    file.c_str());
}

void setFontLanguage(const std::string& locale) {
    const std::string code = codeOf(locale);
    if (code == language())
        return;
    language() = code;
    for (Evas_Textblock_Style* style : styles())
        if (const char* text = evas_textblock_style_get(style))
            evas_textblock_style_set(style, plainStyle(text).c_str());
    drawWindowsAnew();
}

} // namespace host

DEVICE_EXTERN_C_BEGIN

DEVICE_API void evas_object_text_font_set(Evas_Object* object, const char* font,
                                          Evas_Font_Size size) {
    static const auto stock = stockOf(&evas_object_text_font_set, "evas_object_text_font_set");
    if (stock)
        stock(object, font ? fontWithLanguage(font).c_str() : nullptr, size);
}

DEVICE_API Evas_Textblock_Style* evas_textblock_style_new(void) {
    static const auto stock = stockOf(&evas_textblock_style_new, "evas_textblock_style_new");
    Evas_Textblock_Style* style = stock ? stock() : nullptr;
    if (style)
        styles().insert(style);
    return style;
}

DEVICE_API void evas_textblock_style_free(Evas_Textblock_Style* style) {
    static const auto stock = stockOf(&evas_textblock_style_free, "evas_textblock_style_free");
    styles().erase(style);
    if (stock)
        stock(style);
}

DEVICE_API void evas_textblock_style_set(Evas_Textblock_Style* style, const char* text) {
    static const auto stock = stockOf(&evas_textblock_style_set, "evas_textblock_style_set");
    if (stock)
        stock(style, text ? styleWithLanguage(text).c_str() : nullptr);
}

DEVICE_EXTERN_C_END
