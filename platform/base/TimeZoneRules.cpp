#include "base/TimeZoneRules.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <limits>
#include <map>
#include <optional>

#include "base/CivilTime.h"
#include "base/Days.h"

namespace base {

namespace {

constexpr std::int64_t SECONDS_PER_DAY = 86400;
constexpr int CYCLE_YEARS = 400;
constexpr std::int64_t CYCLE_SECONDS = 146097 * SECONDS_PER_DAY;
constexpr std::int64_t FOREVER = std::numeric_limits<std::int64_t>::max();
constexpr std::int64_t BEGINNING = std::numeric_limits<std::int64_t>::min();
constexpr std::int32_t LARGEST_OFFSET = 26 * 3600;
// No real zone has changes further away: about the year 36800.
constexpr std::int64_t LATEST_CHANGE = std::int64_t(1) << 40;
// Leaves room for sums with offsets and cycles.
constexpr std::int64_t FARTHEST_INSTANT = std::int64_t(1) << 61;
constexpr std::size_t LARGEST_FILE = std::size_t(1) << 20;

/** Reads big-endian numbers from a text and remembers whether it was long enough. */
class Reader {
public:
    explicit Reader(std::string_view content) : _rest(content) {}

    std::string_view take(std::size_t size) {
        if (size > _rest.size()) {
            _failed = true;
            _rest = {};
            return {};
        }
        const auto head = _rest.substr(0, size);
        _rest.remove_prefix(size);
        return head;
    }

    std::int64_t number(std::size_t bytes) {
        std::uint64_t value = 0;
        const auto digits = take(bytes);
        for (const char digit : digits)
            value = (value << 8) | static_cast<unsigned char>(digit);
        if (bytes == 4)
            return static_cast<std::int32_t>(static_cast<std::uint32_t>(value));
        return static_cast<std::int64_t>(value);
    }

    bool failed() const { return _failed; }
    std::string_view rest() const { return _rest; }

private:
    std::string_view _rest;
    bool _failed = false;
};

} // namespace

struct TimeZoneFileHeader {
    char version = 0;
    std::size_t utcIndicators = 0;
    std::size_t standardIndicators = 0;
    std::size_t leapSeconds = 0;
    std::size_t changes = 0;
    std::size_t types = 0;
    std::size_t characters = 0;

    std::size_t blockSize(std::size_t timeBytes) const {
        return changes * (timeBytes + 1) + types * 6 + characters + leapSeconds * (timeBytes + 4) +
               standardIndicators + utcIndicators;
    }
};

namespace {

std::optional<TimeZoneFileHeader> readHeader(Reader& reader) {
    if (reader.take(4) != "TZif")
        return std::nullopt;
    TimeZoneFileHeader header;
    const auto version = reader.take(1);
    header.version = version.empty() ? '\0' : version.front();
    reader.take(15);
    for (auto* count : {&header.utcIndicators, &header.standardIndicators, &header.leapSeconds,
                        &header.changes, &header.types, &header.characters})
        *count = static_cast<std::size_t>(reader.number(4)) & 0xffffffU;
    if (reader.failed())
        return std::nullopt;
    return header;
}

/** Walks over a POSIX TZ rule. */
class RuleReader {
public:
    explicit RuleReader(std::string_view rule) : _rest(rule) {}

    bool atEnd() const { return _rest.empty(); }
    char next() const { return _rest.empty() ? '\0' : _rest.front(); }

    bool skip(char expected) {
        if (next() != expected)
            return false;
        _rest.remove_prefix(1);
        return true;
    }

    bool name() {
        const bool quoted = skip('<');
        std::size_t length = 0;
        while (length < _rest.size() && isNameCharacter(_rest[length], quoted))
            ++length;
        _rest.remove_prefix(length);
        return length >= 3 && (!quoted || skip('>'));
    }

    std::optional<int> number(int limit) {
        int value = 0;
        std::size_t digits = 0;
        while (digits < _rest.size() && digits < 4 && isDigit(_rest[digits]))
            value = value * 10 + (_rest[digits++] - '0');
        _rest.remove_prefix(digits);
        if (digits == 0 || value > limit)
            return std::nullopt;
        return value;
    }

    /** [+-]hh[:mm[:ss]] in seconds. */
    std::optional<std::int32_t> time(int hourLimit) {
        const bool negative = skip('-');
        if (!negative)
            skip('+');
        const auto hours = number(hourLimit);
        if (!hours)
            return std::nullopt;
        std::int32_t seconds = *hours * 3600;
        for (const int unit : {60, 1}) {
            if (!skip(':'))
                break;
            const auto part = number(59);
            if (!part)
                return std::nullopt;
            seconds += *part * unit;
        }
        return negative ? -seconds : seconds;
    }

private:
    static bool isDigit(char c) { return c >= '0' && c <= '9'; }
    static bool isNameCharacter(char c, bool quoted) {
        const bool letter = (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
        return letter || (quoted && (isDigit(c) || c == '+' || c == '-'));
    }

    std::string_view _rest;
};

/** The day and time of a yearly change. */
struct YearlyChange {
    enum class Form { MonthWeekDay, DayWithoutLeapDay, DayOfYear };
    Form form = Form::MonthWeekDay;
    int month = 0;
    int week = 0;
    int day = 0;
    std::int32_t time = 2 * 3600;

    /** The change's wall clock reading in a year, as seconds without regard to the offset. */
    std::int64_t inYear(int year) const {
        const auto firstDay = daysFromCivil({year, 1, 1});
        switch (form) {
        case Form::DayOfYear:
            return (firstDay + day) * SECONDS_PER_DAY + time;
        case Form::DayWithoutLeapDay: {
            const bool afterLeapDay = day >= 60 && daysInMonth(year, 2) == 29;
            return (firstDay + day - 1 + (afterLeapDay ? 1 : 0)) * SECONDS_PER_DAY + time;
        }
        case Form::MonthWeekDay:
            break;
        }
        const CivilDate first{year, month, 1};
        int dayOfMonth = 1 + (day - weekdayOf(first) + 7) % 7 + (week - 1) * 7;
        if (dayOfMonth > daysInMonth(year, month))
            dayOfMonth -= 7;
        return (daysFromCivil(first) + dayOfMonth - 1) * SECONDS_PER_DAY + time;
    }
};

bool readMonthWeekDay(RuleReader& reader, YearlyChange& change) {
    const auto month = reader.number(12);
    if (!month || *month < 1 || !reader.skip('.'))
        return false;
    const auto week = reader.number(5);
    if (!week || *week < 1 || !reader.skip('.'))
        return false;
    const auto day = reader.number(6);
    if (!day)
        return false;
    change.month = *month;
    change.week = *week;
    change.day = *day;
    return true;
}

std::optional<YearlyChange> readYearlyChange(RuleReader& reader) {
    YearlyChange change;
    if (reader.skip('M')) {
        if (!readMonthWeekDay(reader, change))
            return std::nullopt;
    } else {
        const bool julian = reader.skip('J');
        change.form =
            julian ? YearlyChange::Form::DayWithoutLeapDay : YearlyChange::Form::DayOfYear;
        const auto day = reader.number(365);
        if (!day || (julian && *day == 0))
            return std::nullopt;
        change.day = *day;
    }
    if (reader.skip('/')) {
        const auto time = reader.time(167);
        if (!time)
            return std::nullopt;
        change.time = *time;
    }
    return change;
}

} // namespace

struct YearlyRule {
    std::int32_t standardOffset = 0;
    bool hasSummerTime = false;
    std::int32_t summerOffset = 0;
    YearlyChange toSummer;
    YearlyChange toStandard;
};

namespace {

bool readSummerTime(RuleReader& reader, YearlyRule& rule) {
    if (!reader.name())
        return false;
    rule.hasSummerTime = true;
    rule.summerOffset = rule.standardOffset + 3600;
    if (!reader.atEnd() && reader.next() != ',') {
        const auto west = reader.time(24);
        if (!west)
            return false;
        rule.summerOffset = -*west;
    }
    // Without dates POSIX leaves the choice to the system; the C library takes these.
    RuleReader dates = reader.atEnd() ? RuleReader(",M3.2.0,M11.1.0") : reader;
    if (!dates.skip(','))
        return false;
    const auto toSummer = readYearlyChange(dates);
    if (!toSummer || !dates.skip(','))
        return false;
    const auto toStandard = readYearlyChange(dates);
    if (!toStandard || !dates.atEnd())
        return false;
    rule.toSummer = *toSummer;
    rule.toStandard = *toStandard;
    return true;
}

std::optional<YearlyRule> readRule(std::string_view text) {
    RuleReader reader(text);
    YearlyRule rule;
    if (!reader.name())
        return std::nullopt;
    const auto west = reader.time(24);
    if (!west)
        return std::nullopt;
    rule.standardOffset = -*west;
    if (!reader.atEnd() && !readSummerTime(reader, rule))
        return std::nullopt;
    return rule;
}

std::string zoneFolder() {
    const char* folder = std::getenv("TZDIR");
    return folder && *folder ? folder : "/usr/share/zoneinfo";
}

bool isSafeName(std::string_view id) {
    return !id.empty() && id.size() < 128 && id.front() != '/' &&
           id.find("..") == std::string_view::npos && id.find('\0') == std::string_view::npos;
}

std::string readFile(const std::string& path) {
    std::ifstream file(path, std::ios::binary);
    std::string content;
    std::array<char, 4096> block{};
    while (content.size() < LARGEST_FILE &&
           (file.read(block.data(), block.size()), file.gcount() > 0))
        content.append(block.data(), static_cast<std::size_t>(file.gcount()));
    return content;
}

std::shared_ptr<const TimeZoneRules> load(const std::string& folder, const std::string& id) {
    if (!isSafeName(id))
        return nullptr;
    if (auto zone = TimeZoneRules::fromFile(readFile(folder + "/" + id)))
        return zone;
    return TimeZoneRules::fromRule(id);
}

} // namespace

std::shared_ptr<const TimeZoneRules> TimeZoneRules::find(const std::string& id) {
    static std::map<std::pair<std::string, std::string>, std::shared_ptr<const TimeZoneRules>>
        zones;
    const auto folder = zoneFolder();
    const auto key = std::make_pair(folder, id);
    if (const auto known = zones.find(key); known != zones.end())
        return known->second;
    auto zone = load(folder, id);
    // Unknown ids are not remembered: there is no end of them.
    if (zone)
        zones.emplace(key, zone);
    return zone;
}

std::shared_ptr<const TimeZoneRules> TimeZoneRules::fromFile(std::string_view content) {
    Reader reader(content);
    auto header = readHeader(reader);
    std::size_t timeBytes = 4;
    if (header && header->version >= '2') {
        reader.take(header->blockSize(timeBytes));
        header = readHeader(reader);
        timeBytes = 8;
    }
    if (!header || header->types == 0 || header->blockSize(timeBytes) > reader.rest().size())
        return nullptr;
    auto zone = std::make_shared<TimeZoneRules>();
    if (!zone->readChanges(reader.take(header->blockSize(timeBytes)), *header, timeBytes))
        return nullptr;
    auto footer = reader.rest();
    if (timeBytes == 8 && footer.size() >= 2 && footer.front() == '\n') {
        footer.remove_prefix(1);
        zone->appendRule(footer.substr(0, footer.find('\n')));
    }
    return zone;
}

bool TimeZoneRules::readChanges(std::string_view block, const TimeZoneFileHeader& header,
                                std::size_t timeBytes) {
    Reader reader(block);
    _changes.resize(header.changes);
    for (auto& change : _changes)
        change.instant = reader.number(timeBytes);
    const auto types = reader.take(header.changes);
    std::vector<std::int32_t> offsets(header.types);
    for (auto& offset : offsets) {
        offset = static_cast<std::int32_t>(reader.number(4));
        reader.take(2);
        if (offset > LARGEST_OFFSET || offset < -LARGEST_OFFSET)
            return false;
    }
    _firstOffset = offsets.front();
    for (std::size_t i = 0; i < header.changes; ++i) {
        const auto type = static_cast<unsigned char>(types[i]);
        if (type >= header.types || (i > 0 && _changes[i].instant <= _changes[i - 1].instant))
            return false;
        _changes[i].offset = offsets[type];
    }
    return !reader.failed();
}

std::shared_ptr<const TimeZoneRules> TimeZoneRules::fromRule(std::string_view text) {
    const auto rule = readRule(text);
    if (!rule)
        return nullptr;
    auto zone = std::make_shared<TimeZoneRules>();
    zone->_firstOffset = rule->standardOffset;
    zone->appendRule(text);
    return zone;
}

std::vector<TimeZoneRules::Change> TimeZoneRules::changesOf(const YearlyRule& rule, int firstYear,
                                                            int lastYear) {
    std::vector<Change> changes;
    for (int year = firstYear; year <= lastYear; ++year) {
        changes.push_back({rule.toSummer.inYear(year) - rule.standardOffset, rule.summerOffset});
        changes.push_back({rule.toStandard.inYear(year) - rule.summerOffset, rule.standardOffset});
    }
    std::stable_sort(changes.begin(), changes.end(),
                     [](const Change& a, const Change& b) { return a.instant < b.instant; });
    return changes;
}

void TimeZoneRules::appendRule(std::string_view text) {
    const auto rule = readRule(text);
    if (!rule || !rule->hasSummerTime)
        return;
    const auto last = _changes.empty() ? BEGINNING : _changes.back().instant;
    if (last > LATEST_CHANGE)
        return;
    const int firstYear =
        last < -LATEST_CHANGE ? 1900 : civilFromDays(floorDivide(last, SECONDS_PER_DAY)).year;
    const auto yearly = changesOf(*rule, firstYear, firstYear + CYCLE_YEARS + 3);
    auto offset = _changes.empty() ? _firstOffset : _changes.back().offset;
    for (std::size_t i = 0; i < yearly.size(); ++i) {
        const auto& change = yearly[i];
        // Summer time all the year: one change ends it and another begins it at once.
        const bool undone = i + 1 < yearly.size() && yearly[i + 1].instant == change.instant;
        if (change.instant <= last || undone || change.offset == offset)
            continue;
        _changes.push_back(change);
        offset = change.offset;
    }
    _cycleBegin = daysFromCivil({firstYear + 2, 1, 1}) * SECONDS_PER_DAY;
    _cyclic = true;
}

TimeZoneRules::Period TimeZoneRules::periodAt(std::int64_t instant) const {
    instant = std::clamp(instant, -FARTHEST_INSTANT, FARTHEST_INSTANT);
    std::int64_t shift = 0;
    if (_cyclic && instant >= _cycleBegin + CYCLE_SECONDS)
        shift = (instant - _cycleBegin) / CYCLE_SECONDS * CYCLE_SECONDS;
    const auto next =
        std::upper_bound(_changes.begin(), _changes.end(), instant - shift,
                         [](std::int64_t wanted, const Change& c) { return wanted < c.instant; });
    Period period{BEGINNING, FOREVER, _firstOffset};
    if (next != _changes.begin()) {
        period.begin = std::prev(next)->instant + shift;
        period.offset = std::prev(next)->offset;
    }
    if (next != _changes.end())
        period.end = next->instant + shift;
    return period;
}

} // namespace base
