#include "RowTestSupport.h"

#include "CtCommonWidgetUtil.h"
#include "CtDetailViewNumberItem.h"
#include "CtDetailViewVideoCallItem.h"

using namespace ct::test;

namespace {

class NumberRowTest : public RowTest {
protected:
	// A person with one cell number; returns the row's data and record.
	CtDetailData* personWithNumber(const char* number, int* personId = nullptr)
	{
		contacts_record_h contact = newContact(0, "Mina");
		addNumber(contact, number, CONTACTS_NUMBER_TYPE_CELL);
		int id = storePerson(contact);
		if (personId)
			*personId = id;
		CtDetailData* data = load(id);
		EXPECT_EQ(1u, eina_list_count(data->getNumberList()));
		return data;
	}
	contacts_record_h firstNumber(CtDetailData* data)
	{
		return static_cast<contacts_record_h>(eina_list_nth(data->getNumberList(), 0));
	}
};

} // namespace

TEST_F(NumberRowTest, ShowsTypeAndNumberWithCallAndMessageButtons)
{
	CtDetailData* data = personWithNumber("010-2345-6789");
	auto* row = new CtDetailViewNumberItem(data, firstNumber(data), false, false);
	Elm_Object_Item* item = show(row);

	EXPECT_EQ(DETAIL_ITEM_NUMBER, row->getItemType());
	EXPECT_EQ("detail/2line.bottom", ScreenHarness::itemStyle(item));
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_OPT_MOBILE"), text(item, "elm.text.sub.left.top"));
	EXPECT_EQ("010-2345-6789", text(item, "elm.text.main.left.bottom"));
	EXPECT_EQ("010-2345-6789", row->getCopyText());
	EXPECT_EQ(nullptr, content(item, "elm.icon.left.bottom"));

	Evas_Object* icons = content(item, "elm.icon.2");
	ASSERT_NE(nullptr, icons);
	Evas_Object* call = elm_object_part_content_get(icons, "elm.icon1");
	Evas_Object* message = elm_object_part_content_get(icons, "elm.icon3");
	ASSERT_NE(nullptr, call);
	ASSERT_NE(nullptr, message);
	EXPECT_NE(nullptr, elm_object_content_get(call));
	EXPECT_NE(nullptr, elm_object_content_get(message));
	EXPECT_NE(nullptr, content(item, "copy.text.area"));
}

TEST_F(NumberRowTest, CallSendsTheNumberWithThePersonIndexAndLogsUse)
{
	int personId = 0;
	CtDetailData* data = personWithNumber("+82 10 1111 2222", &personId);
	auto* row = new CtDetailViewNumberItem(data, firstNumber(data), false, false);
	Elm_Object_Item* item = show(row);

	tapIcon(content(item, "elm.icon.2"), "touch.call");
	auto launches = m_launches->launches();
	ASSERT_EQ(1u, launches.size());
	EXPECT_EQ(APP_CONTROL_OPERATION_CALL, launches[0].operation);
	EXPECT_EQ("tel:+82 10 1111 2222", launches[0].uri);
	EXPECT_EQ(std::to_string(personId), launches[0].extra("ctindex"));
	EXPECT_FALSE(launches[0].replyRequested);

	ScreenHarness::selectItem(item);
	EXPECT_EQ(2u, m_launches->launches().size());
	EXPECT_FALSE(elm_genlist_item_selected_get(item));

	auto usage = usageRecords("PH01");
	ASSERT_EQ(2u, usage.size());
	EXPECT_EQ(CONTACTS_APP_ID, usage[0].appId);
	EXPECT_EQ("Contacts_detail", usage[0].extra);
}

TEST_F(NumberRowTest, MessageIconComposesToTheNumberAndTheSameTapDoesNotCall)
{
	CtDetailData* data = personWithNumber("5550100");
	contacts_record_h number = firstNumber(data);
	int numberId = 0;
	contacts_record_get_int(number, _contacts_number.id, &numberId);
	auto* row = new CtDetailViewNumberItem(data, number, false, false);
	Elm_Object_Item* item = show(row);

	tapIcon(content(item, "elm.icon.2"), "touch.message");
	// The tap reaches the row too, as on the device.
	ScreenHarness::selectItem(item);
	auto launches = m_launches->launches();
	ASSERT_EQ(1u, launches.size());
	EXPECT_EQ(MESSAGE_COMPOSER_APP_ID, launches[0].appId);
	EXPECT_EQ(APP_CONTROL_OPERATION_COMPOSE, launches[0].operation);
	EXPECT_EQ(APP_CONTROL_LAUNCH_MODE_GROUP, launches[0].launchMode);
	EXPECT_EQ("5550100/" + std::to_string(numberId), launches[0].extra("number/index"));
	ASSERT_EQ(1u, usageRecords("PH03").size());
	EXPECT_EQ("Contacts_detail", usageRecords("PH03")[0].extra);
	EXPECT_TRUE(usageRecords("PH01").empty());

	// The next tap on the row is a call again.
	ScreenHarness::selectItem(item);
	launches = m_launches->launches();
	ASSERT_EQ(2u, launches.size());
	EXPECT_EQ(APP_CONTROL_OPERATION_CALL, launches[1].operation);
}

TEST_F(NumberRowTest, BlockMarkFollowsTheBlockStateWithoutARebuild)
{
	CtDetailData* data = personWithNumber("5550111");
	auto* row = new CtDetailViewNumberItem(data, firstNumber(data), true, false);
	Elm_Object_Item* item = show(row);
	EXPECT_TRUE(row->isBlocked());
	EXPECT_NE(nullptr, content(item, "elm.icon.left.bottom"));

	row->setBlocked(false);
	elm_genlist_item_fields_update(item, "elm.icon.left.bottom", ELM_GENLIST_ITEM_FIELD_CONTENT);
	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, content(item, "elm.icon.left.bottom"));
	EXPECT_EQ(item, row->getElmObjectItem());
}

TEST_F(NumberRowTest, SimContactShowsThePhoneLabel)
{
	CtDetailData* data = personWithNumber("5550122");
	Elm_Object_Item* item = show(new CtDetailViewNumberItem(data, firstNumber(data), false, true));
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_HEADER_PHONE_M_CALL"), text(item, "elm.text.sub.left.top"));
}

TEST_F(NumberRowTest, CopyAreaOfAVeryLongNumberStaysWithinItsCap)
{
	std::string longNumber(300, '7');
	CtDetailData* data = personWithNumber(longNumber.c_str());
	Elm_Object_Item* shortItem = show(new CtDetailViewNumberItem(data, firstNumber(data), false, false));
	Evas_Object* area = content(shortItem, "copy.text.area");
	ASSERT_NE(nullptr, area);
	Evas_Coord w = 0, h = 0;
	evas_object_size_hint_min_get(area, &w, &h);
	double s = ctCommonGetScale();
	EXPECT_EQ((Evas_Coord)(656 * s), w);
	EXPECT_GT(h, 0);
	EXPECT_LE(h, (Evas_Coord)(54 * s));
}

TEST_F(NumberRowTest, MarkupInANumberIsShownAsText)
{
	CtDetailData* data = personWithNumber("<b>5550133</b>");
	Elm_Object_Item* item = show(new CtDetailViewNumberItem(data, firstNumber(data), false, false));
	EXPECT_EQ("&lt;b&gt;5550133&lt;/b&gt;", text(item, "elm.text.main.left.bottom"));
}

TEST_F(NumberRowTest, VideoCallRowAsksItsOwnerUnlessPowerSavingIsOn)
{
	CtDetailData* data = personWithNumber("5550144");
	auto* row = new CtDetailViewVideoCallItem(m_view, data, false);
	Elm_Object_Item* item = show(row);
	EXPECT_EQ(DETAIL_ITEM_VIDEO_CALL, row->getItemType());
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_OPT_VIDEO_CALL"), text(item, "elm.text.main.left"));
	tapIcon(content(item, "elm.icon.2"), "touch.icon");
	ScreenHarness::selectItem(item);
	EXPECT_EQ(2, m_view->videoCalls);

	Elm_Object_Item* saving = show(new CtDetailViewVideoCallItem(m_view, data, true));
	EXPECT_TRUE(elm_object_item_disabled_get(saving));
	tapIcon(content(saving, "elm.icon.2"), "touch.icon");
	EXPECT_EQ(2, m_view->videoCalls);
	EXPECT_TRUE(m_launches->launches().empty());
}
