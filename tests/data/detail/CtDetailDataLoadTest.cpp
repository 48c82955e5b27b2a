// Loading one person for the detail screens: a rich linked person, persons
// that do not exist, GAL entries and the stored writes.
#include "CtDetailData.h"
#include "DetailTestStore.h"

#include "ContactsCommon.h"
#include "CtContactsAgentMgr.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonRecordUtil.h"
#include "LogSink.h"
#include "SqliteFaultInjector.h"

#include <glib.h>

#include <cstdio>
#include <fstream>

using namespace ct::test;

namespace {

contacts_record_h first(Eina_List* list)
{
	return static_cast<contacts_record_h>(eina_list_data_get(list));
}

std::vector<std::string> numbersOf(CtDetailData& data)
{
	std::vector<std::string> out;
	for (Eina_List* l = data.getNumberList(); l; l = eina_list_next(l))
		out.push_back(data.getNumber(first(l)));
	return out;
}

class CtDetailDataLoadTest : public StoreTest {
protected:
	// Ann (phone book, rich) linked with Bob's contact of a second account.
	int addRichLinkedPerson(int* annContact, int* otherContact)
	{
		int account = addAddressbook("work@example.com", 0, 3, "Exchange");
		contacts_record_h ann = newContact(0, "Ann");
		contacts_record_h name = nullptr;
		contacts_record_get_child_record_at_p(ann, _contacts_contact.name, 0, &name);
		contacts_record_set_str(name, _contacts_name.phonetic_first, "An");
		contacts_record_set_str(name, _contacts_name.phonetic_last, "Lee");
		addText(ann, _contacts_contact.nickname, _contacts_nickname._uri, _contacts_nickname.name, "Annie");
		contacts_record_h company = addText(ann, _contacts_contact.company, _contacts_company._uri, _contacts_company.name, "Acme");
		contacts_record_set_str(company, _contacts_company.department, "Sales");
		contacts_record_set_str(company, _contacts_company.job_title, "Manager");
		addNumber(ann, "111", CONTACTS_NUMBER_TYPE_CELL);
		addNumber(ann, "222", CONTACTS_NUMBER_TYPE_CUSTOM, "Boat");
		addEmail(ann, "ann@example.com");
		contacts_record_h address = addText(ann, _contacts_contact.address, _contacts_address._uri, _contacts_address.street, "1 Main St");
		contacts_record_set_str(address, _contacts_address.locality, "Springfield");
		contacts_record_set_str(address, _contacts_address.country, "USA");
		addText(ann, _contacts_contact.messenger, _contacts_messenger._uri, _contacts_messenger.im_id, "ann.im");
		addText(ann, _contacts_contact.url, _contacts_url._uri, _contacts_url.url, "https://ann.example.com");
		addText(ann, _contacts_contact.relationship, _contacts_relationship._uri, _contacts_relationship.name, "Carl");
		contacts_record_h event = addChild(ann, _contacts_contact.event, _contacts_event._uri);
		contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
		contacts_record_set_int(event, _contacts_event.date, 19800102);
		contacts_record_set_int(event, _contacts_event.calendar_type, CONTACTS_EVENT_CALENDAR_TYPE_LUNAR);
		contacts_record_set_bool(event, _contacts_event.is_leap_month, true);
		addText(ann, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, "likes tea");
		addImage(ann, "/images/ann1.jpg", 1);
		*annContact = store(ann);

		contacts_record_h other = newContact(account, "Bob");
		addNumber(other, "333", CONTACTS_NUMBER_TYPE_HOME);
		addEmail(other, "bob@example.com");
		addImage(other, "/images/ann2.jpg", 2);
		*otherContact = store(other);
		return linkContacts({*annContact, *otherContact});
	}
};

} // namespace

TEST_F(CtDetailDataLoadTest, RichLinkedPersonLoadsEveryFieldOverAllContactsInOrder)
{
	int annContact = 0, otherContact = 0;
	int personId = addRichLinkedPerson(&annContact, &otherContact);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_group_add_contact(addGroup(0, "Climbers"), annContact));

	CtDetailData data(personId);
	EXPECT_EQ(personId, data.getPersonId());
	EXPECT_NE(nullptr, data.getDisplayName());
	EXPECT_STREQ("Acme Sales, Manager", data.getCompany());
	EXPECT_STREQ("Annie", data.getExtraName1First());
	EXPECT_STREQ("An Lee", data.getExtraName1Second());
	EXPECT_STREQ("An Lee, Annie", data.getExtraName2());
	EXPECT_EQ((std::vector<std::string>{"111", "222", "333"}), numbersOf(data));

	contacts_record_h custom = static_cast<contacts_record_h>(eina_list_nth(data.getNumberList(), 1));
	EXPECT_EQ(CONTACTS_NUMBER_TYPE_CUSTOM, data.getDataType(custom, _contacts_number.type));
	EXPECT_STREQ("Boat", data.getDataTypeCustom(custom, _contacts_number.label));
	char address[1024] = {0};
	data.getAddress(first(data.getAddressList()), address, sizeof(address));
	EXPECT_STREQ("Springfield\n1 Main St\nUSA", address);
	char small[8] = {0};
	data.getAddress(first(data.getAddressList()), small, sizeof(small));
	EXPECT_STREQ("Springf", small);

	contacts_record_h event = first(data.getEventList());
	EXPECT_EQ((std::vector<std::string>{"ann@example.com", "ann.im", "https://ann.example.com", "Carl", "likes tea"}),
		(std::vector<std::string>{data.getEmail(first(data.getEmailList())), data.getMessenger(first(data.getMessengerList())),
			data.getUrl(first(data.getUrlList())), data.getRelationship(first(data.getRelationshipList())),
			data.getNote(first(data.getNoteList()))}));
	EXPECT_EQ(19800102, data.getEvent(event));
	EXPECT_EQ(CONTACTS_EVENT_CALENDAR_TYPE_LUNAR, data.getCalendarType(event));
	EXPECT_TRUE(data.getIsLeapMonth(event));
	EXPECT_EQ((std::vector<unsigned>(4, 2)), (std::vector<unsigned>{eina_list_count(data.getContactsList()),
		eina_list_count(data.getEmailList()), eina_list_count(data.getNameList()), eina_list_count(data.getImageList())}));

	std::unique_ptr<char, decltype(&free)> second(data.getImagePath(2), free);
	EXPECT_STREQ("/images/ann2.jpg", second.get());
	for (int order : {0, 3, 6})
		EXPECT_EQ(nullptr, data.getImagePath(order)) << order;
	EXPECT_TRUE(ct::log::contains("* Critical * Invalid Param : order : 6"));

	EXPECT_TRUE(data.getNameContactId() == annContact || data.getNameContactId() == otherContact);
	EXPECT_EQ("Climbers", data.getGroupNames());

	EXPECT_FALSE(data.getReadOnlyMode() || data.getFacebookMode() || data.isSimContact());
	EXPECT_TRUE(data.isCurrentPersonValid());
	std::unique_ptr<char, decltype(&free)> vcard(data.getVcardStream(), free);
	ASSERT_NE(nullptr, vcard.get());
	EXPECT_NE(std::string::npos, std::string(vcard.get()).find("BEGIN:VCARD"));
	EXPECT_NE(std::string::npos, std::string(vcard.get()).find("111"));
}

TEST_F(CtDetailDataLoadTest, BarePersonShowsNotAssignedAndAMissingOneGivesAnEmptyObject)
{
	int contactId = 0;
	int deleted = addSimplePerson("Gone", &contactId);
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_delete_record(_contacts_person._uri, deleted));

	CtDetailData solo(addSimplePerson("Solo"));
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_BODY_NOT_ASSIGNED"), solo.getGroupNames());
	EXPECT_EQ(nullptr, solo.getCompany());
	EXPECT_EQ(nullptr, solo.getExtraName2());
	EXPECT_EQ(nullptr, solo.getNumberList());

	for (int personId : {0, -7, deleted, 999999}) {
		CtDetailData data(personId);
		for (const void* empty : {(const void*)data.getDisplayName(), (const void*)data.getContactsList(),
				 (const void*)data.getNumberList(), (const void*)data.getImageList(), (const void*)data.getImagePath(1),
				 (const void*)data.getContactsWithoutFacebook(), (const void*)data.getVcardStream()})
			EXPECT_EQ(nullptr, empty) << personId;
		EXPECT_EQ((std::vector<int>{0, 0, 0}), (std::vector<int>{data.getPersonId(), data.getDefaultImageId(),
			data.getNameContactId()}));
		EXPECT_EQ("", data.getGroupNames());
		EXPECT_FALSE(data.isFavorite() || data.isCurrentPersonValid() || data.isSimContact());
		EXPECT_TRUE(data.getReadOnlyMode() && data.getFacebookMode());
		data.setFavorite(true);
		data.setRingtone("/x.ogg");
		EXPECT_FALSE(data.isFavorite());
	}
}

TEST_F(CtDetailDataLoadTest, FavoriteAndRingtoneWritesPersistAndAFailedWriteKeepsTheStore)
{
	std::string tone = m_dir.file("tone.ogg");
	std::ofstream(tone) << "ogg";
	int personId = addSimplePerson("Fav");
	{
		CtDetailData data(personId);
		EXPECT_FALSE(data.isFavorite());
		data.setFavorite(true);
		data.setRingtone(tone.c_str());
	}
	reopenStore();
	{
		CtDetailData data(personId);
		EXPECT_TRUE(data.isFavorite());
		EXPECT_STREQ(tone.c_str(), data.getRingtonePath());
	}

	// Loading clears a ringtone whose file is gone; then the disk fills up.
	std::remove(tone.c_str());
	CtDetailData data(personId);
	EXPECT_EQ(nullptr, data.getRingtonePath());
	{
		ct::db::ScopedWriteFailure full(1);
		ct::log::clear();
		data.setFavorite(false);
		data.setRingtone("/other.ogg");
	}
	EXPECT_TRUE(data.isFavorite());
	EXPECT_EQ(nullptr, data.getRingtonePath());
	EXPECT_TRUE(ct::log::contains("contacts_db_update_record() Failed(-28)"));
	reopenStore();
	contacts_record_h person = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_record(_contacts_person._uri, personId, &person));
	char* ringtone = nullptr;
	contacts_record_get_str_p(person, _contacts_person.ringtone_path, &ringtone);
	EXPECT_EQ(nullptr, ringtone);
	contacts_record_destroy(person, true);
	CtDetailData reread(personId);
	EXPECT_TRUE(reread.isFavorite());
}

TEST_F(CtDetailDataLoadTest, ReadOnlySocialAndSimModesFollowTheAddressBooks)
{
	int readOnly = addAddressbook("ro", CONTACTS_ADDRESS_BOOK_MODE_READONLY, 4, "Corp");
	int social = addAddressbook("fb", CT_ADDRESSBOOK_MODE_SOCIAL, 5, "Facebook");
	int sim = addAddressbook(CONTACTS_SIM1_ADDRESS_BOOK_NAME, 0, 0, CONTACTS_SIM1_PROVIDER_NAME);

	int roContact = store(newContact(readOnly, "Ro"));
	{
		CtDetailData data(personOf(roContact));
		EXPECT_TRUE(data.getReadOnlyMode());
		EXPECT_FALSE(data.getFacebookMode() || data.isSimContact());
	}
	int fbContact = store(newContact(social, "Fb"));
	{
		CtDetailData data(personOf(fbContact));
		EXPECT_TRUE(data.getFacebookMode());
		EXPECT_EQ(nullptr, data.getContactsWithoutFacebook());
	}
	int phoneContact = store(newContact(0, "Ph"));
	int linked = linkContacts({fbContact, phoneContact, roContact});
	{
		CtDetailData data(linked);
		EXPECT_FALSE(data.getFacebookMode());
		EXPECT_FALSE(data.getReadOnlyMode());
		Eina_List* others = data.getContactsWithoutFacebook();
		ASSERT_EQ(2u, eina_list_count(others));
		int id = 0;
		contacts_record_get_int(first(others), _contacts_contact.id, &id);
		EXPECT_NE(fbContact, id);
		ctCommonDestroyRecordList(others);
	}
	EXPECT_TRUE(CtDetailData(personOf(store(newContact(sim, "Sim")))).isSimContact());
}

TEST_F(CtDetailDataLoadTest, GalEntryBuildsInMemoryRecordsAndStoresNothing)
{
	CtGalSearchData full = {nullptr, "/gal/pic.jpg", "Gail\nSmith", "100", "200", "300", "gail@corp.com", "Corp"};
	{
		CtDetailData data(&full);
		EXPECT_EQ(-2, data.getPersonId());
		EXPECT_STREQ("Gail Smith", data.getDisplayName());
		EXPECT_STREQ("/gal/pic.jpg", data.getImageThumbnailPath());
		EXPECT_STREQ("Corp", data.getCompany());
		EXPECT_EQ((std::vector<std::string>{"100", "200", "300"}), numbersOf(data));
		std::vector<int> types;
		for (Eina_List* l = data.getNumberList(); l; l = eina_list_next(l))
			types.push_back(data.getDataType(first(l), _contacts_number.type));
		EXPECT_EQ((std::vector<int>{4, 64, 2}), types);
		ASSERT_EQ(1u, eina_list_count(data.getEmailList()));
		contacts_record_h email = first(data.getEmailList());
		EXPECT_STREQ("gail@corp.com", data.getEmail(email));
		EXPECT_EQ(4, data.getDataType(email, _contacts_email.type));
		EXPECT_FALSE(data.isCurrentPersonValid());
	}
	CtGalSearchData secondOnly = {nullptr, nullptr, nullptr, "", "200", nullptr, nullptr, nullptr};
	{
		CtDetailData data(&secondOnly);
		ASSERT_EQ(1u, eina_list_count(data.getNumberList()));
		EXPECT_EQ(64, data.getDataType(first(data.getNumberList()), _contacts_number.type));
		EXPECT_EQ(nullptr, data.getEmailList());
		EXPECT_EQ(nullptr, data.getDisplayName());
	}
	CtGalSearchData broken = {nullptr, nullptr, "Bad\xff name", "\xfe\xff", "200", nullptr, "\xc3", "Co\xffrp"};
	{
		CtDetailData data(&broken);
		EXPECT_EQ((std::vector<std::string>{"200"}), numbersOf(data));
		EXPECT_EQ(nullptr, data.getEmailList());
		ASSERT_NE(nullptr, data.getDisplayName());
		EXPECT_TRUE(g_utf8_validate(data.getDisplayName(), -1, nullptr));
		EXPECT_TRUE(g_utf8_validate(data.getCompany(), -1, nullptr));
	}
	CtGalSearchData empty = {};
	CtDetailData blank(&empty);
	EXPECT_EQ(nullptr, blank.getNumberList());
	CtDetailData none(static_cast<const CtGalSearchData*>(nullptr));
	EXPECT_EQ(-2, none.getPersonId());

	int count = -1;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_count(_contacts_contact._uri, &count));
	EXPECT_EQ(0, count);
}

TEST_F(CtDetailDataLoadTest, FavoriteStartsADataSyncOnlyWithEasySignUp)
{
	int personId = addSimplePerson("Synced");
	CtContactsAgentMgr* agent = CtContactsAgentMgr::getInstance();
	agent->clearSyncRequests();
	CtDetailData data(personId);
	data.setFavorite(true);
	EXPECT_TRUE(agent->getSyncRequests().empty());

	setenv("CONTACTS_FEATURES", "13", 1);
	data.setFavorite(false);
	unsetenv("CONTACTS_FEATURES");
	ASSERT_EQ(1u, agent->getSyncRequests().size());
	EXPECT_EQ(CtContactsAgentMgr::SyncKind::PersonData, agent->getSyncRequests().front().kind);
	EXPECT_EQ(personId, agent->getSyncRequests().front().personId);
	settle(0.1);
	agent->clearSyncRequests();
}
