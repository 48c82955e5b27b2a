// Reading the usage log (tools and tests); writing goes through
// velmora_log_manager_insert.
#pragma once

#include "SqliteDatabase.h"

#include <cstdint>
#include <string>
#include <vector>

namespace ct::usagelog {

struct Record {
	int64_t id = 0;
	std::string uri;
	std::string appId;
	std::string feature;
	std::string extra;
	std::string value;
	int64_t timeMs = 0; // milliseconds since the epoch
};

// Opens (and creates) "usagelog.db" in the data folder with its schema.
// SQLITE_OK or the SQLite error.
int openLog(ct::db::Database& db);

// Every record, oldest first; empty when the log cannot be read.
std::vector<Record> records();

} // namespace ct::usagelog
