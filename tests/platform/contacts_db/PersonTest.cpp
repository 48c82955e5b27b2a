// Persons aggregate their linked contacts; link, unlink, defaults, delete;
// address books, groups, my profile and emergency records.
#include "ContactsTestSupport.h"

using namespace ct::test;

namespace {

int insertBook(const char* name, int mode, int accountId)
{
	RecordPtr book = newRecord(_contacts_address_book._uri);
	contacts_record_set_str(book.get(), _contacts_address_book.name, name);
	contacts_record_set_int(book.get(), _contacts_address_book.mode, mode);
	contacts_record_set_int(book.get(), _contacts_address_book.account_id, accountId);
	return insertRecord(book.get());
}

int defaultOf(contacts_person_property_e property, int person)
{
	int id = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_person_get_default_property(property, person, &id));
	return id;
}

// "display name|display contact|link count|books|thumbnail|has e-mail" of the person.
std::string summary(int personId)
{
	RecordPtr p = getRecord(_contacts_person._uri, personId);
	return strOf(p.get(), _contacts_person.display_name) + "|" + std::to_string(intOf(p.get(), _contacts_person.display_contact_id))
		+ "|" + std::to_string(intOf(p.get(), _contacts_person.link_count)) + "|" + strOf(p.get(), _contacts_person.addressbook_ids)
		+ "|" + strOf(p.get(), _contacts_person.image_thumbnail_path) + "|" + std::to_string(boolOf(p.get(), _contacts_person.has_email));
}

} // namespace

TEST(Person, LinkedContactsAggregateIntoOnePersonWithDefaultsAndUnlinkAgain)
{
	ConnectedStore store;
	int book = insertBook("Social", 101, 3);
	int a = insertContact({ "Ann", "Lee", { "111" }, {}, 0, "/img/a.jpg" });
	int b = insertContact({ "Annie", "", {}, { "ann@x.org" }, book, "/img/b.jpg" });
	int personA = personOf(a), personB = personOf(b);
	int markerBefore = intOf(getRecord(_contacts_person._uri, personA).get(), _contacts_person.changed_ver);

	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(personA, personB));
	store.reopen();
	EXPECT_EQ(personA, personOf(b));
	contacts_record_h gone = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_get_record(_contacts_person._uri, personB, &gone));
	const std::string books = "|0 " + std::to_string(book) + "|";
	EXPECT_EQ("Ann Lee|" + std::to_string(a) + "|2" + books + "/img/a.jpg|1", summary(personA));
	EXPECT_GT(intOf(getRecord(_contacts_person._uri, personA).get(), _contacts_person.changed_ver), markerBefore);

	// Defaults: the name contact and the image.
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_set_default_property(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, personA, b));
	int imageId = intOf(childAt(getRecord(_contacts_contact._uri, b).get(), _contacts_contact.image), _contacts_image.id);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_set_default_property(CONTACTS_PERSON_PROPERTY_IMAGE, personA, imageId));
	store.reopen();
	EXPECT_EQ(b, defaultOf(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, personA));
	EXPECT_EQ(imageId, defaultOf(CONTACTS_PERSON_PROPERTY_IMAGE, personA));
	EXPECT_EQ("Annie|" + std::to_string(b) + "|2" + books + "/img/b.jpg|1", summary(personA));
	// Ids that are not the person's are refused.
	int stranger = insertContact({ "Zed", "" });
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_person_set_default_property(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, personA, stranger));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_person_set_default_property(static_cast<contacts_person_property_e>(9), personA, a));
	int id = 0;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_person_get_default_property(CONTACTS_PERSON_PROPERTY_IMAGE, 9999, &id));

	// Unlink gives the contact back a person of its own.
	int newPerson = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_unlink_contact(personA, b, &newPerson));
	EXPECT_EQ(newPerson, personOf(b));
	EXPECT_EQ("Ann Lee|" + std::to_string(a) + "|1|0|/img/a.jpg|0", summary(personA));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_person_unlink_contact(personA, a, &newPerson));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_person_link_person(personA, personA));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_person_link_person(personA, 9999));
}

TEST(Person, FirstNumberAndEmailBecomeDefaultsUntilAnotherIsChosen)
{
	ConnectedStore store;
	int a = insertContact({ "A", "", { "1", "2" }, { "a@x", "b@x" } });
	int b = insertContact({ "B", "", { "3" } });
	int person = personOf(a);
	RecordPtr contact = getRecord(_contacts_contact._uri, a);
	contacts_record_h first = childAt(contact.get(), _contacts_contact.number, 0);
	contacts_record_h second = childAt(contact.get(), _contacts_contact.number, 1);
	EXPECT_TRUE(boolOf(first, _contacts_number.is_default));
	EXPECT_FALSE(boolOf(second, _contacts_number.is_default));
	EXPECT_EQ(intOf(first, _contacts_number.id), defaultOf(CONTACTS_PERSON_PROPERTY_NUMBER, person));

	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(person, personOf(b)));
	int secondId = intOf(second, _contacts_number.id);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_set_default_property(CONTACTS_PERSON_PROPERTY_NUMBER, person, secondId));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(getRecord(_contacts_contact._uri, b).get()));
	EXPECT_EQ(secondId, defaultOf(CONTACTS_PERSON_PROPERTY_NUMBER, person));
	EXPECT_GT(defaultOf(CONTACTS_PERSON_PROPERTY_EMAIL, person), 0);
}

TEST(Person, SettingsReachEveryContactAndProjectedUpdatesWriteOnlyWhatTheyHold)
{
	ConnectedStore store;
	int a = insertContact({ "A", "" });
	int b = insertContact({ "B", "" });
	int person = personOf(a);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(person, personOf(b)));
	RecordPtr p = getRecord(_contacts_person._uri, person);
	contacts_record_set_str(p.get(), _contacts_person.ringtone_path, "/ring.ogg");
	contacts_record_set_str(p.get(), _contacts_person.vibration, "pattern");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(p.get()));

	// A record read with only its id sets the favourite and keeps the ringtone.
	QueryOwner q(_contacts_person._uri);
	unsigned props[] = { _contacts_person.id };
	contacts_query_set_projection(q.query, props, 1);
	contacts_list_h list = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_records_with_query(q.query, 0, 0, &list));
	ListPtr owner(list);
	contacts_record_h projected = nullptr;
	contacts_list_get_current_record_p(list, &projected);
	contacts_record_set_bool(projected, _contacts_person.is_favorite, true);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(projected));

	store.reopen();
	for (int id : { a, b }) {
		RecordPtr c = getRecord(_contacts_contact._uri, id);
		EXPECT_TRUE(boolOf(c.get(), _contacts_contact.is_favorite));
		EXPECT_EQ("/ring.ogg", strOf(c.get(), _contacts_contact.ringtone_path));
	}
	p = getRecord(_contacts_person._uri, person);
	EXPECT_EQ("/ring.ogg", strOf(p.get(), _contacts_person.ringtone_path));
	EXPECT_EQ("pattern", strOf(p.get(), _contacts_person.vibration));
	EXPECT_TRUE(boolOf(p.get(), _contacts_person.is_favorite));

	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, person));
	for (const char* uri : { _contacts_contact._uri, _contacts_person._uri, _contacts_name._uri })
		EXPECT_EQ(0, countOf(uri)) << uri;
}

TEST(Person, DeletingTheLastContactDeletesThePersonAndIdsAreNeverReused)
{
	ConnectedStore store;
	int a = insertContact({ "Solo", "", { "1" } });
	int person = personOf(a);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_contact._uri, a));
	contacts_record_h r = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_get_record(_contacts_person._uri, person, &r));
	EXPECT_EQ(0, countOf(_contacts_number._uri));

	// An open screen may still hold the deleted ids: they are never given out again.
	int next = insertContact({ "Next", "", { "2" } });
	EXPECT_GT(next, a);
	EXPECT_GT(personOf(next), person);
}

TEST(AddressBook, PhoneBookAlwaysExistsAndDeletingABookDeletesItsContacts)
{
	ConnectedStore store;
	EXPECT_TRUE(getRecord(_contacts_address_book._uri, 0));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_delete_record(_contacts_address_book._uri, 0));
	int book = insertBook("Work", CONTACTS_ADDRESS_BOOK_MODE_READONLY, 5);
	int c = insertContact({ "W", "", {}, {}, book });
	store.reopen();
	EXPECT_EQ(CONTACTS_ADDRESS_BOOK_MODE_READONLY, intOf(getRecord(_contacts_address_book._uri, book).get(), _contacts_address_book.mode));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_address_book._uri, book));
	contacts_record_h r = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_get_record(_contacts_contact._uri, c, &r));
}

TEST(Group, GroupsAndRelationsFollowTheirContacts)
{
	ConnectedStore store;
	RecordPtr group = newRecord(_contacts_group._uri);
	contacts_record_set_str(group.get(), _contacts_group.name, "Family");
	int groupId = insertRecord(group.get());
	RecordPtr contact = makeContact({ "G", "" });
	contacts_record_h rel = addChild(contact.get(), _contacts_contact.group_relation, _contacts_group_relation._uri);
	contacts_record_set_int(rel, _contacts_group_relation.group_id, groupId);
	int id = insertRecord(contact.get());
	int other = insertContact({ "H", "" });
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_group_add_contact(groupId, other));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_group_add_contact(groupId + 50, other));
	store.reopen();
	RecordPtr read = getRecord(_contacts_contact._uri, id);
	EXPECT_EQ(std::vector<std::string>{ "Family" }, texts(read.get(), _contacts_contact.group_relation, _contacts_group_relation.name));
	EXPECT_EQ(2, countOf(_contacts_group_relation._uri));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_group_remove_contact(groupId, other));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_group_remove_contact(groupId, other));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_group._uri, groupId));
	EXPECT_EQ(0, countOf(_contacts_group_relation._uri));
	// A relation to a group that does not exist is refused with the whole save.
	RecordPtr bad = makeContact({ "X", "" });
	rel = addChild(bad.get(), _contacts_contact.group_relation, _contacts_group_relation._uri);
	contacts_record_set_int(rel, _contacts_group_relation.group_id, 999);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_record(bad.get(), nullptr));
	EXPECT_EQ(2, countOf(_contacts_contact._uri));
}

TEST(MyProfile, ProfileKeepsChildrenStatusAndPictureOrderApartFromContacts)
{
	ConnectedStore store;
	RecordPtr profile = newRecord(_contacts_my_profile._uri);
	contacts_record_set_str(addChild(profile.get(), _contacts_my_profile.name, _contacts_name._uri), _contacts_name.first, "Me");
	contacts_record_set_str(profile.get(), _contacts_my_profile_ex.status, "Busy");
	for (int order : { 2, 1 }) {
		contacts_record_h image = addChild(profile.get(), _contacts_my_profile.image, _contacts_image._uri);
		contacts_record_set_str(image, _contacts_image.path, ("/p" + std::to_string(order)).c_str());
		EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_set_int(image, _contacts_image_ex.order, order));
	}
	contacts_record_set_str(addChild(profile.get(), _contacts_my_profile.number, _contacts_number._uri),
		_contacts_number.number, "555");
	int id = insertRecord(profile.get());
	store.reopen();
	RecordPtr read = getRecord(_contacts_my_profile._uri, id);
	EXPECT_EQ("Me", strOf(read.get(), _contacts_my_profile.display_name));
	EXPECT_EQ("Busy", strOf(read.get(), _contacts_my_profile_ex.status));
	EXPECT_EQ((std::vector<std::string>{ "/p2", "/p1" }), texts(read.get(), _contacts_my_profile.image, _contacts_image.path));
	EXPECT_EQ(1, intOf(childAt(read.get(), _contacts_my_profile.image, 1), _contacts_image_ex.order));
	EXPECT_EQ(0, countOf(_contacts_number._uri));
	EXPECT_EQ(0, countOf(_contacts_person._uri));
	contacts_record_set_str(read.get(), _contacts_my_profile_ex.status, "Free");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(read.get()));
	EXPECT_EQ("Free", strOf(getRecord(_contacts_my_profile._uri, id).get(), _contacts_my_profile_ex.status));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_my_profile._uri, id));
	EXPECT_EQ(0, countOf(_contacts_my_profile._uri));
}

TEST(Emergency, EmergencyRecordsNameAPersonAndANumberAndGoWithThePerson)
{
	ConnectedStore store;
	int c = insertContact({ "Mom", "", { "112" } });
	int numberId = intOf(childAt(getRecord(_contacts_contact._uri, c).get(), _contacts_contact.number), _contacts_number.id);
	RecordPtr e = newRecord(_contacts_emergency._uri);
	contacts_record_set_int(e.get(), _contacts_emergency.person_id, personOf(c));
	contacts_record_set_int(e.get(), _contacts_emergency.number_id, numberId);
	contacts_record_set_int(e.get(), _contacts_emergency.value, 1);
	int id = insertRecord(e.get());
	QueryOwner q(_contacts_emergency._uri);
	contacts_filter_add_int(q.filter, _contacts_emergency.person_id, CONTACTS_MATCH_EQUAL, personOf(c));
	EXPECT_EQ(std::vector<int>{ id }, q.run(_contacts_emergency.id));
	contacts_record_set_int(e.get(), _contacts_emergency.person_id, 4444);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_record(e.get(), nullptr));
	contacts_db_delete_record(_contacts_person._uri, personOf(c));
	EXPECT_TRUE(q.run(_contacts_emergency.id).empty());
}
