#include "CtContactsAgentUtil.h"

#include "ContactsDebug.h"
#include "CtProfileSettingKeys.h"

#include <app_preference.h>

#include <climits>
#include <cstdlib>
#include <string>
#include <vector>

namespace {

// "12,34,56" -> {12, 34, 56}; anything that is not a positive id is skipped.
std::vector<int> parseIds(const char* text)
{
	std::vector<int> ids;
	const char* p = text;
	while (p && *p) {
		char* end = nullptr;
		long id = strtol(p, &end, 10);
		if (end == p) {
			++p;
			continue;
		}
		if (id > 0 && id <= INT_MAX)
			ids.push_back((int)id);
		p = end;
	}
	return ids;
}

int readInt(const char* key, int fallback)
{
	int value = fallback;
	int ret = preference_get_int(key, &value);
	return ret == PREFERENCE_ERROR_NONE ? value : fallback;
}

} // namespace

int CtContactsAgentUtil::getPreferenceSelectedContactsList(int** out)
{
	WPRET_VM(!out, 0, "Invalid param : out");
	*out = nullptr;
	char* text = nullptr;
	if (preference_get_string(CT_PREF_PROFILE_SHARE_WITH_LIST, &text) != PREFERENCE_ERROR_NONE)
		return 0;
	std::vector<int> ids = parseIds(text);
	free(text);
	if (ids.empty())
		return 0;
	*out = static_cast<int*>(malloc(ids.size() * sizeof(int)));
	WPRET_VM(!*out, 0, "out of memory");
	for (size_t i = 0; i < ids.size(); ++i)
		(*out)[i] = ids[i];
	return (int)ids.size();
}

bool CtContactsAgentUtil::setPreferenceSelectedContactsList(const int* personIds, int count)
{
	WPRET_VM(count < 0 || (count > 0 && !personIds), false, "Invalid param : count %d", count);
	std::string text;
	for (int i = 0; i < count; ++i) {
		if (!text.empty())
			text += ',';
		text += std::to_string(personIds[i]);
	}
	int ret = preference_set_string(CT_PREF_PROFILE_SHARE_WITH_LIST, text.c_str());
	if (ret != PREFERENCE_ERROR_NONE) {
		WFAILED("preference_set_string", ret);
		return false;
	}
	return true;
}

int CtContactsAgentUtil::getPreferenceProfileType()
{
	return readInt(CT_PREF_PROFILE_TYPE, 0);
}

int CtContactsAgentUtil::getPreferenceProfilePrivacyLevel()
{
	return readInt(CT_PREF_PROFILE_PRIVACY_LEVEL, 1);
}
