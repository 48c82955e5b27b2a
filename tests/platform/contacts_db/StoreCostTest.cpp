// What reads and writes cost the database: a record with its children in one
// statement, a new contact and its person written once, one change key for
// the contact views; and that the shortcuts store exactly what the long way
// would.
#include "ContactsTestSupport.h"
#include "../vconf/StoreTestSupport.h"

#include <functional>
#include <set>

using namespace ct::test;

namespace {

// Statements the store ran for fn.
int64_t statementsOf(const std::function<void()>& fn)
{
	int64_t before = ct::db::statementsStarted();
	fn();
	return ct::db::statementsStarted() - before;
}

// One row of a table, read through a second connection, as "a|b|c|".
std::string rowOf(const ConnectedStore& store, const std::string& table, int id, const std::set<std::string>& skip = {})
{
	ct::db::Database db;
	EXPECT_EQ(SQLITE_OK, db.open(store.dir().file("contacts.db"), ct::db::OpenMode::ReadOnly));
	auto st = db.prepare(("SELECT * FROM " + table + " WHERE id = " + std::to_string(id)).c_str());
	std::string out;
	if (st.step() != SQLITE_ROW)
		return "(none)";
	for (int c = 0; c < sqlite3_column_count(st.handle()); ++c)
		if (!skip.count(sqlite3_column_name(st.handle(), c)))
			out += st.columnText(c) + "|";
	return out;
}

int execOnFile(const ConnectedStore& store, const char* sql)
{
	ct::db::Database db;
	EXPECT_EQ(SQLITE_OK, db.open(store.dir().file("contacts.db")));
	return db.exec(sql);
}

int insertGroup(const char* name)
{
	RecordPtr g = newRecord(_contacts_group._uri);
	contacts_record_set_str(g.get(), _contacts_group.name, name);
	return insertRecord(g.get());
}

// A contact with a child of every kind and several numbers.
RecordPtr richContact(int group)
{
	RecordPtr c = makeContact({ "Ada", "Lovelace", { "111", "222", "333" }, { "ada@x.org", "ada@y.org" }, 0, "/p/a.jpg" });
	contacts_record_set_str(c.get(), _contacts_contact.ringtone_path, "/r/ring.ogg");
	contacts_record_set_str(c.get(), _contacts_contact.vibration, "buzz");
	contacts_record_set_bool(c.get(), _contacts_contact.is_favorite, true);
	contacts_record_set_bool(childAt(c.get(), _contacts_contact.email, 1), _contacts_email.is_default, true);
	contacts_record_set_str(addChild(c.get(), _contacts_contact.note, _contacts_note._uri), _contacts_note.note, "n");
	contacts_record_set_str(addChild(c.get(), _contacts_contact.nickname, _contacts_nickname._uri),
		_contacts_nickname.name, "Countess");
	contacts_record_set_int(addChild(c.get(), _contacts_contact.event, _contacts_event._uri), _contacts_event.date,
		18151210);
	contacts_record_set_str(addChild(c.get(), _contacts_contact.company, _contacts_company._uri),
		_contacts_company.name, "Engine");
	contacts_record_set_int(addChild(c.get(), _contacts_contact.group_relation, _contacts_group_relation._uri),
		_contacts_group_relation.group_id, group);
	return c;
}

} // namespace

TEST(StoreCost, ARecordAndAllItsChildrenAreReadInOneStatementInIdOrder)
{
	ConnectedStore store;
	int group = insertGroup("Friends");
	int id = insertRecord(richContact(group).get());
	int person = personOf(id);
	RecordPtr contact, personRecord;
	EXPECT_EQ(1, statementsOf([&] { contact = getRecord(_contacts_contact._uri, id); }));
	EXPECT_EQ(1, statementsOf([&] { personRecord = getRecord(_contacts_person._uri, person); }));
	EXPECT_EQ("Ada Lovelace", strOf(personRecord.get(), _contacts_person.display_name));
	EXPECT_EQ((std::vector<std::string>{ "111", "222", "333" }),
		texts(contact.get(), _contacts_contact.number, _contacts_number.number));
	EXPECT_EQ((std::vector<std::string>{ "Countess" }),
		texts(contact.get(), _contacts_contact.nickname, _contacts_nickname.name));
	EXPECT_EQ((std::vector<std::string>{ "Friends" }),
		texts(contact.get(), _contacts_contact.group_relation, _contacts_group_relation.name));
	EXPECT_EQ(18151210, intOf(childAt(contact.get(), _contacts_contact.event), _contacts_event.date));

	// The middle number goes, a new one comes: the order stays the ids' order.
	RecordPtr removed(childAt(contact.get(), _contacts_contact.number, 1));
	contacts_record_remove_child_record(contact.get(), _contacts_contact.number, removed.get());
	contacts_record_set_str(addChild(contact.get(), _contacts_contact.number, _contacts_number._uri),
		_contacts_number.number, "444");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(contact.get()));
	store.reopen();
	EXPECT_EQ((std::vector<std::string>{ "111", "333", "444" }),
		texts(getRecord(_contacts_contact._uri, id).get(), _contacts_contact.number, _contacts_number.number));

	// A profile with the same id as the contact has only its own children.
	RecordPtr profile = newRecord(_contacts_my_profile._uri);
	contacts_record_set_str(addChild(profile.get(), _contacts_my_profile.number, _contacts_number._uri),
		_contacts_number.number, "999");
	int profileId = insertRecord(profile.get());
	ASSERT_EQ(id, profileId);
	EXPECT_EQ(std::vector<std::string>{ "999" },
		texts(getRecord(_contacts_my_profile._uri, profileId).get(), _contacts_my_profile.number, _contacts_number.number));

	// Children left behind without their contact do not make it exist.
	ASSERT_EQ(SQLITE_OK, execOnFile(store, "INSERT INTO numbers(contact_id, owner, number) VALUES (777, 0, '5')"));
	contacts_record_h none = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_get_record(_contacts_contact._uri, 777, &none));
	EXPECT_EQ(nullptr, none);
}

TEST(StoreCost, ANewContactAndItsPersonAreWrittenOnceAndHoldWhatARecomputationGives)
{
	ConnectedStore store;
	int group = insertGroup("Friends");
	RecordPtr record = richContact(group);
	int id = 0;
	int children = 14;
	int64_t statements = statementsOf([&] { ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(record.get(), &id)); });
	// Transaction, version, book check, name order, person, contact, change
	// row and change key around the children (the group one checks its group).
	EXPECT_LE(statements, children + 10);
	int person = personOf(id);
	const std::set<std::string> moving = { "changed_ver", "changed_time" };
	std::string personRow = rowOf(store, "persons", person, moving);
	std::string contactRow = rowOf(store, "contacts", id, moving);
	RecordPtr stored = getRecord(_contacts_contact._uri, id);
	EXPECT_TRUE(boolOf(childAt(stored.get(), _contacts_contact.number, 0), _contacts_number.is_default));
	EXPECT_FALSE(boolOf(childAt(stored.get(), _contacts_contact.number, 1), _contacts_number.is_default));
	EXPECT_FALSE(boolOf(childAt(stored.get(), _contacts_contact.email, 0), _contacts_email.is_default));
	EXPECT_TRUE(boolOf(childAt(stored.get(), _contacts_contact.email, 1), _contacts_email.is_default));
	EXPECT_EQ(id, intOf(getRecord(_contacts_person._uri, person).get(), _contacts_person.display_contact_id));

	// An update without changes recomputes both rows the long way.
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(stored.get()));
	EXPECT_EQ(personRow, rowOf(store, "persons", person, moving));
	EXPECT_EQ(contactRow, rowOf(store, "contacts", id, moving));
	EXPECT_NE(std::string::npos, personRow.find("Ada Lovelace|A|")) << personRow;
	EXPECT_NE(std::string::npos, personRow.find("/r/ring.ogg|/p/a.jpg|buzz|")) << personRow;
}

TEST(StoreCost, APersonNamesItsContactEvenWhenTheIdSequenceWasTamperedWith)
{
	ConnectedStore store;
	for (const char* name : { "A", "B", "C" })
		insertContact({ name, "" });
	for (const char* sql : { "UPDATE sqlite_sequence SET seq = 0 WHERE name = 'contacts'",
			 "DELETE FROM sqlite_sequence WHERE name = 'contacts'" }) {
		ASSERT_EQ(SQLITE_OK, execOnFile(store, sql)) << sql;
		int id = insertContact({ "D", "" });
		EXPECT_EQ(id, intOf(getRecord(_contacts_person._uri, personOf(id)).get(), _contacts_person.display_contact_id))
			<< sql;
	}
}

namespace {

struct Calls {
	std::multiset<std::string> uris;
	static void cb(const char* uri, void* data) { static_cast<Calls*>(data)->uris.insert(uri); }
};

} // namespace

TEST(StoreCost, AContactWriteStoresOneChangeKeyAndStillReachesEveryContactView)
{
	EcoreScope ecore;
	ConnectedStore store;
	Calls calls;
	const char* watched[] = { _contacts_person._uri, _contacts_simple_contact._uri, _contacts_number._uri,
		_contacts_group_relation._uri, _contacts_group._uri, _contacts_my_profile._uri };
	for (const char* uri : watched)
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_add_changed_cb(uri, Calls::cb, &calls));
	int version = 0;
	int id = insertContact({ "Key", "", { "1" } });
	contacts_db_get_current_version(&version);
	ct::db::Database db;
	ASSERT_EQ(SQLITE_OK, db.open(store.dir().file("contacts.db"), ct::db::OpenMode::ReadOnly));
	auto st = db.prepare(("SELECT count(*) FROM view_versions WHERE version = " + std::to_string(version)).c_str());
	ASSERT_EQ(SQLITE_ROW, st.step());
	EXPECT_EQ(1, st.columnInt(0));

	ecore_main_loop_iterate();
	EXPECT_EQ((std::multiset<std::string>{ _contacts_person._uri, _contacts_simple_contact._uri, _contacts_number._uri,
		_contacts_group_relation._uri }), calls.uris);
	calls.uris.clear();
	insertGroup("Work");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_contact._uri, id));
	ecore_main_loop_iterate();
	EXPECT_EQ((std::multiset<std::string>{ _contacts_person._uri, _contacts_simple_contact._uri, _contacts_number._uri,
		_contacts_group_relation._uri, _contacts_group._uri }), calls.uris);
	for (const char* uri : watched)
		contacts_db_remove_changed_cb(uri, Calls::cb, &calls);
}
