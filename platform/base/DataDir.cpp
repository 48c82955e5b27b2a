#include "DataDir.h"

#include <cerrno>
#include <cstdlib>
#include <sys/stat.h>

namespace ct::platform {

namespace {

std::string chooseDataDir()
{
	if (const char* dir = getenv("CONTACTS_DATA_DIR"); dir && *dir)
		return dir;
	if (const char* xdg = getenv("XDG_DATA_HOME"); xdg && *xdg)
		return std::string(xdg) + "/contacts-demo";
	const char* home = getenv("HOME");
	return std::string(home && *home ? home : "/tmp") + "/.local/share/contacts-demo";
}

} // namespace

int makeDirectories(const std::string& path)
{
	if (path.empty())
		return -EINVAL;
	for (size_t pos = 1; pos <= path.size(); ++pos) {
		if (pos != path.size() && path[pos] != '/')
			continue;
		std::string part = path.substr(0, pos);
		if (mkdir(part.c_str(), 0700) != 0 && errno != EEXIST)
			return -errno;
	}
	struct stat st;
	if (stat(path.c_str(), &st) != 0)
		return -errno;
	return S_ISDIR(st.st_mode) ? 0 : -ENOTDIR;
}

std::string dataDir()
{
	// The environment is read every time (tests point each case at a fresh
	// folder); the folder is only created when that choice changes.
	static thread_local std::string madeDir;
	std::string dir = chooseDataDir();
	if (dir == madeDir)
		return dir;
	if (makeDirectories(dir) != 0)
		return std::string();
	madeDir = dir;
	return dir;
}

std::string dataPath(const std::string& name)
{
	std::string dir = dataDir();
	return dir.empty() ? std::string() : dir + "/" + name;
}

} // namespace ct::platform
