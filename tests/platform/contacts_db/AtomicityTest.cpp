// A write that fails at any point (disk full) leaves the database as it was.
#include "ContactsTestSupport.h"
#include "SqliteFaultInjector.h"

#include <functional>

using namespace ct::test;

namespace {

// Every row of every table, read through a second connection.
std::string dump(const std::string& path)
{
	ct::db::Database db;
	EXPECT_EQ(SQLITE_OK, db.open(path, ct::db::OpenMode::ReadOnly));
	std::string out;
	std::vector<std::string> tables;
	auto st = db.prepare("SELECT name FROM sqlite_master WHERE type = 'table' ORDER BY name");
	while (st.step() == SQLITE_ROW)
		tables.push_back(st.columnText(0));
	for (const std::string& t : tables) {
		auto rows = db.prepare(("SELECT * FROM \"" + t + "\"").c_str());
		out += "[" + t + "]\n";
		while (rows.step() == SQLITE_ROW) {
			for (int c = 0; c < sqlite3_column_count(rows.handle()); ++c)
				out += rows.columnText(c) + "|";
			out += "\n";
		}
	}
	return out;
}

// Runs op with the Nth write failing, for N = 1, 2, ... until op succeeds;
// every failed run must leave the database exactly as it was.
void expectAtomic(const ConnectedStore& store, const std::function<int()>& op)
{
	std::string path = store.dir().file("contacts.db");
	std::string before = dump(path);
	for (int n = 1; n < 400; ++n) {
		int err;
		{
			ct::db::ScopedWriteFailure failure(n);
			err = op();
		}
		if (err == CONTACTS_ERROR_NONE) {
			EXPECT_NE(before, dump(path)) << "succeeded without writing at n=" << n;
			return;
		}
		EXPECT_EQ(CONTACTS_ERROR_FILE_NO_SPACE, err) << "n=" << n;
		ASSERT_EQ(before, dump(path)) << "partial write at n=" << n;
	}
	FAIL() << "the write never succeeded";
}

} // namespace

TEST(Atomicity, InsertUpdateDeleteAndLinkLoseNothingWhenTheDiskFills)
{
	ConnectedStore store;
	int keep = insertContact({ "Keep", "Me", { "42" } });

	RecordPtr contact = makeContact({ "Big", "Contact", { "1", "2", "3", "4", "5", "6" }, { "a@b", "c@d", "e@f" } });
	for (int i = 0; i < 10; ++i)
		contacts_record_set_str(addChild(contact.get(), _contacts_contact.url, _contacts_url._uri), _contacts_url.url,
			("http://x/" + std::to_string(i)).c_str());
	expectAtomic(store, [&]() { return contacts_db_insert_record(contact.get(), nullptr); });
	int id = intOf(contact.get(), _contacts_contact.id);
	ASSERT_GT(id, 0);

	RecordPtr stored = getRecord(_contacts_contact._uri, id);
	contacts_record_set_str(childAt(stored.get(), _contacts_contact.number, 0), _contacts_number.number, "changed");
	contacts_record_h number = childAt(stored.get(), _contacts_contact.number, 1);
	contacts_record_remove_child_record(stored.get(), _contacts_contact.number, number);
	contacts_record_destroy(number, true);
	contacts_record_set_str(addChild(stored.get(), _contacts_contact.email, _contacts_email._uri), _contacts_email.email, "new@x");
	expectAtomic(store, [&]() { return contacts_db_update_record(stored.get()); });
	RecordPtr reread = getRecord(_contacts_contact._uri, id);
	EXPECT_EQ(5, childCount(reread.get(), _contacts_contact.number));
	EXPECT_EQ(4, childCount(reread.get(), _contacts_contact.email));

	int base = personOf(keep);
	expectAtomic(store, [&]() { return contacts_person_link_person(base, personOf(id)); });
	expectAtomic(store, [&]() { return contacts_utils_set_ringtone_info(1, id, "/r.ogg", 1, 30); });
	expectAtomic(store, [&]() { return contacts_db_delete_record(_contacts_person._uri, base); });
	EXPECT_EQ(0, countOf(_contacts_contact._uri));
}

TEST(Atomicity, ProfileGroupAndSettingWritesLoseNothingWhenTheDiskFills)
{
	ConnectedStore store;
	insertContact({ "Ann", "Lee", { "1" } });
	insertContact({ "Bo", "Kim", { "2" } });
	expectAtomic(store, []() { return contacts_setting_set_name_display_order(CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST); });

	RecordPtr group = newRecord(_contacts_group._uri);
	contacts_record_set_str(group.get(), _contacts_group.name, "Team");
	expectAtomic(store, [&]() { return contacts_db_insert_record(group.get(), nullptr); });
	int groupId = intOf(group.get(), _contacts_group.id);
	expectAtomic(store, [&]() { return contacts_group_add_contact(groupId, 1); });
	expectAtomic(store, [&]() { return contacts_db_delete_record(_contacts_group._uri, groupId); });

	RecordPtr profile = newRecord(_contacts_my_profile._uri);
	contacts_record_set_str(addChild(profile.get(), _contacts_my_profile.name, _contacts_name._uri), _contacts_name.first, "Me");
	contacts_record_set_str(profile.get(), _contacts_my_profile_ex.status, "Here");
	expectAtomic(store, [&]() { return contacts_db_insert_record(profile.get(), nullptr); });
	EXPECT_EQ(1, countOf(_contacts_my_profile._uri));
}
