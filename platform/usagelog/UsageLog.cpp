#include "UsageLog.h"

#include "ContactsDebug.h"
#include "DataDir.h"

namespace ct::usagelog {

namespace {

const char kSchema[] =
	"CREATE TABLE IF NOT EXISTS records ("
	" id INTEGER PRIMARY KEY AUTOINCREMENT,"
	" uri TEXT NOT NULL,"
	" app_id TEXT NOT NULL,"
	" feature TEXT NOT NULL,"
	" extra TEXT,"
	" value TEXT,"
	" time INTEGER NOT NULL);";

} // namespace

int openLog(ct::db::Database& db)
{
	std::string path = ct::platform::dataPath("usagelog.db");
	if (path.empty())
		return SQLITE_CANTOPEN;
	int rc = db.open(path);
	if (rc == SQLITE_OK)
		rc = db.exec(kSchema);
	if (rc != SQLITE_OK) {
		WERROR("usage log %s unavailable: %s (%d)", path.c_str(), db.errorMessage().c_str(), rc);
		db.close();
	}
	return rc;
}

std::vector<Record> records()
{
	std::vector<Record> result;
	ct::db::Database db;
	if (openLog(db) != SQLITE_OK)
		return result;
	auto st = db.prepare("SELECT id, uri, app_id, feature, extra, value, time FROM records ORDER BY id");
	while (st.step() == SQLITE_ROW) {
		result.push_back({st.columnInt64(0), st.columnText(1), st.columnText(2), st.columnText(3),
			st.columnText(4), st.columnText(5), st.columnInt64(6)});
	}
	return result;
}

} // namespace ct::usagelog
