// Contacts, their children and persons: writes, reads, persistence, bad input.
#include "ContactsTestSupport.h"
#include "LogSink.h"

#include <fstream>

using namespace ct::test;

TEST(ContactStore, InsertedContactKeepsEveryChildAcrossReopen)
{
	ConnectedStore store;
	RecordPtr contact = makeContact({ "Anna", "Lopez", { "+1 555 0100", "0200" }, { "anna@example.com" } });
	addChild(contact.get(), _contacts_contact.nickname, _contacts_nickname._uri);
	contacts_record_h event = addChild(contact.get(), _contacts_contact.event, _contacts_event._uri);
	contacts_record_set_int(event, _contacts_event.date, 19800229);
	contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
	contacts_record_set_bool(event, _contacts_event.is_leap_month, true);
	contacts_record_h note = addChild(contact.get(), _contacts_contact.note, _contacts_note._uri);
	contacts_record_set_str(note, _contacts_note.note, "it's 100% \"quoted\"; DROP TABLE contacts;--");
	int id = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(contact.get(), &id));
	EXPECT_GT(id, 0);
	EXPECT_EQ(id, intOf(contact.get(), _contacts_contact.id));

	store.reopen();
	RecordPtr read = getRecord(_contacts_contact._uri, id);
	ASSERT_TRUE(read);
	EXPECT_EQ("Anna Lopez", strOf(read.get(), _contacts_contact.display_name));
	EXPECT_EQ(CONTACTS_DISPLAY_NAME_SOURCE_TYPE_NAME, intOf(read.get(), _contacts_contact.display_source_type));
	EXPECT_EQ(2, childCount(read.get(), _contacts_contact.number));
	EXPECT_EQ(1, childCount(read.get(), _contacts_contact.email));
	contacts_record_h number = nullptr;
	contacts_record_get_child_record_at_p(read.get(), _contacts_contact.number, 0, &number);
	EXPECT_EQ("+1 555 0100", strOf(number, _contacts_number.number));
	EXPECT_EQ("+15550100", strOf(number, _contacts_number.cleaned_number));
	EXPECT_EQ(CONTACTS_NUMBER_TYPE_CELL, intOf(number, _contacts_number.type));
	EXPECT_EQ(id, intOf(number, _contacts_number.contact_id));
	contacts_record_h readEvent = nullptr;
	contacts_record_get_child_record_at_p(read.get(), _contacts_contact.event, 0, &readEvent);
	EXPECT_EQ(19800229, intOf(readEvent, _contacts_event.date));
	bool leap = false;
	contacts_record_get_bool(readEvent, _contacts_event.is_leap_month, &leap);
	EXPECT_TRUE(leap);
	contacts_record_h readNote = nullptr;
	contacts_record_get_child_record_at_p(read.get(), _contacts_contact.note, 0, &readNote);
	EXPECT_EQ("it's 100% \"quoted\"; DROP TABLE contacts;--", strOf(readNote, _contacts_note.note));
	EXPECT_EQ(1, countOf(_contacts_contact._uri));
	EXPECT_EQ(1, countOf(_contacts_person._uri));
}

TEST(ContactStore, UpdateInsertsChangesAndDeletesChildren)
{
	ConnectedStore store;
	int id = insertContact({ "Bo", "", { "1", "2", "3" }, {} });
	RecordPtr contact = getRecord(_contacts_contact._uri, id);
	contacts_record_h first = nullptr, second = nullptr;
	contacts_record_get_child_record_at_p(contact.get(), _contacts_contact.number, 0, &first);
	contacts_record_get_child_record_at_p(contact.get(), _contacts_contact.number, 1, &second);
	int firstId = intOf(first, _contacts_number.id);
	contacts_record_set_str(first, _contacts_number.number, "11");
	contacts_record_remove_child_record(contact.get(), _contacts_contact.number, second);
	contacts_record_destroy(second, true);
	contacts_record_h added = addChild(contact.get(), _contacts_contact.number, _contacts_number._uri);
	contacts_record_set_str(added, _contacts_number.number, "4");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(contact.get()));
	EXPECT_GT(intOf(added, _contacts_number.id), 0);

	store.reopen();
	RecordPtr read = getRecord(_contacts_contact._uri, id);
	ASSERT_EQ(3, childCount(read.get(), _contacts_contact.number));
	std::vector<std::string> numbers;
	for (int i = 0; i < 3; ++i) {
		contacts_record_h n = nullptr;
		contacts_record_get_child_record_at_p(read.get(), _contacts_contact.number, i, &n);
		numbers.push_back(strOf(n, _contacts_number.number));
		if (i == 0) {
			EXPECT_EQ(firstId, intOf(n, _contacts_number.id));
		}
	}
	EXPECT_EQ((std::vector<std::string>{ "11", "3", "4" }), numbers);
	// Saving the same record twice does not duplicate the new child.
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(contact.get()));
	RecordPtr again = getRecord(_contacts_contact._uri, id);
	EXPECT_EQ(3, childCount(again.get(), _contacts_contact.number));
}

TEST(ContactStore, DisplayNameFallsBackAndFollowsTheNameOrder)
{
	ConnectedStore store;
	int named = insertContact({ "Jae", "Kim", {}, {} });
	int numberOnly = insertContact({ "", "", { "0101234" }, {} });
	int emailOnly = insertContact({ "", "", {}, { "x@y.z" } });
	EXPECT_EQ("0101234", strOf(getRecord(_contacts_contact._uri, numberOnly).get(), _contacts_contact.display_name));
	EXPECT_EQ("x@y.z", strOf(getRecord(_contacts_contact._uri, emailOnly).get(), _contacts_contact.display_name));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_setting_set_name_display_order(CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST));
	contacts_name_display_order_e order = CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST;
	store.reopen();
	contacts_setting_get_name_display_order(&order);
	EXPECT_EQ(CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST, order);
	RecordPtr person = getRecord(_contacts_person._uri, personOf(named));
	EXPECT_EQ("Kim Jae", strOf(person.get(), _contacts_person.display_name));
	EXPECT_EQ("K", strOf(person.get(), _contacts_person.display_name_index));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_setting_set_name_display_order(static_cast<contacts_name_display_order_e>(7)));
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
	// A contact in an address book that does not exist.
	RecordPtr orphan = makeContact({ "A", "", {}, {}, 77 });
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_record(orphan.get(), nullptr));
	RecordPtr person = makeContact({ "P", "", {}, {} });
	contacts_record_h p = nullptr;
	contacts_record_create(_contacts_person._uri, &p);
	RecordPtr personOwner(p);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_record(p, nullptr));
	// Updating a contact that is gone.
	RecordPtr ghost = makeContact({ "G", "", {}, {} });
	contacts_record_set_int(ghost.get(), _contacts_contact.id, 4242);
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_update_record(ghost.get()));
	// A child record is saved with its parent.
	contacts_record_h name = nullptr;
	contacts_record_get_child_record_at_p(ghost.get(), _contacts_contact.name, 0, &name);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_record(name, nullptr));
	EXPECT_EQ(0, countOf(_contacts_contact._uri));
}

TEST(ContactStore, CallsWithoutAConnectionFail)
{
	TempDataDir dir;
	contacts_record_h r = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_db_get_record(_contacts_contact._uri, 1, &r));
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_disconnect());
	int version = 0;
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_db_get_current_version(&version));
	// Connections are counted: the second disconnect closes.
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_disconnect());
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_current_version(&version));
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_disconnect());
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_db_get_current_version(&version));
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
	contacts_record_h profile = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_create(_contacts_profile._uri, &profile));
	contacts_record_set_str(profile, _contacts_profile.uri, "fb://profile/1");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_add_child_record(contact.get(), _contacts_contact.profile, profile));
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(contact.get()));
	EXPECT_EQ(1, childCount(getRecord(_contacts_contact._uri, id).get(), _contacts_contact.profile));
	contacts_disconnect();
}

TEST(ContactStore, ForeignOrCorruptDatabaseIsReportedAndLeftAlone)
{
	TempDataDir dir;
	{
		std::ofstream garbage(dir.file("contacts.db"), std::ios::binary);
		garbage << std::string(8192, 'x');
	}
	EXPECT_EQ(CONTACTS_ERROR_DB, contacts_connect());
	std::ifstream in(dir.file("contacts.db"), std::ios::binary);
	std::string content((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
	EXPECT_EQ(std::string(8192, 'x'), content);

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
}

TEST(ContactStore, UnwritableDataFolderFailsToConnect)
{
	TempDataDir dir;
	std::string file = dir.file("plain");
	std::ofstream(file) << "x";
	setenv("CONTACTS_DATA_DIR", (file + "/sub").c_str(), 1);
	EXPECT_NE(CONTACTS_ERROR_NONE, contacts_connect());
	setenv("CONTACTS_DATA_DIR", dir.path().c_str(), 1);
}

TEST(ContactStore, BatchWritesAreAllOrNothingAndReplaceKeepsTheId)
{
	ConnectedStore store;
	contacts_list_h list = nullptr;
	contacts_list_create(&list);
	contacts_list_add(list, makeContact({ "One", "" }).release());
	contacts_list_add(list, makeContact({ "Two", "", {}, {}, 99 }).release()); // no such address book
	int* ids = nullptr;
	int count = 0;
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_records(list, &ids, &count));
	EXPECT_EQ(0, countOf(_contacts_contact._uri));
	contacts_record_h second = nullptr;
	contacts_list_last(list);
	contacts_list_get_current_record_p(list, &second);
	contacts_record_set_int(second, _contacts_contact.address_book_id, 0);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_records(list, &ids, &count));
	ASSERT_EQ(2, count);
	int first = ids[0];
	int secondId = ids[1];
	free(ids);
	contacts_list_destroy(list, true);

	RecordPtr replacement = makeContact({ "Uno", "", { "1" } });
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_replace_record(replacement.get(), first));
	RecordPtr read = getRecord(_contacts_contact._uri, first);
	EXPECT_EQ("Uno", strOf(read.get(), _contacts_contact.display_name));
	EXPECT_EQ(1, childCount(read.get(), _contacts_contact.name));
	EXPECT_EQ(1, childCount(read.get(), _contacts_contact.number));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_replace_record(replacement.get(), 5000));

	int both[] = { first, secondId };
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_records(_contacts_contact._uri, both, 2));
	EXPECT_EQ(0, countOf(_contacts_contact._uri));
	int missing[] = { 12345 };
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_delete_records(_contacts_contact._uri, missing, 1));
}

TEST(ContactStore, MegabyteTextsAreStoredWhole)
{
	ConnectedStore store;
	std::string big(3 * 1024 * 1024, 'n');
	big += "ünï";
	RecordPtr contact = makeContact({ "Big", "" });
	contacts_record_h note = addChild(contact.get(), _contacts_contact.note, _contacts_note._uri);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_set_str(note, _contacts_note.note, big.c_str()));
	int id = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(contact.get(), &id));
	store.reopen();
	RecordPtr read = getRecord(_contacts_contact._uri, id);
	contacts_record_h readNote = nullptr;
	contacts_record_get_child_record_at_p(read.get(), _contacts_contact.note, 0, &readNote);
	EXPECT_EQ(big, strOf(readNote, _contacts_note.note));
}
