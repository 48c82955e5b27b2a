#include "DemoOptions.h"

#include "DemoScreens.h"

#include <cerrno>
#include <climits>
#include <cstdlib>
#include <cmath>
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

// Seconds to hold a screen open: a positive number up to a day.
bool parseSeconds(const char* text, double& out)
{
	char* end = nullptr;
	errno = 0;
	double value = strtod(text, &end);
	if (errno != 0 || end == text || *end || !std::isfinite(value) || value <= 0 || value > 86400)
		return false;
	out = value;
	return true;
}

} // namespace

std::string DemoOptions::usage()
{
	std::string text =
		"usage: contacts-demo [--person ID] [--screen NAME] [--hold SECONDS] [--screenshot FILE.png]\n"
		"       contacts-demo --screenshots DIR\n"
		"  --person ID           open the detail screen of person ID\n"
		"  --screen NAME         open another screen (below); some need --person\n"
		"  --hold SECONDS        keep the screen open that long, then go on (changes made\n"
		"                        meanwhile by other programs, such as contacts-ctl, arrive)\n"
		"  --screenshot FILE     render the screen headless, save it as PNG and exit\n"
		"  --screenshots DIR     save pictures of a few screens into DIR and print their paths\n"
		"screens:\n";
	for (const DemoScreen& screen : demoScreens()) {
		char line[160];
		snprintf(line, sizeof(line), "  %-20s  %s%s\n", screen.name, screen.description, screen.needsPerson ? " (--person)" : "");
		text += line;
	}
	return text;
}

bool DemoOptions::parse(int argc, char** argv, std::string& error)
{
	for (int i = 1; i < argc; ++i) {
		std::string arg = argv[i];
		const char* value = i + 1 < argc ? argv[i + 1] : nullptr;
		bool takesValue = arg == "--person" || arg == "--screen" || arg == "--hold" || arg == "--screenshot" ||
			arg == "--screenshots";
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
		if (arg == "--screen" && !findDemoScreen(value)) {
			error = std::string("unknown screen '") + value + "' (see --help)";
			return false;
		}
		if (arg == "--screen")
			screen = value;
		if (arg == "--hold" && !parseSeconds(value, holdSeconds)) {
			error = std::string("--hold needs a number of seconds above 0, not '") + value + "'";
			return false;
		}
		if (arg == "--screenshot")
			screenshotFile = value;
		if (arg == "--screenshots")
			screenshotDir = value;
	}
	if (!screenshotDir.empty() && (!screenshotFile.empty() || !screen.empty() || personId > 0 || holdSeconds > 0)) {
		error = "--screenshots takes no other option";
		return false;
	}
	const DemoScreen* chosen = screen.empty() ? nullptr : findDemoScreen(screen);
	if (chosen && chosen->needsPerson && personId < 1) {
		error = "--screen " + screen + " needs --person ID";
		return false;
	}
	return true;
}

} // namespace ct::demo
