// contacts-ctl pref get|set|remove|list
#include "CtlCommand.h"
#include "CtlText.h"
#include "CtlTypedValue.h"

#include "app_preference.h"

#include <cstdio>
#include <cstdlib>

namespace {

using namespace ct::ctl;

const char kName[] = "pref";

// The preference API has no type query: try each type in turn.
int printValue(const std::string& key)
{
	const char* k = key.c_str();
	bool flag = false;
	int number = 0;
	double real = 0;
	char* text = nullptr;
	if (preference_get_boolean(k, &flag) == PREFERENCE_ERROR_NONE)
		printf("%s\n", flag ? "true" : "false");
	else if (preference_get_int(k, &number) == PREFERENCE_ERROR_NONE)
		printf("%d\n", number);
	else if (preference_get_double(k, &real) == PREFERENCE_ERROR_NONE)
		printf("%g\n", real);
	else if (preference_get_string(k, &text) == PREFERENCE_ERROR_NONE)
		printf("%s\n", text);
	else
		return fail("no such preference: " + key);
	free(text);
	return kExitOk;
}

int setValue(const std::string& key, const std::string& type, const std::string& text)
{
	const char* k = key.c_str();
	TypedSetters setters = {
		[k](int v) { return preference_set_int(k, v); },
		[k](bool v) { return preference_set_boolean(k, v); },
		[k](double v) { return preference_set_double(k, v); },
		[k](const char* v) { return preference_set_string(k, v); },
	};
	return setTypedValue(kName, "pref set " + key, type, text, setters, PREFERENCE_ERROR_NONE);
}

int run(const Args& args)
{
	if (args.size() == 2 && args[0] == "get")
		return printValue(args[1]);
	if (args.size() == 4 && args[0] == "set")
		return setValue(args[1], args[2], args[3]);
	if (args.size() == 2 && args[0] == "remove") {
		int rc = preference_remove(args[1].c_str());
		return rc == PREFERENCE_ERROR_NONE ? kExitOk
			: fail("pref remove " + args[1] + " failed (" + std::to_string(rc) + ")");
	}
	return usageError(kName, "bad pref arguments");
}

CtlCommandRegistration registration{{kName,
	"pref get KEY\n"
	"pref set KEY int|bool|double|string VALUE\n"
	"pref remove KEY",
	run}};

} // namespace
