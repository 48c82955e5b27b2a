#include "CtlTypedValue.h"

#include "CtlCommand.h"
#include "CtlText.h"

namespace ct::ctl {

int setTypedValue(const char* commandName, const std::string& what, const std::string& type,
		const std::string& text, const TypedSetters& setters, int ok)
{
	int number = 0;
	bool flag = false;
	double real = 0;
	int rc = ok;
	if (type == "int" && parseInt(text, &number))
		rc = setters.setInt(number);
	else if (type == "bool" && parseBool(text, &flag))
		rc = setters.setBool(flag);
	else if (type == "double" && parseDouble(text, &real))
		rc = setters.setDouble(real);
	else if (type == "string")
		rc = setters.setString(text.c_str());
	else
		return usageError(commandName, "'" + text + "' is not a valid " + type + " value");
	if (rc != ok)
		return fail(what + " failed (" + std::to_string(rc) + ")");
	return kExitOk;
}

} // namespace ct::ctl
