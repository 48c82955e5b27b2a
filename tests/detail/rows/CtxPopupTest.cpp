#include "RowTestSupport.h"

#include "CtCommonWidgetUtil.h"
#include "CtDetailViewCtxPopup.h"
#include "CtDetailViewMultiImageItem.h"
#include "CtDetailViewNumberItem.h"
#include "CtDetailViewRingtoneItem.h"
#include "LogSink.h"

#include <fstream>
#include <iterator>

using namespace ct::test;

namespace {

const char* const kBacking = "<backing=on backing_color=#BFF6FF linesize=20>";

struct Clipboard {
	bool received = false;
	Elm_Sel_Format format = ELM_SEL_FORMAT_NONE;
	std::string data;
};

Eina_Bool clipboardCb(void* data, Evas_Object*, Elm_Selection_Data* selection)
{
	auto* clip = static_cast<Clipboard*>(data);
	clip->received = true;
	clip->format = selection->format;
	clip->data.assign(static_cast<const char*>(selection->data), selection->len);
	while (selection->format != ELM_SEL_FORMAT_IMAGE && !clip->data.empty() && clip->data.back() == '\0')
		clip->data.pop_back();
	return EINA_TRUE;
}

class CtxPopupTest : public RowTest {
protected:
	// A person with `count` numbers, each shown as a row.
	std::vector<Elm_Object_Item*> numberRows(int count)
	{
		contacts_record_h contact = newContact(0, "Ari");
		for (int i = 0; i < count; ++i)
			addNumber(contact, ("555010" + std::to_string(i)).c_str(), CONTACTS_NUMBER_TYPE_CELL);
		CtDetailData* data = load(storePerson(contact));
		std::vector<Elm_Object_Item*> items;
		for (int i = 0; i < count; ++i) {
			auto* record = static_cast<contacts_record_h>(eina_list_nth(data->getNumberList(), i));
			items.push_back(show(new CtDetailViewNumberItem(data, record, false, false)));
		}
		return items;
	}
	CtDetailViewCtxPopup* open(Elm_Object_Item* item)
	{
		auto weak = CtDetailViewCtxPopup::open(m_view, m_screen->win(), item);
		m_screen->pumpUntilIdle();
		auto popup = weak.lock();
		return popup ? static_cast<CtDetailViewCtxPopup*>(popup.get()) : nullptr;
	}
	Clipboard readClipboard(Elm_Sel_Format format)
	{
		Clipboard clip;
		elm_cnp_selection_get(m_screen->win(), ELM_SEL_TYPE_CLIPBOARD, format, clipboardCb, &clip);
		for (int i = 0; i < 50 && !clip.received; ++i)
			m_screen->pumpFrames(1);
		return clip;
	}
	static CtDetailViewGenlistItem* rowOf(Elm_Object_Item* item)
	{
		return static_cast<CtDetailViewGenlistItem*>(elm_object_item_data_get(item));
	}
};

} // namespace

TEST_F(CtxPopupTest, PlacementKeepsClearOfTheTopOfTheScreen)
{
	// Above the value when there is room.
	auto pos = CtDetailViewCtxPopup::computePosition(40, 400, 200, 30, false, 1.0);
	EXPECT_EQ(140, pos.x);
	EXPECT_EQ(386, pos.y);
	// Too close to the top: the fixed height limit + band + margin.
	pos = CtDetailViewCtxPopup::computePosition(40, 150, 200, 30, false, 1.0);
	EXPECT_EQ(150 + 72 + 20, pos.y);
	// The boundary: wanted - band must exceed the limit.
	EXPECT_EQ(242, CtDetailViewCtxPopup::computePosition(0, 236, 0, 0, false, 1.0).y);
	EXPECT_EQ(223, CtDetailViewCtxPopup::computePosition(0, 237, 0, 0, false, 1.0).y);
	// The picture row points at the middle of the picture.
	pos = CtDetailViewCtxPopup::computePosition(0, 200, 480, 270, true, 1.0);
	EXPECT_EQ(240, pos.x);
	EXPECT_EQ(200 + 135 + 36 - 14, pos.y);
	EXPECT_EQ(242, CtDetailViewCtxPopup::computePosition(0, 0, 480, 270, true, 1.0).y);
	// Every distance grows with the scale.
	EXPECT_EQ(300 + 144 + 40, CtDetailViewCtxPopup::computePosition(0, 300, 0, 0, false, 2.0).y);
	EXPECT_EQ(700 - 28, CtDetailViewCtxPopup::computePosition(0, 700, 0, 0, false, 2.0).y);
	EXPECT_EQ(75 + 36 + 10, CtDetailViewCtxPopup::computePosition(0, 50, 0, 0, false, 0.5).y);
}

TEST_F(CtxPopupTest, LongPressHighlightsTheValueAndTheBackKeyRemovesIt)
{
	std::vector<Elm_Object_Item*> items = numberRows(1);
	Elm_Object_Item* item = items[0];
	Evas_Object* genlist = m_view->genlist;
	CtDetailViewCtxPopup* popup = open(item);
	ASSERT_NE(nullptr, popup);
	EXPECT_EQ(popup, m_view->getPopup());
	EXPECT_TRUE(rowOf(item)->isHighlighted());
	EXPECT_EQ(std::string(kBacking) + "5550100</backing>", text(item, "elm.text.main.left.bottom"));
	EXPECT_EQ(ELM_SCROLLER_MOVEMENT_BLOCK_VERTICAL, elm_scroller_movement_block_get(genlist));

	Evas_Object* ctxpopup = popup->getEvasObj();
	Elm_Object_Item* entry = elm_ctxpopup_first_item_get(ctxpopup);
	ASSERT_NE(nullptr, entry);
	EXPECT_STREQ(ContactsCommon::translate("IDS_PB_OPT_VIEW_COPY"), elm_object_item_text_get(entry));
	EXPECT_EQ(nullptr, elm_ctxpopup_item_next_get(entry));
	EXPECT_TRUE(elm_ctxpopup_horizontal_get(ctxpopup));

	// The first row sits near the top of the screen.
	Evas_Coord x, y, w, h;
	evas_object_geometry_get(content(item, "copy.text.area"), &x, &y, &w, &h);
	double s = ctCommonGetScale();
	ASSERT_LE(y - (int)(14 * s) - (int)(72 * s), (int)(150 * s));
	EXPECT_EQ((int)(150 * s) + (int)(72 * s) + (int)(20 * s), popup->getPosition().y);
	EXPECT_EQ(x + w / 2, popup->getPosition().x);

	m_screen->sendBackKey();
	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, m_view->getPopup());
	EXPECT_FALSE(rowOf(item)->isHighlighted());
	EXPECT_EQ("5550100", text(item, "elm.text.main.left.bottom"));
	EXPECT_EQ(1, m_screen->viewCount());
}

TEST_F(CtxPopupTest, PopupOfALowerRowPointsAboveItsValue)
{
	std::vector<Elm_Object_Item*> items = numberRows(8);
	Elm_Object_Item* item = items[6];
	m_screen->pumpUntilIdle();
	Evas_Coord x, y, w, h;
	evas_object_geometry_get(content(item, "copy.text.area"), &x, &y, &w, &h);
	double s = ctCommonGetScale();
	ASSERT_GT(y - (int)(14 * s) - (int)(72 * s), (int)(150 * s));
	CtDetailViewCtxPopup* popup = open(item);
	ASSERT_NE(nullptr, popup);
	EXPECT_EQ(y - (int)(14 * s), popup->getPosition().y);
	EXPECT_EQ(x + w / 2, popup->getPosition().x);
}

TEST_F(CtxPopupTest, CopyPutsTheValueOnTheClipboardAsText)
{
	std::vector<Elm_Object_Item*> items = numberRows(2);
	CtDetailViewCtxPopup* popup = open(items[1]);
	ASSERT_NE(nullptr, popup);
	popup->copy();
	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, m_view->getPopup());
	EXPECT_FALSE(rowOf(items[1])->isHighlighted());
	Clipboard clip = readClipboard(ELM_SEL_FORMAT_TEXT);
	ASSERT_TRUE(clip.received);
	EXPECT_EQ("5550101", clip.data);
}

TEST_F(CtxPopupTest, PictureRowCopiesThePictureAsAnImage)
{
	std::string path = picture("copy.png", 320, 240, 0xFF804020, 0xFF204080);
	contacts_record_h contact = newContact(0, "Pia");
	addImage(contact, path.c_str(), 1);
	CtDetailData* data = load(storePerson(contact));
	Elm_Object_Item* item = show(new CtDetailViewMultiImageItem(m_view, data, false));
	CtDetailViewCtxPopup* popup = open(item);
	ASSERT_NE(nullptr, popup);
	// The picture itself is never highlighted.
	EXPECT_FALSE(rowOf(item)->isHighlighted());
	Evas_Coord x, y, w, h;
	evas_object_geometry_get(content(item, "elm.icon"), &x, &y, &w, &h);
	EXPECT_EQ(CtDetailViewCtxPopup::computePosition(x, y, w, h, true, ctCommonGetScale()).y, popup->getPosition().y);
	popup->copy();
	m_screen->pumpUntilIdle();
	Clipboard clip = readClipboard(ELM_SEL_FORMAT_IMAGE);
	ASSERT_TRUE(clip.received);
	EXPECT_EQ(ELM_SEL_FORMAT_IMAGE, clip.format);
	std::ifstream file(path, std::ios::binary);
	std::string bytes((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
	ASSERT_FALSE(bytes.empty());
	EXPECT_EQ(bytes.size(), clip.data.size());
	EXPECT_TRUE(clip.data == bytes);
	EXPECT_FALSE(readClipboard(ELM_SEL_FORMAT_TEXT).data == path);
}

TEST_F(CtxPopupTest, NothingOpensForARowWithoutCopyText)
{
	CtDetailData* data = load(addSimplePerson("Ari"));
	Elm_Object_Item* item = show(new CtDetailViewRingtoneItem(data));
	ct::log::clear();
	EXPECT_EQ(nullptr, open(item));
	EXPECT_EQ(nullptr, m_view->getPopup());
	EXPECT_TRUE(ct::log::contains("* Critical * no copy text"));
	EXPECT_EQ(ELM_SCROLLER_MOVEMENT_NO_BLOCK, elm_scroller_movement_block_get(m_view->genlist));
	EXPECT_FALSE(rowOf(item)->isHighlighted());
}

TEST_F(CtxPopupTest, ClosingAfterTheRowsWereClearedTouchesNoDeadRow)
{
	std::vector<Elm_Object_Item*> items = numberRows(1);
	CtDetailViewCtxPopup* popup = open(items[0]);
	ASSERT_NE(nullptr, popup);
	elm_genlist_clear(m_view->genlist);
	m_screen->pumpUntilIdle();
	popup->copy();
	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, m_view->getPopup());
}
