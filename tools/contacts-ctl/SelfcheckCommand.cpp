// contacts-ctl selfcheck: starts every platform store in the data folder and
// reads its defaults; `make run` uses it until the host application exists.
#include "CtlCommand.h"
#include "CtlText.h"

#include "DataDir.h"
#include "FeatureFlags.h"
#include "UsageLog.h"
#include "app_preference.h"
#include "bundle.h"
#include "phone_misc.h"
#include "vconf.h"
#include "velmora_log_manager.h"

#include <cstdio>
#include <cstdlib>
#include <string>

namespace {

using namespace ct::ctl;

const char kName[] = "selfcheck";

bool report(const char* service, const std::string& file, bool ok, const std::string& detail)
{
	printf("%-12s %-4s %s%s%s\n", service, ok ? "ok" : "FAIL", file.c_str(),
		detail.empty() ? "" : "  ", detail.c_str());
	return ok;
}

bool checkVconf()
{
	int psmode = -1, sim1 = -1;
	char* region = vconf_get_str(VCONFKEY_REGIONFORMAT);
	bool ok = vconf_get_int(VCONFKEY_SETAPPL_PSMODE, &psmode) == VCONF_OK
		&& vconf_get_int(VCONFKEY_TELEPHONY_SIM_POWER_STATE1, &sim1) == VCONF_OK && region;
	std::string detail = "psmode=" + std::to_string(psmode) + " sim1 power=" + std::to_string(sim1)
		+ " region=" + (region ? region : "?");
	free(region);
	return report("vconf", ct::platform::dataPath("vconf.db"), ok, detail);
}

bool checkPreferences()
{
	bool exists = false;
	int rc = preference_is_existing(PREFERENCE_KEY_HIDE_STORAGE_POPUP, &exists);
	return report("preferences", ct::platform::dataPath("preferences.db"), rc == PREFERENCE_ERROR_NONE,
		std::string("hide_storage_popup ") + (exists ? "set" : "unset"));
}

bool checkCallBlock()
{
	phone_misc_h handle = nullptr;
	int rc = phone_misc_connect(&handle);
	int blocked = 0;
	if (rc == PHONE_MISC_ERROR_NONE) {
		rc = phone_misc_block_find(handle, PHONE_MISC_BLOCK_TYPE_CALL, "+10000000000", &blocked);
		phone_misc_disconnect(handle);
	}
	return report("call-block", ct::platform::dataPath("callblock.db"), rc >= 0, "");
}

bool checkUsageLog()
{
	velmora_log_manager_h handle = nullptr;
	int rc = velmora_log_manager_create(&handle);
	if (rc == VELMORA_LOG_MANAGER_ERROR_NONE)
		velmora_log_manager_destroy(handle);
	return report("usage log", ct::platform::dataPath("usagelog.db"), rc == VELMORA_LOG_MANAGER_ERROR_NONE,
		std::to_string(ct::usagelog::records().size()) + " records");
}

bool checkFeatures()
{
	auto flags = ct::feature::FeatureFlags::instance().configured();
	return report("features", ct::platform::dataPath("features.conf"), true,
		std::to_string(flags.size()) + " flags set");
}

bool checkBundle()
{
	bundle* b = bundle_create();
	bundle_raw* raw = nullptr;
	int len = 0;
	bool ok = b && bundle_add_str(b, "app_id", "selfcheck") == BUNDLE_ERROR_NONE
		&& bundle_encode(b, &raw, &len) == BUNDLE_ERROR_NONE;
	bundle* decoded = ok ? bundle_decode(raw, len) : nullptr;
	ok = ok && bundle_get_count(decoded) == 1;
	bundle_free_encoded_rawdata(&raw);
	if (decoded)
		bundle_free(decoded);
	if (b)
		bundle_free(b);
	return report("bundle", "(memory)", ok, "");
}

int run(const Args& args)
{
	if (!args.empty())
		return usageError(kName, "selfcheck takes no arguments");
	std::string dir = ct::platform::dataDir();
	printf("data folder: %s\n", dir.empty() ? "(unavailable)" : dir.c_str());
	bool ok = !dir.empty();
	ok = checkVconf() && ok;
	ok = checkPreferences() && ok;
	ok = checkCallBlock() && ok;
	ok = checkUsageLog() && ok;
	ok = checkFeatures() && ok;
	ok = checkBundle() && ok;
	printf("%s\n", ok ? "all services work" : "some services failed");
	return ok ? kExitOk : kExitFailed;
}

CtlCommandRegistration registration{{kName, "selfcheck    (opens every store and reads its defaults)", run}};

} // namespace
