// Persons aggregate their linked contacts; link, unlink, defaults, delete.
#include "ContactsTestSupport.h"

using namespace ct::test;

namespace {

int insertBook(const char* name, int mode, int accountId)
{
	contacts_record_h book = nullptr;
	contacts_record_create(_contacts_address_book._uri, &book);
	RecordPtr owner(book);
	contacts_record_set_str(book, _contacts_address_book.name, name);
	contacts_record_set_int(book, _contacts_address_book.mode, mode);
	contacts_record_set_int(book, _contacts_address_book.account_id, accountId);
	int id = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(book, &id));
	return id;
}

} // namespace

TEST(Person, LinkedContactsAggregateIntoOnePerson)
{
	ConnectedStore store;
	int book = insertBook("Social", 101, 3);
	int a = insertContact({ "Ann", "Lee", { "111" }, {}, 0, "/img/a.jpg" });
	int b = insertContact({ "Annie", "", {}, { "ann@x.org" }, book, "/img/b.jpg" });
	int personA = personOf(a), personB = personOf(b);
	ASSERT_NE(personA, personB);
	RecordPtr before = getRecord(_contacts_person._uri, personA);
	int markerBefore = intOf(before.get(), _contacts_person.changed_ver);

	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(personA, personB));
	store.reopen();
	EXPECT_EQ(personA, personOf(b));
	contacts_record_h gone = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_get_record(_contacts_person._uri, personB, &gone));
	RecordPtr person = getRecord(_contacts_person._uri, personA);
	EXPECT_EQ("Ann Lee", strOf(person.get(), _contacts_person.display_name));
	EXPECT_EQ(a, intOf(person.get(), _contacts_person.display_contact_id));
	EXPECT_EQ(2, intOf(person.get(), _contacts_person.link_count));
	EXPECT_EQ("0 " + std::to_string(book), strOf(person.get(), _contacts_person.addressbook_ids));
	EXPECT_EQ("/img/a.jpg", strOf(person.get(), _contacts_person.image_thumbnail_path));
	bool has = false;
	contacts_record_get_bool(person.get(), _contacts_person.has_email, &has);
	EXPECT_TRUE(has);
	EXPECT_GT(intOf(person.get(), _contacts_person.changed_ver), markerBefore);

	// Defaults: the name contact and the image.
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_set_default_property(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, personA, b));
	RecordPtr contactB = getRecord(_contacts_contact._uri, b);
	contacts_record_h imageB = nullptr;
	contacts_record_get_child_record_at_p(contactB.get(), _contacts_contact.image, 0, &imageB);
	int imageId = intOf(imageB, _contacts_image.id);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_set_default_property(CONTACTS_PERSON_PROPERTY_IMAGE, personA, imageId));
	store.reopen();
	int id = 0;
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_person_get_default_property(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, personA, &id));
	EXPECT_EQ(b, id);
	EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_person_get_default_property(CONTACTS_PERSON_PROPERTY_IMAGE, personA, &id));
	EXPECT_EQ(imageId, id);
	person = getRecord(_contacts_person._uri, personA);
	EXPECT_EQ("Annie", strOf(person.get(), _contacts_person.display_name));
	EXPECT_EQ("/img/b.jpg", strOf(person.get(), _contacts_person.image_thumbnail_path));
	// Ids that are not the person's are refused.
	int stranger = insertContact({ "Zed", "" });
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_person_set_default_property(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, personA, stranger));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER,
		contacts_person_set_default_property(static_cast<contacts_person_property_e>(9), personA, a));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_person_get_default_property(CONTACTS_PERSON_PROPERTY_IMAGE, 9999, &id));

	// Unlink gives the contact back a person of its own.
	int newPerson = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_unlink_contact(personA, b, &newPerson));
	EXPECT_EQ(newPerson, personOf(b));
	person = getRecord(_contacts_person._uri, personA);
	EXPECT_EQ("Ann Lee", strOf(person.get(), _contacts_person.display_name));
	EXPECT_EQ(1, intOf(person.get(), _contacts_person.link_count));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_person_unlink_contact(personA, a, &newPerson));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_person_link_person(personA, personA));
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_person_link_person(personA, 9999));
}

TEST(Person, PersonSettingsReachEveryContactAndDeletingThePersonDeletesThem)
{
	ConnectedStore store;
	int a = insertContact({ "A", "" });
	int b = insertContact({ "B", "" });
	int person = personOf(a);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(person, personOf(b)));
	RecordPtr p = getRecord(_contacts_person._uri, person);
	contacts_record_set_bool(p.get(), _contacts_person.is_favorite, true);
	contacts_record_set_str(p.get(), _contacts_person.ringtone_path, "/ring.ogg");
	contacts_record_set_str(p.get(), _contacts_person.vibration, "pattern");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(p.get()));
	store.reopen();
	for (int id : { a, b }) {
		RecordPtr c = getRecord(_contacts_contact._uri, id);
		bool favorite = false;
		contacts_record_get_bool(c.get(), _contacts_contact.is_favorite, &favorite);
		EXPECT_TRUE(favorite);
		EXPECT_EQ("/ring.ogg", strOf(c.get(), _contacts_contact.ringtone_path));
	}
	p = getRecord(_contacts_person._uri, person);
	EXPECT_EQ("/ring.ogg", strOf(p.get(), _contacts_person.ringtone_path));
	EXPECT_EQ("pattern", strOf(p.get(), _contacts_person.vibration));

	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, person));
	EXPECT_EQ(0, countOf(_contacts_contact._uri));
	EXPECT_EQ(0, countOf(_contacts_person._uri));
	EXPECT_EQ(0, countOf(_contacts_name._uri));
}

TEST(Person, DeletingTheLastContactDeletesThePerson)
{
	ConnectedStore store;
	int a = insertContact({ "Solo", "", { "1" } });
	int person = personOf(a);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_contact._uri, a));
	contacts_record_h r = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_get_record(_contacts_person._uri, person, &r));
	EXPECT_EQ(0, countOf(_contacts_number._uri));
}

TEST(AddressBook, PhoneBookAlwaysExistsAndBooksCarryModes)
{
	ConnectedStore store;
	RecordPtr phone = getRecord(_contacts_address_book._uri, 0);
	ASSERT_TRUE(phone);
	EXPECT_EQ(0, intOf(phone.get(), _contacts_address_book.mode));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_delete_record(_contacts_address_book._uri, 0));
	int book = insertBook("Work", CONTACTS_ADDRESS_BOOK_MODE_READONLY, 5);
	int c = insertContact({ "W", "", {}, {}, book });
	store.reopen();
	RecordPtr read = getRecord(_contacts_address_book._uri, book);
	EXPECT_EQ("Work", strOf(read.get(), _contacts_address_book.name));
	EXPECT_EQ(1, intOf(read.get(), _contacts_address_book.mode));
	EXPECT_EQ(5, intOf(read.get(), _contacts_address_book.account_id));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_address_book._uri, book));
	contacts_record_h r = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NO_DATA, contacts_db_get_record(_contacts_contact._uri, c, &r));
}

TEST(Group, GroupsAndRelationsFollowTheirContacts)
{
	ConnectedStore store;
	contacts_record_h group = nullptr;
	contacts_record_create(_contacts_group._uri, &group);
	RecordPtr owner(group);
	contacts_record_set_str(group, _contacts_group.name, "Family");
	contacts_record_set_str(group, _contacts_group.system_id, "emergency");
	int groupId = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(group, &groupId));
	RecordPtr contact = makeContact({ "G", "" });
	contacts_record_h rel = addChild(contact.get(), _contacts_contact.group_relation, _contacts_group_relation._uri);
	contacts_record_set_int(rel, _contacts_group_relation.group_id, groupId);
	int id = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(contact.get(), &id));
	int other = insertContact({ "H", "" });
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_group_add_contact(groupId, other));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_group_add_contact(groupId + 50, other));
	store.reopen();
	RecordPtr read = getRecord(_contacts_contact._uri, id);
	ASSERT_EQ(1, childCount(read.get(), _contacts_contact.group_relation));
	contacts_record_h readRel = nullptr;
	contacts_record_get_child_record_at_p(read.get(), _contacts_contact.group_relation, 0, &readRel);
	EXPECT_EQ(groupId, intOf(readRel, _contacts_group_relation.group_id));
	EXPECT_EQ("Family", strOf(readRel, _contacts_group_relation.name));
	RecordPtr readGroup = getRecord(_contacts_group._uri, groupId);
	EXPECT_EQ("emergency", strOf(readGroup.get(), _contacts_group.system_id));
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

TEST(MyProfile, ProfileKeepsChildrenStatusAndPictureOrder)
{
	ConnectedStore store;
	contacts_record_h profile = nullptr;
	contacts_record_create(_contacts_my_profile._uri, &profile);
	RecordPtr owner(profile);
	contacts_record_h name = addChild(profile, _contacts_my_profile.name, _contacts_name._uri);
	contacts_record_set_str(name, _contacts_name.first, "Me");
	contacts_record_set_str(profile, _contacts_my_profile_ex.status, "Busy");
	for (int order : { 2, 1 }) {
		contacts_record_h image = addChild(profile, _contacts_my_profile.image, _contacts_image._uri);
		contacts_record_set_str(image, _contacts_image.path, ("/p" + std::to_string(order)).c_str());
		EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_record_set_int(image, _contacts_image_ex.order, order));
	}
	contacts_record_h number = addChild(profile, _contacts_my_profile.number, _contacts_number._uri);
	contacts_record_set_str(number, _contacts_number.number, "555");
	contacts_record_set_bool(number, _contacts_number.is_default, true);
	contacts_record_set_str(number, _contacts_number.label, "sim_card_number");
	int id = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(profile, &id));
	store.reopen();
	RecordPtr read = getRecord(_contacts_my_profile._uri, id);
	EXPECT_EQ("Me", strOf(read.get(), _contacts_my_profile.display_name));
	EXPECT_EQ("Busy", strOf(read.get(), _contacts_my_profile_ex.status));
	ASSERT_EQ(2, childCount(read.get(), _contacts_my_profile.image));
	contacts_record_h image = nullptr;
	contacts_record_get_child_record_at_p(read.get(), _contacts_my_profile.image, 1, &image);
	EXPECT_EQ(1, intOf(image, _contacts_image_ex.order));
	EXPECT_EQ("/p1", strOf(image, _contacts_image.path));
	// Profile children are not contacts' children.
	EXPECT_EQ(0, countOf(_contacts_number._uri));
	EXPECT_EQ(0, countOf(_contacts_person._uri));
	contacts_record_set_str(read.get(), _contacts_my_profile_ex.status, "Free");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(read.get()));
	EXPECT_EQ("Free", strOf(getRecord(_contacts_my_profile._uri, id).get(), _contacts_my_profile_ex.status));
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_my_profile._uri, id));
	EXPECT_EQ(0, countOf(_contacts_my_profile._uri));
}

TEST(Emergency, EmergencyRecordsNameAPersonAndANumber)
{
	ConnectedStore store;
	int c = insertContact({ "Mom", "", { "112" } });
	RecordPtr contact = getRecord(_contacts_contact._uri, c);
	contacts_record_h number = nullptr;
	contacts_record_get_child_record_at_p(contact.get(), _contacts_contact.number, 0, &number);
	contacts_record_h e = nullptr;
	contacts_record_create(_contacts_emergency._uri, &e);
	RecordPtr owner(e);
	contacts_record_set_int(e, _contacts_emergency.person_id, personOf(c));
	contacts_record_set_int(e, _contacts_emergency.number_id, intOf(number, _contacts_number.id));
	contacts_record_set_int(e, _contacts_emergency.value, 1);
	int id = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_insert_record(e, &id));
	contacts_query_h query = nullptr;
	contacts_query_create(_contacts_emergency._uri, &query);
	contacts_filter_h filter = nullptr;
	contacts_filter_create(_contacts_emergency._uri, &filter);
	contacts_filter_add_int(filter, _contacts_emergency.person_id, CONTACTS_MATCH_EQUAL, personOf(c));
	contacts_query_set_filter(query, filter);
	EXPECT_EQ(std::vector<int>{ id }, queryIds(query, _contacts_emergency.id));
	contacts_record_set_int(e, _contacts_emergency.person_id, 4444);
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, contacts_db_insert_record(e, nullptr));
	// The person's deletion takes its emergency records along.
	contacts_db_delete_record(_contacts_person._uri, personOf(c));
	EXPECT_TRUE(queryIds(query, _contacts_emergency.id).empty());
	contacts_filter_destroy(filter);
	contacts_query_destroy(query);
}

TEST(Person, UpdatingAProjectedRecordWritesOnlyWhatItHolds)
{
	ConnectedStore store;
	int a = insertContact({ "Ring", "" });
	int person = personOf(a);
	RecordPtr full = getRecord(_contacts_person._uri, person);
	contacts_record_set_str(full.get(), _contacts_person.ringtone_path, "/keep.ogg");
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(full.get()));

	contacts_query_h query = nullptr;
	contacts_query_create(_contacts_person._uri, &query);
	unsigned props[] = { _contacts_person.id };
	contacts_query_set_projection(query, props, 1);
	contacts_list_h list = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_records_with_query(query, 0, 0, &list));
	ListPtr owner(list);
	contacts_record_h projected = nullptr;
	contacts_list_get_current_record_p(list, &projected);
	contacts_record_set_bool(projected, _contacts_person.is_favorite, true);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(projected));
	contacts_query_destroy(query);

	RecordPtr read = getRecord(_contacts_person._uri, person);
	EXPECT_EQ("/keep.ogg", strOf(read.get(), _contacts_person.ringtone_path));
	bool favorite = false;
	contacts_record_get_bool(read.get(), _contacts_person.is_favorite, &favorite);
	EXPECT_TRUE(favorite);
}

TEST(Person, FirstNumberAndEmailBecomeDefaultsUntilAnotherIsChosen)
{
	ConnectedStore store;
	int a = insertContact({ "A", "", { "1", "2" }, { "a@x", "b@x" } });
	int b = insertContact({ "B", "", { "3" } });
	int person = personOf(a);
	RecordPtr contact = getRecord(_contacts_contact._uri, a);
	contacts_record_h first = nullptr, second = nullptr;
	contacts_record_get_child_record_at_p(contact.get(), _contacts_contact.number, 0, &first);
	contacts_record_get_child_record_at_p(contact.get(), _contacts_contact.number, 1, &second);
	bool isDefault = false;
	contacts_record_get_bool(first, _contacts_number.is_default, &isDefault);
	EXPECT_TRUE(isDefault);
	contacts_record_get_bool(second, _contacts_number.is_default, &isDefault);
	EXPECT_FALSE(isDefault);
	int id = 0;
	contacts_person_get_default_property(CONTACTS_PERSON_PROPERTY_NUMBER, person, &id);
	EXPECT_EQ(intOf(first, _contacts_number.id), id);

	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(person, personOf(b)));
	int secondId = intOf(second, _contacts_number.id);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_set_default_property(CONTACTS_PERSON_PROPERTY_NUMBER, person, secondId));
	RecordPtr other = getRecord(_contacts_contact._uri, b);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(other.get()));
	contacts_person_get_default_property(CONTACTS_PERSON_PROPERTY_NUMBER, person, &id);
	EXPECT_EQ(secondId, id);
	contacts_person_get_default_property(CONTACTS_PERSON_PROPERTY_EMAIL, person, &id);
	EXPECT_GT(id, 0);
}
