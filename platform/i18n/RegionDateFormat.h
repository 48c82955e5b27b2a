// Event dates (YYYYMMDD, year 0 = no year) as text in the user's region
// format (vconf "db/menu_widget/regionformat").
#pragma once

#include "utils_i18n.h"

#include <string>

namespace ct::i18n {

enum class Year { Shown, Hidden };

// The region format as an ICU locale name ("en_US", "de_DE"); "en_US" when
// the key is unset, unreadable or not a plausible locale name.
std::string regionFormat();

// A formatter of the locale's medium date, with year ("yMMMd") or without
// ("MMMd"), for `locale` (the region format when empty), in UTC. The caller
// destroys it with i18n_udate_destroy; nullptr on failure (logged).
i18n_udate_h createEventDateFormatter(Year year, const std::string& locale = {});

// Noon UTC of a calendar day, for formatters in UTC; false (logged) when the
// day does not exist. Year 0 stands for "no year" and uses a leap year, so
// that 29 February stays a valid day.
bool eventDayToUdate(int year, int month, int day, i18n_udate* out);

// The text of an event date with `formatter`; "" for an impossible date.
std::string formatEventDate(i18n_udate_h formatter, int yyyymmdd);

} // namespace ct::i18n
