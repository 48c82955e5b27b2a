#include "RowTestSupport.h"

#include "CtCommonAddressbookUtil.h"
#include "CtDetailViewBasicInfoItem.h"
#include "CtDetailViewFacebookItem.h"
#include "CtDetailViewLinkItem.h"
#include "CtDetailViewMultiImageItem.h"
#include "CtDetailViewProfileMultiImageItem.h"
#include "CtDetailViewProfileSharingItem.h"
#include "CtProfileSettingKeys.h"
#include "CtRegistryMgr.h"

#include <app_preference.h>
#include <glib.h>
#include <vconf.h>

#include <algorithm>
#include <cstring>

using namespace ct::test;

namespace {

const char* const kDefaultImageKey = "db/deco-contact-image-editor/contact_default_image_path";

std::string imageGroup(Evas_Object* image)
{
	const char* file = nullptr;
	const char* group = nullptr;
	elm_image_file_get(image, &file, &group);
	return group ? group : "";
}

std::string imageFile(Evas_Object* image)
{
	const char* file = nullptr;
	elm_image_file_get(image, &file, nullptr);
	return file ? file : "";
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

std::string extraOf(app_control_h handle, const char* key)
{
	char* value = nullptr;
	if (app_control_get_extra_data(handle, key, &value) != APP_CONTROL_ERROR_NONE)
		return "<none>";
	std::string out = value ? value : "";
	free(value);
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
		int base = personOf(ids[0]);
		for (size_t i = 1; i < ids.size(); ++i)
			EXPECT_EQ(CONTACTS_ERROR_NONE, contacts_person_link_person(base, personOf(ids[i])));
		return base;
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

TEST_F(PictureAndAccountRowsTest, WithoutPicturesTheDefaultPictureIsShownAndNothingCopies)
{
	CtDetailData* data = load(addSimplePerson("Pia"));
	auto* row = new CtDetailViewMultiImageItem(m_view, data, false);
	Elm_Object_Item* item = show(row);
	EXPECT_EQ(DETAIL_ITEM_MULTI_IMAGE, row->getItemType());
	EXPECT_EQ("detail.multi.image", ScreenHarness::itemStyle(item));
	Evas_Object* layout = content(item, "elm.icon");
	ASSERT_NE(nullptr, layout);
	EXPECT_EQ("layout/detail/contact_image", layoutGroup(layout));
	EXPECT_EQ("contacts_caller_id_default_full.png", imageGroup(elm_object_part_content_get(layout, "elm.swallow.content")));
	EXPECT_EQ("", row->getCopyText());
	EXPECT_EQ(nullptr, row->getPager());

	std::string custom = picture("custom_default.png", 64, 64, 0xFF336699, 0xFF6699CC);
	vconf_set_str(kDefaultImageKey, custom.c_str());
	Elm_Object_Item* second = show(new CtDetailViewMultiImageItem(m_view, data, false));
	EXPECT_EQ(custom, imageFile(elm_object_part_content_get(content(second, "elm.icon"), "elm.swallow.content")));
}

TEST_F(PictureAndAccountRowsTest, OnePictureFillsTheAreaOrSitsSmallInTheLowResolutionLayout)
{
	std::string path = picture("one.png", 640, 480, 0xFF884422, 0xFF224488);
	CtDetailData* data = load(personWithPictures({path}));
	auto* row = new CtDetailViewMultiImageItem(m_view, data, false);
	Elm_Object_Item* item = show(row);
	Evas_Object* layout = content(item, "elm.icon");
	EXPECT_EQ("layout/detail/contact_image", layoutGroup(layout));
	EXPECT_EQ(path, imageFile(elm_object_part_content_get(layout, "elm.swallow.content")));
	EXPECT_EQ(path, row->getCopyText());
	ScreenHarness::selectItem(item);
	ASSERT_EQ(1u, m_view->imagePages.size());
	EXPECT_EQ(0, m_view->imagePages[0]);

	auto* low = new CtDetailViewMultiImageItem(m_view, data, true);
	Elm_Object_Item* lowItem = show(low);
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
	EXPECT_EQ(DETAIL_ITEM_PROFILE_MULTI_IMAGE, row->getItemType());
	Evas_Object* layout = content(item, "elm.icon");
	EXPECT_EQ("layout/multi_image", layoutGroup(layout));
	Evas_Object* pager = row->getPager();
	ASSERT_NE(nullptr, pager);
	EXPECT_EQ(pager, elm_object_part_content_get(layout, "scroller"));
	Evas_Object* box = elm_object_content_get(pager);
	Eina_List* pages = elm_box_children_get(box);
	EXPECT_EQ(3u, eina_list_count(pages));
	eina_list_free(pages);

	Evas_Object* index = elm_object_part_content_get(layout, "controller");
	ASSERT_NE(nullptr, index);
	EXPECT_TRUE(elm_index_horizontal_get(index));
	EXPECT_TRUE(elm_index_autohide_disabled_get(index));
	Elm_Object_Item* first = elm_index_item_find(index, (void*)1);
	ASSERT_NE(nullptr, first);
	EXPECT_NE(nullptr, elm_index_item_find(index, (void*)3));
	EXPECT_EQ(nullptr, elm_index_item_find(index, (void*)4));
	EXPECT_EQ(first, elm_index_selected_item_get(index, 0));

	EXPECT_EQ(paths[0], row->getCopyText());
	elm_scroller_page_show(pager, 2, 0);
	m_screen->pumpUntilIdle();
	EXPECT_EQ(2, row->getCurrentPage());
	EXPECT_EQ(paths[2], row->getCopyText());
	ScreenHarness::selectItem(item);
	ASSERT_EQ(1u, m_view->imagePages.size());
	EXPECT_EQ(2, m_view->imagePages[0]);
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
		for (int slot = 1; slot <= 8; ++slot) {
			Evas_Object* icon = content(item, ("elm.icon." + std::to_string(slot)).c_str());
			EXPECT_EQ(slot <= c.filledSlots, icon != nullptr) << "slot " << slot;
			if (!icon)
				continue;
			if (slot == 8 && c.moreIcon)
				EXPECT_EQ("contacts_ic_linked.png", imageGroup(icon));
			else
				EXPECT_EQ(ctCommonGetAccountIconPathByAddressbookId(0), imageFile(icon));
		}
	}
}

TEST_F(PictureAndAccountRowsTest, BasicInfoRowShowsTheNameAndItsStarTogglesTheFavourite)
{
	contacts_record_h contact = newContact(0, "Ari");
	contacts_record_h nickname = addChild(contact, _contacts_contact.nickname, _contacts_nickname._uri);
	contacts_record_set_str(nickname, _contacts_nickname.name, "Ace");
	contacts_record_h company = addChild(contact, _contacts_contact.company, _contacts_company._uri);
	contacts_record_set_str(company, _contacts_company.name, "Velmora");
	int personId = storePerson(contact);
	CtDetailData* data = load(personId);
	ASSERT_FALSE(data->isFavorite());

	Elm_Object_Item* oneLine = show(new CtDetailViewBasicInfoItem(data, 0));
	EXPECT_EQ("display_name_1line", ScreenHarness::itemStyle(oneLine));
	EXPECT_EQ("", text(oneLine, "sub.name1"));
	auto* row = new CtDetailViewBasicInfoItem(data, 1);
	Elm_Object_Item* item = show(row);
	EXPECT_EQ("display_name_4line", ScreenHarness::itemStyle(item));
	EXPECT_EQ(DETAIL_ITEM_BASIC_INFO, row->getItemType());
	EXPECT_EQ("Ari", text(item, "main.name"));
	std::vector<std::string> subs = {text(item, "sub.name1"), text(item, "sub.name2"), text(item, "sub.name3")};
	EXPECT_NE(subs.end(), std::find(subs.begin(), subs.end(), "Ace"));
	EXPECT_NE(subs.end(), std::find(subs.begin(), subs.end(), "Velmora"));
	EXPECT_NE(nullptr, content(item, "elm.icon.2"));

	std::vector<std::pair<int, int>> signals;
	int listener = CtRegistryMgr::getInstance()->addChangeListener(
			[&](ctRegistryKey key, int value) { signals.push_back({key, value}); });
	Evas_Object* star = row->getFavoriteIcon();
	ASSERT_NE(nullptr, star);
	Evas_Coord x, y, w, h;
	evas_object_geometry_get(star, &x, &y, &w, &h);
	Evas* evas = evas_object_evas_get(star);
	// A tap beside the star is an ordinary row tap.
	evas_event_feed_mouse_move(evas, x - 30, y + h / 2, 0, nullptr);
	evas_event_feed_mouse_down(evas, 1, EVAS_BUTTON_NONE, 0, nullptr);
	evas_event_feed_mouse_up(evas, 1, EVAS_BUTTON_NONE, 0, nullptr);
	EXPECT_FALSE(row->getSkipOnce());
	evas_event_feed_mouse_move(evas, x + w / 2, y + h / 2, 0, nullptr);
	evas_event_feed_mouse_down(evas, 1, EVAS_BUTTON_NONE, 0, nullptr);
	evas_event_feed_mouse_up(evas, 1, EVAS_BUTTON_NONE, 0, nullptr);
	CtRegistryMgr::getInstance()->removeChangeListener(listener);

	EXPECT_TRUE(row->getSkipOnce());
	row->clearSkipOnce();
	EXPECT_FALSE(row->getSkipOnce());
	EXPECT_TRUE(row->isFavorite());
	ASSERT_EQ(1u, signals.size());
	EXPECT_EQ(CT_REGISTRY_KEY_FAVORITE_CHANGED, signals[0].first);
	reopenStore();
	CtDetailData reread(personId);
	EXPECT_TRUE(reread.isFavorite());
}

TEST_F(PictureAndAccountRowsTest, NamelessPersonIsShownAsUnknown)
{
	CtDetailData* data = load(storePerson(newContact(0, nullptr)));
	Elm_Object_Item* item = show(new CtDetailViewBasicInfoItem(data, 0));
	EXPECT_EQ(ContactsCommon::translate("IDS_LOGS_MBODY_UNKNOWN"), text(item, "main.name"));
}

TEST_F(PictureAndAccountRowsTest, SocialProfileOpensInTheSocialAppWithDecodedExtras)
{
	CtDetailViewFacebookItem::SocialProfile own;
	own.appId = FACEBOOK_APP_ID;
	own.operation = APP_CONTROL_OPERATION_VIEW;
	own.uri = "fb://profile/42";
	own.extraData = b64("profile_id") + ":" + b64("42") + "," + b64("source") + ":" + b64("contacts") + ",broken";
	app_control_h handle = CtDetailViewFacebookItem::createLaunchRequest(own);
	ASSERT_NE(nullptr, handle);
	EXPECT_EQ("42", extraOf(handle, "profile_id"));
	EXPECT_EQ("contacts", extraOf(handle, "source"));
	EXPECT_EQ("<none>", extraOf(handle, "fb.appcontrol.launch.type"));
	char* uri = nullptr;
	app_control_get_uri(handle, &uri);
	EXPECT_STREQ("fb://profile/42", uri);
	free(uri);
	app_control_destroy(handle);

	CtDetailViewFacebookItem::SocialProfile other;
	other.appId = "org.example.other";
	other.uri = "https://social.example/ari";
	handle = CtDetailViewFacebookItem::createLaunchRequest(other);
	ASSERT_NE(nullptr, handle);
	char* app = nullptr;
	app_control_get_app_id(handle, &app);
	EXPECT_STREQ(FACEBOOK_APP_ID, app);
	free(app);
	EXPECT_EQ("launch_url", extraOf(handle, "fb.appcontrol.launch.type"));
	EXPECT_EQ("https://social.example/ari", extraOf(handle, "fb.appcontrol.launch.info"));
	app_control_destroy(handle);

	CtDetailData* bare = load(addSimplePerson("Ari"));
	auto* row = new CtDetailViewFacebookItem(bare);
	Elm_Object_Item* item = show(row);
	EXPECT_EQ(DETAIL_ITEM_FACEBOOK, row->getItemType());
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_MBODY_VIEW_FACEBOOK_PROFILE"), text(item, "elm.text.main.left"));
	ScreenHarness::selectItem(item);
	EXPECT_TRUE(m_launches->launches().empty()) << "a contact without a profile opens nothing";

	contacts_record_h contact = newContact(0, "Bea");
	contacts_record_h profile = nullptr;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_create(_contacts_profile._uri, &profile));
	contacts_record_set_str(profile, _contacts_profile.app_id, FACEBOOK_APP_ID);
	contacts_record_set_str(profile, _contacts_profile.service_operation, APP_CONTROL_OPERATION_VIEW);
	contacts_record_set_str(profile, _contacts_profile.uri, "fb://profile/7");
	contacts_record_set_str(profile, _contacts_profile.extra_data, (b64("profile_id") + ":" + b64("7")).c_str());
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_record_add_child_record(contact, _contacts_contact.profile, profile));
	Elm_Object_Item* stored = show(new CtDetailViewFacebookItem(load(storePerson(contact))));
	ScreenHarness::selectItem(stored);
	auto launches = m_launches->launches();
	ASSERT_EQ(1u, launches.size());
	EXPECT_EQ(FACEBOOK_APP_ID, launches[0].appId);
	EXPECT_EQ("fb://profile/7", launches[0].uri);
	EXPECT_EQ("7", launches[0].extra("profile_id"));
}

TEST_F(PictureAndAccountRowsTest, ProfileSharingRowTellsTheSharingState)
{
	CtDetailData* data = load(addSimplePerson("Me"));
	preference_set_boolean(CT_PREF_PROFILE_SHARING_STATUS, false);
	Elm_Object_Item* off = show(new CtDetailViewProfileSharingItem(data));
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_MBODY_PROFILE_SHARING"), text(off, "elm.text.sub.left.top"));
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_BODY_OFF_M_NOT_USED"), text(off, "elm.text.main.left.bottom"));
	preference_set_boolean(CT_PREF_PROFILE_SHARING_STATUS, true);
	preference_set_int(CT_PREF_PROFILE_TYPE, 1);
	Elm_Object_Item* business = show(new CtDetailViewProfileSharingItem(data));
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_HEADER_BUSINESS_PROFILE_ABB"), text(business, "elm.text.main.left.bottom"));
	preference_set_int(CT_PREF_PROFILE_TYPE, 0);
	Elm_Object_Item* personal = show(new CtDetailViewProfileSharingItem(data));
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_HEADER_PERSONAL_PROFILE_ABB"), text(personal, "elm.text.main.left.bottom"));
	preference_set_boolean(CT_PREF_PROFILE_SHARING_STATUS, false);
}
