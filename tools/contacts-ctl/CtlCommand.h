// The subcommands of contacts-ctl. Each lives in its own file and registers
// itself with a file-scope CtlCommandRegistration, so adding one needs no
// edit elsewhere:
//
//   static int runFoo(const ct::ctl::Args& args) { ... }
//   static ct::ctl::CtlCommandRegistration foo{
//       {"foo", "foo get KEY\n  foo set KEY VALUE", runFoo}};
#pragma once

#include <string>
#include <vector>

namespace ct::ctl {

using Args = std::vector<std::string>;

// Exit codes of every subcommand.
enum ExitCode : int { kExitOk = 0, kExitFailed = 1, kExitUsage = 2 };

struct CtlCommand {
	const char* name;
	// One or more lines "name ARGS..." shown in the help.
	const char* usage;
	// Gets the arguments after the command name; returns an ExitCode.
	int (*run)(const Args& args);
};

class CtlCommandRegistry {
public:
	static void add(const CtlCommand& command);
	// Null when no command has that name.
	static const CtlCommand* find(const std::string& name);
	// Sorted by name.
	static std::vector<CtlCommand> all();
};

struct CtlCommandRegistration {
	explicit CtlCommandRegistration(const CtlCommand& command) { CtlCommandRegistry::add(command); }
};

} // namespace ct::ctl
