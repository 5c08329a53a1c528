// A text as ICU's string search sees it: the weights of its collation elements, and between which
// of them a match may begin and end.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace rules {

struct CollationElement {
    std::uint64_t weights = 0;
    bool begins = false; // A match may begin with this element.
    bool ends = false;   // A match may end with it.
};

// Takes texts apart by the collation of one locale.
class CollationElements {
public:
    explicit CollationElements(const std::string& locale);
    ~CollationElements();
    CollationElements(const CollationElements&) = delete;
    CollationElements& operator=(const CollationElements&) = delete;

    // False when ICU knows no collation at all: nothing is found then.
    bool isUsable() const;

    // The elements of a text that is searched in.
    const std::vector<CollationElement>& ofText(std::u16string_view text);

    // The weights of a text that is searched for; empty when it says nothing in this locale.
    std::vector<std::uint64_t> ofPattern(std::u16string_view pattern);

private:
    class Reader;
    std::unique_ptr<Reader> _reader;
};

} // namespace rules
