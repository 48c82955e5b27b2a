// In-memory record of every log line, for tests and diagnostics.
#pragma once

#include "dlog.h"

#include <string>
#include <vector>

namespace ct::log {

struct Entry {
	log_priority priority;
	std::string tag;
	std::string text;
};

// A copy of the lines kept so far (the newest 256 kB of them), oldest first.
std::vector<Entry> entries();
// True when a kept line contains `needle`, at `priority` unless that is DLOG_UNKNOWN.
bool contains(const std::string& needle, log_priority priority = DLOG_UNKNOWN);
size_t count(const std::string& needle, log_priority priority = DLOG_UNKNOWN);
void clear();

} // namespace ct::log
