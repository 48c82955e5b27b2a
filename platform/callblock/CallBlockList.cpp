#include "CallBlockList.h"

#include "ContactsDebug.h"
#include "DataDir.h"

#include <algorithm>
#include <cctype>
#include <cerrno>

namespace ct::callblock {

namespace {

const char kSchema[] =
	"CREATE TABLE IF NOT EXISTS blocked ("
	" type INTEGER NOT NULL,"
	" number TEXT NOT NULL,"
	" PRIMARY KEY(type, number));";

int storageError(const ct::db::Database& db, const char* what, int rc)
{
	WERROR("call-block %s failed: %s (%d)", what, db.errorMessage().c_str(), rc);
	int err = ct::db::toErrno(rc);
	return err ? err : -EIO;
}

} // namespace

CallBlockList::CallBlockList() = default;

CallBlockList::~CallBlockList() = default;

int CallBlockList::open()
{
	std::string path = ct::platform::dataPath("callblock.db");
	if (path.empty()) {
		WERROR("no data folder for the call-block list");
		return -EACCES;
	}
	int rc = m_db.open(path);
	if (rc == SQLITE_OK)
		rc = m_db.exec(kSchema);
	if (rc != SQLITE_OK) {
		int err = storageError(m_db, "open", rc);
		m_db.close();
		return err;
	}
	return 0;
}

std::string CallBlockList::cleanNumber(const std::string& number)
{
	std::string clean;
	bool leading = true;
	for (char c : number) {
		if (std::isdigit(static_cast<unsigned char>(c)))
			clean.push_back(c);
		else if (c == '+' && leading)
			clean.push_back(c);
		if (!std::isspace(static_cast<unsigned char>(c)))
			leading = false;
	}
	return clean.find_first_of("0123456789") == std::string::npos ? std::string() : clean;
}

int CallBlockList::find(int type, const std::string& number) const
{
	// Asked once per number row of every detail screen.
	ct::db::CachedStatement st(m_db.cached("SELECT 1 FROM blocked WHERE type = ? AND number = ?"));
	int rc = st->bind(1, type).bind(2, cleanNumber(number)).step();
	if (rc == SQLITE_ROW)
		return 1;
	return rc == SQLITE_DONE ? 0 : storageError(m_db, "find", rc);
}

int CallBlockList::add(int type, const std::string& number)
{
	int rc = __write("INSERT OR IGNORE INTO blocked(type, number) VALUES(?, ?)", type, number);
	return rc == 0 && m_db.changes() == 0 ? -EEXIST : rc;
}

int CallBlockList::remove(int type, const std::string& number)
{
	int rc = __write("DELETE FROM blocked WHERE type = ? AND number = ?", type, number);
	return rc == 0 && m_db.changes() == 0 ? -ENODATA : rc;
}

int CallBlockList::__write(const char* sql, int type, const std::string& number)
{
	auto st = m_db.prepare(sql);
	int rc = st.bind(1, type).bind(2, cleanNumber(number)).step();
	if (rc != SQLITE_DONE)
		return storageError(m_db, "write", rc);
	if (m_db.changes() > 0 && m_watcher)
		m_watcher->notifyLocalChange();
	return 0;
}

std::vector<std::string> CallBlockList::numbers(int type) const
{
	std::vector<std::string> result;
	auto st = m_db.prepare("SELECT number FROM blocked WHERE type = ? ORDER BY number");
	st.bind(1, type);
	while (st.step() == SQLITE_ROW)
		result.push_back(st.columnText(0));
	return result;
}

void CallBlockList::addObserver(const void* tag, std::function<void()> observer)
{
	for (auto& registration : m_observers) {
		if (registration->tag == tag) {
			registration->observer = std::move(observer);
			return;
		}
	}
	m_observers.push_back(std::make_shared<Registration>(Registration{tag, std::move(observer)}));
	if (!m_watcher && m_db.isOpen())
		m_watcher = std::make_unique<ct::db::StoreChangeWatcher>(m_db, [this] { __deliver(); });
}

bool CallBlockList::removeObserver(const void* tag)
{
	auto it = std::find_if(m_observers.begin(), m_observers.end(),
		[tag](const auto& registration) { return registration->tag == tag; });
	if (it == m_observers.end())
		return false;
	(*it)->active = false;
	m_observers.erase(it);
	return true;
}

void CallBlockList::removeAllObservers()
{
	for (auto& registration : m_observers)
		registration->active = false;
	m_observers.clear();
}

void CallBlockList::__deliver()
{
	// A snapshot: observers may add or remove registrations while we call them.
	auto snapshot = m_observers;
	++m_delivering;
	for (const auto& registration : snapshot) {
		if (registration->active)
			registration->observer();
	}
	--m_delivering;
}

} // namespace ct::callblock
