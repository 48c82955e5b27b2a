#include "RegionDateFormat.h"

#include "ContactsDebug.h"
#include "vconf.h"

#include <unicode/gregocal.h>
#include <unicode/timezone.h>

#include <cctype>
#include <cstdlib>
#include <memory>

namespace ct::i18n {
namespace {

const char* const kDefaultRegion = "en_US";
// A leap year standing in for "no year".
const int kYearlessYear = 2000;

// Letters, digits, '_', '-' and '@=' for ICU keywords; anything else is garbage.
bool isPlausibleLocale(const std::string& name)
{
	if (name.empty() || name.size() > 64 || !isalpha((unsigned char)name[0]))
		return false;
	for (char c : name) {
		if (!isalnum((unsigned char)c) && c != '_' && c != '-' && c != '@' && c != '=' && c != ';')
			return false;
	}
	return true;
}

} // namespace

std::string regionFormat()
{
	char* value = vconf_get_str(VCONFKEY_REGIONFORMAT);
	if (!value) {
		WWARNING("vconf_get_str(%s) failed; using %s", VCONFKEY_REGIONFORMAT, kDefaultRegion);
		return kDefaultRegion;
	}
	std::string name(value);
	free(value);
	size_t dot = name.find('.');
	if (dot != std::string::npos)
		name.erase(dot);
	if (!isPlausibleLocale(name)) {
		WERROR("bad region format '%s'; using %s", name.c_str(), kDefaultRegion);
		return kDefaultRegion;
	}
	return name;
}

i18n_udate_h createEventDateFormatter(Year year, const std::string& locale)
{
	std::string name = locale.empty() ? regionFormat() : locale;
	const char* skeleton = year == Year::Shown ? "yMMMd" : "MMMd";
	i18n_udate_h formatter = nullptr;
	int err = i18n_udate_create_from_skeleton(skeleton, name.c_str(), "UTC", &formatter);
	if (err != I18N_ERROR_NONE) {
		WFAILED("i18n_udate_create_from_skeleton", err);
		return nullptr;
	}
	return formatter;
}

bool eventDayToUdate(int year, int month, int day, i18n_udate* out)
{
	if (!out || year < 0 || year > 9999 || month < 1 || month > 12 || day < 1 || day > 31) {
		WERROR("Invalid date(year=%d,mon=%d,day=%d)", year, month, day);
		return false;
	}
	UErrorCode status = U_ZERO_ERROR;
	icu::GregorianCalendar calendar(icu::TimeZone::getGMT()->clone(), status);
	calendar.setLenient(false);
	calendar.clear();
	calendar.set(year == 0 ? kYearlessYear : year, month - 1, day, 12, 0, 0);
	UDate date = calendar.getTime(status);
	if (U_FAILURE(status)) {
		WERROR("Invalid date(year=%d,mon=%d,day=%d)", year, month, day);
		return false;
	}
	*out = date;
	return true;
}

std::string formatEventDate(i18n_udate_h formatter, int yyyymmdd)
{
	WPRET_VM(!formatter, std::string(), "Invalid param : formatter");
	WPRET_VM(yyyymmdd < 0, std::string(), "Invalid param : date %d", yyyymmdd);
	i18n_udate date = 0;
	if (!eventDayToUdate(yyyymmdd / 10000, yyyymmdd / 100 % 100, yyyymmdd % 100, &date))
		return {};
	char* text = nullptr;
	int err = i18n_udate_format_date_utf8(formatter, date, &text);
	if (err != I18N_ERROR_NONE) {
		WFAILED("i18n_udate_format_date_utf8", err);
		return {};
	}
	std::string out(text);
	free(text);
	return out;
}

} // namespace ct::i18n
