#include "rules/CollationElements.h"

#include <cstddef>

#include <unicode/localpointer.h>
#include <unicode/ubrk.h>
#include <unicode/ucol.h>
#include <unicode/ucoleitr.h>
#include <unicode/unorm2.h>
#include <unicode/utf16.h>

namespace rules {

namespace {

// Letters up to here stand for themselves: no boundary rule joins two of them but CR and LF.
constexpr char16_t FIRST_MARK = 0x300;

// An element and its place in the text. One that is not the first of its character lies behind the
// character and is of no length.
struct PlacedElement {
    std::uint64_t weights = 0;
    std::int32_t low = 0;
    std::int32_t high = 0;

    bool continues() const { return low == high; }
    bool hasPrimary() const { return weights >> 48U != 0; }
};

bool isPlain(std::u16string_view text) {
    for (const char16_t unit : text) {
        if (unit >= FIRST_MARK || unit == u'\r')
            return false;
    }
    return true;
}

// Where the characters of a text, as a person counts them, begin and end.
class Boundaries {
public:
    explicit Boundaries(const char* locale) {
        UErrorCode status = U_ZERO_ERROR;
        _iterator.adoptInstead(ubrk_open(UBRK_CHARACTER, locale, nullptr, 0, &status));
    }

    bool isUsable() const { return _iterator.isValid(); }

    void setText(std::u16string_view text) {
        _boundaries.assign(text.size() + 1, true);
        if (isPlain(text))
            return;
        _boundaries.assign(text.size() + 1, false);
        UErrorCode status = U_ZERO_ERROR;
        ubrk_setText(_iterator.getAlias(), text.data(), static_cast<std::int32_t>(text.size()),
                     &status);
        for (auto place = ubrk_first(_iterator.getAlias()); place != UBRK_DONE;
             place = ubrk_next(_iterator.getAlias()))
            _boundaries[static_cast<std::size_t>(place)] = true;
    }

    bool contain(std::int32_t place) const { return _boundaries[static_cast<std::size_t>(place)]; }

    // The next one behind a place; -1 behind the last.
    std::int32_t after(std::int32_t place) const {
        const auto size = static_cast<std::int32_t>(_boundaries.size());
        while (++place < size) {
            if (contain(place))
                return place;
        }
        return -1;
    }

private:
    icu::LocalUBreakIteratorPointer _iterator;
    std::vector<bool> _boundaries;
};

bool isNormalizationBoundary(std::u16string_view text, std::int32_t place) {
    UErrorCode status = U_ZERO_ERROR;
    const UNormalizer2* form = unorm2_getNFDInstance(&status);
    if (U_FAILURE(status))
        return false;
    const auto size = static_cast<std::int32_t>(text.size());
    UChar32 before = 0;
    UChar32 behind = 0;
    U16_GET(text.data(), 0, place, size, behind);
    std::int32_t start = place;
    U16_PREV(text.data(), 0, start, before);
    return unorm2_hasBoundaryBefore(form, behind) || unorm2_hasBoundaryAfter(form, before);
}

} // namespace

class CollationElements::Reader {
public:
    explicit Reader(const std::string& locale);

    bool isUsable() const { return _collator.isValid() && _iterator && _boundaries->isUsable(); }
    const std::vector<CollationElement>& ofText(std::u16string_view text);
    std::vector<std::uint64_t> ofPattern(std::u16string_view pattern);

private:
    void read(std::u16string_view text);
    std::uint64_t weightsOf(std::uint32_t element);
    bool mayEndBefore(std::u16string_view text, const PlacedElement& last,
                      const PlacedElement& next) const;
    bool mayEndInside(std::u16string_view text, const PlacedElement& last,
                      const PlacedElement& next) const;

    icu::LocalUCollatorPointer _collator;
    std::unique_ptr<UCollationElements, decltype(&ucol_closeElements)> _iterator{
        nullptr, ucol_closeElements};
    std::unique_ptr<Boundaries> _boundaries;
    // Punctuation and spaces count for nothing in some languages.
    bool _shifts = false;
    std::uint32_t _variableTop = 0;
    bool _afterShifted = false;
    bool _saysSomething = false;
    std::vector<PlacedElement> _placed; // With one behind the last.
    std::vector<CollationElement> _elements;
};

CollationElements::Reader::Reader(const std::string& locale) {
    UErrorCode status = U_ZERO_ERROR;
    _collator.adoptInstead(ucol_open(locale.c_str(), &status));
    if (U_FAILURE(status))
        return;
    _shifts =
        ucol_getAttribute(_collator.getAlias(), UCOL_ALTERNATE_HANDLING, &status) == UCOL_SHIFTED;
    _variableTop = ucol_getVariableTop(_collator.getAlias(), &status);
    _boundaries = std::make_unique<Boundaries>(
        ucol_getLocaleByType(_collator.getAlias(), ULOC_VALID_LOCALE, &status));
    _iterator.reset(ucol_openElements(_collator.getAlias(), u"", 0, &status));
}

// The weights that are compared; 0 for an element that is passed over.
std::uint64_t CollationElements::Reader::weightsOf(std::uint32_t element) {
    const auto order = static_cast<std::int32_t>(element);
    const auto primary = static_cast<std::uint64_t>(ucol_primaryOrder(order)) & 0xffffU;
    // What follows a shifted element without a letter of its own belongs to it.
    _afterShifted = primary == 0 ? _afterShifted : _shifts && element < _variableTop;
    if (_afterShifted)
        return 0;
    const auto secondary = static_cast<std::uint64_t>(ucol_secondaryOrder(order)) & 0xffU;
    const auto tertiary = static_cast<std::uint64_t>(ucol_tertiaryOrder(order)) & 0xffU;
    return primary << 48U | secondary << 32U | tertiary << 16U;
}

void CollationElements::Reader::read(std::u16string_view text) {
    _placed.clear();
    _afterShifted = false;
    _saysSomething = false;
    UErrorCode status = U_ZERO_ERROR;
    auto* iterator = _iterator.get();
    ucol_setText(iterator, text.data(), static_cast<std::int32_t>(text.size()), &status);
    while (U_SUCCESS(status)) {
        const auto low = ucol_getOffset(iterator);
        const auto element = ucol_next(iterator, &status);
        if (element == UCOL_NULLORDER)
            break;
        const auto weights = weightsOf(static_cast<std::uint32_t>(element));
        if (weights != 0)
            _placed.push_back({weights, low, ucol_getOffset(iterator)});
        if (element != 0 && (!_shifts || static_cast<std::uint32_t>(element) >= _variableTop))
            _saysSomething = true;
    }
    const auto end = static_cast<std::int32_t>(text.size());
    _placed.push_back({0, end, end});
}

const std::vector<CollationElement>& CollationElements::Reader::ofText(std::u16string_view text) {
    read(text);
    _boundaries->setText(text);
    _elements.clear();
    for (std::size_t place = 0; place + 1 < _placed.size(); ++place) {
        const auto& element = _placed[place];
        const bool begins = !element.continues() && _boundaries->contain(element.low);
        const bool ends = mayEndBefore(text, element, _placed[place + 1]);
        _elements.push_back({element.weights, begins, ends});
    }
    return _elements;
}

std::vector<std::uint64_t> CollationElements::Reader::ofPattern(std::u16string_view pattern) {
    read(pattern);
    std::vector<std::uint64_t> weights;
    if (!_saysSomething)
        return weights;
    for (std::size_t place = 0; place + 1 < _placed.size(); ++place)
        weights.push_back(_placed[place].weights);
    return weights;
}

// Inside of what a person takes for one character, as between a consonant and a vowel sign.
bool CollationElements::Reader::mayEndInside(std::u16string_view text, const PlacedElement& last,
                                             const PlacedElement& next) const {
    return static_cast<std::size_t>(next.low) < text.size() && next.hasPrimary() &&
           next.low >= last.high && isNormalizationBoundary(text, next.low);
}

// What ICU's search asks of the end of a match.
bool CollationElements::Reader::mayEndBefore(std::u16string_view text, const PlacedElement& last,
                                             const PlacedElement& next) const {
    const bool isEnd = &next == &_placed.back();
    if (next.continues() && !isEnd)
        return false;
    if (mayEndInside(text, last, next))
        return true;
    if (last.low == next.low)
        return _boundaries->contain(next.low);
    if (last.continues() && _boundaries->contain(last.low))
        return true;
    // The character must be over where the next element begins.
    const auto boundary = _boundaries->after(last.low);
    return boundary >= last.high ? boundary <= next.low : _boundaries->contain(next.low);
}

CollationElements::CollationElements(const std::string& locale)
    : _reader(std::make_unique<Reader>(locale)) {}

CollationElements::~CollationElements() = default;

bool CollationElements::isUsable() const {
    return _reader->isUsable();
}

const std::vector<CollationElement>& CollationElements::ofText(std::u16string_view text) {
    return _reader->ofText(text);
}

std::vector<std::uint64_t> CollationElements::ofPattern(std::u16string_view pattern) {
    return _reader->ofPattern(pattern);
}

} // namespace rules
