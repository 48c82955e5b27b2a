#include "StoreAudit.h"

#include <sqlite3.h>

#include <memory>

namespace ct::test {
namespace {

struct Check {
	const char* fault;
	std::string sql; // counts the rows that show the fault
};

const char* const kChildTables[] = { "names", "numbers", "emails", "addresses", "messengers", "urls",
	"relationships", "events", "notes", "images", "nicknames", "companies", "group_relations", "profiles" };

std::string countOf(const std::string& sql)
{
	return "(SELECT count(*) FROM " + sql + ")";
}

std::vector<Check> checks()
{
	std::vector<Check> list = {
		{ "contact without its name record", "SELECT count(*) FROM contacts c WHERE NOT EXISTS "
			"(SELECT 1 FROM names n WHERE n.contact_id = c.id AND n.owner = 0)" },
		{ "contact without its person", "SELECT count(*) FROM contacts WHERE person_id NOT IN (SELECT id FROM persons)" },
		{ "person without contacts", "SELECT count(*) FROM persons p WHERE NOT EXISTS "
			"(SELECT 1 FROM contacts c WHERE c.person_id = p.id)" },
		{ "person whose link count is not its number of contacts", "SELECT count(*) FROM persons p WHERE link_count != "
			+ countOf("contacts c WHERE c.person_id = p.id") },
		{ "person shown through a contact that is not its own", "SELECT count(*) FROM persons p WHERE NOT EXISTS "
			"(SELECT 1 FROM contacts c WHERE c.id = p.display_contact_id AND c.person_id = p.id)" },
		{ "contact without exactly one note", "SELECT count(*) FROM contacts c WHERE "
			+ countOf("notes n WHERE n.contact_id = c.id AND n.owner = 0") + " != 1" },
		// Every writer's note names how many numbers and e-mails the contact has.
		{ "contact whose numbers or e-mails are half written", "SELECT count(*) FROM contacts c JOIN notes n "
			"ON n.contact_id = c.id AND n.owner = 0 WHERE n.note != 'numbers=' || "
			+ countOf("numbers x WHERE x.contact_id = c.id AND x.owner = 0") + " || ' emails=' || "
			+ countOf("emails x WHERE x.contact_id = c.id AND x.owner = 0") },
	};
	for (const char* table : kChildTables) {
		list.push_back({ "child record without its contact",
			std::string("SELECT count(*) FROM ") + table + " WHERE owner = 0 AND contact_id NOT IN (SELECT id FROM contacts)" });
	}
	return list;
}

using Connection = std::unique_ptr<sqlite3, int (*)(sqlite3*)>;

Connection open(const std::string& path)
{
	sqlite3* db = nullptr;
	sqlite3_open_v2(path.c_str(), &db, SQLITE_OPEN_READWRITE, nullptr);
	return Connection(db, sqlite3_close_v2);
}

} // namespace

StoreAudit::StoreAudit(std::string databasePath) : m_path(std::move(databasePath)) {}

long long StoreAudit::__count(const std::string& sql) const
{
	Connection db = open(m_path);
	sqlite3_stmt* st = nullptr;
	long long value = -1;
	if (sqlite3_prepare_v2(db.get(), sql.c_str(), -1, &st, nullptr) == SQLITE_OK && sqlite3_step(st) == SQLITE_ROW)
		value = sqlite3_column_int64(st, 0);
	sqlite3_finalize(st);
	return value;
}

std::vector<std::string> StoreAudit::problems() const
{
	std::vector<std::string> found;
	Connection db = open(m_path);
	sqlite3_stmt* st = nullptr;
	if (sqlite3_prepare_v2(db.get(), "PRAGMA integrity_check", -1, &st, nullptr) != SQLITE_OK) {
		found.push_back(std::string("unreadable database: ") + sqlite3_errmsg(db.get()));
		return found;
	}
	while (sqlite3_step(st) == SQLITE_ROW) {
		std::string line = reinterpret_cast<const char*>(sqlite3_column_text(st, 0));
		if (line != "ok")
			found.push_back("integrity check: " + line);
	}
	sqlite3_finalize(st);
	for (const Check& check : checks()) {
		long long bad = __count(check.sql);
		if (bad != 0)
			found.push_back(std::string(check.fault) + ": " + std::to_string(bad));
	}
	return found;
}

long long StoreAudit::version() const
{
	return __count("SELECT value FROM meta WHERE key = 'version'");
}

int StoreAudit::persons() const
{
	return static_cast<int>(__count("SELECT count(*) FROM persons"));
}

int StoreAudit::linkedPersons() const
{
	return static_cast<int>(__count("SELECT count(*) FROM persons WHERE link_count > 1"));
}

} // namespace ct::test
