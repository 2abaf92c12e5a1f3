#include "model/CimDateTime.h"

#include <cstdint>
#include <stdexcept>

namespace tvxbroker {

namespace {

constexpr std::uint64_t microsPerSecond = 1000000;
constexpr std::uint64_t secondsPerDay = 86400;
constexpr std::uint64_t microsPerDay = microsPerSecond * secondsPerDay;
constexpr std::size_t textLength = 25;
constexpr std::size_t signPosition = 21;

struct CivilDate {
    std::int64_t year;
    unsigned month;
    unsigned day;
};

// Days are counted in eras of 400 years that start on 1 March, where the
// leap day falls last; this keeps the month lengths a linear formula.
std::int64_t daysFromCivil(CivilDate date) {
    const std::int64_t y = date.year - (date.month <= 2 ? 1 : 0);
    const std::int64_t era = (y >= 0 ? y : y - 399) / 400;
    const std::int64_t yearOfEra = y - era * 400;
    const unsigned monthFromMarch = date.month > 2 ? date.month - 3 : date.month + 9;
    const std::int64_t dayOfYear = (153 * monthFromMarch + 2) / 5 + date.day - 1;
    const std::int64_t dayOfEra = yearOfEra * 365 + yearOfEra / 4 - yearOfEra / 100 + dayOfYear;
    return era * 146097 + dayOfEra - 719468;
}

CivilDate civilFromDays(std::int64_t days) {
    const std::int64_t z = days + 719468;
    const std::int64_t era = (z >= 0 ? z : z - 146096) / 146097;
    const std::int64_t dayOfEra = z - era * 146097;
    const std::int64_t yearOfEra = (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
    const std::int64_t dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
    const std::int64_t monthFromMarch = (5 * dayOfYear + 2) / 153;
    const auto day = static_cast<unsigned>(dayOfYear - (153 * monthFromMarch + 2) / 5 + 1);
    const auto month = static_cast<unsigned>(monthFromMarch < 10 ? monthFromMarch + 3 : monthFromMarch - 9);
    return {yearOfEra + era * 400 + (month <= 2 ? 1 : 0), month, day};
}

unsigned daysInMonth(std::int64_t year, unsigned month) {
    static const unsigned lengths[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    const bool leap = (year % 4 == 0 && year % 100 != 0) || year % 400 == 0;
    return month == 2 && leap ? 29 : lengths[month - 1];
}

void appendDigits(std::string &out, std::uint64_t value, std::size_t width) {
    std::string digits(width, '0');
    for (std::size_t i = width; i-- > 0; value /= 10) digits[i] = static_cast<char>('0' + value % 10);
    out += digits;
}

bool readDigits(const std::string &text, std::size_t pos, std::size_t width, std::uint64_t &value) {
    value = 0;
    for (std::size_t i = pos; i < pos + width; ++i) {
        if (text[i] < '0' || text[i] > '9') return false;
        value = value * 10 + static_cast<unsigned>(text[i] - '0');
    }
    return true;
}

// The hours, minutes, seconds and microseconds both forms end with.
bool readTimeOfDay(const std::string &text, std::uint64_t &micros) {
    std::uint64_t hours, minutes, seconds, fraction;
    if (!readDigits(text, 8, 2, hours) || !readDigits(text, 10, 2, minutes) ||
        !readDigits(text, 12, 2, seconds) || text[14] != '.' || !readDigits(text, 15, 6, fraction)) {
        return false;
    }
    if (hours > 23 || minutes > 59 || seconds > 59) return false;
    micros = ((hours * 60 + minutes) * 60 + seconds) * microsPerSecond + fraction;
    return true;
}

void appendTimeOfDay(std::string &out, std::uint64_t micros) {
    const std::uint64_t seconds = micros / microsPerSecond;
    appendDigits(out, seconds / 3600, 2);
    appendDigits(out, seconds / 60 % 60, 2);
    appendDigits(out, seconds % 60, 2);
    out += '.';
    appendDigits(out, micros % microsPerSecond, 6);
}

bool parseInterval(const std::string &text, DateTime &value) {
    std::uint64_t days, timeOfDay;
    if (!readDigits(text, 0, 8, days) || !readTimeOfDay(text, timeOfDay) || text.compare(22, 3, "000") != 0) {
        return false;
    }
    value = {days * microsPerDay + timeOfDay, true};
    return true;
}

bool parsePointInTime(const std::string &text, DateTime &value) {
    std::uint64_t year, month, day, timeOfDay, offsetMinutes;
    if (!readDigits(text, 0, 4, year) || !readDigits(text, 4, 2, month) || !readDigits(text, 6, 2, day) ||
        !readTimeOfDay(text, timeOfDay) || !readDigits(text, 22, 3, offsetMinutes)) {
        return false;
    }
    if (month < 1 || month > 12 || day < 1 || day > daysInMonth(static_cast<std::int64_t>(year), unsigned(month))) {
        return false;
    }
    const std::int64_t days = daysFromCivil({static_cast<std::int64_t>(year), unsigned(month), unsigned(day)});
    // The local time is UTC shifted by the offset, so UTC is the local time shifted back.
    const std::int64_t offset = static_cast<std::int64_t>(offsetMinutes * 60 * microsPerSecond);
    const std::int64_t utc = days * std::int64_t(microsPerDay) + std::int64_t(timeOfDay) +
                             (text[signPosition] == '+' ? -offset : offset);
    if (utc < 0) return false;
    value = {static_cast<std::uint64_t>(utc), false};
    return true;
}

}  // namespace

std::string formatCimDateTime(const DateTime &value) {
    const std::uint64_t days = value.microseconds / microsPerDay;
    const std::uint64_t timeOfDay = value.microseconds % microsPerDay;
    std::string out;
    if (value.interval) {
        if (days > 99999999) throw std::out_of_range("interval longer than 99999999 days");
        appendDigits(out, days, 8);
        appendTimeOfDay(out, timeOfDay);
        return out + ":000";
    }
    const CivilDate date = civilFromDays(static_cast<std::int64_t>(days));
    if (date.year > 9999) throw std::out_of_range("point in time after the year 9999");
    appendDigits(out, static_cast<std::uint64_t>(date.year), 4);
    appendDigits(out, date.month, 2);
    appendDigits(out, date.day, 2);
    appendTimeOfDay(out, timeOfDay);
    return out + "+000";
}

bool parseCimDateTime(const std::string &text, DateTime &value) {
    if (text.size() != textLength) return false;
    switch (text[signPosition]) {
    case ':':
        return parseInterval(text, value);
    case '+':
    case '-':
        return parsePointInTime(text, value);
    default:
        return false;
    }
}

}  // namespace tvxbroker
