#include "dlog.h"
#include "LogSink.h"

#include <atomic>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <deque>
#include <mutex>
#include <unistd.h>

namespace {

// The newest lines are kept up to this size (a ring, as the system log is):
// a long-running process keeps a bounded tail, not its whole history.
constexpr size_t kMaxKeptBytes = 256 * 1024;
constexpr size_t kMaxLineBytes = 4096;
// What a kept line costs beside its texts (entry, strings, queue slot).
constexpr size_t kLineOverheadBytes = 96;

std::mutex& sinkMutex()
{
	static std::mutex m;
	return m;
}

std::deque<ct::log::Entry>& sink()
{
	static std::deque<ct::log::Entry> lines;
	return lines;
}

size_t& keptBytes()
{
	static size_t bytes = 0;
	return bytes;
}

size_t costOf(const ct::log::Entry& e)
{
	return e.tag.size() + e.text.size() + kLineOverheadBytes;
}

log_priority priorityFromEnv()
{
	const char* level = getenv("CONTACTS_LOG_LEVEL");
	if (!level)
		return DLOG_INFO;
	struct { const char* name; log_priority prio; } const names[] = {
		{"verbose", DLOG_VERBOSE}, {"debug", DLOG_DEBUG}, {"info", DLOG_INFO},
		{"warn", DLOG_WARN}, {"error", DLOG_ERROR}, {"silent", DLOG_SILENT},
	};
	for (const auto& n : names)
		if (strcmp(level, n.name) == 0)
			return n.prio;
	return DLOG_INFO;
}

std::atomic<int>& stderrPriority()
{
	static std::atomic<int> prio{priorityFromEnv()};
	return prio;
}

char priorityLetter(log_priority prio)
{
	static const char letters[] = "??VDIWEFS";
	return prio < DLOG_PRIO_MAX ? letters[prio] : '?';
}

void keep(log_priority prio, const char* tag, const char* text)
{
	std::lock_guard<std::mutex> lock(sinkMutex());
	auto& lines = sink();
	lines.push_back({prio, tag, text});
	keptBytes() += costOf(lines.back());
	while (keptBytes() > kMaxKeptBytes && lines.size() > 1) {
		keptBytes() -= costOf(lines.front());
		lines.pop_front();
	}
}

bool matches(const ct::log::Entry& e, const std::string& needle, log_priority prio)
{
	return (prio == DLOG_UNKNOWN || e.priority == prio) && e.text.find(needle) != std::string::npos;
}

} // namespace

extern "C" int dlog_vprint(log_priority prio, const char* tag, const char* fmt, va_list ap)
{
	if (!tag || !fmt || prio <= DLOG_DEFAULT || prio >= DLOG_SILENT)
		return DLOG_ERROR_INVALID_PARAMETER;

	char text[kMaxLineBytes];
	int len = vsnprintf(text, sizeof(text), fmt, ap);
	if (len < 0)
		return DLOG_ERROR_INVALID_PARAMETER;

	keep(prio, tag, text);
	if (prio >= stderrPriority().load())
		fprintf(stderr, "%c/%s(%5d): %s\n", priorityLetter(prio), tag, (int)getpid(), text);
	return len;
}

extern "C" int dlog_print(log_priority prio, const char* tag, const char* fmt, ...)
{
	va_list ap;
	va_start(ap, fmt);
	int ret = dlog_vprint(prio, tag, fmt, ap);
	va_end(ap);
	return ret;
}

extern "C" void dlog_set_stderr_priority(log_priority prio)
{
	stderrPriority().store(prio);
}

extern "C" const char* dlog_basename(const char* path)
{
	if (!path)
		return "";
	const char* slash = strrchr(path, '/');
	return slash ? slash + 1 : path;
}

namespace ct::log {

std::vector<Entry> entries()
{
	std::lock_guard<std::mutex> lock(sinkMutex());
	return {sink().begin(), sink().end()};
}

size_t count(const std::string& needle, log_priority priority)
{
	std::lock_guard<std::mutex> lock(sinkMutex());
	size_t n = 0;
	for (const auto& e : sink())
		n += matches(e, needle, priority) ? 1 : 0;
	return n;
}

bool contains(const std::string& needle, log_priority priority)
{
	return count(needle, priority) > 0;
}

void clear()
{
	std::lock_guard<std::mutex> lock(sinkMutex());
	sink().clear();
	keptBytes() = 0;
}

} // namespace ct::log
