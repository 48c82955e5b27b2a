// contacts_utils_*: ringtone information and case-insensitive search.
#include "ContactsConnection.h"
#include "ContactsDebug.h"
#include "contacts_service.h"

#include <glib.h>

#include <cstring>

using namespace ct::contacts;

namespace {

// The case-folded text of one UTF-8 character at p.
std::string foldedChar(const char* p)
{
	const char* next = g_utf8_next_char(p);
	gchar* folded = g_utf8_casefold(p, next - p);
	std::string out = folded ? folded : "";
	g_free(folded);
	return out;
}

// Byte length of the haystack text at p whose folding equals foldedNeedle, or -1.
int matchAt(const char* p, const std::string& foldedNeedle)
{
	std::string acc;
	const char* q = p;
	while (*q && acc.size() < foldedNeedle.size()) {
		acc += foldedChar(q);
		q = g_utf8_next_char(q);
		if (foldedNeedle.compare(0, acc.size(), acc) != 0)
			return -1;
	}
	return acc == foldedNeedle ? static_cast<int>(q - p) : -1;
}

} // namespace

extern "C" {

int contacts_utils_strstr(const char* haystack, const char* needle, int* len)
{
	if (len)
		*len = 0;
	if (!haystack || !needle || !len || !*needle)
		return -1;
	if (!g_utf8_validate(haystack, -1, nullptr) || !g_utf8_validate(needle, -1, nullptr)) {
		WERROR("text is not valid UTF-8");
		return -1;
	}
	gchar* folded = g_utf8_casefold(needle, -1);
	std::string foldedNeedle = folded;
	g_free(folded);
	for (const char* p = haystack; *p; p = g_utf8_next_char(p)) {
		int matched = matchAt(p, foldedNeedle);
		if (matched > 0) {
			*len = matched;
			return static_cast<int>(p - haystack);
		}
	}
	return -1;
}

int contacts_utils_get_ringtone_info(int kind, int id, char** path, int* flag, long long int* position)
{
	WPRET_VM(!path || !flag || !position || id <= 0 || kind < 0 || kind > CONTACTS_RINGTONE_KIND_GROUP,
		CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : kind %d, id %d", kind, id);
	*path = nullptr;
	*flag = 0;
	*position = 0;
	ContactsConnection* conn = ContactsConnection::current();
	WPRET_VM(!conn, CONTACTS_ERROR_DB, "not connected");
	CachedStatement st(conn->statement("SELECT path, flag, position FROM ringtones WHERE kind = ? AND id = ?"));
	int rc = st->bind(1, kind).bind(2, id).step();
	if (rc == SQLITE_DONE)
		return CONTACTS_ERROR_NO_DATA;
	if (rc != SQLITE_ROW)
		return conn->failed("ringtone", rc);
	if (const char* text = st->columnTextPtr(0))
		*path = strdup(text);
	*flag = st->columnInt(1);
	*position = st->columnInt64(2);
	return CONTACTS_ERROR_NONE;
}

int contacts_utils_set_ringtone_info(int kind, int id, const char* path, int flag, long long int position)
{
	WPRET_VM(id <= 0 || kind < 0 || kind > CONTACTS_RINGTONE_KIND_GROUP, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : kind %d, id %d", kind, id);
	WPRET_VM(path && !g_utf8_validate(path, -1, nullptr), CONTACTS_ERROR_INVALID_PARAMETER, "path is not UTF-8");
	ContactsConnection* conn = ContactsConnection::current();
	WPRET_VM(!conn, CONTACTS_ERROR_DB, "not connected");
	return conn->write([&](WriteContext&) {
		CachedStatement st(conn->statement(path
			? "INSERT OR REPLACE INTO ringtones(kind, id, path, flag, position) VALUES (?, ?, ?, ?, ?)"
			: "DELETE FROM ringtones WHERE kind = ? AND id = ?"));
		st->bind(1, kind).bind(2, id);
		if (path)
			st->bind(3, path).bind(4, flag).bind(5, static_cast<int64_t>(position));
		int rc = st->run();
		return rc == SQLITE_DONE ? CONTACTS_ERROR_NONE : conn->failed("ringtone", rc);
	});
}

} // extern "C"
