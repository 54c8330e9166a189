// The local date, behind one function so that tests can fix it.
#include <cstdio>
#include <ctime>

#include "legacy/legacy_internal.h"

namespace vorlite::legacy {

namespace {

const LocalDate* fixed_date = nullptr;

}  // namespace

void set_date_for_tests(const LocalDate* date) { fixed_date = date; }

LocalDate current_date() {
    if (fixed_date != nullptr) return *fixed_date;
    const std::time_t now = std::time(nullptr);
    std::tm local{};
    if (localtime_r(&now, &local) == nullptr) return LocalDate{1970, 1, 1, 4};
    return LocalDate{local.tm_year + 1900, local.tm_mon + 1, local.tm_mday, local.tm_wday};
}

std::string date_text(const LocalDate& date) {
    static constexpr const char* k_days[] = {"SUN", "MON", "TUE", "WED", "THU", "FRI", "SAT"};
    static constexpr const char* k_months[] = {"JAN", "FEB", "MAR", "APR", "MAY", "JUN",
                                               "JUL", "AUG", "SEP", "OCT", "NOV", "DEC"};
    const int weekday = date.weekday >= 0 && date.weekday <= 6 ? date.weekday : 0;
    const int month = date.month >= 1 && date.month <= 12 ? date.month : 1;
    const int day = date.day >= 1 && date.day <= 31 ? date.day : 1;
    const int year = date.year >= 0 && date.year <= 9999 ? date.year : 1970;
    char text[32];
    std::snprintf(text, sizeof text, "%s %s %02d %d", k_days[weekday], k_months[month - 1], day, year);
    return text;
}

}  // namespace vorlite::legacy
