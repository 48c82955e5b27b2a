// Locale date texts and datetime formats from ICU's pattern generator.
#include "ui_extension.h"

#include "ContactsDebug.h"

#include <unicode/dtptngen.h>
#include <unicode/smpdtfmt.h>
#include <unicode/timezone.h>

#include <cctype>
#include <cstring>
#include <memory>
#include <string>

namespace {

// "de_DE.UTF-8" or "en_US@euro" name the locale "de_DE" / "en_US".
icu::Locale localeOf(const char* region)
{
	std::string name = region && *region ? region : "en_US";
	size_t cut = name.find_first_of(".@");
	if (cut != std::string::npos)
		name.resize(cut);
	return icu::Locale(name.c_str());
}

const char* skeletonOf(int format)
{
	switch (format) {
	case UXT_DATE_FORMAT_DATE_WITHOUT_YEAR:
		return "MMMMd";
	case UXT_DATE_FORMAT_DATE_WITH_YEAR:
		return "yMMMMd";
	default:
		return nullptr;
	}
}

bool bestPattern(const icu::Locale& locale, const char* skeleton, icu::UnicodeString* out)
{
	UErrorCode status = U_ZERO_ERROR;
	std::unique_ptr<icu::DateTimePatternGenerator> generator(
		icu::DateTimePatternGenerator::createInstance(locale, status));
	if (U_FAILURE(status) || !generator) {
		WFAILED("icu::DateTimePatternGenerator::createInstance", status);
		return false;
	}
	*out = generator->getBestPattern(icu::UnicodeString(skeleton), status);
	return U_SUCCESS(status);
}

// ICU pattern letters to the strftime-style fields of elm_datetime.
std::string datetimeFormatOf(const icu::UnicodeString& pattern)
{
	std::string utf8;
	pattern.toUTF8String(utf8);
	std::string out;
	for (size_t i = 0; i < utf8.size();) {
		char c = utf8[i];
		size_t run = 1;
		while (i + run < utf8.size() && utf8[i + run] == c)
			++run;
		if (c == '\'') {
			size_t end = utf8.find('\'', i + 1);
			out += utf8.substr(i + 1, (end == std::string::npos ? utf8.size() : end) - i - 1);
			i = end == std::string::npos ? utf8.size() : end + 1;
			continue;
		}
		if (c == 'y')
			out += run == 2 ? "%y" : "%Y";
		else if (c == 'M' || c == 'L')
			out += run <= 2 ? "%m" : run == 3 ? "%b" : "%B";
		else if (c == 'd')
			out += "%d";
		else if (!isalpha(static_cast<unsigned char>(c)))
			out += utf8.substr(i, run);
		i += run;
	}
	return out;
}

} // namespace

char* uxt_util_get_date_time_text_by_locale(const char* region, const struct tm* date, int format)
{
	WPRET_VM(!date, nullptr, "Invalid param : date");
	const char* skeleton = skeletonOf(format);
	WPRET_VM(!skeleton, nullptr, "unsupported date format %d", format);
	icu::Locale locale = localeOf(region);
	icu::UnicodeString pattern;
	if (!bestPattern(locale, skeleton, &pattern))
		return nullptr;
	UErrorCode status = U_ZERO_ERROR;
	icu::SimpleDateFormat formatter(pattern, locale, status);
	formatter.setTimeZone(*icu::TimeZone::getGMT());
	std::unique_ptr<icu::Calendar> calendar(
		icu::Calendar::createInstance(icu::TimeZone::getGMT()->clone(), icu::Locale("en_US@calendar=gregorian"), status));
	if (U_FAILURE(status) || !calendar) {
		WFAILED("icu::SimpleDateFormat", status);
		return nullptr;
	}
	calendar->clear();
	// Dates without a year (year part 0) still need a year where 29 February exists.
	int year = date->tm_year + 1900 > 0 ? date->tm_year + 1900 : 2000;
	calendar->set(year, date->tm_mon, date->tm_mday, 12, 0, 0);
	UDate when = calendar->getTime(status);
	icu::UnicodeString text;
	formatter.format(when, text);
	std::string utf8;
	text.toUTF8String(utf8);
	return strdup(utf8.c_str());
}

int uxt_date_time_set_format_by_locale(Evas_Object* datetime, const char* region)
{
	WPRET_VM(!datetime, UXT_ERROR_INVALID_PARAMETER, "Invalid param : datetime");
	icu::UnicodeString pattern;
	if (!bestPattern(localeOf(region), "yMMMd", &pattern))
		return UXT_ERROR_OPERATION_FAILED;
	std::string format = datetimeFormatOf(pattern);
	elm_datetime_format_set(datetime, format.c_str());
	return UXT_ERROR_NONE;
}
