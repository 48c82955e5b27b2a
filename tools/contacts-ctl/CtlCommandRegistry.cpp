#include "CtlCommand.h"

#include <algorithm>
#include <cstring>

namespace ct::ctl {

namespace {

// A function-local list: registrations run during static initialisation, in
// any order across files.
std::vector<CtlCommand>& commands()
{
	static std::vector<CtlCommand> list;
	return list;
}

} // namespace

void CtlCommandRegistry::add(const CtlCommand& command)
{
	commands().push_back(command);
}

const CtlCommand* CtlCommandRegistry::find(const std::string& name)
{
	for (const auto& command : commands()) {
		if (name == command.name)
			return &command;
	}
	return nullptr;
}

std::vector<CtlCommand> CtlCommandRegistry::all()
{
	auto list = commands();
	std::sort(list.begin(), list.end(),
		[](const CtlCommand& a, const CtlCommand& b) { return strcmp(a.name, b.name) < 0; });
	return list;
}

} // namespace ct::ctl
