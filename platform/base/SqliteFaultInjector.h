// A pass-through SQLite VFS that can be told to fail writes, so tests can
// prove that a store loses nothing when the disk fills up mid-save.
#pragma once

namespace ct::db {

class FaultInjector {
public:
	// Name of the VFS every Database opens with; registered on first call.
	static const char* vfsName();

	// From now on, the `n`th write (1 = the next one) and every write after it
	// fail with SQLITE_FULL until disarm(). Syncs of dirty files fail too.
	static void failWritesFrom(int n);
	static void disarm();
	// Writes seen since the last failWritesFrom()/disarm()/resetCount().
	static int writeCount();
	static void resetCount();
};

// Arms the injector for one scope.
class ScopedWriteFailure {
public:
	explicit ScopedWriteFailure(int n) { FaultInjector::failWritesFrom(n); }
	~ScopedWriteFailure() { FaultInjector::disarm(); }
	ScopedWriteFailure(const ScopedWriteFailure&) = delete;
	ScopedWriteFailure& operator=(const ScopedWriteFailure&) = delete;
};

} // namespace ct::db
