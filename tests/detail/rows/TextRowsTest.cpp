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

using namespace ct::test;

namespace {

contacts_record_h nth(Eina_List* list, int index)
{
	return static_cast<contacts_record_h>(eina_list_nth(list, index));
}

std::string tr(const char* id)
{
	return ContactsCommon::translate(id);
}

// The "ct_icon" colour of the image inside an icon layout's part.
bool iconColor(Evas_Object* layout, const char* part, int* r, int* g, int* b, int* a)
{
	Evas_Object* button = layout ? elm_object_part_content_get(layout, part) : nullptr;
	Evas_Object* image = button ? elm_object_content_get(button) : nullptr;
	Evas_Object* edje = image ? elm_image_object_get(image) : nullptr;
	int r2, g2, b2, a2, r3, g3, b3, a3;
	return edje && edje_object_color_class_get(edje, "ct_icon", r, g, b, a, &r2, &g2, &b2, &a2, &r3, &g3, &b3, &a3);
}

class TextRowsTest : public RowTest {
protected:
	void addEvent(contacts_record_h contact, int date, int type, int calendar)
	{
		contacts_record_h event = addChild(contact, _contacts_contact.event, _contacts_event._uri);
		contacts_record_set_int(event, _contacts_event.date, date);
		contacts_record_set_int(event, _contacts_event.type, type);
		contacts_record_set_int(event, _contacts_event.calendar_type, calendar);
	}
};

} // namespace

TEST_F(TextRowsTest, EmailRowComposesWithAReplyRequestAndLogsUse)
{
	contacts_record_h contact = newContact(0, "Ari");
	addEmail(contact, "ari@example.com");
	CtDetailData* data = load(storePerson(contact));
	auto* row = new CtDetailViewEmailItem(data, nth(data->getEmailList(), 0), false);
	Elm_Object_Item* item = show(row);

	EXPECT_EQ(DETAIL_ITEM_EMAIL, row->getItemType());
	EXPECT_EQ(tr("IDS_PB_OPT_HOME_ABB2"), text(item, "elm.text.sub.left.top"));
	EXPECT_EQ("ari@example.com", text(item, "elm.text.main.left.bottom"));
	EXPECT_EQ("ari@example.com", row->getCopyText());
	EXPECT_FALSE(elm_object_item_disabled_get(item));

	tapIcon(content(item, "elm.icon.2"), "touch.icon");
	auto launches = m_launches->launches();
	ASSERT_EQ(1u, launches.size());
	EXPECT_EQ(APP_CONTROL_OPERATION_COMPOSE, launches[0].operation);
	EXPECT_EQ("mailto:ari@example.com", launches[0].uri);
	EXPECT_EQ("true", launches[0].extra(RETURN_RESULT_DATA_KEY));
	EXPECT_EQ(APP_CONTROL_LAUNCH_MODE_GROUP, launches[0].launchMode);
	ASSERT_EQ(1u, usageRecords("CT0E").size());
	EXPECT_EQ("", usageRecords("CT0E")[0].extra);
}

TEST_F(TextRowsTest, PowerSavingDisablesEmailRowsWithTheDisabledIconColour)
{
	contacts_record_h contact = newContact(0, "Ari");
	addEmail(contact, "ari@example.com");
	CtDetailData* data = load(storePerson(contact));
	Elm_Object_Item* item = show(new CtDetailViewEmailItem(data, nth(data->getEmailList(), 0), true));
	EXPECT_TRUE(elm_object_item_disabled_get(item));

	int r, g, b, a, er, eg, eb, ea;
	ASSERT_TRUE(iconColor(content(item, "elm.icon.2"), "elm.icon", &r, &g, &b, &a));
	std::string disabled = CtDetailViewGenlistItem::getIconColorCode() + "D";
	ASSERT_TRUE(ctCommonGetThemeColor(disabled.c_str(), &er, &eg, &eb, &ea));
	EXPECT_EQ(ea, a);
	EXPECT_LT(a, 255);

	auto* row = static_cast<CtDetailViewEmailItem*>(elm_object_item_data_get(item));
	row->compose();
	EXPECT_TRUE(m_launches->launches().empty());
	EXPECT_TRUE(usageRecords("CT0E").empty());
}

TEST_F(TextRowsTest, IconTurnsToThePressedColourWhileHeld)
{
	contacts_record_h contact = newContact(0, "Ari");
	addEmail(contact, "ari@example.com");
	CtDetailData* data = load(storePerson(contact));
	Elm_Object_Item* item = show(new CtDetailViewEmailItem(data, nth(data->getEmailList(), 0), false));
	Evas_Object* layout = content(item, "elm.icon.2");
	int r, g, b, a, pr, pg, pb, pa;
	std::string code = CtDetailViewGenlistItem::getIconColorCode();
	tapIcon(layout, "touch.icon", "mouse,down,1");
	ASSERT_TRUE(iconColor(layout, "elm.icon", &r, &g, &b, &a));
	ASSERT_TRUE(ctCommonGetThemeColor((code + "P").c_str(), &pr, &pg, &pb, &pa));
	EXPECT_EQ(pr, r);
	tapIcon(layout, "touch.icon", "mouse,up,1");
	ASSERT_TRUE(iconColor(layout, "elm.icon", &r, &g, &b, &a));
	ASSERT_TRUE(ctCommonGetThemeColor(code.c_str(), &pr, &pg, &pb, &pa));
	EXPECT_EQ(pr, r);
	EXPECT_TRUE(m_launches->launches().empty());
}

TEST_F(TextRowsTest, WithoutAnEmailApplicationNothingIsComposed)
{
	contacts_record_h contact = newContact(0, "Ari");
	addEmail(contact, "ari@example.com");
	CtDetailData* data = load(storePerson(contact));
	delete m_launches;
	m_launches = nullptr;
	auto* row = new CtDetailViewEmailItem(data, nth(data->getEmailList(), 0), false);
	m_launches = new LaunchRecorder();
	show(row);
	row->compose();
	EXPECT_TRUE(m_launches->launches().empty());
}

TEST_F(TextRowsTest, AddressRowWrapsTheAddressAndAsksItsOwnerForTheMap)
{
	contacts_record_h contact = newContact(0, "Ari");
	contacts_record_h address = addChild(contact, _contacts_contact.address, _contacts_address._uri);
	contacts_record_set_int(address, _contacts_address.type, CONTACTS_ADDRESS_TYPE_HOME);
	contacts_record_set_str(address, _contacts_address.street, "12 Harbour Road");
	contacts_record_set_str(address, _contacts_address.locality, "Portsmouth");
	CtDetailData* data = load(storePerson(contact));
	contacts_record_h record = nth(data->getAddressList(), 0);
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
	ASSERT_EQ(2u, m_view->addresses.size());
	EXPECT_EQ(record, m_view->addresses[0]);

	Elm_Object_Item* saving = show(new CtDetailViewAddressItem(m_view, data, record, true));
	EXPECT_TRUE(elm_object_item_disabled_get(saving));
	tapIcon(content(saving, "elm.icon.right"), "touch.icon");
	EXPECT_EQ(2u, m_view->addresses.size());
}

TEST_F(TextRowsTest, WebsiteRowOpensTheUrlAddingHttpOnlyWhenMissing)
{
	contacts_record_h contact = newContact(0, "Ari");
	for (const char* url : {"example.org/ari", "https://secure.example.org"}) {
		contacts_record_h child = addChild(contact, _contacts_contact.url, _contacts_url._uri);
		contacts_record_set_str(child, _contacts_url.url, url);
	}
	CtDetailData* data = load(storePerson(contact));
	ASSERT_EQ(2u, eina_list_count(data->getUrlList()));
	Elm_Object_Item* plain = show(new CtDetailViewWebsiteItem(data, nth(data->getUrlList(), 0)));
	Elm_Object_Item* secure = show(new CtDetailViewWebsiteItem(data, nth(data->getUrlList(), 1)));
	EXPECT_EQ(tr("IDS_PB_OPT_WEB_ADDRESS_ABB"), text(plain, "elm.text.sub.left.top"));
	EXPECT_EQ("example.org/ari", text(plain, "elm.text.main.left.bottom"));

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
	contacts_record_h contact = newContact(0, "Ari");
	addEvent(contact, 19900315, CONTACTS_EVENT_TYPE_BIRTH, 0);
	addEvent(contact, 1224, CONTACTS_EVENT_TYPE_ANNIVERSARY, 0);
	addEvent(contact, 18000101, CONTACTS_EVENT_TYPE_OTHER, 0);
	addEvent(contact, 20010815, CONTACTS_EVENT_TYPE_OTHER, 1);
	addEvent(contact, 20011315, CONTACTS_EVENT_TYPE_OTHER, 0);
	CtDetailData* data = load(storePerson(contact));
	ASSERT_EQ(5u, eina_list_count(data->getEventList()));
	std::vector<Elm_Object_Item*> items;
	std::vector<int> dates;
	for (int i = 0; i < 5; ++i) {
		items.push_back(show(new CtDetailViewEventItem(data, nth(data->getEventList(), i))));
		dates.push_back(data->getEvent(nth(data->getEventList(), i)));
	}
	auto rowOf = [&](int date) {
		for (size_t i = 0; i < dates.size(); ++i)
			if (dates[i] == date)
				return items[i];
		return (Elm_Object_Item*)nullptr;
	};
	auto value = [&](int date) { return text(rowOf(date), "elm.text.main.left.bottom"); };

	EXPECT_EQ(tr("IDS_PB_OPT_BIRTHDAY"), text(rowOf(19900315), "elm.text.sub.left.top"));
	EXPECT_EQ(CtCommonGetDatetimeStr(data->getTimeFormatter(), 1990, 3, 15), value(19900315));
	EXPECT_NE(std::string::npos, value(19900315).find("1990"));
	EXPECT_EQ(CtCommonGetDatetimeStr(data->getTimeFormatterWithoutYear(), 0, 12, 24), value(1224));
	EXPECT_EQ(std::string::npos, value(1224).find("0000"));
	EXPECT_EQ(CtCommonGetDatetimeStr(data->getTimeFormatter(), 1902, 1, 1), value(18000101));
	EXPECT_EQ(CtCommonGetDatetimeStr(data->getTimeFormatter(), 2001, 8, 15) + "(" + tr("IDS_PB_SBODY_LUNAR_M_STATUS") + ")",
			value(20010815));

	ct::log::clear();
	auto* bad = static_cast<CtDetailViewEventItem*>(elm_object_item_data_get(rowOf(20011315)));
	EXPECT_EQ("", bad->getCopyText());
	EXPECT_TRUE(ct::log::contains("* Critical * Invalid date(mon=13,day=15)"));
	auto* good = static_cast<CtDetailViewEventItem*>(elm_object_item_data_get(rowOf(19900315)));
	EXPECT_EQ(CtCommonGetDatetimeStr(data->getTimeFormatter(), 1990, 3, 15), good->getCopyText());
}

TEST_F(TextRowsTest, MessengerRelationAndNoteRowsShowTheirValuesAndOnlyClearTheSelection)
{
	contacts_record_h contact = newContact(0, "Ari");
	contacts_record_h im = addChild(contact, _contacts_contact.messenger, _contacts_messenger._uri);
	contacts_record_set_int(im, _contacts_messenger.type, CONTACTS_MESSENGER_TYPE_CUSTOM);
	contacts_record_set_str(im, _contacts_messenger.label, "Chatter");
	contacts_record_set_str(im, _contacts_messenger.im_id, "ari_42");
	contacts_record_h relation = addChild(contact, _contacts_contact.relationship, _contacts_relationship._uri);
	contacts_record_set_int(relation, _contacts_relationship.type, CONTACTS_RELATIONSHIP_TYPE_SISTER);
	contacts_record_set_str(relation, _contacts_relationship.name, "Bo");
	contacts_record_h note = addChild(contact, _contacts_contact.note, _contacts_note._uri);
	contacts_record_set_str(note, _contacts_note.note, "Line one\nLine two & more");
	CtDetailData* data = load(storePerson(contact));

	Elm_Object_Item* imItem = show(new CtDetailViewMessengerItem(data, nth(data->getMessengerList(), 0)));
	Elm_Object_Item* relItem = show(new CtDetailViewRelationItem(data, nth(data->getRelationshipList(), 0)));
	auto* noteRow = new CtDetailViewNoteItem(data, nth(data->getNoteList(), 0));
	Elm_Object_Item* noteItem = show(noteRow);

	EXPECT_EQ("Chatter", text(imItem, "elm.text.sub.left.top"));
	EXPECT_EQ("ari_42", text(imItem, "elm.text.main.left.bottom"));
	EXPECT_EQ(tr("IDS_PB_OPT_SISTER"), text(relItem, "elm.text.sub.left.top"));
	EXPECT_EQ("Bo", text(relItem, "elm.text.main.left.bottom"));
	EXPECT_EQ("detail/multiline_main.sub", ScreenHarness::itemStyle(noteItem));
	EXPECT_EQ(tr("IDS_PB_BUTTON_NOTES"), text(noteItem, "elm.text.sub"));
	EXPECT_EQ("Line one<br/>Line two &amp; more", text(noteItem, "elm.text.multiline"));
	EXPECT_EQ("Line one\nLine two & more", noteRow->getCopyText());

	for (Elm_Object_Item* item : {imItem, relItem, noteItem}) {
		ScreenHarness::selectItem(item);
		EXPECT_FALSE(elm_genlist_item_selected_get(item));
	}
	EXPECT_TRUE(m_launches->launches().empty());
}

TEST_F(TextRowsTest, RingtoneGroupsAndStatusRowsCannotBeSelected)
{
	int personId = addSimplePerson("Ari");
	CtDetailData* data = load(personId);
	auto* ringtone = new CtDetailViewRingtoneItem(data);
	Elm_Object_Item* ringtoneItem = show(ringtone);
	Elm_Object_Item* groupsItem = show(new CtDetailViewGroupsItem(data));
	Elm_Object_Item* statusItem = show(new CtDetailViewStatusItem(data));

	EXPECT_EQ(tr("IDS_PB_OPT_RINGTONE"), text(ringtoneItem, "elm.text.sub.left.top"));
	EXPECT_EQ(tr("IDS_PB_BODY_DEFAULT"), text(ringtoneItem, "elm.text.main.left.bottom"));
	EXPECT_EQ(tr("IDS_PB_BODY_GROUPS"), text(groupsItem, "elm.text.sub.left.top"));
	EXPECT_EQ(data->getGroupNames(), text(groupsItem, "elm.text.main.left.bottom"));
	EXPECT_EQ(tr("IDS_PB_MBODY_STATUS"), text(statusItem, "elm.text.sub.left.top"));
	for (Elm_Object_Item* item : {ringtoneItem, groupsItem, statusItem}) {
		EXPECT_EQ(ELM_OBJECT_SELECT_MODE_NONE, elm_genlist_item_select_mode_get(item));
		EXPECT_EQ("", static_cast<CtDetailViewGenlistItem*>(elm_object_item_data_get(item))->getCopyText());
	}
	EXPECT_EQ(DETAIL_ITEM_RINGTONE, ringtone->getItemType());
}

TEST_F(TextRowsTest, RingtoneRowShowsTheFileNameWithoutFolderOrExtension)
{
	std::string tone = m_dir.path() + "/Over the Horizon.ogg";
	FILE* f = fopen(tone.c_str(), "w");
	ASSERT_NE(nullptr, f);
	fputs("tone", f);
	fclose(f);
	int personId = addSimplePerson("Ari");
	{
		CtDetailData writer(personId);
		writer.setRingtone(tone.c_str());
	}
	CtDetailData* data = load(personId);
	Elm_Object_Item* item = show(new CtDetailViewRingtoneItem(data));
	EXPECT_EQ("Over the Horizon", text(item, "elm.text.main.left.bottom"));
}
