#include "CtlText.h"

#include "CtlCommand.h"

#include <cerrno>
#include <climits>
#include <cstdio>
#include <cstdlib>
#include <strings.h>

namespace ct::ctl {

bool parseInt(const std::string& text, int* value)
{
	if (text.empty())
		return false;
	char* end = nullptr;
	errno = 0;
	long parsed = strtol(text.c_str(), &end, 10);
	if (errno != 0 || *end != '\0' || parsed < INT_MIN || parsed > INT_MAX)
		return false;
	*value = static_cast<int>(parsed);
	return true;
}

bool parseDouble(const std::string& text, double* value)
{
	if (text.empty())
		return false;
	char* end = nullptr;
	errno = 0;
	double parsed = strtod(text.c_str(), &end);
	if (errno != 0 || *end != '\0')
		return false;
	*value = parsed;
	return true;
}

bool parseBool(const std::string& text, bool* value)
{
	for (const char* yes : {"true", "1", "on", "yes"}) {
		if (strcasecmp(text.c_str(), yes) == 0) {
			*value = true;
			return true;
		}
	}
	for (const char* no : {"false", "0", "off", "no"}) {
		if (strcasecmp(text.c_str(), no) == 0) {
			*value = false;
			return true;
		}
	}
	return false;
}

std::string formatUsage(const char* usage)
{
	std::string result;
	std::string text = usage;
	size_t start = 0;
	while (start <= text.size()) {
		size_t end = text.find('\n', start);
		if (end == std::string::npos)
			end = text.size();
		result += "  contacts-ctl " + text.substr(start, end - start) + "\n";
		start = end + 1;
	}
	return result;
}

int fail(const std::string& message)
{
	fprintf(stderr, "contacts-ctl: %s\n", message.c_str());
	return kExitFailed;
}

int usageError(const char* commandName, const std::string& message)
{
	fprintf(stderr, "contacts-ctl: %s\n", message.c_str());
	if (const CtlCommand* command = CtlCommandRegistry::find(commandName))
		fprintf(stderr, "usage:\n%s", formatUsage(command->usage).c_str());
	return kExitUsage;
}

} // namespace ct::ctl
