#include "DemoResourceDir.h"

#include "ContactsCommon.h"

#include <cstdlib>
#include <filesystem>
#include <system_error>

namespace ct::demo {

namespace {

const char* const kResDirVariable = "CONTACTS_RES_DIR";
const char* const kThemes[] = {"contacts.edj", "detail_layout.edj", "image_layout.edj", "list.edj"};

std::string missingTheme(const std::filesystem::path& dir)
{
	std::error_code ec;
	for (const char* theme : kThemes) {
		if (!std::filesystem::is_regular_file(dir / "edje" / theme, ec))
			return theme;
	}
	return "";
}

} // namespace

bool DemoResourceDir::resolve(std::string& error)
{
	const char* given = getenv(kResDirVariable);
	std::string dir = given && *given ? given : ContactsCommon::getResourceDir();
	std::string origin = given && *given ? std::string(" (") + kResDirVariable + ")" : "";
	std::error_code ec;
	std::filesystem::path absolute = std::filesystem::canonical(dir, ec);
	if (ec || !std::filesystem::is_directory(absolute, ec)) {
		error = "no resources in " + dir + origin + ": the folder does not exist (build them with make build)";
		return false;
	}
	std::string missing = missingTheme(absolute);
	if (!missing.empty()) {
		error = "no resources in " + dir + origin + ": edje/" + missing + " is missing (build them with make build)";
		return false;
	}
	setenv(kResDirVariable, absolute.c_str(), 1);
	return true;
}

} // namespace ct::demo
