// The editable profile: a new one is inserted, a stored one updated (and a
// failed save changes nothing), the own number stays out of the list,
// pictures keep orders 1 to 5, and the type rules that differ from a contact.
#include "CtMyProfileInputData.h"
#include "MyProfileTestStore.h"

#include "LogSink.h"
#include "SqliteFaultInjector.h"

using namespace ct::test;

namespace {

std::string textOr(const char* text)
{
	return text ? text : "<null>";
}

// The stored profile's pictures as "order:path" in stored order; "<none>" without a profile.
std::string storedPictures()
{
	CtMyProfileInputData data;
	if (data.getContactId() == 0)
		return "<none>";
	std::string out;
	for (int i = 0; i < data.getImageCount(); ++i) {
		contacts_record_h image = nullptr;
		contacts_record_get_child_record_at_p(data.getProfileRecord(), _contacts_my_profile.image, i, &image);
		char* path = nullptr;
		contacts_record_get_str_p(image, _contacts_image.path, &path);
		out += (i ? " " : "") + std::to_string(data.getImageOrder(i)) + ":" + textOr(path);
	}
	return out;
}

std::vector<std::string> numbers(CtMyProfileInputData& data)
{
	std::vector<std::string> out;
	Eina_List* list = data.getNumberList();
	void* record = nullptr;
	EINA_LIST_FREE(list, record)
		out.push_back(textOr(data.getNumberNumber(static_cast<contacts_record_h>(record))));
	return out;
}

} // namespace

class CtMyProfileInputDataTest : public StoreTest {};

TEST_F(CtMyProfileInputDataTest, EmptyStoreStartsANewProfileWithIdZeroThatInsertThenStores)
{
	int id = -1;
	{
		CtMyProfileInputData data;
		EXPECT_EQ(0, data.getContactId());
		ASSERT_NE(nullptr, data.getProfileRecord());
		EXPECT_EQ(0, profileCount());
		data.setFullName("Ines Maria Lopez");
		data.setStatus("Reading");
		data.setStatus(nullptr);
		ASSERT_EQ(CONTACTS_ERROR_NONE, data.insertContact(&id));
		EXPECT_GT(id, 0);
		EXPECT_EQ(id, data.getContactId());
	}
	reopenStore();
	CtMyProfileInputData loaded;
	EXPECT_EQ(id, loaded.getContactId());
	EXPECT_EQ("Ines Maria Lopez", loaded.getFullName());
	EXPECT_EQ("Reading", textOr(loaded.getStatus()));
	EXPECT_EQ(1, profileCount());
}

TEST_F(CtMyProfileInputDataTest, StoredProfileReplacesAPassedRecordAndUpdatesInPlace)
{
	int id = storeProfile(newProfile("Stored"));
	contacts_record_h passed = newProfile("Passed");
	CtMyProfileInputData data(passed);
	EXPECT_EQ(id, data.getContactId());
	EXPECT_EQ("Stored", textOr(data.getFirstName()));
	data.setFirstName("Renamed");
	data.addEmail("me@example.com");
	ASSERT_EQ(CONTACTS_ERROR_NONE, data.updateContact());
	reopenStore();
	CtMyProfileInputData loaded;
	EXPECT_EQ("Renamed", textOr(loaded.getFirstName()));
	Eina_List* emails = loaded.getEmailList();
	ASSERT_EQ(1u, eina_list_count(emails));
	EXPECT_EQ("me@example.com", textOr(loaded.getEmailEmail(static_cast<contacts_record_h>(eina_list_data_get(emails)))));
	eina_list_free(emails);
	EXPECT_EQ(1, profileCount());
}

TEST_F(CtMyProfileInputDataTest, FailedSaveLeavesTheStoredProfileAsItWas)
{
	contacts_record_h profile = newProfile("Kept");
	addProfilePictures(profile, {{"/p/a.png", 1}, {"/p/b.png", 2}});
	storeProfile(profile);
	CtMyProfileInputData data;
	data.setFirstName("Lost");
	data.removeImage(data.getImageRecord(1));
	{
		ct::db::ScopedWriteFailure full(1);
		EXPECT_NE(CONTACTS_ERROR_NONE, data.updateContact());
	}
	reopenStore();
	CtMyProfileInputData loaded;
	EXPECT_EQ("Kept", textOr(loaded.getFirstName()));
	EXPECT_EQ("1:/p/a.png 2:/p/b.png", storedPictures());
}

TEST_F(CtMyProfileInputDataTest, OwnNumberIsTheDefaultLabelledSimCardNumberAndStaysOutOfTheList)
{
	struct Case {
		bool isDefault;
		const char* label;
		std::vector<std::string> listed;
		const char* own;
	};
	const Case cases[] = {
		{true, "sim_card_number", {}, "555"},
		{true, nullptr, {"555"}, "<null>"},
		{false, "sim_card_number", {"555"}, "<null>"},
	};
	for (const Case& c : cases) {
		contacts_record_h profile = newProfile("Me");
		addProfileNumber(profile, "555", c.isDefault, c.label);
		int id = storeProfile(profile);
		CtMyProfileInputData data;
		EXPECT_EQ(c.listed, numbers(data)) << c.isDefault << textOr(c.label);
		EXPECT_EQ(c.own, textOr(data.getNumberNumber(data.getDefaultNumber())));
		data.addNumber("777");
		std::vector<std::string> withNew = c.listed;
		withNew.push_back("777");
		EXPECT_EQ(withNew, numbers(data));
		contacts_db_delete_record(_contacts_my_profile._uri, id);
	}
}

TEST_F(CtMyProfileInputDataTest, RemovingAPictureMovesTheLaterOrdersDownAndIsSaved)
{
	contacts_record_h profile = newProfile("Me");
	addProfilePictures(profile, {{"/p/1.png", 1}, {"/p/2.png", 2}, {"/p/3.png", 3}});
	storeProfile(profile);
	CtMyProfileInputData data;
	EXPECT_EQ(3, data.getImageCount());
	ASSERT_EQ(CONTACTS_ERROR_NONE, data.removeImage(data.getImageRecord(2)));
	EXPECT_EQ(2, data.getImageCount());
	EXPECT_EQ("/p/1.png", textOr(data.getImagePath(1)));
	EXPECT_EQ("/p/3.png", textOr(data.getImagePath(2)));
	EXPECT_EQ("<null>", textOr(data.getImagePath(3)));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, data.removeImage(nullptr));
	ASSERT_EQ(CONTACTS_ERROR_NONE, data.updateContact());
	reopenStore();
	EXPECT_EQ("1:/p/1.png 2:/p/3.png", storedPictures());
}

TEST_F(CtMyProfileInputDataTest, PictureOperationsRefuseOrdersOutsideOneToFiveAndCreateNothing)
{
	CtMyProfileInputData data;
	for (int order : {0, 6, -1}) {
		ct::log::clear();
		EXPECT_EQ(nullptr, data.getImageRecord(order)) << order;
		EXPECT_TRUE(ct::log::contains("Invalid Param : order : " + std::to_string(order)));
		EXPECT_EQ(nullptr, data.getImagePath(order));
		EXPECT_EQ(-1, data.getImageIndex(order));
		data.setImageOrder(0, order);
	}
	EXPECT_EQ(0, data.getImageCount());
	EXPECT_EQ(-1, data.getImageOrder(-1));
	EXPECT_EQ(-1, data.getImageOrder(0));

	contacts_record_h fourth = data.getImageRecord(4);
	ASSERT_NE(nullptr, fourth);
	EXPECT_EQ(fourth, data.getImageRecord(4));
	EXPECT_EQ(1, data.getImageCount());
	EXPECT_EQ(0, data.getImageIndex(4));
	EXPECT_EQ(CONTACTS_ERROR_NONE, data.setImage(fourth, "", 0));
	EXPECT_EQ(nullptr, data.getImagePath(4));
	EXPECT_EQ(CONTACTS_ERROR_NONE, data.setImage(fourth, "/p/four.png", 1));
	EXPECT_EQ("/p/four.png", textOr(data.getImagePath(4)));
	data.setImageOrder(0, 2);
	EXPECT_EQ(2, data.getImageOrder(0));
	EXPECT_EQ("/p/four.png", textOr(data.getImagePath(2)));
	EXPECT_EQ(CONTACTS_ERROR_INVALID_PARAMETER, data.setImage(nullptr, "/p/x.png", 1));
	EXPECT_EQ(1, data.getImageCount());
}

TEST_F(CtMyProfileInputDataTest, TypeRulesDifferFromAContactWhereTheProfileSaysSo)
{
	CtMyProfileInputData data;
	const std::pair<int, int> numberIndexes[] = {
		{CONTACTS_NUMBER_TYPE_VOICE, CtDataType::NUMBER_MENU_OTHER_OR_CUSTOM},
		{CONTACTS_NUMBER_TYPE_FAX, CtDataType::NUMBER_MENU_OTHER_OR_CUSTOM},
		{CtDataType::kNumberHomeVoice, CtDataType::NUMBER_MENU_HOME},
		{CtDataType::kNumberWorkFax, CtDataType::NUMBER_MENU_WORK_FAX},
		{CONTACTS_NUMBER_TYPE_CELL, CtDataType::NUMBER_MENU_MOBILE},
	};
	for (const auto& [type, index] : numberIndexes)
		EXPECT_EQ(index, data.getNumberIndexType(type)) << type;
	EXPECT_EQ(CONTACTS_MESSENGER_TYPE_JABBER, data.getMessengerTypeByIndex(CtDataType::MESSENGER_MENU_HANGOUTS));
	EXPECT_EQ(CtDataType::MESSENGER_MENU_JABBER, data.getMessengerIndexType(CONTACTS_MESSENGER_TYPE_GOOGLE));
	// Choosing the shown position again keeps the type, for every position.
	for (int i = CtDataType::MESSENGER_MENU_CUSTOM; i <= CtDataType::MESSENGER_MENU_JABBER; ++i)
		EXPECT_EQ(i, data.getMessengerIndexType(data.getMessengerTypeByIndex(i))) << i;

	std::vector<int> proposed;
	for (int i = CtDataType::MESSENGER_MENU_AIM; i <= CtDataType::MESSENGER_MENU_JABBER; ++i) {
		proposed.push_back(data.getNextMessengerType());
		data.addMessenger("id");
	}
	EXPECT_EQ((std::vector<int>{CONTACTS_MESSENGER_TYPE_AIM, CONTACTS_MESSENGER_TYPE_YAHOO,
				  CONTACTS_MESSENGER_TYPE_SKYPE, CONTACTS_MESSENGER_TYPE_QQ, CONTACTS_MESSENGER_TYPE_JABBER,
				  CONTACTS_MESSENGER_TYPE_ICQ, CONTACTS_MESSENGER_TYPE_GOOGLE}),
		proposed);
	EXPECT_EQ(CONTACTS_MESSENGER_TYPE_CUSTOM, data.getNextMessengerType());

	EXPECT_EQ(CONTACTS_EVENT_TYPE_BIRTH, data.getNextEventType());
	contacts_record_h anniversary = data.addEvent(20000101);
	data.setEventType(anniversary, CONTACTS_EVENT_TYPE_ANNIVERSARY, nullptr);
	EXPECT_EQ(CONTACTS_EVENT_TYPE_BIRTH, data.getNextEventType());
	data.addEvent(19800101);
	EXPECT_EQ(CONTACTS_EVENT_TYPE_ANNIVERSARY, data.getNextEventType());
	data.addEvent(19900101);
	EXPECT_EQ(CONTACTS_EVENT_TYPE_ANNIVERSARY, data.getNextEventType());
}

TEST_F(CtMyProfileInputDataTest, ContactOnlyOperationsAnswerFixedValuesAndWriteNothing)
{
	CtMyProfileInputData data;
	int id = -1;
	EXPECT_EQ(0, data.insertSIMContact(&id));
	EXPECT_EQ(-1, id);
	EXPECT_EQ(0, data.updateSIMContact());
	EXPECT_EQ(nullptr, data.addGroupRelation(1));
	EXPECT_EQ(nullptr, data.addRelationship("Mum"));
	EXPECT_EQ(nullptr, data.getRelationshipList());
	EXPECT_EQ(0, data.setRingtone("/r.ogg"));
	EXPECT_EQ(nullptr, data.getRingtone());
	EXPECT_FALSE(data.getIsFavorite());
	EXPECT_TRUE(data.getSimFieldStatus(0));
	std::vector<int> groups = {7};
	data.getAllGroupsId(groups);
	EXPECT_EQ(std::vector<int>{7}, groups);
	EXPECT_EQ("", data.getGroupsName());
	EXPECT_EQ(0, profileCount());
}
