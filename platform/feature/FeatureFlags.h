// The configured feature flags: the data folder's "features.conf", reread
// when it changes, plus the ids listed in $CONTACTS_FEATURES.
#pragma once

#include <ctime>
#include <map>
#include <mutex>
#include <set>
#include <string>

#include <sys/types.h>

namespace ct::feature {

class FeatureFlags {
public:
	static FeatureFlags& instance();

	bool isEnabled(int id);
	// Every id set by the file or the environment with its value, by id.
	std::map<int, bool> configured();

	// "id=true|false" lines; '#' starts a comment; bad lines are logged and
	// skipped.
	static std::map<int, bool> parseFile(const std::string& text);
	// "88, 12": the listed ids; bad entries are logged and skipped.
	static std::set<int> parseList(const std::string& text);

private:
	FeatureFlags() = default;
	void __reloadIfChanged();

	std::mutex m_mutex;
	std::string m_path;
	bool m_exists = false;
	timespec m_mtime{};
	off_t m_size = 0;
	ino_t m_inode = 0;
	bool m_racy = false;
	std::map<int, bool> m_fileFlags;
};

} // namespace ct::feature
