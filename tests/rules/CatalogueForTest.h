// The language of the process and its texts, for the length of a test.
#pragma once

#include <clocale>
#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <libintl.h>
#include <map>
#include <string>

class CatalogueForTest {
public:
    using Texts = std::map<std::string, std::string>; // Sorted, as the file format wants it.

    explicit CatalogueForTest(const char* language, const Texts& texts = {}) {
        std::string folder = (std::filesystem::temp_directory_path() / "catalogue-XXXXXX").string();
        _folder = mkdtemp(folder.data());
        if (const char* before = std::getenv("LANGUAGE"))
            _languageBefore = before;
        _localeBefore = setlocale(LC_ALL, nullptr);
        setLanguage(language);
        setlocale(LC_ALL, "C.UTF-8");
        write(language, texts);
        bindtextdomain("clock", _folder.c_str());
        bind_textdomain_codeset("clock", "UTF-8");
    }
    ~CatalogueForTest() {
        setenv("LANGUAGE", _languageBefore.c_str(), 1);
        setlocale(LC_ALL, _localeBefore.c_str());
        std::filesystem::remove_all(_folder);
    }
    CatalogueForTest(const CatalogueForTest&) = delete;
    CatalogueForTest& operator=(const CatalogueForTest&) = delete;

    static void setLanguage(const char* language) { setenv("LANGUAGE", language, 1); }

private:
    void write(const std::string& language, Texts texts) const {
        texts[""] = "Content-Type: text/plain; charset=UTF-8\n";
        const auto folder = _folder + "/" + language + "/LC_MESSAGES";
        std::filesystem::create_directories(folder);
        std::ofstream file(folder + "/clock.mo", std::ios::binary);
        const auto count = static_cast<std::uint32_t>(texts.size());
        std::string pool;
        std::string tables[2];
        const auto append = [&](std::string& table, const std::string& text) {
            for (const auto number : {static_cast<std::uint32_t>(text.size()),
                                      static_cast<std::uint32_t>(28 + 16 * count + pool.size())})
                table.append(reinterpret_cast<const char*>(&number), 4);
            pool.append(text.c_str(), text.size() + 1);
        };
        for (const auto& [id, text] : texts) {
            append(tables[0], id);
            append(tables[1], text);
        }
        for (const std::uint32_t number :
             {0x950412deU, 0U, count, 28U, 28U + 8U * count, 0U, 28U + 16U * count})
            file.write(reinterpret_cast<const char*>(&number), 4);
        file << tables[0] << tables[1] << pool;
    }

    std::string _folder;
    std::string _languageBefore;
    std::string _localeBefore;
};
