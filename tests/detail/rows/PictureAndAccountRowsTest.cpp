#include "RowTestSupport.h"

#include "CtCommonAddressbookUtil.h"
#include "CtDetailViewBasicInfoItem.h"
#include "CtDetailViewFacebookItem.h"
#include "CtDetailViewLinkItem.h"
#include "CtDetailViewMultiImageItem.h"
#include "CtDetailViewProfileMultiImageItem.h"
#include "CtDetailViewProfileSharingItem.h"
#include "CtProfileSettingKeys.h"

#include <app_preference.h>
#include <glib.h>
#include <vconf.h>

#include <cstring>

using namespace ct::test;

namespace {

using Strings = std::vector<std::string>;

const char* const kDefaultImageKey = "db/deco-contact-image-editor/contact_default_image_path";

// The file of an image, or its edje group when it has one.
std::string imageSource(Evas_Object* image)
{
	const char* file = nullptr;
	const char* group = nullptr;
	elm_image_file_get(image, &file, &group);
	return group ? group : file ? file : "";
}

std::string layoutGroup(Evas_Object* layout)
{
	const char* group = nullptr;
	elm_layout_file_get(layout, nullptr, &group);
	return group ? group : "";
}

std::string b64(const char* text)
{
	gchar* encoded = g_base64_encode((const guchar*)text, strlen(text));
	std::string out = encoded;
	g_free(encoded);
	return out;
}

class PictureAndAccountRowsTest : public RowTest {
protected:
	void TearDown() override
	{
		vconf_set_str(kDefaultImageKey, "");
		RowTest::TearDown();
	}
	// A person of `count` linked phone contacts.
	int linkedPerson(int count)
	{
		std::vector<int> ids;
		for (int i = 0; i < count; ++i)
			ids.push_back(store(newContact(0, ("Part" + std::to_string(i)).c_str())));
		return linkContacts(ids);
	}
	Evas_Object* pictureOf(Elm_Object_Item* item)
	{
		return elm_object_part_content_get(content(item, "elm.icon"), "elm.swallow.content");
	}
	int personWithPictures(const std::vector<std::string>& paths)
	{
		contacts_record_h contact = newContact(0, "Pia");
		int order = 1;
		for (const std::string& path : paths)
			addImage(contact, path.c_str(), order++);
		return storePerson(contact);
	}
};

} // namespace

TEST_F(PictureAndAccountRowsTest, OnePictureOrTheDefaultFillsTheAreaOrSitsSmallInTheLowResolutionLayout)
{
	CtDetailData* bare = load(addSimplePerson("Pia"));
	auto* row = new CtDetailViewMultiImageItem(m_view, bare, false);
	Elm_Object_Item* item = show(row);
	EXPECT_EQ("detail.multi.image", ScreenHarness::itemStyle(item));
	EXPECT_EQ("layout/detail/contact_image", layoutGroup(content(item, "elm.icon")));
	EXPECT_EQ("contacts_caller_id_default_full.png", imageSource(pictureOf(item)));
	EXPECT_EQ("", row->getCopyText());
	EXPECT_EQ(nullptr, row->getPager());
	std::string custom = picture("custom_default.png", 64, 64, 0xFF336699, 0xFF6699CC);
	vconf_set_str(kDefaultImageKey, custom.c_str());
	EXPECT_EQ(custom, imageSource(pictureOf(show(new CtDetailViewMultiImageItem(m_view, bare, false)))));
	elm_genlist_clear(m_view->genlist); // picture rows are tall: keep the next ones on screen

	std::string path = picture("one.png", 640, 480, 0xFF884422, 0xFF224488);
	CtDetailData* data = load(personWithPictures({path}));
	row = new CtDetailViewMultiImageItem(m_view, data, false);
	item = show(row);
	EXPECT_EQ("layout/detail/contact_image", layoutGroup(content(item, "elm.icon")));
	EXPECT_EQ(path, imageSource(pictureOf(item)));
	EXPECT_EQ(path, row->getCopyText());
	ScreenHarness::selectItem(item);
	EXPECT_EQ(std::vector<int>{0}, m_view->imagePages);

	Elm_Object_Item* lowItem = show(new CtDetailViewMultiImageItem(m_view, data, true));
	EXPECT_EQ("detail.multi.image/low", ScreenHarness::itemStyle(lowItem));
	EXPECT_EQ("layout/detail/contact_image/low_resolution", layoutGroup(content(lowItem, "elm.icon")));
}

TEST_F(PictureAndAccountRowsTest, SeveralPicturesMakeAPagerWithOneIndicatorPerPicture)
{
	std::vector<std::string> paths = {
		picture("p1.png", 400, 300, 0xFFAA3333, 0xFF3333AA),
		picture("p2.png", 400, 300, 0xFF33AA33, 0xFFAAAA33),
		picture("p3.png", 400, 300, 0xFF3333AA, 0xFF33AAAA),
	};
	CtDetailData* data = load(personWithPictures(paths));
	auto* row = new CtDetailViewProfileMultiImageItem(m_view, data, false);
	Elm_Object_Item* item = show(row);
	Evas_Object* layout = content(item, "elm.icon");
	EXPECT_EQ("layout/multi_image", layoutGroup(layout));
	Evas_Object* pager = row->getPager();
	ASSERT_NE(nullptr, pager);
	EXPECT_EQ(pager, elm_object_part_content_get(layout, "scroller"));
	Eina_List* pages = elm_box_children_get(elm_object_content_get(pager));
	EXPECT_EQ(3u, eina_list_count(pages));
	eina_list_free(pages);

	Evas_Object* index = elm_object_part_content_get(layout, "controller");
	EXPECT_NE(nullptr, elm_index_item_find(index, (void*)3));
	EXPECT_EQ(nullptr, elm_index_item_find(index, (void*)4));
	EXPECT_EQ(elm_index_item_find(index, (void*)1), elm_index_selected_item_get(index, 0));

	EXPECT_EQ(paths[0], row->getCopyText());
	elm_scroller_page_show(pager, 2, 0);
	m_screen->pumpUntilIdle();
	EXPECT_EQ(2, row->getCurrentPage());
	EXPECT_EQ(paths[2], row->getCopyText());
	ScreenHarness::selectItem(item);
	EXPECT_EQ(std::vector<int>{2}, m_view->imagePages);
}

TEST_F(PictureAndAccountRowsTest, LinkedAccountsShowSevenIconsThenTheEighthOrTheMoreIcon)
{
	struct Case {
		int contacts;
		int filledSlots;
		bool moreIcon;
	};
	for (Case c : {Case{1, 1, false}, Case{7, 7, false}, Case{8, 8, false}, Case{9, 8, true}}) {
		SCOPED_TRACE(c.contacts);
		CtDetailData* data = load(linkedPerson(c.contacts));
		ASSERT_EQ((unsigned)c.contacts, eina_list_count(data->getContactsList()));
		auto* row = new CtDetailViewLinkItem(data);
		Elm_Object_Item* item = show(row);
		EXPECT_EQ(ContactsCommon::translate("IDS_PB_HEADER_LINKED_CONTACTS_ABB"), text(item, "elm.text"));
		EXPECT_EQ(ELM_OBJECT_SELECT_MODE_NONE, elm_genlist_item_select_mode_get(item));
		Strings icons, expected;
		for (int slot = 1; slot <= 8; ++slot) {
			Evas_Object* icon = content(item, ("elm.icon." + std::to_string(slot)).c_str());
			icons.push_back(icon ? imageSource(icon) : "-");
			expected.push_back(slot > c.filledSlots ? "-"
					: slot == 8 && c.moreIcon ? "contacts_ic_linked.png"
											  : ctCommonGetAccountIconPathByAddressbookId(0));
		}
		EXPECT_EQ(expected, icons);
	}
}

TEST_F(PictureAndAccountRowsTest, BasicInfoRowShowsTheNameAndItsStarTogglesTheFavourite)
{
	contacts_record_h contact = newContact(0, "Ari");
	addText(contact, _contacts_contact.nickname, _contacts_nickname._uri, _contacts_nickname.name, "Ace");
	addText(contact, _contacts_contact.company, _contacts_company._uri, _contacts_company.name, "Velmora");
	int personId = storePerson(contact);
	CtDetailData* data = load(personId);
	ASSERT_FALSE(data->isFavorite());

	Elm_Object_Item* oneLine = show(new CtDetailViewBasicInfoItem(data, 0));
	EXPECT_EQ("display_name_1line", ScreenHarness::itemStyle(oneLine));
	EXPECT_EQ("", text(oneLine, "sub.name1"));
	auto* row = new CtDetailViewBasicInfoItem(data, 1);
	Elm_Object_Item* item = show(row);
	EXPECT_EQ("display_name_4line", ScreenHarness::itemStyle(item));
	EXPECT_EQ("Ari", text(item, "main.name"));
	Strings subs = {text(item, "sub.name1"), text(item, "sub.name2"), text(item, "sub.name3")};
	for (const char* sub : {"Ace", "Velmora"})
		EXPECT_NE(subs.end(), std::find(subs.begin(), subs.end(), sub)) << sub;
	EXPECT_NE(nullptr, content(item, "elm.icon.2"));

	SignalRecorder signals;
	Evas_Object* star = row->getFavoriteIcon();
	ASSERT_NE(nullptr, star);
	Evas_Coord x, y, w, h;
	evas_object_geometry_get(star, &x, &y, &w, &h);
	auto tapAt = [evas = evas_object_evas_get(star)](int tx, int ty) {
		evas_event_feed_mouse_move(evas, tx, ty, 0, nullptr);
		evas_event_feed_mouse_down(evas, 1, EVAS_BUTTON_NONE, 0, nullptr);
		evas_event_feed_mouse_up(evas, 1, EVAS_BUTTON_NONE, 0, nullptr);
	};
	tapAt(x - 30, y + h / 2); // beside the star: an ordinary row tap
	EXPECT_FALSE(row->getSkipOnce());
	tapAt(x + w / 2, y + h / 2);
	EXPECT_TRUE(row->getSkipOnce());
	EXPECT_TRUE(row->isFavorite());
	EXPECT_EQ(1u, signals.signals.size());
	EXPECT_EQ(1, signals.count(CT_REGISTRY_KEY_FAVORITE_CHANGED));
	reopenStore();
	EXPECT_TRUE(CtDetailData(personId).isFavorite());

	Elm_Object_Item* nameless = show(new CtDetailViewBasicInfoItem(load(storePerson(newContact(0, nullptr))), 0));
	EXPECT_EQ(ContactsCommon::translate("IDS_LOGS_MBODY_UNKNOWN"), text(nameless, "main.name"));
}

TEST_F(PictureAndAccountRowsTest, SocialProfileOpensInTheSocialAppWithDecodedExtras)
{
	ScreenHarness::selectItem(show(new CtDetailViewFacebookItem(load(addSimplePerson("Ari")))));
	EXPECT_TRUE(m_launches->launches().empty()) << "a contact without a profile opens nothing";

	auto open = [this](const char* appId, const char* uri, const std::string& extras) {
		contacts_record_h contact = newContact(0, "Bea");
		contacts_record_h profile = addText(contact, _contacts_contact.profile, _contacts_profile._uri, _contacts_profile.app_id, appId);
		contacts_record_set_str(profile, _contacts_profile.service_operation, APP_CONTROL_OPERATION_VIEW);
		contacts_record_set_str(profile, _contacts_profile.uri, uri);
		contacts_record_set_str(profile, _contacts_profile.extra_data, extras.c_str());
		m_launches->clear();
		ScreenHarness::selectItem(show(new CtDetailViewFacebookItem(load(storePerson(contact)))));
		auto launches = m_launches->launches();
		EXPECT_EQ(1u, launches.size()) << appId;
		return launches.empty() ? ct::appcontrol::LaunchRecord() : launches[0];
	};
	auto own = open(FACEBOOK_APP_ID, "fb://profile/7",
			b64("profile_id") + ":" + b64("7") + "," + b64("source") + ":" + b64("contacts") + ",broken");
	EXPECT_EQ((Strings{FACEBOOK_APP_ID, "fb://profile/7", "7", "contacts", ""}),
			(Strings{own.appId, own.uri, own.extra("profile_id"), own.extra("source"),
				own.extra("fb.appcontrol.launch.type")}));
	auto other = open("org.example.other", "https://social.example/ari", "");
	EXPECT_EQ((Strings{FACEBOOK_APP_ID, "launch_url", "https://social.example/ari"}),
			(Strings{other.appId, other.extra("fb.appcontrol.launch.type"),
				other.extra("fb.appcontrol.launch.info")}));
}

TEST_F(PictureAndAccountRowsTest, ProfileSharingRowTellsTheSharingState)
{
	CtDetailData* data = load(addSimplePerson("Me"));
	struct Case {
		bool sharing;
		int type;
		const char* value;
	};
	for (Case c : {Case{false, 0, "IDS_PB_BODY_OFF_M_NOT_USED"}, Case{true, 1, "IDS_PB_HEADER_BUSINESS_PROFILE_ABB"},
			 Case{true, 0, "IDS_PB_HEADER_PERSONAL_PROFILE_ABB"}}) {
		preference_set_boolean(CT_PREF_PROFILE_SHARING_STATUS, c.sharing);
		preference_set_int(CT_PREF_PROFILE_TYPE, c.type);
		Elm_Object_Item* item = show(new CtDetailViewProfileSharingItem(data));
		EXPECT_EQ((Strings{ContactsCommon::translate("IDS_PB_MBODY_PROFILE_SHARING"),
					  ContactsCommon::translate(c.value)}),
				labelAndValue(item));
	}
	preference_set_boolean(CT_PREF_PROFILE_SHARING_STATUS, false);
}
