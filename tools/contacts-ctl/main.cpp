// contacts-ctl: reads and changes the platform stores from outside a running
// screen. The subcommands register themselves (CtlCommand.h).
#include "CtlCommand.h"
#include "CtlText.h"

#include <cstdio>
#include <cstdlib>
#include <string>

namespace {

void printUsage(FILE* out)
{
	fprintf(out, "usage: contacts-ctl COMMAND [ARGS...]\n\ncommands:\n");
	for (const auto& command : ct::ctl::CtlCommandRegistry::all())
		fputs(ct::ctl::formatUsage(command.usage).c_str(), out);
	fprintf(out, "\nThe stores live in $CONTACTS_DATA_DIR (else $XDG_DATA_HOME/contacts-demo).\n");
}

} // namespace

int main(int argc, char** argv)
{
	// Keep the output for the answers; warnings still reach stderr.
	setenv("CONTACTS_LOG_LEVEL", "warn", 0);
	if (argc < 2) {
		printUsage(stderr);
		return ct::ctl::kExitUsage;
	}
	std::string name = argv[1];
	if (name == "help" || name == "--help" || name == "-h") {
		printUsage(stdout);
		return ct::ctl::kExitOk;
	}
	const ct::ctl::CtlCommand* command = ct::ctl::CtlCommandRegistry::find(name);
	if (!command) {
		fprintf(stderr, "contacts-ctl: unknown command '%s'\n", name.c_str());
		printUsage(stderr);
		return ct::ctl::kExitUsage;
	}
	return command->run(ct::ctl::Args(argv + 2, argv + argc));
}
