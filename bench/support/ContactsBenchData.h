// Generated contacts databases for benchmarks, built once into a cache folder
// and copied into a fresh data folder per run.
#pragma once

#include <contacts.h>

#include <string>

namespace ct::bench {

// A copy of the generated database in a fresh data folder, removed with the
// object (moved, never copied).
struct BenchDatabase {
	std::string dataDir; // CONTACTS_DATA_DIR now points here
	std::string dbPath;  // the contacts database file in it
	int bigPersonId = 0; // a person of 10 linked contacts with over 100 child records
	int persons = 0;

	BenchDatabase() = default;
	~BenchDatabase();
	BenchDatabase(BenchDatabase&& other) noexcept;
	BenchDatabase& operator=(BenchDatabase&& other) noexcept;
	BenchDatabase(const BenchDatabase&) = delete;
	BenchDatabase& operator=(const BenchDatabase&) = delete;
};

// Makes sure a database of `persons` persons exists in the cache folder
// ($CONTACTS_BENCH_CACHE, else /tmp/contacts-bench-cache), generating it
// when missing (names in several scripts, 1-3 numbers, e-mails, some
// addresses, birthdays and groups, 5% of the persons linked), then copies it
// into a new data folder and points CONTACTS_DATA_DIR there. The copy is
// removed when the returned object (usually a global) is destroyed.
BenchDatabase ensureDatabase(int persons);

// The id of the first contact whose person id compares to `personId` as
// `match` says (equal: one of the person's contacts; not equal: another's).
int firstContactId(int personId, contacts_match_int_flag_e match);
// Rewrites the contact's uid, so that the store reports a change of it.
void touchContact(int contactId, int round);

// Resident memory of this process in bytes.
long residentBytes();

} // namespace ct::bench
