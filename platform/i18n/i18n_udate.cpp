// ICU-backed date formatters behind i18n_udate_h.
#include "utils_i18n.h"

#include "ContactsDebug.h"

#include <glib.h>
#include <unicode/dtptngen.h>
#include <unicode/smpdtfmt.h>
#include <unicode/timezone.h>

#include <cstring>
#include <map>
#include <memory>
#include <mutex>
#include <string>
#include <utility>

struct i18n_udate_s {
	std::unique_ptr<icu::SimpleDateFormat> format;
};

namespace {

bool isValidArgument(const char* text)
{
	if (!text || !text[0])
		return false;
	size_t length = strnlen(text, I18N_MAX_ARGUMENT_LENGTH + 1);
	return length <= I18N_MAX_ARGUMENT_LENGTH && g_utf8_validate(text, (gssize)length, nullptr);
}

// "de_DE.UTF-8" -> the ICU locale de_DE.
icu::Locale toLocale(const char* locale)
{
	std::string name(locale);
	size_t dot = name.find('.');
	if (dot != std::string::npos)
		name.erase(dot);
	return icu::Locale::createCanonical(name.c_str());
}

// Null when ICU does not know the zone (it would silently give GMT).
icu::TimeZone* makeZone(const char* tzId)
{
	icu::UnicodeString id = icu::UnicodeString::fromUTF8(tzId ? tzId : "UTC");
	icu::TimeZone* zone = icu::TimeZone::createTimeZone(id);
	icu::UnicodeString resolved;
	zone->getID(resolved);
	if (*zone == icu::TimeZone::getUnknown() || resolved == UNICODE_STRING_SIMPLE("Etc/Unknown")) {
		delete zone;
		return nullptr;
	}
	return zone;
}

int makeFormatter(const icu::UnicodeString& pattern, const icu::Locale& locale, const char* tzId,
		i18n_udate_h* formatter)
{
	std::unique_ptr<icu::TimeZone> zone(makeZone(tzId));
	WPRET_VM(!zone, I18N_ERROR_INVALID_PARAMETER, "Invalid param : time zone %s", tzId);
	UErrorCode status = U_ZERO_ERROR;
	auto format = std::make_unique<icu::SimpleDateFormat>(pattern, locale, status);
	if (U_FAILURE(status)) {
		WWARNING("SimpleDateFormat() Failed(%s)", u_errorName(status));
		return I18N_ERROR_INVALID_PARAMETER;
	}
	format->adoptTimeZone(zone.release());
	*formatter = new i18n_udate_s{std::move(format)};
	return I18N_ERROR_NONE;
}

// The locale's pattern for a skeleton. Making a pattern generator costs most of
// a millisecond and screens rebuild their formatters often, so patterns are
// kept per (locale, skeleton); the number of pairs in use is small.
bool bestPattern(const icu::Locale& locale, const char* skeleton, icu::UnicodeString* pattern)
{
	static std::mutex mutex;
	static auto* cache = new std::map<std::pair<std::string, std::string>, icu::UnicodeString>;
	const size_t maxCached = 64;
	std::pair<std::string, std::string> key(locale.getName(), skeleton);
	std::lock_guard<std::mutex> lock(mutex);
	auto it = cache->find(key);
	if (it != cache->end()) {
		*pattern = it->second;
		return true;
	}
	UErrorCode status = U_ZERO_ERROR;
	std::unique_ptr<icu::DateTimePatternGenerator> generator(
			icu::DateTimePatternGenerator::createInstance(locale, status));
	if (U_SUCCESS(status))
		*pattern = generator->getBestPattern(icu::UnicodeString::fromUTF8(skeleton), status);
	if (U_FAILURE(status)) {
		WWARNING("getBestPattern() Failed(%s)", u_errorName(status));
		return false;
	}
	if (cache->size() >= maxCached)
		cache->clear();
	cache->emplace(key, *pattern);
	return true;
}

template <typename Body>
int guarded(Body body)
{
	try {
		return body();
	} catch (const std::bad_alloc&) {
		WFAILED("i18n_udate", I18N_ERROR_OUT_OF_MEMORY);
		return I18N_ERROR_OUT_OF_MEMORY;
	}
}

char* toUtf8Copy(const icu::UnicodeString& text)
{
	std::string utf8;
	text.toUTF8String(utf8);
	return strdup(utf8.c_str());
}

} // namespace

int i18n_udate_create_from_skeleton(const char* skeleton, const char* locale, const char* tz_id,
		i18n_udate_h* formatter)
{
	WPRET_VM(!formatter, I18N_ERROR_INVALID_PARAMETER, "Invalid param : formatter");
	*formatter = nullptr;
	WPRET_VM(!isValidArgument(skeleton) || !isValidArgument(locale) || (tz_id && !isValidArgument(tz_id)),
			I18N_ERROR_INVALID_PARAMETER, "Invalid param : skeleton, locale or tz_id");
	return guarded([&] {
		icu::Locale loc = toLocale(locale);
		icu::UnicodeString pattern;
		if (!bestPattern(loc, skeleton, &pattern))
			return (int)I18N_ERROR_INVALID_PARAMETER;
		return makeFormatter(pattern, loc, tz_id, formatter);
	});
}

int i18n_udate_create_from_pattern(const char* pattern, const char* locale, const char* tz_id,
		i18n_udate_h* formatter)
{
	WPRET_VM(!formatter, I18N_ERROR_INVALID_PARAMETER, "Invalid param : formatter");
	*formatter = nullptr;
	WPRET_VM(!isValidArgument(pattern) || !isValidArgument(locale) || (tz_id && !isValidArgument(tz_id)),
			I18N_ERROR_INVALID_PARAMETER, "Invalid param : pattern, locale or tz_id");
	return guarded([&] {
		return makeFormatter(icu::UnicodeString::fromUTF8(pattern), toLocale(locale), tz_id, formatter);
	});
}

int i18n_udate_destroy(i18n_udate_h formatter)
{
	WPRET_VM(!formatter, I18N_ERROR_INVALID_PARAMETER, "Invalid param : formatter");
	delete formatter;
	return I18N_ERROR_NONE;
}

int i18n_udate_get_pattern(i18n_udate_h formatter, char** pattern)
{
	WPRET_VM(!formatter || !pattern, I18N_ERROR_INVALID_PARAMETER, "Invalid param : formatter or pattern");
	icu::UnicodeString text;
	formatter->format->toPattern(text);
	*pattern = toUtf8Copy(text);
	return *pattern ? I18N_ERROR_NONE : I18N_ERROR_OUT_OF_MEMORY;
}

int i18n_udate_format_date(i18n_udate_h formatter, i18n_udate date, i18n_uchar* result, int32_t result_len,
		int32_t* buf_size_needed)
{
	WPRET_VM(!formatter || !buf_size_needed || result_len < 0 || (result_len > 0 && !result),
			I18N_ERROR_INVALID_PARAMETER, "Invalid param : formatter or buffer");
	return guarded([&] {
		icu::UnicodeString text;
		formatter->format->format(date, text);
		*buf_size_needed = text.length();
		if (text.length() >= result_len) {
			if (result_len > 0)
				result[0] = 0;
			return (int)I18N_ERROR_BUFFER_OVERFLOW;
		}
		UErrorCode status = U_ZERO_ERROR;
		text.extract(reinterpret_cast<UChar*>(result), result_len, status);
		return (int)I18N_ERROR_NONE;
	});
}

int i18n_udate_format_date_utf8(i18n_udate_h formatter, i18n_udate date, char** result)
{
	WPRET_VM(!formatter || !result, I18N_ERROR_INVALID_PARAMETER, "Invalid param : formatter or result");
	*result = nullptr;
	return guarded([&] {
		icu::UnicodeString text;
		formatter->format->format(date, text);
		*result = toUtf8Copy(text);
		return *result ? (int)I18N_ERROR_NONE : (int)I18N_ERROR_OUT_OF_MEMORY;
	});
}
