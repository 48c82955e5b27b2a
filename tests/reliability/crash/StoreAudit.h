// Reads a contacts database file from outside the service, as a recovery
// would after a crash, and lists what is wrong with it: SQLite's integrity
// check and every way a person can be torn.
#pragma once

#include <string>
#include <vector>

namespace ct::test {

class StoreAudit {
public:
	explicit StoreAudit(std::string databasePath);

	// One line per fault found; empty when the store is sound.
	std::vector<std::string> problems() const;
	// The version of the last committed write (-1 when unreadable).
	long long version() const;
	int persons() const;
	int linkedPersons() const;

private:
	long long __count(const std::string& sql) const;

	std::string m_path;
};

} // namespace ct::test
