// The common record and address-book helpers over a real contacts store.
#include "../CommonTestSupport.h"

#include "ContactsCommon.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonRecordUtil.h"
#include "LogSink.h"

#include <cstring>

using namespace ct::test;

namespace {

using CtCommonRecordUtilTest = StoreTest;

std::string tr(const char* id)
{
	return ContactsCommon::translate(id);
}

} // namespace

// Book names, ids and SIM books are the naming test's.
TEST_F(CtCommonRecordUtilTest, SimContactIsASinglePersonContactInASimBook)
{
	int sim = addAddressbook(CONTACTS_SIM1_ADDRESS_BOOK_NAME, 0, 0, CONTACTS_SIM1_PROVIDER_NAME);
	int simContact = store(newContact(sim, "Sim"));
	int phoneContact = store(newContact(0, "Phone"));
	EXPECT_TRUE(ctCommonIsSimContact(personOf(simContact)));
	EXPECT_FALSE(ctCommonIsSimContact(personOf(phoneContact)));
	EXPECT_FALSE(ctCommonIsSimContact(0));
	int linked = linkContacts({simContact, phoneContact});
	EXPECT_FALSE(ctCommonIsSimContact(linked));
}

TEST_F(CtCommonRecordUtilTest, AddressBookLookupsAnswerNamesProvidersAndWritableContacts)
{
	int readOnly = addAddressbook("corp", CONTACTS_ADDRESS_BOOK_MODE_READONLY, 7, "Corp");

	char* provider = nullptr;
	char* user = nullptr;
	EXPECT_EQ(CONTACTS_ERROR_NONE, ctCommonGetProviderNameByAddressbookId(readOnly, &provider, &user));
	EXPECT_STREQ("Corp", take(provider).get());
	EXPECT_STREQ("user@example.com", take(user).get());
	EXPECT_EQ(CONTACTS_ERROR_NONE, ctCommonGetAccountInforByAddressbookId(0, &provider, &user));
	EXPECT_STREQ("IDS_PB_OPT_DEVICE", take(provider).get());
	free(user);
	EXPECT_NE(std::string::npos, ctCommonGetAccountIconPathByAddressbookId(0).find("contacts_list_ic_device.png"));
	EXPECT_EQ("", ctCommonGetAccountIconPathByAddressbookId(readOnly));

	int roContact = store(newContact(readOnly, "Ro"));
	int phoneContact = store(newContact(0, "Ph"));
	int other = store(newContact(0, "Ph2"));
	int personId = linkContacts({roContact, phoneContact, other});
	Eina_List* writable = ctCommonGetWritableContactList(personId, 0);
	EXPECT_EQ(2u, eina_list_count(writable));
	ctCommonDestroyRecordList(writable);
	writable = ctCommonGetWritableContactList(personId, 1);
	ASSERT_EQ(1u, eina_list_count(writable));
	int id = 0;
	contacts_record_get_int(static_cast<contacts_record_h>(eina_list_data_get(writable)), _contacts_contact.id, &id);
	EXPECT_EQ(phoneContact, id);
	ctCommonDestroyRecordList(writable);
	EXPECT_EQ(nullptr, ctCommonGetWritableContactList(personOf(store(newContact(readOnly, "Only"))), 0));
}

TEST_F(CtCommonRecordUtilTest, GroupNamesUseSystemNamesOnceEach)
{
	int exchange = addAddressbook("eas", 0, 9, "Exchange");
	int hikers = addGroup(0, "Hikers", nullptr);
	int family = addGroup(0, "ignored", "family");
	int easDefault = addGroup(exchange, "Contacts", "contacts");
	EXPECT_EQ(easDefault, ctCommonGetEasDefaultGroupId(exchange));
	EXPECT_EQ(0, ctCommonGetEasDefaultGroupId(0));

	int a = store(newContact(0, "A"));
	int b = store(newContact(0, "B"));
	contacts_group_add_contact(hikers, a);
	contacts_group_add_contact(family, a);
	contacts_group_add_contact(hikers, b);
	int personId = linkContacts({a, b});
	Eina_List* contacts = ctCommonGetContactsList(personId);
	EXPECT_EQ("Hikers, " + ctCommonGetDisplayGroupName("family"), ctCommonGetGroupNames(contacts));
	ctCommonDestroyRecordList(contacts);
	EXPECT_EQ("", ctCommonGetGroupNames(nullptr));
	EXPECT_EQ("custom_sys", ctCommonGetDisplayGroupName("custom_sys"));
	EXPECT_EQ("", ctCommonGetDisplayGroupName(nullptr));
}

TEST_F(CtCommonRecordUtilTest, CompanyExtraNamesNewlinesAndShareText)
{
	contacts_record_h contact = newContact(0, "Dana");
	addText(contact, _contacts_contact.company, _contacts_company._uri, _contacts_company.job_title, "Chief");
	addNumber(contact, "0101", CONTACTS_NUMBER_TYPE_CELL);
	addEmail(contact, "dana@example.com");
	int personId = personOf(store(contact));

	Eina_List* contacts = ctCommonGetContactsList(personId);
	EXPECT_STREQ("Chief", take(CtCommonGetCompany(contacts)).get());
	for (Eina_List* list : {contacts, static_cast<Eina_List*>(nullptr)}) {
		char* first = nullptr;
		char* second = nullptr;
		CtCommonGetExtraName1(list, &first, &second);
		EXPECT_TRUE(!first && !second) << list;
	}
	ctCommonDestroyRecordList(contacts);
	EXPECT_EQ(nullptr, CtCommonGetCompany(nullptr));

	EXPECT_STREQ("a b  c", take(ctCommonRemoveNewline("a\nb\r\nc")).get());
	EXPECT_EQ(nullptr, ctCommonRemoveNewline(nullptr));

	EXPECT_STREQ("Dana\n0101\ndana@example.com", take(CtCommonGetShareText(personId)).get());
	EXPECT_EQ(nullptr, CtCommonGetShareText(0));
}

TEST_F(CtCommonRecordUtilTest, TypeLabelsCombineBitsAndFallBackForUnknownAndCustomTypes)
{
	// Voice is implied, fax combines with home or work, unknown types are "Other".
	const std::pair<int, const char*> numbers[] = {{CONTACTS_NUMBER_TYPE_CELL | CONTACTS_NUMBER_TYPE_VOICE,
		"IDS_PB_OPT_MOBILE"}, {CONTACTS_NUMBER_TYPE_HOME | CONTACTS_NUMBER_TYPE_VOICE, "IDS_PB_OPT_HOME_ABB2"},
		{CONTACTS_NUMBER_TYPE_FAX | CONTACTS_NUMBER_TYPE_HOME, "IDS_PB_OPT_FAX_HHOME_ABB"},
		{CONTACTS_NUMBER_TYPE_FAX | CONTACTS_NUMBER_TYPE_WORK, "IDS_PB_OPT_FAX_HWORK_ABB"},
		{CONTACTS_NUMBER_TYPE_ASSISTANT, "IDS_PB_OPT_ASSISTANT_M_CONTACTS"},
		{CONTACTS_NUMBER_TYPE_MODEM, "IDS_PB_OPT_OTHER"}, {CONTACTS_NUMBER_TYPE_CUSTOM, "IDS_PB_OPT_CUSTOM"}};
	for (const auto& [type, id] : numbers)
		EXPECT_EQ(tr(id), CtCommonGetNumberTypeStr(type, "")) << type;
	EXPECT_STREQ("Boat", CtCommonGetNumberTypeStr(CONTACTS_NUMBER_TYPE_CUSTOM, "Boat"));
	contacts_record_h number = nullptr;
	contacts_record_create(_contacts_number._uri, &number);
	contacts_record_set_str(number, _contacts_number.label, "Yacht");
	EXPECT_STREQ("Yacht", CtCommonGetNumberTypeStr(number, CONTACTS_NUMBER_TYPE_CUSTOM));
	contacts_record_destroy(number, true);
	EXPECT_EQ(tr("IDS_PB_OPT_CUSTOM"), CtCommonGetNumberTypeStr(static_cast<contacts_record_h>(nullptr), 1));

	EXPECT_EQ(tr("IDS_PB_OPT_MOBILE"), CtCommonGetEmailTypeStr(CONTACTS_EMAIL_TYPE_MOBILE, nullptr));
	EXPECT_EQ(tr("IDS_PB_OPT_OTHER"), CtCommonGetAddressTypeStr(CONTACTS_ADDRESS_TYPE_PARCEL, nullptr));
	EXPECT_EQ(tr("IDS_PB_OPT_WORK"), CtCommonGetUrlTypeStr(CONTACTS_URL_TYPE_WORK, nullptr));
	EXPECT_EQ(tr("IDS_PB_OPT_ANNIVERSARY_ABB"), CtCommonGetEventTypeStr(CONTACTS_EVENT_TYPE_ANNIVERSARY, nullptr));
	EXPECT_EQ(tr("IDS_PB_BODY_SKYPE"), CtCommonGetMessengerTypeStr(CONTACTS_MESSENGER_TYPE_SKYPE, nullptr));
	EXPECT_EQ(tr("IDS_PB_OPT_SPOUSE"), CtCommonGetRelationshipTypeStr(CONTACTS_RELATIONSHIP_TYPE_SPOUSE, nullptr));
	for (int outOfRange : {99, -4, 40}) {
		EXPECT_EQ(tr("IDS_PB_OPT_OTHER"), CtCommonGetMessengerTypeStr(outOfRange, nullptr));
		EXPECT_EQ(tr("IDS_PB_OPT_OTHER"), CtCommonGetRelationshipTypeStr(outOfRange, nullptr));
	}
	EXPECT_STREQ("Alt", CtCommonGetEmailTypeStr(CONTACTS_EMAIL_TYPE_CUSTOM, "Alt"));
	EXPECT_STREQ("Cabin", CtCommonGetAddressTypeStr(CONTACTS_ADDRESS_TYPE_CUSTOM, "Cabin"));
	EXPECT_STREQ("Signal", CtCommonGetMessengerTypeStr(CONTACTS_MESSENGER_TYPE_CUSTOM, "Signal"));
	EXPECT_STREQ("Blog", CtCommonGetUrlTypeStr(CONTACTS_URL_TYPE_CUSTOM, "Blog"));
	EXPECT_STREQ("Mentor", CtCommonGetRelationshipTypeStr(CONTACTS_RELATIONSHIP_TYPE_CUSTOM, "Mentor"));
	EXPECT_STREQ("Graduation", CtCommonGetEventTypeStr(CONTACTS_EVENT_TYPE_CUSTOM, "Graduation"));
}

TEST_F(CtCommonRecordUtilTest, DateFormattersPackYearMonthAndDay)
{
	// Following the region format is the i18n layer's test.
	i18n_udate_h withYear = CtCommonGetTimeFormatter();
	i18n_udate_h withoutYear = CtCommonGetTimeFormatterWithoutYear();
	EXPECT_EQ("Dec 31, 1999", CtCommonGetDatetimeStr(withYear, 1999, 12, 31));
	EXPECT_EQ("Feb 29", CtCommonGetDatetimeStr(withoutYear, 0, 2, 29));
	EXPECT_EQ("", CtCommonGetDatetimeStr(nullptr, 1999, 1, 1));
	i18n_udate_destroy(withYear);
	i18n_udate_destroy(withoutYear);
}

TEST_F(CtCommonRecordUtilTest, UnknownIdsNullRecordsAndBadTextsGiveEmptyAnswers)
{
	for (int id : {-7, 4242}) {
		EXPECT_FALSE(ctCommonIsSimAddressbook(id));
		char* provider = nullptr;
		char* user = nullptr;
		EXPECT_LT(ctCommonGetProviderNameByAddressbookId(id, &provider, &user), 0);
		EXPECT_EQ(user, nullptr);
		EXPECT_EQ(take(ctCommonGetAddressBookName(id)), nullptr);
		EXPECT_EQ(ctCommonGetAccountIconPathByAddressbookId(id), "");
		EXPECT_EQ(ctCommonGetEasDefaultGroupId(id), 0);
	}
	for (const std::string& name : {std::string("nobody"), std::string("bad\xff\xfe"), std::string(200000, 'b')})
		EXPECT_EQ(ctCommonGetAddressBookId(name.c_str()), -1);
	EXPECT_EQ(ctCommonGetAddressBookId(nullptr), -1);
	for (int personId : {0, -3, 99999}) {
		EXPECT_EQ(ctCommonGetContactsList(personId), nullptr);
		EXPECT_EQ(ctCommonGetWritableContactList(personId, 0), nullptr);
	}
	ctCommonDestroyRecordList(nullptr);
	EXPECT_TRUE(ct::log::contains("Invalid param : personId"));
	EXPECT_EQ(CtCommonGetChildDataList(nullptr, _contacts_contact.number), nullptr);
	CText oneLine = take(ctCommonRemoveNewline("a\nb\r\xff"));
	ASSERT_NE(oneLine, nullptr);
	EXPECT_EQ(std::string(oneLine.get()).find('\n'), std::string::npos);
}
