// Writes to the contacts store the way a busy application does, for the
// reliability tests: random saves, updates, links, unlinks and deletes until
// killed, or updates of one contact on command. Every contact it writes
// describes itself (its note names how many numbers and e-mails it has), so
// a reader can tell a torn write from a whole one.
#pragma once

#include <random>
#include <string>
#include <vector>

namespace ct::tools {

class StoreWriter {
public:
	explicit StoreWriter(unsigned seed);

	// Writes at random until the process is killed. Prints "begin" before and
	// "ok <version>" after every write that committed.
	[[noreturn]] void runRandom();
	// Reads commands from stdin: "burst N" updates the contact N times and
	// prints "ok <count> <version>" after the last one; "quit" or the end of
	// input stops. Returns the process exit code.
	int runCommands(int contactId, const std::string& tag);

private:
	int __insertPerson();
	int __updateContact(int contactId, const std::string& note, int numbers);
	int __linkTwo();
	int __unlinkOne();
	int __deleteOne();
	// A write retried while the database is locked by another process.
	template <typename Write>
	int __retryLocked(Write write);
	std::vector<std::pair<int, int>> __contactsAndPersons();
	int __pick(int count);

	std::mt19937 m_rng;
};

} // namespace ct::tools
