// Counts what the project's own code holds open on the main loop and in its
// stores: timers, idlers, animators, jobs, store change callbacks, settings
// listeners and prepared SQLite statements. The program defines each add and
// remove function itself, so every library calls through it; only calls made
// from this program or the project's libraries are counted, not the toolkit's.
#pragma once

#include <map>
#include <string>

namespace ct::test {

class HandleCensus {
public:
	// Live handles by kind ("timers", "statements", ...), at this moment.
	static std::map<std::string, long> now();
	// The resident memory of this process in bytes, after returning freed
	// heap pages to the system.
	static long residentBytes();
};

} // namespace ct::test
