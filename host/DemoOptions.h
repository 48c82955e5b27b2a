// The command line of contacts-demo.
#pragma once

#include <string>

namespace ct::demo {

struct DemoOptions {
	int personId = 0;             // 0: start with the person list
	std::string screen;           // --screen NAME (empty: the detail screen of --person)
	double holdSeconds = 0;       // --hold SECONDS: keep the screen open that long
	std::string screenshotFile;   // --screenshot FILE.png
	std::string screenshotDir;    // --screenshots DIR
	bool help = false;

	// Parses argv. Returns false with a message for the user in `error`.
	bool parse(int argc, char** argv, std::string& error);
	static std::string usage();
};

} // namespace ct::demo
