// contacts-ctl vconf get|set|unset
#include "CtlCommand.h"
#include "CtlText.h"
#include "CtlTypedValue.h"

#include "vconf.h"

#include <cstdio>
#include <cstdlib>

namespace {

using namespace ct::ctl;

const char kName[] = "vconf";

int printValue(const std::string& key)
{
	int value = 0;
	double real = 0;
	switch (vconf_get_type(key.c_str())) {
	case VCONF_TYPE_INT:
		vconf_get_int(key.c_str(), &value);
		printf("%d\n", value);
		return kExitOk;
	case VCONF_TYPE_BOOL:
		vconf_get_bool(key.c_str(), &value);
		printf("%s\n", value ? "true" : "false");
		return kExitOk;
	case VCONF_TYPE_DOUBLE:
		vconf_get_dbl(key.c_str(), &real);
		printf("%g\n", real);
		return kExitOk;
	case VCONF_TYPE_STRING: {
		char* text = vconf_get_str(key.c_str());
		printf("%s\n", text ? text : "");
		free(text);
		return kExitOk;
	}
	default:
		return fail("no such key: " + key);
	}
}

int setValue(const std::string& key, const std::string& type, const std::string& text)
{
	const char* k = key.c_str();
	TypedSetters setters = {
		[k](int v) { return vconf_set_int(k, v); },
		[k](bool v) { return vconf_set_bool(k, v ? 1 : 0); },
		[k](double v) { return vconf_set_dbl(k, v); },
		[k](const char* v) { return vconf_set_str(k, v); },
	};
	return setTypedValue(kName, "vconf set " + key, type, text, setters, VCONF_OK);
}

int run(const Args& args)
{
	if (args.size() == 2 && args[0] == "get")
		return printValue(args[1]);
	if (args.size() == 4 && args[0] == "set")
		return setValue(args[1], args[2], args[3]);
	if (args.size() == 2 && args[0] == "unset") {
		int rc = vconf_unset(args[1].c_str());
		return rc == VCONF_OK ? kExitOk : fail("vconf unset " + args[1] + " failed (" + std::to_string(rc) + ")");
	}
	return usageError(kName, "bad vconf arguments");
}

CtlCommandRegistration registration{{kName,
	"vconf get KEY\n"
	"vconf set KEY int|bool|double|string VALUE\n"
	"vconf unset KEY",
	run}};

} // namespace
