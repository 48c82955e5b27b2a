// contacts-ctl features
#include "CtlCommand.h"
#include "CtlText.h"

#include "FeatureFlags.h"
#include "csc_feature.h"

#include <cstdio>

namespace {

using namespace ct::ctl;

const char kName[] = "features";

int run(const Args& args)
{
	if (!args.empty())
		return usageError(kName, "features takes no arguments");
	struct {
		int id;
		const char* name;
	} const known[] = {
		{CSC_FEATURE_CONTACTS_HIDE_ADDRESS_ROW, "hide address row"},
		{CSC_FEATURE_CONTACTS_ADDRESS_INPUT_STYLE_2, "address input style 2"},
		{CSC_FEATURE_CONTACTS_EASY_SIGNUP, "easy sign-up"},
	};
	for (const auto& feature : known)
		printf("%d=%s\t(%s)\n", feature.id, csc_feature_get_bool(feature.id) ? "true" : "false", feature.name);
	for (const auto& [id, value] : ct::feature::FeatureFlags::instance().configured()) {
		bool isKnown = false;
		for (const auto& feature : known)
			isKnown = isKnown || feature.id == id;
		if (!isKnown)
			printf("%d=%s\n", id, value ? "true" : "false");
	}
	return kExitOk;
}

CtlCommandRegistration registration{{kName, "features    (every known or configured flag)", run}};

} // namespace
