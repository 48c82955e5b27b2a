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
		for (int i = 0; i < count; ++i)
			items.push_back(show(new CtDetailViewNumberItem(data, nth(data->getNumberList(), i), false, false)));
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
	// Where the popup of a value row goes (the placement table checks the rule).
	CtDetailViewCtxPopup::Position expectedPosition(Elm_Object_Item* item)
	{
		Evas_Coord x, y, w, h;
		evas_object_geometry_get(content(item, "copy.text.area"), &x, &y, &w, &h);
		return CtDetailViewCtxPopup::computePosition(x, y, w, h, false, ctCommonGetScale());
	}
};

} // namespace

TEST_F(CtxPopupTest, PlacementKeepsClearOfTheTopOfTheScreen)
{
	struct Case {
		int x, y, w, h;
		bool picture;
		double scale;
		int wantedX, wantedY;
	};
	const Case cases[] = {
		{40, 400, 200, 30, false, 1.0, 140, 386}, // above the value when there is room
		{40, 150, 200, 30, false, 1.0, 140, 150 + 72 + 20}, // too close to the top: limit + band + margin
		{0, 236, 0, 0, false, 1.0, 0, 242}, // the boundary: wanted - band must exceed the limit
		{0, 237, 0, 0, false, 1.0, 0, 223},
		{0, 200, 480, 270, true, 1.0, 240, 200 + 135 + 36 - 14}, // the middle of a picture
		{0, 0, 480, 270, true, 1.0, 240, 242},
		{0, 300, 0, 0, false, 2.0, 0, 300 + 144 + 40}, // every distance grows with the scale
		{0, 700, 0, 0, false, 2.0, 0, 700 - 28},
		{0, 50, 0, 0, false, 0.5, 0, 75 + 36 + 10},
	};
	for (const Case& c : cases) {
		auto pos = CtDetailViewCtxPopup::computePosition(c.x, c.y, c.w, c.h, c.picture, c.scale);
		EXPECT_EQ(std::make_pair(c.wantedX, c.wantedY), std::make_pair(pos.x, pos.y)) << c.y << " at " << c.scale;
	}
}

TEST_F(CtxPopupTest, LongPressHighlightsTheValueAndTheBackKeyRemovesIt)
{
	std::vector<Elm_Object_Item*> items = numberRows(8);
	m_screen->pumpUntilIdle();
	Evas_Object* genlist = m_view->genlist;
	for (int index : {0, 6}) {
		SCOPED_TRACE(index);
		Elm_Object_Item* item = items[index];
		auto wanted = expectedPosition(item);
		CtDetailViewCtxPopup* popup = open(item);
		ASSERT_NE(nullptr, popup);
		EXPECT_EQ(popup, m_view->getPopup());
		EXPECT_TRUE(rowOf(item)->isHighlighted());
		std::string value = "555010" + std::to_string(index);
		EXPECT_EQ(std::string(kBacking) + value + "</backing>", text(item, "elm.text.main.left.bottom"));
		EXPECT_EQ(ELM_SCROLLER_MOVEMENT_BLOCK_VERTICAL, elm_scroller_movement_block_get(genlist));
		EXPECT_EQ(std::make_pair(wanted.x, wanted.y), std::make_pair(popup->getPosition().x, popup->getPosition().y));
		// The popup itself went there: its arrow points at that spot.
		Evas_Object* ctxpopup = popup->getEvasObj();
		Evas_Coord shownX = -1, shownY = -1;
		evas_object_geometry_get(ctxpopup, &shownX, &shownY, nullptr, nullptr);
		EXPECT_EQ(std::make_pair(wanted.x, wanted.y), std::make_pair(shownX, shownY));

		Elm_Object_Item* entry = elm_ctxpopup_first_item_get(ctxpopup);
		ASSERT_NE(nullptr, entry);
		EXPECT_STREQ(ContactsCommon::translate("IDS_PB_OPT_VIEW_COPY"), elm_object_item_text_get(entry));
		EXPECT_EQ(nullptr, elm_ctxpopup_item_next_get(entry));

		m_screen->sendBackKey();
		m_screen->pumpUntilIdle();
		EXPECT_EQ(nullptr, m_view->getPopup());
		EXPECT_FALSE(rowOf(item)->isHighlighted());
		EXPECT_EQ(value, text(item, "elm.text.main.left.bottom"));
		EXPECT_EQ(1, m_screen->viewCount());
	}
	// The first row sits near the top, the seventh has room above its value.
	double s = ctCommonGetScale();
	EXPECT_EQ((int)(150 * s) + (int)(72 * s) + (int)(20 * s), expectedPosition(items[0]).y);
	EXPECT_NE((int)(150 * s) + (int)(72 * s) + (int)(20 * s), expectedPosition(items[6]).y);
}

TEST_F(CtxPopupTest, CopyPutsTheValueOnTheClipboardAndSurvivesClearedRowsAndARowWithoutCopyTextOpensNothing)
{
	Elm_Object_Item* ringtone = show(new CtDetailViewRingtoneItem(load(addSimplePerson("Ari"))));
	ct::log::clear();
	EXPECT_EQ(nullptr, open(ringtone));
	EXPECT_EQ(nullptr, m_view->getPopup());
	EXPECT_TRUE(ct::log::contains("* Critical * no copy text"));
	EXPECT_EQ(ELM_SCROLLER_MOVEMENT_NO_BLOCK, elm_scroller_movement_block_get(m_view->genlist));
	EXPECT_FALSE(rowOf(ringtone)->isHighlighted());

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

	popup = open(items[0]);
	ASSERT_NE(nullptr, popup);
	elm_genlist_clear(m_view->genlist);
	m_screen->pumpUntilIdle();
	popup->copy();
	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, m_view->getPopup());
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
	EXPECT_TRUE(clip.data == bytes);
	EXPECT_FALSE(readClipboard(ELM_SEL_FORMAT_TEXT).data == path);
}
