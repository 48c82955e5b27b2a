#include "RowTestSupport.h"

#include "CtCommonRecordUtil.h"
#include "CtCommonWidgetUtil.h"
#include "CtDetailViewAddressItem.h"
#include "CtDetailViewEmailItem.h"
#include "CtDetailViewEventItem.h"
#include "CtDetailViewGroupsItem.h"
#include "CtDetailViewMessengerItem.h"
#include "CtDetailViewNoteItem.h"
#include "CtDetailViewRelationItem.h"
#include "CtDetailViewRingtoneItem.h"
#include "CtDetailViewStatusItem.h"
#include "CtDetailViewWebsiteItem.h"
#include "LogSink.h"

#include <Edje.h>

#include <array>
#include <fstream>

using namespace ct::test;

namespace {

using Strings = std::vector<std::string>;
using Rgba = std::array<int, 4>;

std::string tr(const char* id)
{
	return ContactsCommon::translate(id);
}

// The "ct_icon" colour of the image inside an icon layout's "elm.icon".
Rgba iconColor(Evas_Object* layout)
{
	Evas_Object* button = layout ? elm_object_part_content_get(layout, "elm.icon") : nullptr;
	Evas_Object* image = button ? elm_object_content_get(button) : nullptr;
	Evas_Object* edje = image ? elm_image_object_get(image) : nullptr;
	Rgba c = {-1, -1, -1, -1};
	int ignored[8];
	EXPECT_TRUE(edje && edje_object_color_class_get(edje, "ct_icon", &c[0], &c[1], &c[2], &c[3], &ignored[0],
			&ignored[1], &ignored[2], &ignored[3], &ignored[4], &ignored[5], &ignored[6], &ignored[7]));
	return c;
}

Rgba themeColor(const std::string& code)
{
	Rgba c = {-1, -1, -1, -1};
	EXPECT_TRUE(ctCommonGetThemeColor(code.c_str(), &c[0], &c[1], &c[2], &c[3]));
	return c;
}

using TextRowsTest = RowTest;

} // namespace

TEST_F(TextRowsTest, EmailRowComposesWithAReplyRequestUnlessPowerSavingOrNoEmailApplication)
{
	contacts_record_h contact = newContact(0, "Ari");
	addEmail(contact, "ari@example.com");
	CtDetailData* data = load(storePerson(contact));
	contacts_record_h email = nth(data->getEmailList());
	auto* row = new CtDetailViewEmailItem(data, email, false);
	Elm_Object_Item* item = show(row);
	EXPECT_EQ((Strings{tr("IDS_PB_OPT_HOME_ABB2"), "ari@example.com"}), labelAndValue(item));
	EXPECT_EQ("ari@example.com", row->getCopyText());
	EXPECT_FALSE(elm_object_item_disabled_get(item));

	// A held icon takes the pressed colour; letting go without a click composes nothing.
	Evas_Object* icon = content(item, "elm.icon.2");
	std::string code = CtDetailViewGenlistItem::getIconColorCode();
	tapIcon(icon, "touch.icon", "mouse,down,1");
	EXPECT_EQ(themeColor(code + "P")[0], iconColor(icon)[0]);
	tapIcon(icon, "touch.icon", "mouse,up,1");
	EXPECT_EQ(themeColor(code)[0], iconColor(icon)[0]);
	EXPECT_TRUE(m_launches->launches().empty());

	tapIcon(icon, "touch.icon");
	auto launches = m_launches->launches();
	ASSERT_EQ(1u, launches.size());
	EXPECT_EQ((Strings{APP_CONTROL_OPERATION_COMPOSE, "mailto:ari@example.com", "true"}),
			(Strings{launches[0].operation, launches[0].uri, launches[0].extra(RETURN_RESULT_DATA_KEY)}));
	EXPECT_EQ(APP_CONTROL_LAUNCH_MODE_GROUP, launches[0].launchMode);
	ASSERT_EQ(1u, usageRecords("CT0E").size());
	EXPECT_EQ("", usageRecords("CT0E")[0].extra);
	m_launches->clear();

	Elm_Object_Item* saving = show(new CtDetailViewEmailItem(data, email, true));
	EXPECT_TRUE(elm_object_item_disabled_get(saving));
	int alpha = iconColor(content(saving, "elm.icon.2"))[3];
	EXPECT_EQ(themeColor(code + "D")[3], alpha);
	EXPECT_LT(alpha, 255);
	static_cast<CtDetailViewEmailItem*>(rowOf(saving))->compose();

	// A row made while no application handles e-mail composes nothing later.
	delete m_launches;
	m_launches = nullptr;
	auto* orphan = new CtDetailViewEmailItem(data, email, false);
	m_launches = new LaunchRecorder();
	show(orphan);
	orphan->compose();
	EXPECT_TRUE(m_launches->launches().empty());
	EXPECT_EQ(1u, usageRecords("CT0E").size());
}

TEST_F(TextRowsTest, AddressRowWrapsTheAddressAndAsksItsOwnerForTheMap)
{
	contacts_record_h contact = newContact(0, "Ari");
	contacts_record_h address = addText(contact, _contacts_contact.address, _contacts_address._uri, _contacts_address.street, "12 Harbour Road");
	contacts_record_set_int(address, _contacts_address.type, CONTACTS_ADDRESS_TYPE_HOME);
	contacts_record_set_str(address, _contacts_address.locality, "Portsmouth");
	CtDetailData* data = load(storePerson(contact));
	contacts_record_h record = nth(data->getAddressList());
	auto* row = new CtDetailViewAddressItem(m_view, data, record, false);
	Elm_Object_Item* item = show(row);

	char expected[1024] = {0};
	data->getAddress(record, expected, sizeof(expected));
	EXPECT_EQ("detail/multiline_main.sub.1icon.2", ScreenHarness::itemStyle(item));
	EXPECT_EQ(tr("IDS_PB_OPT_HOME_ABB2"), text(item, "elm.text.main"));
	EXPECT_NE(std::string::npos, text(item, "elm.text.multiline").find("12 Harbour Road"));
	EXPECT_EQ(expected, row->getCopyText());
	tapIcon(content(item, "elm.icon.right"), "touch.icon");
	ScreenHarness::selectItem(item);
	EXPECT_EQ((std::vector<contacts_record_h>{record, record}), m_view->addresses);

	Elm_Object_Item* saving = show(new CtDetailViewAddressItem(m_view, data, record, true));
	tapIcon(content(saving, "elm.icon.right"), "touch.icon");
	EXPECT_EQ(2u, m_view->addresses.size());
}

TEST_F(TextRowsTest, WebsiteRowOpensTheUrlAddingHttpOnlyWhenMissing)
{
	contacts_record_h contact = newContact(0, "Ari");
	for (const char* url : {"example.org/ari", "https://secure.example.org"})
		addText(contact, _contacts_contact.url, _contacts_url._uri, _contacts_url.url, url);
	CtDetailData* data = load(storePerson(contact));
	ASSERT_EQ(2u, eina_list_count(data->getUrlList()));
	Elm_Object_Item* plain = show(new CtDetailViewWebsiteItem(data, nth(data->getUrlList(), 0)));
	Elm_Object_Item* secure = show(new CtDetailViewWebsiteItem(data, nth(data->getUrlList(), 1)));
	EXPECT_EQ((Strings{tr("IDS_PB_OPT_WEB_ADDRESS_ABB"), "example.org/ari"}), labelAndValue(plain));

	ScreenHarness::selectItem(plain);
	tapIcon(content(secure, "elm.icon.2"), "touch.icon");
	auto launches = m_launches->launches();
	ASSERT_EQ(2u, launches.size());
	EXPECT_EQ(APP_CONTROL_OPERATION_VIEW, launches[0].operation);
	EXPECT_EQ("http://example.org/ari", launches[0].uri);
	EXPECT_EQ(APP_CONTROL_LAUNCH_MODE_GROUP, launches[0].launchMode);
	EXPECT_EQ("https://secure.example.org", launches[1].uri);
}

TEST_F(TextRowsTest, EventRowsFormatDatesWithAndWithoutYearAndMarkLunarDates)
{
	struct Event {
		int date, type, calendar;
	};
	const Event events[] = {{19900315, CONTACTS_EVENT_TYPE_BIRTH, 0}, {1224, CONTACTS_EVENT_TYPE_ANNIVERSARY, 0},
		{18000101, CONTACTS_EVENT_TYPE_OTHER, 0}, {20010815, CONTACTS_EVENT_TYPE_OTHER, 1},
		{20011315, CONTACTS_EVENT_TYPE_OTHER, 0}};
	contacts_record_h contact = newContact(0, "Ari");
	for (const Event& e : events) {
		contacts_record_h event = addChild(contact, _contacts_contact.event, _contacts_event._uri);
		contacts_record_set_int(event, _contacts_event.date, e.date);
		contacts_record_set_int(event, _contacts_event.type, e.type);
		contacts_record_set_int(event, _contacts_event.calendar_type, e.calendar);
	}
	CtDetailData* data = load(storePerson(contact));
	std::map<int, Elm_Object_Item*> rows;
	for (Eina_List* l = data->getEventList(); l; l = eina_list_next(l)) {
		auto* event = static_cast<contacts_record_h>(eina_list_data_get(l));
		rows[data->getEvent(event)] = show(new CtDetailViewEventItem(data, event));
	}
	ASSERT_EQ(5u, rows.size());
	auto full = [data](int y, int m, int d) { return CtCommonGetDatetimeStr(data->getTimeFormatter(), y, m, d); };
	const std::map<int, std::string> expected = {{19900315, full(1990, 3, 15)},
		{1224, CtCommonGetDatetimeStr(data->getTimeFormatterWithoutYear(), 0, 12, 24)},
		{18000101, full(1902, 1, 1)},
		{20010815, full(2001, 8, 15) + "(" + tr("IDS_PB_SBODY_LUNAR_M_STATUS") + ")"}};
	for (const auto& [date, value] : expected)
		EXPECT_EQ(value, text(rows[date], "elm.text.main.left.bottom")) << date;
	EXPECT_EQ(tr("IDS_PB_OPT_BIRTHDAY"), text(rows[19900315], "elm.text.sub.left.top"));

	ct::log::clear();
	EXPECT_EQ("", rowOf(rows[20011315])->getCopyText());
	EXPECT_TRUE(ct::log::contains("* Critical * Invalid date(mon=13,day=15)"));
	EXPECT_EQ(expected.at(19900315), rowOf(rows[19900315])->getCopyText());
}

TEST_F(TextRowsTest, MessengerRelationAndNoteRowsShowTheirValuesAndOnlyClearTheSelection)
{
	contacts_record_h contact = newContact(0, "Ari");
	contacts_record_h im = addText(contact, _contacts_contact.messenger, _contacts_messenger._uri, _contacts_messenger.im_id, "ari_42");
	contacts_record_set_int(im, _contacts_messenger.type, CONTACTS_MESSENGER_TYPE_CUSTOM);
	contacts_record_set_str(im, _contacts_messenger.label, "Chatter");
	contacts_record_set_int(addText(contact, _contacts_contact.relationship, _contacts_relationship._uri,
		_contacts_relationship.name, "Bo"), _contacts_relationship.type, CONTACTS_RELATIONSHIP_TYPE_SISTER);
	addText(contact, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, "Line one\nLine two & more");
	CtDetailData* data = load(storePerson(contact));

	Elm_Object_Item* imItem = show(new CtDetailViewMessengerItem(data, nth(data->getMessengerList())));
	Elm_Object_Item* relItem = show(new CtDetailViewRelationItem(data, nth(data->getRelationshipList())));
	Elm_Object_Item* noteItem = show(new CtDetailViewNoteItem(data, nth(data->getNoteList())));
	EXPECT_EQ((Strings{"Chatter", "ari_42"}), labelAndValue(imItem));
	EXPECT_EQ((Strings{tr("IDS_PB_OPT_SISTER"), "Bo"}), labelAndValue(relItem));
	EXPECT_EQ((Strings{"detail/multiline_main.sub", tr("IDS_PB_BUTTON_NOTES"), "Line one<br/>Line two &amp; more",
				  "Line one\nLine two & more"}),
			(Strings{ScreenHarness::itemStyle(noteItem), text(noteItem, "elm.text.sub"),
				text(noteItem, "elm.text.multiline"), rowOf(noteItem)->getCopyText()}));

	for (Elm_Object_Item* item : {imItem, relItem, noteItem}) {
		ScreenHarness::selectItem(item);
		EXPECT_FALSE(elm_genlist_item_selected_get(item));
	}
	EXPECT_TRUE(m_launches->launches().empty());
}

TEST_F(TextRowsTest, RingtoneGroupsAndStatusRowsCannotBeSelectedAndTheRingtoneShowsItsFileName)
{
	contacts_record_h contact = newContact(0, "Ari");
	for (const char* group : {"Book club", "Tennis & Co"}) {
		contacts_record_h relation = addChild(contact, _contacts_contact.group_relation, _contacts_group_relation._uri);
		contacts_record_set_int(relation, _contacts_group_relation.group_id, addGroup(0, group));
	}
	int personId = storePerson(contact);
	CtDetailData* data = load(personId);
	Elm_Object_Item* ringtoneItem = show(new CtDetailViewRingtoneItem(data));
	Elm_Object_Item* groupsItem = show(new CtDetailViewGroupsItem(data));
	Elm_Object_Item* statusItem = show(new CtDetailViewStatusItem(data));
	EXPECT_EQ((Strings{tr("IDS_PB_OPT_RINGTONE"), tr("IDS_PB_BODY_DEFAULT")}), labelAndValue(ringtoneItem));
	EXPECT_EQ((Strings{tr("IDS_PB_BODY_GROUPS"), "Book club, Tennis &amp; Co"}), labelAndValue(groupsItem));
	EXPECT_EQ(tr("IDS_PB_MBODY_STATUS"), text(statusItem, "elm.text.sub.left.top"));
	for (Elm_Object_Item* item : {ringtoneItem, groupsItem, statusItem}) {
		EXPECT_EQ(ELM_OBJECT_SELECT_MODE_NONE, elm_genlist_item_select_mode_get(item));
		EXPECT_EQ("", rowOf(item)->getCopyText());
	}

	std::string tone = m_dir.path() + "/Over the Horizon.ogg";
	std::ofstream(tone) << "tone";
	CtDetailData(personId).setRingtone(tone.c_str());
	Elm_Object_Item* item = show(new CtDetailViewRingtoneItem(load(personId)));
	EXPECT_EQ("Over the Horizon", text(item, "elm.text.main.left.bottom"));
}
