// Contacts, their children and persons: writes, reads, persistence, bad input.
#include "ContactsTestSupport.h"

#include <fstream>

using namespace ct::test;

TEST(ContactStore, InsertedContactKeepsEveryChildAndHugeQuotedTextsAndUpdatesChangeOnlyTheirChildren)
{
	ConnectedStore store;
	RecordPtr contact = makeContact({ "Anna", "Lopez", { "+1 555 0100", "0200" }, { "anna@example.com" } });
	addChild(contact.get(), _contacts_contact.nickname, _contacts_nickname._uri);
	contacts_record_h event = addChild(contact.get(), _contacts_contact.event, _contacts_event._uri);
	contacts_record_set_int(event, _contacts_event.date, 19800229);
	contacts_record_set_bool(event, _contacts_event.is_leap_month, true);
	const std::string note = "it's 100% \"quoted\"; DROP TABLE contacts;--" + std::string(3 << 20, 'n') + "ünï";
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_set_str(addChild(contact.get(), _contacts_contact.note,
		_contacts_note._uri), _contacts_note.note, note.c_str()));
	int id = insertRecord(contact.get());
	store.reopen();
	RecordPtr read = getRecord(_contacts_contact._uri, id);
	ASSERT_TRUE(read);
	EXPECT_EQ("Anna Lopez", strOf(read.get(), _contacts_contact.display_name));
	EXPECT_EQ(CONTACTS_DISPLAY_NAME_SOURCE_TYPE_NAME, intOf(read.get(), _contacts_contact.display_source_type));
	EXPECT_EQ((std::vector<std::string>{ "+1 555 0100", "0200" }), texts(read.get(), _contacts_contact.number, _contacts_number.number));
	EXPECT_EQ(std::vector<std::string>{ "anna@example.com" }, texts(read.get(), _contacts_contact.email, _contacts_email.email));
	contacts_record_h number = childAt(read.get(), _contacts_contact.number);
	EXPECT_EQ("+15550100", strOf(number, _contacts_number.cleaned_number));
	EXPECT_EQ(CONTACTS_NUMBER_TYPE_CELL, intOf(number, _contacts_number.type));
	EXPECT_EQ(id, intOf(number, _contacts_number.contact_id));
	event = childAt(read.get(), _contacts_contact.event);
	EXPECT_TRUE(intOf(event, _contacts_event.date) == 19800229 && boolOf(event, _contacts_event.is_leap_month));
	EXPECT_TRUE(note == strOf(childAt(read.get(), _contacts_contact.note), _contacts_note.note));

	// Change the first number, drop the second, add a third.
	int firstId = intOf(number, _contacts_number.id);
	contacts_record_set_str(number, _contacts_number.number, "11");
	contacts_record_h second = childAt(read.get(), _contacts_contact.number, 1);
	contacts_record_remove_child_record(read.get(), _contacts_contact.number, second);
	contacts_record_destroy(second, true);
	contacts_record_set_str(addChild(read.get(), _contacts_contact.number, _contacts_number._uri), _contacts_number.number, "4");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(read.get()));
	// Saving the same record twice does not duplicate the new child.
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(read.get()));
	store.reopen();
	read = getRecord(_contacts_contact._uri, id);
	EXPECT_EQ((std::vector<std::string>{ "11", "4" }), texts(read.get(), _contacts_contact.number, _contacts_number.number));
	EXPECT_EQ(firstId, intOf(childAt(read.get(), _contacts_contact.number), _contacts_number.id));
	EXPECT_TRUE(note == strOf(childAt(read.get(), _contacts_contact.note), _contacts_note.note));
}

TEST(ContactStore, DisplayNameFallsBackAndFollowsTheNameOrder)
{
	ConnectedStore store;
	int named = insertContact({ "Jae", "Kim" });
	int numberOnly = insertContact({ "", "", { "0101234" } });
	int emailOnly = insertContact({ "", "", {}, { "x@y.z" } });
	EXPECT_EQ("0101234", strOf(getRecord(_contacts_contact._uri, numberOnly).get(), _contacts_contact.display_name));
	EXPECT_EQ("x@y.z", strOf(getRecord(_contacts_contact._uri, emailOnly).get(), _contacts_contact.display_name));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_setting_set_name_display_order(CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_setting_set_name_display_order(static_cast<contacts_name_display_order_e>(7)));
	store.reopen();
	contacts_name_display_order_e order = CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST;
	contacts_setting_get_name_display_order(&order);
	EXPECT_EQ(CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST, order);
	RecordPtr person = getRecord(_contacts_person._uri, personOf(named));
	EXPECT_EQ("Kim Jae", strOf(person.get(), _contacts_person.display_name));
	EXPECT_EQ("K", strOf(person.get(), _contacts_person.display_name_index));
}

TEST(ContactStore, BadIdsHandlesAndViewsGiveErrorsNotCrashes)
{
	ConnectedStore store;
	contacts_record_h r = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_get_record(_contacts_contact._uri, 12345, &r));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_get_record(_contacts_contact._uri, -1, &r));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_get_record("nope", 1, &r));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_get_record(nullptr, 1, &r));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_get_record(_contacts_contact._uri, 1, nullptr));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_delete_record(_contacts_contact._uri, 999));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_delete_record(_contacts_person._uri, 999));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_delete_record(_contacts_contact._uri, -3));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_record(nullptr, nullptr));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_update_record(nullptr));
	// A contact in a missing address book, a person (only made by linking),
	// a child record alone (saved with its parent), a contact that is gone.
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_record(makeContact({ "A", "", {}, {}, 77 }).get(), nullptr));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_record(newRecord(_contacts_person._uri).get(), nullptr));
	RecordPtr ghost = makeContact({ "G", "" });
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_db_insert_record(childAt(ghost.get(), _contacts_contact.name), nullptr));
	contacts_record_set_int(ghost.get(), _contacts_contact.id, 4242);
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_update_record(ghost.get()));
	EXPECT_EQ(0, countOf(_contacts_contact._uri));
}

TEST(ContactStore, DatabaseOfTheFirstSchemaIsUpgradedKeepingItsContacts)
{
	TempDataDir dir;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	int id = insertContact({ "Old", "", { "555" } });
	contacts_disconnect();
	{
		// What a store written before social profiles existed looks like.
		ct::db::Database old;
		ASSERT_EQ(SQLITE_OK, old.open(dir.file("contacts.db"), ct::db::OpenMode::ReadWrite));
		ASSERT_EQ(SQLITE_OK, old.exec("DROP TABLE profiles; UPDATE meta SET value = 'contacts-service/1' WHERE key = 'schema';"))
			<< old.errorMessage();
	}
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	RecordPtr contact = getRecord(_contacts_contact._uri, id);
	EXPECT_EQ("Old", strOf(contact.get(), _contacts_contact.display_name));
	contacts_record_set_str(addChild(contact.get(), _contacts_contact.profile, _contacts_profile._uri),
		_contacts_profile.uri, "fb://profile/1");
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(contact.get()));
	EXPECT_EQ(1, childCount(getRecord(_contacts_contact._uri, id).get(), _contacts_contact.profile));
	contacts_disconnect();
}

TEST(ContactStore, CallsWithoutAConnectionAndGarbageForeignOrUnreachableDatabasesFail)
{
	TempDataDir dir;
	contacts_record_h r = nullptr;
	int version = 0;
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_db_get_record(_contacts_contact._uri, 1, &r));
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_disconnect());
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_db_get_current_version(&version));
	// Connections are counted: the second disconnect closes.
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_disconnect());
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_current_version(&version));
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_disconnect());
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_db_get_current_version(&version));

	std::ofstream(dir.file("contacts.db"), std::ios::binary) << std::string(8192, 'x');
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_connect());
	std::ifstream in(dir.file("contacts.db"), std::ios::binary);
	EXPECT_EQ(std::string(8192, 'x'), std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()));

	TempDataDir other;
	{
		ct::db::Database foreign;
		ASSERT_EQ(SQLITE_OK, foreign.open(other.file("contacts.db")));
		foreign.exec("CREATE TABLE mine(x); INSERT INTO mine VALUES (42);");
	}
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_connect());
	ct::db::Database check;
	ASSERT_EQ(SQLITE_OK, check.open(other.file("contacts.db")));
	auto st = check.prepare("SELECT x FROM mine");
	ASSERT_EQ(SQLITE_ROW, st.step());
	EXPECT_EQ(42, st.columnInt(0));

	std::ofstream(other.file("plain")) << "x";
	setenv("CONTACTS_DATA_DIR", other.file("plain/sub").c_str(), 1);
	EXPECT_NE(CONTACTS_ERROR_NONE, contacts_connect());
	setenv("CONTACTS_DATA_DIR", other.path().c_str(), 1);
}

TEST(ContactStore, BatchWritesAreAllOrNothingAndReplaceKeepsTheId)
{
	ConnectedStore store;
	contacts_list_h list = nullptr;
	contacts_list_create(&list);
	ListPtr listOwner(list);
	contacts_list_add(list, makeContact({ "One", "" }).release());
	contacts_record_h second = makeContact({ "Two", "", {}, {}, 99 }).release(); // no such address book
	contacts_list_add(list, second);
	int* ids = nullptr;
	int count = 0;
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_records(list, &ids, &count));
	EXPECT_EQ(0, countOf(_contacts_contact._uri));
	contacts_record_set_int(second, _contacts_contact.address_book_id, 0);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_records(list, &ids, &count));
	ASSERT_EQ(2, count);
	std::vector<int> both(ids, ids + 2);
	free(ids);

	RecordPtr replacement = makeContact({ "Uno", "", { "1" } });
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_replace_record(replacement.get(), both[0]));
	RecordPtr read = getRecord(_contacts_contact._uri, both[0]);
	EXPECT_EQ("Uno", strOf(read.get(), _contacts_contact.display_name));
	EXPECT_EQ(1, childCount(read.get(), _contacts_contact.name));
	EXPECT_EQ(1, childCount(read.get(), _contacts_contact.number));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_replace_record(replacement.get(), 5000));

	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_records(_contacts_contact._uri, both.data(), 2));
	EXPECT_EQ(0, countOf(_contacts_contact._uri));
	int missing[] = { 12345 };
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_delete_records(_contacts_contact._uri, missing, 1));
}
