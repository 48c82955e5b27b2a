#include "DemoOptions.h"

#include <cerrno>
#include <climits>
#include <cstdlib>
#include <cstring>

namespace ct::demo {

namespace {

// A person id: decimal digits only, 1 to INT_MAX.
bool parsePersonId(const char* text, int& out)
{
	if (!text || !*text || strspn(text, "0123456789") != strlen(text))
		return false;
	errno = 0;
	long long value = strtoll(text, nullptr, 10);
	if (errno == ERANGE || value < 1 || value > INT_MAX)
		return false;
	out = static_cast<int>(value);
	return true;
}

} // namespace

const char* DemoOptions::usage()
{
	return "usage: contacts-demo [--person ID] [--screenshot FILE.png] [--screenshots DIR]\n"
	       "  --person ID           open the detail screen of person ID\n"
	       "  --screenshot FILE     render the screen headless, save it as PNG and exit\n"
	       "  --screenshots DIR     save pictures of a few screens into DIR and print their paths\n";
}

bool DemoOptions::parse(int argc, char** argv, std::string& error)
{
	for (int i = 1; i < argc; ++i) {
		std::string arg = argv[i];
		const char* value = i + 1 < argc ? argv[i + 1] : nullptr;
		bool takesValue = arg == "--person" || arg == "--screenshot" || arg == "--screenshots";
		if (arg == "--help" || arg == "-h") {
			help = true;
			continue;
		}
		if (!takesValue) {
			error = "unknown argument: " + arg;
			return false;
		}
		if (!value || !*value || strncmp(value, "--", 2) == 0) {
			error = arg + " needs a value";
			return false;
		}
		++i;
		if (arg == "--person" && !parsePersonId(value, personId)) {
			error = std::string("--person needs a person id from 1 to ") + std::to_string(INT_MAX) + ", not '" + value + "'";
			return false;
		}
		if (arg == "--screenshot")
			screenshotFile = value;
		if (arg == "--screenshots")
			screenshotDir = value;
	}
	if (!screenshotFile.empty() && !screenshotDir.empty()) {
		error = "use either --screenshot or --screenshots";
		return false;
	}
	return true;
}

} // namespace ct::demo
