// contacts-ctl sharing [show] | network up|down | sim 1|2 in|out
//
// The outside state the profile-sharing screens react to: the data network
// and the SIM cards, and the sharing settings the contacts agent keeps.
#include "CtlCommand.h"
#include "CtlText.h"

#include "CtProfileSettingKeys.h"

#include "app_preference.h"
#include "vconf.h"

#include <cstdio>
#include <string>

namespace {

using namespace ct::ctl;

const char kName[] = "sharing";
// Read by the screens' network check; connected unless set to 0.
const char kNetworkKey[] = "memory/network/status";
const char* const kSimPowerKeys[] = {"db/telephony/sim_power_state1", "db/telephony/sim_power_state2"};
const char* const kFieldNames[] = {"email", "organisation", "address", "birthday"};

int readVconf(const char* key, int fallback)
{
	int value = fallback;
	if (vconf_get_int(key, &value) != VCONF_OK && vconf_get_bool(key, &value) != VCONF_OK)
		return fallback;
	return value;
}

int readPref(const char* key, int fallback)
{
	int value = fallback;
	return preference_get_int(key, &value) == PREFERENCE_ERROR_NONE ? value : fallback;
}

bool readFlag(const std::string& key)
{
	bool on = false;
	preference_get_boolean(key.c_str(), &on);
	return on;
}

int show()
{
	std::string fields;
	for (int i = 0; i < 4; ++i) {
		if (readFlag(CT_PREF_PROFILE_PROPERTY_PREFIX + std::to_string(i)))
			fields += (fields.empty() ? "" : ",") + std::string(kFieldNames[i]);
	}
	printf("sharing=%s network=%s sim1=%s sim2=%s type=%s privacy=%d fields=%s\n",
		readFlag(CT_PREF_PROFILE_SHARING_STATUS) ? "on" : "off",
		readVconf(kNetworkKey, 1) ? "up" : "down",
		readVconf(kSimPowerKeys[0], 0) ? "in" : "out",
		readVconf(kSimPowerKeys[1], 0) ? "in" : "out",
		readPref(CT_PREF_PROFILE_TYPE, 0) == 1 ? "business" : "personal",
		readPref(CT_PREF_PROFILE_PRIVACY_LEVEL, 1),
		fields.empty() ? "none" : fields.c_str());
	return kExitOk;
}

int setVconf(const char* key, int value)
{
	int rc = vconf_set_int(key, value);
	return rc == VCONF_OK ? kExitOk : fail(std::string("vconf_set_int(") + key + ") failed (" + std::to_string(rc) + ")");
}

int run(const Args& args)
{
	if (args.empty() || (args.size() == 1 && args[0] == "show"))
		return show();
	if (args.size() == 2 && args[0] == "network" && (args[1] == "up" || args[1] == "down"))
		return setVconf(kNetworkKey, args[1] == "up" ? 1 : 0);
	if (args.size() == 3 && args[0] == "sim" && (args[1] == "1" || args[1] == "2")
			&& (args[2] == "in" || args[2] == "out"))
		return setVconf(kSimPowerKeys[args[1] == "2"], args[2] == "in" ? 1 : 0);
	return usageError(kName, "bad sharing arguments");
}

CtlCommandRegistration registration{{kName,
	"sharing [show]\n"
	"sharing network up|down\n"
	"sharing sim 1|2 in|out",
	run}};

} // namespace
