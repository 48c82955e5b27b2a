#include "ContactsCommon.h"

#include "ContactsDebug.h"

#include <vconf.h>

#include <phonenumbers/phonenumberutil.h>

#include <libintl.h>

#include <cctype>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <sys/stat.h>

using i18n::phonenumbers::PhoneNumber;
using i18n::phonenumbers::PhoneNumberUtil;

namespace {

constexpr size_t kMaxNumberBytes = 1024;
constexpr const char* kTextDomain = "contacts";
constexpr const char* kInstalledResDir = "/usr/share/contacts-details/res";

bool fileExists(const std::string& path)
{
	struct stat st;
	return stat(path.c_str(), &st) == 0 && S_ISREG(st.st_mode);
}

std::string baseName(const char* name)
{
	const char* slash = strrchr(name, '/');
	return slash ? slash + 1 : name;
}

std::string readVconfString(const char* key)
{
	std::unique_ptr<char, decltype(&free)> value(vconf_get_str(key), free);
	return value ? value.get() : "";
}

// "en_US.UTF-8" -> "US"; "" when the text has no region part.
std::string regionOfLocale(const std::string& locale)
{
	size_t underscore = locale.find('_');
	if (underscore == std::string::npos)
		return {};
	std::string region;
	for (size_t i = underscore + 1; i < locale.size() && isalpha((unsigned char)locale[i]); ++i)
		region += (char)toupper((unsigned char)locale[i]);
	return region.size() == 2 ? region : std::string();
}

// National and international formats group with spaces, brackets and dashes
// depending on the region; the contacts screens show dashes only.
std::string dashesOnly(const std::string& formatted)
{
	std::string out;
	for (char c : formatted) {
		if (c == '(' || c == ')')
			continue;
		if (c == ' ' || c == '-') {
			if (!out.empty() && out.back() != '-')
				out += '-';
			continue;
		}
		out += c;
	}
	while (!out.empty() && out.back() == '-')
		out.pop_back();
	return out;
}

} // namespace

std::string ContactsCommon::getResourceDir()
{
	if (const char* dir = getenv("CONTACTS_RES_DIR"); dir && *dir)
		return dir;
#ifdef CT_RES_BUILD_DIR
	struct stat st;
	if (stat(CT_RES_BUILD_DIR, &st) == 0)
		return CT_RES_BUILD_DIR;
#endif
	return kInstalledResDir;
}

std::string ContactsCommon::getLocaleDir()
{
	return getResourceDir() + "/locale";
}

bool ContactsCommon::getAppEdjePath(const char* edjName, std::string& out, bool mustExist)
{
	out.clear();
	WPRET_VM(!edjName || !*edjName, false, "Invalid param : edjName");
	std::string path = getResourceDir() + "/edje/" + baseName(edjName);
	if (mustExist && !fileExists(path)) {
		WERROR("no edje file %s", path.c_str());
		return false;
	}
	out = path;
	return true;
}

std::string ContactsCommon::getAppImagePath(const char* imageName, bool mustExist)
{
	WPRET_VM(!imageName || !*imageName, "", "Invalid param : imageName");
	std::string path = getResourceDir() + "/images/" + baseName(imageName);
	if (mustExist && !fileExists(path)) {
		WERROR("no image %s", path.c_str());
		return "";
	}
	return path;
}

std::string ContactsCommon::getRegionCode()
{
	std::string region = regionOfLocale(readVconfString(VCONFKEY_REGIONFORMAT));
	if (region.empty()) {
		std::string iso = readVconfString(VCONFKEY_CSC_COUNTRY_ISO);
		if (iso.size() == 2)
			region = {(char)toupper((unsigned char)iso[0]), (char)toupper((unsigned char)iso[1])};
	}
	return region.empty() ? "US" : region;
}

std::string ContactsCommon::addNumberDashes(const char* number)
{
	return addNumberDashesForRegion(number, getRegionCode().c_str());
}

std::string ContactsCommon::addNumberDashesForRegion(const char* number, const char* region)
{
	if (!number)
		return "";
	std::string text(number, strnlen(number, kMaxNumberBytes));
	if (!region || text.empty())
		return text;

	const PhoneNumberUtil* util = PhoneNumberUtil::GetInstance();
	PhoneNumber parsed;
	if (util->Parse(text, region, &parsed) != PhoneNumberUtil::NO_PARSING_ERROR)
		return text;
	if (!util->IsPossibleNumber(parsed))
		return text;

	std::string formatted;
	bool international = text[0] == '+';
	util->Format(parsed, international ? PhoneNumberUtil::INTERNATIONAL : PhoneNumberUtil::NATIONAL, &formatted);
	return formatted.empty() ? text : dashesOnly(formatted);
}

std::string ContactsCommon::removeNumberDashes(const char* number)
{
	if (!number)
		return "";
	std::string out;
	for (const char* p = number; *p && (size_t)(p - number) < kMaxNumberBytes; ++p)
		if (*p != '-')
			out += *p;
	return out;
}

void ContactsCommon::bindTextDomain()
{
	static std::string boundDir;
	std::string dir = getLocaleDir();
	if (dir == boundDir)
		return;
	bindtextdomain(kTextDomain, dir.c_str());
	bind_textdomain_codeset(kTextDomain, "UTF-8");
	boundDir = dir;
}

const char* ContactsCommon::translate(const char* textId)
{
	if (!textId)
		return "";
	bindTextDomain();
	return dgettext(kTextDomain, textId);
}

bool ContactsCommon::checkCallManagerReady()
{
	// The platform here has no separate call manager process to wait for.
	return true;
}
