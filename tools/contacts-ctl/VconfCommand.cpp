// contacts-ctl vconf get|set|unset
#include "CtlCommand.h"
#include "CtlText.h"

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
	int rc = VCONF_OK;
	int number = 0;
	bool flag = false;
	double real = 0;
	if (type == "int" && parseInt(text, &number))
		rc = vconf_set_int(key.c_str(), number);
	else if (type == "bool" && parseBool(text, &flag))
		rc = vconf_set_bool(key.c_str(), flag);
	else if (type == "double" && parseDouble(text, &real))
		rc = vconf_set_dbl(key.c_str(), real);
	else if (type == "string")
		rc = vconf_set_str(key.c_str(), text.c_str());
	else
		return usageError(kName, "'" + text + "' is not a valid " + type + " value");
	if (rc != VCONF_OK)
		return fail("vconf set " + key + " failed (" + std::to_string(rc) + ")");
	return kExitOk;
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
