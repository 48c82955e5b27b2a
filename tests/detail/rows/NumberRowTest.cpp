#include "RowTestSupport.h"

#include "CtCommonWidgetUtil.h"
#include "CtDetailViewNumberItem.h"
#include "CtDetailViewVideoCallItem.h"

using namespace ct::test;

namespace {

class NumberRowTest : public RowTest {
protected:
	// A person with one cell number.
	CtDetailData* personWithNumber(const std::string& number)
	{
		contacts_record_h contact = newContact(0, "Mina");
		addNumber(contact, number.c_str(), CONTACTS_NUMBER_TYPE_CELL);
		return load(storePerson(contact));
	}
	Elm_Object_Item* numberRow(CtDetailData* data, bool sim = false)
	{
		return show(new CtDetailViewNumberItem(data, nth(data->getNumberList()), false, sim));
	}
};

} // namespace

TEST_F(NumberRowTest, ShowsTypeAndEscapedNumberWithCallAndMessageButtonsAndACappedCopyArea)
{
	CtDetailData* data = personWithNumber("010-2345-6789");
	Elm_Object_Item* item = numberRow(data);
	EXPECT_EQ("detail/2line.bottom", ScreenHarness::itemStyle(item));
	EXPECT_EQ((std::vector<std::string>{ContactsCommon::translate("IDS_PB_OPT_MOBILE"), "010-2345-6789"}),
			labelAndValue(item));
	EXPECT_EQ("010-2345-6789", rowOf(item)->getCopyText());
	EXPECT_EQ(nullptr, content(item, "elm.icon.left.bottom"));
	Evas_Object* icons = content(item, "elm.icon.2");
	for (const char* part : {"elm.icon1", "elm.icon3"}) {
		Evas_Object* button = icons ? elm_object_part_content_get(icons, part) : nullptr;
		EXPECT_TRUE(button && elm_object_content_get(button)) << part;
	}
	EXPECT_EQ(ContactsCommon::translate("IDS_PB_HEADER_PHONE_M_CALL"),
			text(numberRow(data, true), "elm.text.sub.left.top"));
	EXPECT_EQ("&lt;b&gt;5550133&lt;/b&gt;",
			text(numberRow(personWithNumber("<b>5550133</b>")), "elm.text.main.left.bottom"));

	Evas_Object* area = content(numberRow(personWithNumber(std::string(300, '7'))), "copy.text.area");
	ASSERT_NE(nullptr, area);
	Evas_Coord w = 0, h = 0;
	evas_object_size_hint_min_get(area, &w, &h);
	double s = ctCommonGetScale();
	EXPECT_EQ((Evas_Coord)(656 * s), w);
	EXPECT_GT(h, 0);
	EXPECT_LE(h, (Evas_Coord)(54 * s));
}

TEST_F(NumberRowTest, TheCopyAreaIsAsLargeAsTheNumberTheRowDraws)
{
	CtDetailData* data = personWithNumber("010-2345");
	auto areaSize = [this](Elm_Object_Item* item) {
		m_screen->pumpUntilIdle();
		Evas_Coord w = 0, h = 0;
		evas_object_size_hint_min_get(content(item, "copy.text.area"), &w, &h);
		return std::make_pair(w, h);
	};
	auto drawnSize = [this](Elm_Object_Item* item) {
		Evas_Object* row = evas_object_smart_parent_get(content(item, "copy.text.area"));
		Evas_Coord w = 0, h = 0;
		evas_object_textblock_size_native_get(
				const_cast<Evas_Object*>(edje_object_part_object_get(row, "elm.text.main.left.bottom")), &w, &h);
		return std::make_pair(w, h);
	};
	Elm_Object_Item* plain = numberRow(data);
	auto plainArea = areaSize(plain);
	EXPECT_GT(plainArea.first, 0);
	EXPECT_EQ(drawnSize(plain), plainArea);

	// A larger font for the values (the user's font size setting) and a
	// larger list scale give larger numbers: the area follows both.
	edje_text_class_set("ct_main", "Sans", 24);
	Elm_Object_Item* larger = numberRow(data);
	auto largerArea = areaSize(larger);
	EXPECT_EQ(drawnSize(larger), largerArea);
	EXPECT_GT(largerArea.first, plainArea.first * 5 / 4);
	EXPECT_GT(largerArea.second, plainArea.second);
	edje_text_class_del("ct_main");

	elm_object_scale_set(m_view->genlist, 1.5);
	Elm_Object_Item* scaled = numberRow(data);
	auto scaledArea = areaSize(scaled);
	EXPECT_EQ(drawnSize(scaled), scaledArea);
	EXPECT_GT(scaledArea.first, plainArea.first * 5 / 4);
	elm_object_scale_set(m_view->genlist, 1.0);
}

TEST_F(NumberRowTest, CallAndMessageLaunchWithTheirUsageAndAMessageTapIsNotAlsoACall)
{
	CtDetailData* data = personWithNumber("+82 10 1111 2222");
	int numberId = 0;
	contacts_record_get_int(nth(data->getNumberList()), _contacts_number.id, &numberId);
	Elm_Object_Item* item = numberRow(data);

	tapIcon(content(item, "elm.icon.2"), "touch.call");
	ScreenHarness::selectItem(item);
	EXPECT_FALSE(elm_genlist_item_selected_get(item));
	auto launches = m_launches->launches();
	ASSERT_EQ(2u, launches.size());
	for (const auto& call : launches) {
		EXPECT_EQ(APP_CONTROL_OPERATION_CALL, call.operation);
		EXPECT_EQ("tel:+82 10 1111 2222", call.uri);
		EXPECT_EQ(std::to_string(data->getPersonId()), call.extra("ctindex"));
		EXPECT_FALSE(call.replyRequested);
	}
	auto usage = usageRecords("PH01");
	ASSERT_EQ(2u, usage.size());
	EXPECT_EQ(CONTACTS_APP_ID, usage[0].appId);
	EXPECT_EQ("Contacts_detail", usage[0].extra);
	m_launches->clear();

	tapIcon(content(item, "elm.icon.2"), "touch.message");
	ScreenHarness::selectItem(item); // the tap reaches the row too, as on the device
	launches = m_launches->launches();
	ASSERT_EQ(1u, launches.size());
	EXPECT_EQ((std::vector<std::string>{MESSAGE_COMPOSER_APP_ID, APP_CONTROL_OPERATION_COMPOSE,
				  "+82 10 1111 2222/" + std::to_string(numberId)}),
			(std::vector<std::string>{launches[0].appId, launches[0].operation, launches[0].extra("number/index")}));
	EXPECT_EQ(APP_CONTROL_LAUNCH_MODE_GROUP, launches[0].launchMode);
	ASSERT_EQ(1u, usageRecords("PH03").size());
	EXPECT_EQ("Contacts_detail", usageRecords("PH03")[0].extra);
	EXPECT_EQ(2u, usageRecords("PH01").size());

	ScreenHarness::selectItem(item);
	launches = m_launches->launches();
	ASSERT_EQ(2u, launches.size());
	EXPECT_EQ(APP_CONTROL_OPERATION_CALL, launches[1].operation);
}

TEST_F(NumberRowTest, VideoCallRowAsksItsOwnerUnlessPowerSavingIsOn)
{
	CtDetailData* data = personWithNumber("5550144");
	Elm_Object_Item* item = show(new CtDetailViewVideoCallItem(m_view, data, false));
	tapIcon(content(item, "elm.icon.2"), "touch.icon");
	ScreenHarness::selectItem(item);
	EXPECT_EQ(2, m_view->videoCalls);

	Elm_Object_Item* saving = show(new CtDetailViewVideoCallItem(m_view, data, true));
	tapIcon(content(saving, "elm.icon.2"), "touch.icon");
	EXPECT_EQ(2, m_view->videoCalls);
	EXPECT_TRUE(m_launches->launches().empty());
}
