#include "screens/TestCatalogue.h"

#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <map>
#include <vector>

#include <Elementary.h>
#include <libintl.h>

namespace {

constexpr const char* BUILT_CATALOGUES = CLOCK_RESOURCE_DIR "/locale";

/** The catalogue in the binary form of GNU gettext. */
std::string compile(std::map<std::string, std::string> texts) {
    texts[""] = "Content-Type: text/plain; charset=UTF-8\n";
    const auto count = static_cast<std::uint32_t>(texts.size());
    constexpr std::uint32_t HEADER = 28;
    std::vector<std::uint32_t> words = {0x950412de,         0, count, HEADER, HEADER + 8 * count, 0,
                                        HEADER + 16 * count};
    std::string strings;
    const auto table = [&](bool translations) {
        for (const auto& [id, text] : texts) {
            const std::string& entry = translations ? text : id;
            words.push_back(static_cast<std::uint32_t>(entry.size()));
            words.push_back(HEADER + 16 * count + static_cast<std::uint32_t>(strings.size()));
            strings += entry;
            strings += '\0';
        }
    };
    table(false);
    table(true);
    return std::string(reinterpret_cast<const char*>(words.data()), words.size() * 4) + strings;
}

void use(const std::string& folder, const char* language) {
    setenv("LANGUAGE", language, 1);
    bindtextdomain("clock", folder.c_str());
    textdomain("clock");
    elm_language_set("C.UTF-8");
}

} // namespace

TestCatalogue::TestCatalogue(
    std::initializer_list<std::pair<const std::string, std::string>> texts) {
    _folder = std::filesystem::temp_directory_path() / "catalogue-XXXXXX";
    mkdtemp(_folder.data());
    const std::filesystem::path messages = _folder + "/xx/LC_MESSAGES";
    std::filesystem::create_directories(messages);
    std::ofstream(messages / "clock.mo", std::ios::binary)
        << compile(std::map<std::string, std::string>(texts));
    use(_folder, "xx");
}

TestCatalogue::~TestCatalogue() {
    use(BUILT_CATALOGUES, "en");
    std::error_code ignored;
    std::filesystem::remove_all(_folder, ignored);
}

CatalogueLanguage::CatalogueLanguage(const std::string& language) {
    use(BUILT_CATALOGUES, language.c_str());
}

CatalogueLanguage::~CatalogueLanguage() {
    use(BUILT_CATALOGUES, "en");
}
