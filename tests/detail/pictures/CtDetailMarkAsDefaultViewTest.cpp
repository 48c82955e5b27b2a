// The mark-as-default view, headless: which groups and rows a person of
// linked contacts gets, the Done button following real changes only, what
// Done writes, a contact unlinked while the view is open, and the detail
// screen's entry to it.
#include "PictureScreenTest.h"

#include "ContactsCommon.h"
#include "ContactsDetails.h"
#include "CtDetailData.h"
#include "CtDetailMarkAsDefaultView.h"
#include "CtDetailView.h"

using namespace ct::test;

namespace {

using Row = CtDetailMarkAsDefaultItem;

int defaultProperty(contacts_person_property_e property, int personId)
{
	int id = 0;
	contacts_person_get_default_property(property, personId, &id);
	return id;
}

int firstImageId(int contactId)
{
	contacts_record_h contact = nullptr;
	contacts_db_get_record(_contacts_contact._uri, contactId, &contact);
	contacts_record_h image = nullptr;
	contacts_record_get_child_record_at_p(contact, _contacts_contact.image, 0, &image);
	int id = 0;
	contacts_record_get_int(image, _contacts_image.id, &id);
	contacts_record_destroy(contact, true);
	return id;
}

} // namespace

class CtDetailMarkAsDefaultViewTest : public PictureScreenTest {
protected:
	// Ann (phone, two pictures), Ben (account book, one picture) and, when
	// asked, Cid (phone, no picture), linked into Ann's person.
	int storeLinkedPerson(bool withCid = false)
	{
		m_bookId = addAddressbook("Work", 0, 1, "Google");
		contacts_record_h ann = newContact(0, "Ann");
		addImage(ann, writePicture("ann-1.png", 220, 60, 60).c_str(), 1);
		addImage(ann, writePicture("ann-2.png", 60, 220, 60).c_str(), 2);
		m_annId = store(ann);
		contacts_record_h ben = newContact(m_bookId, "Ben");
		addImage(ben, writePicture("ben.png", 60, 60, 220).c_str(), 1);
		m_benId = store(ben);
		std::vector<int> ids = {m_annId, m_benId};
		if (withCid) {
			m_cidId = store(newContact(0, "Cid"));
			ids.push_back(m_cidId);
		}
		return linkContacts(ids);
	}

	CtDetailMarkAsDefaultView* show(int personId)
	{
		m_data = std::make_unique<CtDetailData>(personId);
		auto* view = new CtDetailMarkAsDefaultView(m_data.get());
		EXPECT_TRUE(m_screen->push(view));
		m_screen->pumpUntilIdle();
		return view;
	}

	static std::vector<Row*> rows(CtDetailMarkAsDefaultView* view, Row::Kind kind)
	{
		return ScreenHarness::rowsWhere<Row>(view->getGenlist(), [kind](Row* row) { return row->getEntry().kind == kind; });
	}

	// Each row as "style|text|sub text" in list order.
	static std::vector<std::string> shown(CtDetailMarkAsDefaultView* view)
	{
		std::vector<std::string> out;
		for (Row* row : ScreenHarness::rowsOf<Row>(view->getGenlist())) {
			std::string sub = row->getText("elm.text.sub.left.bottom");
			std::string main = row->getText(row->getEntry().kind == Row::Kind::Picture && sub.empty()
					? "elm.text" : "elm.text.main.left.top");
			if (row->getEntry().kind == Row::Kind::GroupIndex)
				main = row->getText("elm.text");
			out.push_back(std::string(row->getItemStyle()) + "|" + main + (sub.empty() ? "" : "|" + sub));
		}
		return out;
	}

	bool doneEnabled(CtDetailMarkAsDefaultView* view) { return !ScreenHarness::isDisabled(view->getDoneButton()); }

	std::unique_ptr<CtDetailData> m_data;
	int m_bookId = 0;
	int m_annId = 0;
	int m_benId = 0;
	int m_cidId = 0;
};

TEST_F(CtDetailMarkAsDefaultViewTest, LinkedContactsOfferOnePicturePerContactAndTheirNames)
{
	int personId = storeLinkedPerson();
	CtDetailMarkAsDefaultView* view = show(personId);
	EXPECT_EQ("Set as default", ScreenHarness::naviText(view));
	EXPECT_EQ((std::vector<std::string>{"group_index|Contact picture", "2line.top|Device|Ann",
				  "2line.top|Google|user@example.com", "group_index|Name", "2line.top|Ann|Device",
				  "2line.top|Ben|Google"}),
		shown(view));
	// The person's current picture and name are the chosen ones; Done waits for a change.
	EXPECT_EQ(0, view->getSelectedPictureIndex());
	EXPECT_EQ(0, view->getSelectedNameIndex());
	EXPECT_FALSE(doneEnabled(view));
	EXPECT_TRUE(m_screen->savePng(shotPath("detail-mark-as-default-view")));
}

TEST_F(CtDetailMarkAsDefaultViewTest, OnlyOnePictureAmongTheContactsMeansNoPictureGroup)
{
	int annId = 0;
	addSimplePerson("Solo", &annId);
	contacts_record_h other = newContact(0, "Other");
	addImage(other, writePicture("other.png", 90, 90, 90).c_str(), 1);
	int personId = linkContacts({annId, store(other)});
	CtDetailMarkAsDefaultView* view = show(personId);
	EXPECT_TRUE(rows(view, Row::Kind::Picture).empty());
	EXPECT_EQ(2u, rows(view, Row::Kind::Name).size());
	EXPECT_EQ(1u, rows(view, Row::Kind::GroupIndex).size());
	EXPECT_EQ(-1, view->getSelectedPictureIndex());
}

TEST_F(CtDetailMarkAsDefaultViewTest, DoneFollowsRealChangesOnlyInEitherGroup)
{
	CtDetailMarkAsDefaultView* view = show(storeLinkedPerson());
	auto pictures = rows(view, Row::Kind::Picture);
	auto names = rows(view, Row::Kind::Name);
	ASSERT_EQ(2u, pictures.size());
	ASSERT_EQ(2u, names.size());
	struct Step {
		Row* row;
		bool enabled;
	};
	const Step steps[] = {
		{pictures[0], false}, // the current default again
		{names[1], true},
		{names[0], false},   // back to the initial name
		{pictures[1], true},
		{names[1], true},
		{pictures[0], true},  // the name still differs
		{names[0], false},
	};
	for (const Step& step : steps) {
		ScreenHarness::selectItem(step.row->getElmObjectItem());
		m_screen->pumpUntilIdle();
		EXPECT_EQ(step.enabled, doneEnabled(view)) << step.row->getEntry().text1 << " " << step.row->getEntry().index;
	}
}

TEST_F(CtDetailMarkAsDefaultViewTest, DoneWritesOnlyTheChangedChoiceAndCloses)
{
	int personId = storeLinkedPerson();
	int pictureBefore = defaultProperty(CONTACTS_PERSON_PROPERTY_IMAGE, personId);
	CtDetailMarkAsDefaultView* view = show(personId);
	ScreenHarness::selectItem(rows(view, Row::Kind::Name)[1]->getElmObjectItem());
	ASSERT_TRUE(ScreenHarness::click(view->getDoneButton()));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	reopenStore();
	EXPECT_EQ(m_benId, defaultProperty(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, personId));
	EXPECT_EQ(pictureBefore, defaultProperty(CONTACTS_PERSON_PROPERTY_IMAGE, personId));

	// Ben now names the person and shows his picture; Ann's is chosen back.
	view = show(personId);
	EXPECT_EQ(1, view->getSelectedNameIndex());
	EXPECT_EQ(1, view->getSelectedPictureIndex());
	ScreenHarness::selectItem(rows(view, Row::Kind::Picture)[0]->getElmObjectItem());
	ASSERT_TRUE(ScreenHarness::click(view->getDoneButton()));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	EXPECT_EQ(firstImageId(m_annId), defaultProperty(CONTACTS_PERSON_PROPERTY_IMAGE, personId));
	EXPECT_EQ(m_benId, defaultProperty(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, personId));
}

TEST_F(CtDetailMarkAsDefaultViewTest, CancelAndBackWriteNothing)
{
	int personId = storeLinkedPerson();
	for (bool useCancel : {true, false}) {
		CtDetailMarkAsDefaultView* view = show(personId);
		ScreenHarness::selectItem(rows(view, Row::Kind::Name)[1]->getElmObjectItem());
		if (useCancel) {
			Evas_Object* cancel = m_screen->findButton("Cancel");
			ASSERT_NE(nullptr, cancel);
			EXPECT_TRUE(ScreenHarness::click(cancel));
		} else {
			m_screen->sendBackKey();
		}
		EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
		EXPECT_EQ(m_annId, defaultProperty(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, personId));
	}
}

TEST_F(CtDetailMarkAsDefaultViewTest, ContactUnlinkedWhileOpenIsNotWrittenAndTheScreenCloses)
{
	int personId = storeLinkedPerson(true);
	CtDetailMarkAsDefaultView* view = show(personId);
	auto names = rows(view, Row::Kind::Name);
	ASSERT_EQ(3u, names.size());
	ScreenHarness::selectItem(names[2]->getElmObjectItem());
	ScreenHarness::selectItem(rows(view, Row::Kind::Picture)[1]->getElmObjectItem());
	int cidPerson = 0;
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_person_unlink_contact(personId, m_cidId, &cidPerson));
	m_data.reset(); // the screen below replaces its data on a change
	ASSERT_TRUE(ScreenHarness::click(view->getDoneButton()));
	EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	EXPECT_EQ(m_annId, defaultProperty(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, personId));
	// The picture the user chose is still the person's: it is written.
	EXPECT_EQ(firstImageId(m_benId), defaultProperty(CONTACTS_PERSON_PROPERTY_IMAGE, personId));
}

TEST_F(CtDetailMarkAsDefaultViewTest, MoreMenuOfTheDetailScreenOffersItOnlyForAPersonWithAChoice)
{
	const std::string entry = ContactsCommon::translate("IDS_PB_OPT_SET_DEFAULT_CONTACT_INFO_ABB");
	for (bool linked : {true, false}) {
		int personId = linked ? storeLinkedPerson() : addSimplePerson("Single");
		auto* detail = static_cast<CtDetailView*>(createCtDetailView(personId, nullptr));
		ASSERT_TRUE(m_screen->push(detail));
		ASSERT_TRUE(m_screen->pumpUntil([detail] { return !detail->isBuildingRows(); }));
		m_screen->sendMoreKey();
		m_screen->pumpUntilIdle();
		auto menus = m_screen->findWidgets("Elm_Ctxpopup");
		ASSERT_EQ(1u, menus.size());
		Elm_Object_Item* found = nullptr;
		for (Elm_Object_Item* it = elm_ctxpopup_first_item_get(menus[0]); it; it = elm_ctxpopup_item_next_get(it)) {
			if (entry == elm_object_item_text_get(it))
				found = it;
		}
		EXPECT_EQ(linked, found != nullptr);
		if (found) {
			elm_ctxpopup_item_selected_set(found, EINA_TRUE);
			m_screen->pumpUntilIdle();
			EXPECT_NE(nullptr, dynamic_cast<CtDetailMarkAsDefaultView*>(m_screen->topView()));
		}
		while (m_screen->viewCount() > 0) {
			m_screen->sendBackKey();
			m_screen->pumpUntilIdle();
		}
	}
}
