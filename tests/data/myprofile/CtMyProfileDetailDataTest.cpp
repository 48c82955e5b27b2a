// The read side of the user's own profile: what it answers without a
// profile, pictures by order (bad stored orders too), the own number kept
// apart, the composed texts, and reloading on change only while a listener
// is attached.
#include "CtMyProfileDetailData.h"
#include "MyProfileTestStore.h"

#include "LogSink.h"

#include <cstdlib>

using namespace ct::test;

namespace {

std::string taken(char* text)
{
	std::string out = text ? text : "<null>";
	free(text);
	return out;
}

std::string textOr(const char* text)
{
	return text ? text : "<null>";
}

std::vector<std::string> numbersOf(CtMyProfileDetailData& data, Eina_List* list)
{
	std::vector<std::string> out;
	Eina_List* l = nullptr;
	void* record = nullptr;
	EINA_LIST_FOREACH(list, l, record)
		out.push_back(textOr(data.getNumber(static_cast<contacts_record_h>(record))));
	return out;
}

} // namespace

class CtMyProfileDetailDataTest : public StoreTest {};

TEST_F(CtMyProfileDetailDataTest, WithoutAProfileEverythingIsEmptyAndNothingIsWritten)
{
	CtMyProfileDetailData data;
	EXPECT_EQ(nullptr, data.getPersonRecord());
	EXPECT_EQ(nullptr, data.getDefaultNumberRecord());
	for (Eina_List* list : {data.getNumberList(), data.getEmailList(), data.getAddressList(), data.getMessengerList(),
			 data.getUrlList(), data.getRelationshipList(), data.getEventList(), data.getNoteList(),
			 data.getContactsList(), data.getNameList(), data.getImageList()})
		EXPECT_EQ(nullptr, list);
	for (const char* text : {data.getDisplayName(), data.getImageThumbnailPath(), data.getExtraName2(),
			 data.getExtraName1First(), data.getExtraName1Second(), data.getCompany(), data.getStatus(),
			 data.getRingtonePath()})
		EXPECT_EQ(nullptr, text);
	EXPECT_EQ("<null>", taken(data.getImagePath(1)));
	EXPECT_EQ(0, data.getPersonId());
	EXPECT_EQ(nullptr, data.getVcardStream());
	EXPECT_EQ(0, profileCount());
}

TEST_F(CtMyProfileDetailDataTest, PicturesAreFoundByTheirOrderAndStoredOrdersOutsideOneToFiveAreNeverShown)
{
	contacts_record_h profile = newProfile("Me");
	addProfilePictures(profile, {{"/p/one.png", 1}, {"/p/two.png", 2}, {"/p/four.png", 4}, {"/p/seven.png", 7}});
	storeProfile(profile);
	CtMyProfileDetailData data;
	const std::pair<int, const char*> cases[] = {
		{1, "/p/one.png"}, {2, "/p/two.png"}, {3, "<null>"}, {4, "/p/four.png"}, {5, "<null>"},
		{0, "<null>"}, {6, "<null>"}, {7, "<null>"}, {-1, "<null>"},
	};
	for (const auto& [order, expected] : cases) {
		ct::log::clear();
		EXPECT_EQ(expected, taken(data.getImagePath(order))) << order;
		bool outOfRange = order < 1 || order > 5;
		EXPECT_EQ(outOfRange, ct::log::contains("* Critical * Invalid Param : order : " + std::to_string(order)))
			<< order;
	}
}

TEST_F(CtMyProfileDetailDataTest, DefaultNumberIsKeptApartAndTheOthersKeepTheirOrder)
{
	contacts_record_h profile = newProfile("Me");
	addProfileNumber(profile, "111");
	addProfileNumber(profile, "222", true, "sim_card_number");
	addProfileNumber(profile, "333");
	storeProfile(profile);
	CtMyProfileDetailData data;
	ASSERT_NE(nullptr, data.getDefaultNumberRecord());
	EXPECT_EQ("222", textOr(data.getNumber(data.getDefaultNumberRecord())));
	EXPECT_EQ((std::vector<std::string>{"111", "333"}), numbersOf(data, data.getNumberList()));
}

TEST_F(CtMyProfileDetailDataTest, ExtraNamesAndCompanyLineJoinOnlyThePartsThatAreSet)
{
	struct Case {
		const char* nickname;
		std::vector<const char*> phonetic; // first, middle, last
		std::vector<const char*> company;  // name, department, job title
		contacts_name_display_order_e order;
		const char* extraName2;
		const char* companyLine;
	};
	const Case cases[] = {
		{"Nick", {nullptr, nullptr, nullptr}, {"Acme", "Sales", "Manager"}, CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST,
			"Nick", "Acme Sales, Manager"},
		{"Nick", {"Pa", nullptr, "Pc"}, {nullptr, nullptr, "Manager"}, CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST,
			"Pa Pc, Nick", "Manager"},
		{nullptr, {"Pa", "Pb", "Pc"}, {"Acme", nullptr, "Boss"}, CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST, "Pc Pa Pb",
			"Acme, Boss"},
		{nullptr, {nullptr, nullptr, nullptr}, {nullptr, "Sales", nullptr}, CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST,
			"<null>", "Sales"},
	};
	for (const Case& c : cases) {
		contacts_setting_set_name_display_order(c.order);
		contacts_record_h profile = newProfile("Me");
		contacts_record_h name = nullptr;
		contacts_record_get_child_record_at_p(profile, _contacts_my_profile.name, 0, &name);
		const unsigned phonetic[] = {_contacts_name.phonetic_first, _contacts_name.phonetic_middle,
			_contacts_name.phonetic_last};
		for (int i = 0; i < 3; ++i)
			contacts_record_set_str(name, phonetic[i], c.phonetic[i]);
		if (c.nickname)
			addText(profile, _contacts_my_profile.nickname, _contacts_nickname._uri, _contacts_nickname.name, c.nickname);
		contacts_record_h company = addChild(profile, _contacts_my_profile.company, _contacts_company._uri);
		contacts_record_set_str(company, _contacts_company.name, c.company[0]);
		contacts_record_set_str(company, _contacts_company.department, c.company[1]);
		contacts_record_set_str(company, _contacts_company.job_title, c.company[2]);
		int id = storeProfile(profile);
		CtMyProfileDetailData data;
		EXPECT_EQ(id, data.getPersonId());
		EXPECT_EQ(c.extraName2, textOr(data.getExtraName2())) << c.extraName2;
		EXPECT_EQ(c.companyLine, textOr(data.getCompany())) << c.companyLine;
		contacts_db_delete_record(_contacts_my_profile._uri, id);
	}
}

TEST_F(CtMyProfileDetailDataTest, StatusAddressLinesAndVcardComeFromTheStoredProfile)
{
	contacts_record_h profile = newProfile("Ines");
	contacts_record_set_str(profile, _contacts_my_profile_ex.status, "On holiday");
	contacts_record_h address = addChild(profile, _contacts_my_profile.address, _contacts_address._uri);
	contacts_record_set_str(address, _contacts_address.street, "1 Main St");
	contacts_record_set_str(address, _contacts_address.postal_code, "12345");
	contacts_record_set_str(address, _contacts_address.country, "Utopia");
	storeProfile(profile);
	CtMyProfileDetailData data;
	EXPECT_EQ("On holiday", textOr(data.getStatus()));
	EXPECT_EQ("Ines", textOr(data.getDisplayName()));
	ASSERT_EQ(1u, eina_list_count(data.getAddressList()));
	char text[1024] = {};
	data.getAddress(static_cast<contacts_record_h>(eina_list_data_get(data.getAddressList())), text, sizeof(text));
	EXPECT_STREQ("12345\n1 Main St\nUtopia", text);
	char small[8] = {};
	data.getAddress(static_cast<contacts_record_h>(eina_list_data_get(data.getAddressList())), small, sizeof(small));
	EXPECT_STREQ("12345\n1", small);
	std::string vcard = taken(data.getVcardStream());
	EXPECT_NE(std::string::npos, vcard.find("Ines")) << vcard;
}

TEST_F(CtMyProfileDetailDataTest, ChangesReloadOnlyWhileAListenerIsAttached)
{
	int id = storeProfile(newProfile("Before"));
	CtMyProfileDetailData data;
	auto rename = [id](const char* first) {
		contacts_record_h profile = nullptr;
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_get_record(_contacts_my_profile._uri, id, &profile));
		contacts_record_h name = nullptr;
		contacts_record_get_child_record_at_p(profile, _contacts_my_profile.name, 0, &name);
		contacts_record_set_str(name, _contacts_name.first, first);
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_db_update_record(profile));
		contacts_record_destroy(profile, true);
	};

	rename("Unheard");
	settle();
	EXPECT_EQ("Before", textOr(data.getDisplayName()));

	RecordingListener listener;
	ct::log::clear();
	data.attachListener(nullptr);
	EXPECT_TRUE(ct::log::contains("* Critical * WASSERT! listener"));
	data.attachListener(&listener);
	rename("Heard");
	ASSERT_TRUE(pumpUntil([&] { return !listener.uris.empty(); }, 3.0));
	EXPECT_EQ("Heard", textOr(data.getDisplayName()));
	EXPECT_EQ(_contacts_my_profile._uri, listener.uris.front());

	data.detachListener();
	rename("Gone");
	settle();
	EXPECT_EQ("Heard", textOr(data.getDisplayName()));
	EXPECT_EQ(1u, listener.uris.size());
}
