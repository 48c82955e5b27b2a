#include "FeatureFlags.h"

#include "ContactsDebug.h"
#include "DataDir.h"

#include <glib.h>

#include <cerrno>
#include <cstdlib>
#include <fstream>
#include <sstream>

#include <sys/stat.h>

namespace ct::feature {

namespace {

const int kMaxFileBytes = 1 << 20;
const time_t kRacySeconds = 2;

std::string trim(const std::string& text)
{
	size_t begin = text.find_first_not_of(" \t\r");
	if (begin == std::string::npos)
		return std::string();
	size_t end = text.find_last_not_of(" \t\r");
	return text.substr(begin, end - begin + 1);
}

// A non-negative decimal id that fits an int.
bool parseId(const std::string& text, int* id)
{
	if (text.empty() || text.size() > 9 || text.find_first_not_of("0123456789") != std::string::npos)
		return false;
	*id = std::atoi(text.c_str());
	return true;
}

bool parseBool(const std::string& text, bool* value)
{
	if (g_ascii_strcasecmp(text.c_str(), "true") == 0 || text == "1") {
		*value = true;
		return true;
	}
	if (g_ascii_strcasecmp(text.c_str(), "false") == 0 || text == "0") {
		*value = false;
		return true;
	}
	return false;
}

std::string readFile(const std::string& path)
{
	std::ifstream in(path);
	std::ostringstream text;
	text << in.rdbuf();
	return text.str();
}

} // namespace

FeatureFlags& FeatureFlags::instance()
{
	static FeatureFlags flags;
	return flags;
}

bool FeatureFlags::isEnabled(int id)
{
	if (id < 0)
		return false;
	auto all = configured();
	auto it = all.find(id);
	return it != all.end() && it->second;
}

std::map<int, bool> FeatureFlags::configured()
{
	std::lock_guard<std::mutex> lock(m_mutex);
	__reloadIfChanged();
	std::map<int, bool> result = m_fileFlags;
	if (const char* env = getenv("CONTACTS_FEATURES")) {
		for (int id : parseList(env))
			result[id] = true;
	}
	return result;
}

void FeatureFlags::__reloadIfChanged()
{
	std::string path = ct::platform::dataPath("features.conf");
	struct stat st {};
	bool exists = !path.empty() && stat(path.c_str(), &st) == 0;
	// A file changed twice within the clock's granularity keeps its mtime:
	// while the last load saw a fresh mtime, read the file again.
	bool same = !m_racy && path == m_path && exists == m_exists
		&& (!exists || (st.st_mtim.tv_sec == m_mtime.tv_sec && st.st_mtim.tv_nsec == m_mtime.tv_nsec
			&& st.st_size == m_size && st.st_ino == m_inode));
	if (same)
		return;
	m_path = path;
	m_exists = exists;
	m_mtime = exists ? st.st_mtim : timespec{};
	m_size = exists ? st.st_size : 0;
	m_inode = exists ? st.st_ino : 0;
	m_racy = exists && time(nullptr) - st.st_mtim.tv_sec < kRacySeconds;
	m_fileFlags.clear();
	if (exists && st.st_size > kMaxFileBytes)
		WERROR("%s is larger than %d bytes; ignored", path.c_str(), kMaxFileBytes);
	else if (exists)
		m_fileFlags = parseFile(readFile(path));
	if (!m_racy)
		WINFO("feature flags reloaded from %s (%zu set)", path.c_str(), m_fileFlags.size());
}

std::map<int, bool> FeatureFlags::parseFile(const std::string& text)
{
	std::map<int, bool> flags;
	std::istringstream lines(text);
	std::string line;
	int number = 0;
	while (std::getline(lines, line)) {
		++number;
		line = trim(line.substr(0, line.find('#')));
		if (line.empty())
			continue;
		size_t eq = line.find('=');
		int id = 0;
		bool value = false;
		if (eq == std::string::npos || !parseId(trim(line.substr(0, eq)), &id)
			|| !parseBool(trim(line.substr(eq + 1)), &value)) {
			WWARNING("features.conf line %d ignored: %s", number, line.c_str());
			continue;
		}
		flags[id] = value;
	}
	return flags;
}

std::set<int> FeatureFlags::parseList(const std::string& text)
{
	std::set<int> ids;
	std::istringstream items(text);
	std::string item;
	while (std::getline(items, item, ',')) {
		item = trim(item);
		int id = 0;
		if (item.empty())
			continue;
		if (parseId(item, &id))
			ids.insert(id);
		else
			WWARNING("CONTACTS_FEATURES entry ignored: %s", item.c_str());
	}
	return ids;
}

} // namespace ct::feature
