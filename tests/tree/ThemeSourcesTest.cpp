// The sources of the themes: numbers come from the vocabulary, and code, themes and docs/THEME.md
// name the same things.

#include <algorithm>
#include <cstdlib>
#include <regex>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "Tree.h"

namespace fs = std::filesystem;

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

/** Smaller lengths are parts of a shape; from here on a length has a name. */
constexpr int NAMED_FROM = 17;
constexpr const char* VOCABULARY = "edje/vocabulary/";

bool isThemeSource(const std::string& file) {
    return file.ends_with(".edc") && !file.starts_with(VOCABULARY) && !file.starts_with("tests/");
}

std::vector<std::string> linesOf(const fs::path& file) {
    std::vector<std::string> lines;
    std::istringstream text(contentsOf(file));
    for (std::string line; std::getline(text, line);)
        lines.push_back(line);
    return lines;
}

std::set<std::string> matches(const std::string& text, const std::regex& form, std::size_t group) {
    std::set<std::string> found;
    for (std::sregex_iterator match(text.begin(), text.end(), form), end; match != end; ++match)
        found.insert((*match)[group]);
    return found;
}

bool hasLongNumber(const std::string& value) {
    static const std::regex number(R"((^|[^A-Za-z0-9_.])(\d+)(?![A-Za-z0-9_.]))");
    for (const auto& digits : matches(value, number, 2)) {
        if (std::atoi(digits.c_str()) >= NAMED_FROM)
            return true;
    }
    return false;
}

std::set<std::string> typeSizesIn(const fs::path& file) {
    static const std::regex size(R"(#define (?:\w+_)?TYPE_\w+ (\d+))");
    return matches(contentsOf(file), size, 1);
}

/** Those of every face, and those that a theme names for itself at its top. */
std::set<std::string> typeSizes(const fs::path& root, const std::string& file) {
    std::set<std::string> sizes = typeSizesIn(root / VOCABULARY / "sizes.edc");
    sizes.merge(typeSizesIn(root / file));
    return sizes;
}

/** What is wrong with a line; empty when nothing is. */
std::string faultOf(const std::string& line, const std::set<std::string>& sizes) {
    static const std::regex length(R"((?:^|[\s.])(?:min|max|offset|size|size_range): *([^;]*);)");
    static const std::regex font(R"(\bfont: *")");
    static const std::regex fontSize(R"(font_size=(\d+))");
    static const std::regex colour(R"((?:^|[\s.])color: *(?!255 255 255 |0 0 0 )\d)");
    static const std::regex textColour(R"(color=#)");
    static const std::regex seconds(R"(transition: *\w+ +[\d.])");
    if (line.starts_with("#define ") && line.find('(') == std::string::npos)
        return "";
    if (line.find(" image: ") == std::string::npos)
        for (const auto& value : matches(line, length, 1))
            if (hasLongNumber(value))
                return "length " + value;
    if (std::regex_search(line, font))
        return "font";
    for (const auto& size : matches(line, fontSize, 1))
        if (!sizes.contains(size))
            return "font size " + size;
    if (std::regex_search(line, colour) || std::regex_search(line, textColour))
        return "colour";
    return std::regex_search(line, seconds) ? "seconds" : "";
}

std::vector<std::string> literals(const fs::path& root) {
    std::vector<std::string> found;
    for (const auto& file : filesOf(root)) {
        if (!isThemeSource(file))
            continue;
        const auto sizes = typeSizes(root, file);
        int number = 0;
        for (const auto& line : linesOf(root / file)) {
            ++number;
            if (const auto fault = faultOf(line, sizes); !fault.empty())
                found.push_back(std::string(file)
                                    .append(":")
                                    .append(std::to_string(number))
                                    .append(": ")
                                    .append(fault));
        }
    }
    return found;
}

/** Everything that stands in quotes in the themes. */
std::set<std::string> themeNames(const fs::path& root) {
    static const std::regex quoted(R"re("([^"\n]+)")re");
    std::set<std::string> names;
    for (const auto& file : filesOf(root))
        if (file.ends_with(".edc"))
            names.merge(matches(contentsOf(root / file), quoted, 1));
    return names;
}

/** A signal of a theme with a star in it stands for several. */
bool isPattern(const std::string& known, const std::string& name) {
    const auto star = known.find('*');
    return star != std::string::npos && star > 0 && name.starts_with(known.substr(0, star)) &&
           name.ends_with(known.substr(star + 1));
}

/** True for the name itself and for part of a longer one: "elm.swallow.prev_btn". */
bool isInTheme(const std::set<std::string>& names, const std::string& name) {
    return std::any_of(names.begin(), names.end(), [&](const std::string& known) {
        return known == name || known.ends_with("." + name) || known.ends_with("/" + name) ||
               known.find("/" + name + "/") != std::string::npos ||
               known.find(" " + name) != std::string::npos || name.ends_with("/" + known) ||
               isPattern(known, name);
    });
}

bool isWidgetCode(const std::string& file) {
    return isSource(file) &&
           (file.starts_with("src/") || file.starts_with("host/") ||
            file.starts_with("simulator/") || file.starts_with("platform/app_assist/"));
}

std::set<std::string> widgetCode(const fs::path& root) {
    std::set<std::string> texts;
    for (const auto& file : filesOf(root))
        if (isWidgetCode(file))
            texts.insert(contentsOf(root / file));
    return texts;
}

/** The groups of layouts by their class, group and style. */
std::set<std::string> layoutGroups(const std::string& text) {
    static const std::regex form(
        R"re(layout_theme_set\([^,;]+,\s*"([^"]+)",\s*"([^"]+)",\s*"([^"]+)"\))re");
    std::set<std::string> groups;
    for (std::sregex_iterator match(text.begin(), text.end(), form), end; match != end; ++match)
        groups.insert("elm/" + (*match)[1].str() + "/" + (*match)[2].str() + "/" +
                      (*match)[3].str());
    return groups;
}

/** The parts, styles, groups and signals that code asks the themes for. */
std::set<std::string> codeNames(const fs::path& root) {
    static const std::vector<std::regex> forms{
        std::regex(R"re(part_content_set\([^,;]+,\s*"([^"]+)")re"),
        std::regex(R"re(part_content_unset\([^,;]+,\s*"([^"]+)")re"),
        std::regex(R"re(part_text_set\([^,;]+,\s*"([^"]+)")re"),
        std::regex(R"re(part_drag_value_set\([^,;]+,\s*"([^"]+)")re"),
        std::regex(R"re(style_set\([^,;]+,\s*"([^"]+)")re"),
        std::regex(R"re(layout_file_set\([^;]+,\s*"([^"]+)"\))re"),
        std::regex(R"re(signal_(?:emit|callback_add)\([^,;]+,\s*"([^"]+)")re"),
        std::regex(R"re(item_style = "([^"]+)")re"),
        std::regex(R"re((?:STYLE|PART|GROUP|SIGNAL|DATA)_\w+ = "([^"]+)")re"),
        // The looks of the control panel's widgets.
        std::regex(R"re(inline constexpr const char\* (?:PLAIN|KEY|SET) = "([^"]+)")re"),
    };
    // Parts that the toolkit makes out of others, and its own events.
    static const std::set<std::string> toolkit{"title,text", "guide", "elm,action,focus",
                                               "elm,action,unfocus", "default"};
    std::set<std::string> names;
    for (const auto& text : widgetCode(root)) {
        for (const auto& form : forms)
            names.merge(matches(text, form, 1));
        names.merge(layoutGroups(text));
    }
    std::erase_if(names, [](const std::string& name) { return toolkit.contains(name); });
    return names;
}

/**
 * What a theme offers to code and not to the toolkit: texts and places for other things, layouts
 * of the simulator, and signals whose source is the device or the simulator.
 */
std::set<std::string> offeredNames(const std::string& theme) {
    static const std::vector<std::regex> forms{
        std::regex(R"re(part \{ name: "([^"]+)"; type: (?:TEXT|TEXTBLOCK|SWALLOW);)re"),
        std::regex(R"re(dragable[^}]*confine: "([^"]+)")re"),
        std::regex(R"re(group \{ name: "elm/simulator/control/([^"]+)")re"),
        std::regex(R"re(signal: "([^"]+)"; source: "(?:device|simulator)")re"),
        std::regex(R"re(SIGNAL_EMIT "([^"]+)" "(?:device|simulator)")re"),
    };
    std::set<std::string> names;
    for (const auto& form : forms)
        names.merge(matches(theme, form, 1));
    std::erase_if(names, [](const std::string& name) { return name.starts_with("elm"); });
    return names;
}

/** What themes offer and no code uses. */
std::vector<std::string> unused(const fs::path& root) {
    static const std::regex quoted(R"re("([^"\n]+)")re");
    // The toolkit writes the first, the others are for their own group alone.
    static const std::set<std::string> own{"month_text", "title.full", "text.full", "bar",
                                           "volume.track"};
    std::set<std::string> used = own;
    for (const auto& text : widgetCode(root))
        used.merge(matches(text, quoted, 1));
    std::vector<std::string> found;
    for (const auto& file : filesOf(root)) {
        if (!isThemeSource(file))
            continue;
        for (const auto& name : offeredNames(contentsOf(root / file)))
            if (!used.contains(name) && !name.starts_with("cit_"))
                found.push_back(std::string(file).append(": ").append(name));
    }
    return found;
}

std::set<std::string> documentedNames(const fs::path& root) {
    static const std::regex code(R"(`([^`\n]+)`)");
    return matches(contentsOf(root / "docs/THEME.md"), code, 1);
}

std::vector<std::string> unknownToThemes(const fs::path& root) {
    const auto names = themeNames(root);
    std::vector<std::string> missing;
    for (const auto& name : codeNames(root))
        if (!isInTheme(names, name))
            missing.push_back(name);
    return missing;
}

std::vector<std::string> undocumented(const fs::path& root) {
    const auto documented = documentedNames(root);
    std::vector<std::string> missing;
    for (const auto& name : codeNames(root)) {
        if (!isInTheme(documented, name) &&
            std::none_of(documented.begin(), documented.end(), [&](const std::string& known) {
                return known.find(name) != std::string::npos;
            }))
            missing.push_back(name);
    }
    return missing;
}

/** Parts and signals of docs/THEME.md that no theme has. */
std::vector<std::string> outdated(const fs::path& root) {
    static const std::regex form(R"((elm|device|edit|timepicker|calendar|wheel)[.,][a-z0-9_.,]+)");
    const auto names = themeNames(root);
    std::vector<std::string> gone;
    for (const auto& name : documentedNames(root)) {
        const bool isFile = name.ends_with(".edj") || name.ends_with(".edc");
        if (!isFile && std::regex_match(name, form) && !isInTheme(names, name) &&
            !name.starts_with("elm.cit_") && !name.starts_with("elm.ch_") &&
            contentsOf(root / "docs/THEME.md").find("no part\n`" + name) == std::string::npos)
            gone.push_back(name);
    }
    return gone;
}

} // namespace

TEST(ThemeSources, NumbersFontsAndColoursComeFromTheVocabulary) {
    EXPECT_THAT(literals(CLOCK_SOURCE_DIR), IsEmpty());
}

TEST(ThemeSources, WhatCodeAsksForIsInATheme) {
    EXPECT_THAT(codeNames(CLOCK_SOURCE_DIR), testing::SizeIs(testing::Gt(50U)));
    EXPECT_THAT(unknownToThemes(CLOCK_SOURCE_DIR), IsEmpty());
}

TEST(ThemeSources, WhatThemesOfferIsUsed) {
    EXPECT_THAT(unused(CLOCK_SOURCE_DIR), IsEmpty());
}

TEST(ThemeSources, WhatCodeAsksForIsDocumented) {
    EXPECT_THAT(undocumented(CLOCK_SOURCE_DIR), IsEmpty());
}

TEST(ThemeSources, WhatIsDocumentedIsInATheme) {
    EXPECT_THAT(outdated(CLOCK_SOURCE_DIR), IsEmpty());
}

TEST(ThemeSources, LiteralsAreFound) {
    const PlantedTree tree;
    tree.plant("edje/vocabulary/sizes.edc", "#define TYPE_BODY 22\n");
    tree.plant("host/theme/groups/a.edc", "description { min: 0 48; }\n"
                                          "description { min: 0 TOUCH; max: -1 8; }\n"
                                          "text { size: 22; }\n"
                                          "text { font: \"Roboto\"; }\n"
                                          "base: \"font_size=21\";\n"
                                          "base: \"font_size=22\";\n"
                                          "description { color: 12 0 0 255; }\n"
                                          "description { color: 0 0 0 0; }\n"
                                          "tag: \"a\" \"+ color=#ffd166\";\n"
                                          "program { transition: LINEAR 0.3; }\n");
    EXPECT_THAT(
        literals(tree.root()),
        ElementsAre("host/theme/groups/a.edc:1: length 0 48",
                    "host/theme/groups/a.edc:3: length 22", "host/theme/groups/a.edc:4: font",
                    "host/theme/groups/a.edc:5: font size 21", "host/theme/groups/a.edc:7: colour",
                    "host/theme/groups/a.edc:9: colour", "host/theme/groups/a.edc:10: seconds"));
}

TEST(ThemeSources, AThemeMayNameTypeSizesOfItsOwn) {
    const PlantedTree tree;
    tree.plant("edje/vocabulary/sizes.edc", "#define TYPE_BODY 22\n");
    tree.plant("simulator/control.edc", "#define CONTROL_TYPE_TEXT 12\nbase: \"font_size=12\";\n");
    tree.plant("simulator/simulator.edc", "base: \"font_size=12\";\n");
    EXPECT_THAT(literals(tree.root()), ElementsAre("simulator/simulator.edc:1: font size 12"));
}

TEST(ThemeSources, WhatNoCodeUsesIsFound) {
    const PlantedTree tree;
    tree.plant("simulator/control.edc", "group { name: \"elm/simulator/control/lamp\";\n"
                                        "part { name: \"lamp.text\"; type: TEXT; mouse_events: 0;\n"
                                        "part { name: \"lamp.ring\"; type: IMAGE;\n"
                                        "part { name: \"elm.text\"; type: TEXT;\n"
                                        "program { signal: \"lamp,on\"; source: \"simulator\"; }\n"
                                        "program { signal: \"elm,state,on\"; source: \"elm\"; }\n"
                                        "action: SIGNAL_EMIT \"lamp,lit\" \"simulator\"; }\n");
    tree.plant("simulator/control/Lamp.cpp",
               "elm_layout_theme_set(lamp, \"simulator\", \"control\", \"lamp\");\n"
               "elm_object_signal_emit(lamp, \"lamp,on\", \"simulator\");\n");
    EXPECT_THAT(unused(tree.root()),
                ElementsAre("simulator/control.edc: lamp,lit", "simulator/control.edc: lamp.text"));
}

TEST(ThemeSources, NamesThatDoNotMatchAreFound) {
    const PlantedTree tree;
    tree.plant("host/theme/groups/a.edc", "part { name: \"elm.text\"; } part { name: \"new\"; }\n");
    tree.plant("src/Page.cpp", "elm_object_part_text_set(page, \"elm.text\", \"a\");\n"
                               "elm_object_part_content_set(page, \"lost\", icon);\n"
                               "elm_layout_signal_emit(page, \"elm,state,lost\", \"elm\");\n"
                               "elm_layout_theme_set(page, \"layout\", \"gone\", \"b\");\n"
                               "constexpr const char* PART_OLD = \"old\";\n");
    tree.plant("docs/THEME.md", "`elm.text` and `elm.gone` and `lost`\n");
    EXPECT_THAT(unknownToThemes(tree.root()),
                ElementsAre("elm,state,lost", "elm/layout/gone/b", "lost", "old"));
    EXPECT_THAT(undocumented(tree.root()),
                ElementsAre("elm,state,lost", "elm/layout/gone/b", "old"));
    EXPECT_THAT(outdated(tree.root()), ElementsAre("elm.gone"));
}
