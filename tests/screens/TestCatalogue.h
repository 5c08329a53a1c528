/**
 * @file
 * @brief Message catalogues that a test makes up.
 */
#pragma once

#include <initializer_list>
#include <string>
#include <utility>

/**
 * @brief Replaces the catalogue of the text domain "clock" as long as it lives.
 *
 * Texts that it does not have read as their identifiers. The toolkit is told, as it is when a
 * person chooses another language.
 */
class TestCatalogue {
public:
    TestCatalogue(std::initializer_list<std::pair<const std::string, std::string>> texts);
    ~TestCatalogue();
    TestCatalogue(const TestCatalogue&) = delete;
    TestCatalogue& operator=(const TestCatalogue&) = delete;

private:
    std::string _folder;
};

/**
 * @brief Shows the texts of a language's own catalogue as long as it lives.
 *
 * Texts that it does not have read as their identifiers.
 */
class CatalogueLanguage {
public:
    explicit CatalogueLanguage(const std::string& language);
    ~CatalogueLanguage();
    CatalogueLanguage(const CatalogueLanguage&) = delete;
    CatalogueLanguage& operator=(const CatalogueLanguage&) = delete;
};
