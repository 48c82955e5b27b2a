// The type menus of the typed rows and the custom-label popup.
#include "InputRowTestSupport.h"

#include "CtInputDataTypeCustomPopup.h"
#include "CtInputViewAddressItem.h"
#include "CtInputViewEmailItem.h"
#include "CtInputViewMessengerItem.h"
#include "CtInputViewNumberItem.h"
#include "CtInputViewRelationItem.h"

using namespace ct::test;

namespace {

using Strings = std::vector<std::string>;

Strings trAll(const std::vector<const char*>& ids)
{
	Strings out;
	for (const char* id : ids)
		out.push_back(ContactsCommon::translate(id));
	return out;
}

class TypePopupTest : public InputRowTest {
protected:
	// A stored contact with one number of `type` (and `label`); the row is shown.
	CtInputViewNumberItem* showNumber(int type, const char* label = nullptr)
	{
		contacts_record_h contact = newContact(0, "Ada");
		addNumber(contact, "0101", type, label);
		m_data = edit(store(contact));
		Eina_List* numbers = m_data->getNumberList();
		m_number = static_cast<contacts_record_h>(eina_list_data_get(numbers));
		eina_list_free(numbers);
		auto* row = new CtInputViewNumberItem(m_data, m_number, 0, m_calls.callbacks(), "0101");
		show(row);
		return row;
	}
	Evas_Object* popupEntry()
	{
		for (Evas_Object* entry : m_screen->findWidgets("Elm_Entry"))
			if (evas_object_visible_get(entry) && elm_entry_editable_get(entry))
				return entry;
		return nullptr;
	}
	std::string numberLabel() { return str(m_data->getDataTypeCustom(m_number, _contacts_number.label)); }
	int numberType() { return m_data->getDataType(m_number, _contacts_number.type); }

	std::shared_ptr<CtInputData> m_data;
	contacts_record_h m_number = nullptr;
};

} // namespace

TEST_F(TypePopupTest, EveryTypedRowOffersItsMenuWithTheCurrentCustomLabelFirst)
{
	contacts_record_h contact = newContact(0, "Ada");
	addNumber(contact, "0101", CONTACTS_NUMBER_TYPE_CUSTOM, "Boat");
	auto data = edit(store(contact));
	Eina_List* numbers = data->getNumberList();
	contacts_record_h number = static_cast<contacts_record_h>(eina_list_data_get(numbers));
	eina_list_free(numbers);
	auto* numberRow = new CtInputViewNumberItem(data, number, 0, m_calls.callbacks(), "0101");
	auto* emailRow = new CtInputViewEmailItem(data, data->addEmail(""), 0, m_calls.callbacks(), nullptr);
	auto* addressRow = new CtInputViewAddressItem(data, data->addAddress(""), 0, m_calls.callbacks(), nullptr);
	auto* messengerRow = new CtInputViewMessengerItem(data, data->addMessenger(""), 0, m_calls.callbacks(), nullptr);
	auto* relationRow = new CtInputViewRelationItem(data, data->addRelationship(""), 0, m_calls.callbacks(), nullptr);
	for (CtInputViewGenlistItem* row : std::vector<CtInputViewGenlistItem*>{numberRow, emailRow, addressRow, messengerRow, relationRow})
		show(row);

	Strings numberMenu = {"Boat"};
	for (const std::string& label : trAll({"IDS_PB_OPT_MOBILE", "IDS_PB_OPT_WORK", "IDS_PB_OPT_HOME_ABB2",
			"IDS_PB_OPT_FAX_HWORK_ABB", "IDS_PB_OPT_FAX_HHOME_ABB", "IDS_PB_OPT_PAGER", "IDS_PB_OPT_OTHER",
			"IDS_PB_OPT_CUSTOM"}))
		numberMenu.push_back(label);
	EXPECT_EQ(numberMenu, menuLabels(numberRow->getHoverselObj()));
	EXPECT_EQ("Boat", ScreenHarness::buttonLabel(numberRow->getHoverselObj()));
	EXPECT_EQ(trAll({"IDS_PB_OPT_HOME_M_PERSONAL_ABB", "IDS_PB_OPT_WORK", "IDS_PB_OPT_OTHER", "IDS_PB_OPT_CUSTOM"}),
		menuLabels(emailRow->getHoverselObj()));
	EXPECT_EQ(trAll({"IDS_PB_OPT_HOME_ABB2", "IDS_PB_OPT_WORK", "IDS_PB_OPT_OTHER", "IDS_PB_OPT_CUSTOM"}),
		menuLabels(addressRow->getHoverselObj()));
	EXPECT_EQ(trAll({"IDS_PB_OPT_AIM", "IDS_PB_OPT_YAHOO_E", "IDS_PB_BODY_SKYPE", "IDS_PB_OPT_QQ", "IDS_PB_OPT_HANGOUTS",
				  "IDS_PB_OPT_ICQ", "IDS_PB_OPT_JABBER", "IDS_PB_OPT_CUSTOM"}),
		menuLabels(messengerRow->getHoverselObj()));
	EXPECT_EQ(15u, menuLabels(relationRow->getHoverselObj()).size());

	// A second fill adds nothing.
	EXPECT_FALSE(CtInputViewTypeSelector::fill(emailRow->getHoverselObj()));
	EXPECT_EQ(4u, menuLabels(emailRow->getHoverselObj()).size());
}

TEST_F(TypePopupTest, ChoosingATypeWritesItRelabelsTheSelectorAndMarksTheRowChanged)
{
	CtInputViewNumberItem* row = showNumber(CONTACTS_NUMBER_TYPE_CELL);
	EXPECT_FALSE(row->getIsChanged());
	ASSERT_TRUE(chooseMenu(row->getHoverselObj(), tr("IDS_PB_OPT_FAX_HWORK_ABB")));
	EXPECT_EQ(CONTACTS_NUMBER_TYPE_WORK | CONTACTS_NUMBER_TYPE_FAX, numberType());
	EXPECT_EQ(tr("IDS_PB_OPT_FAX_HWORK_ABB"), ScreenHarness::buttonLabel(row->getHoverselObj()));
	EXPECT_TRUE(row->getIsChanged());
	EXPECT_EQ(1, m_calls.changed);
}

TEST_F(TypePopupTest, CustomLabelIsTrimmedAndKeptWhileCancelOrBlanksKeepThePreviousType)
{
	CtInputViewNumberItem* row = showNumber(CONTACTS_NUMBER_TYPE_CELL);

	// Cancel keeps the type.
	ASSERT_TRUE(chooseMenu(row->getHoverselObj(), tr("IDS_PB_OPT_CUSTOM")));
	Evas_Object* create = m_screen->findButton(tr("IDS_PB_SK_CREATE_ABB"));
	ASSERT_NE(nullptr, create);
	EXPECT_TRUE(ScreenHarness::isDisabled(create));
	ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_BUTTON_CANCEL"))));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(CONTACTS_NUMBER_TYPE_CELL, numberType());
	EXPECT_FALSE(row->getIsChanged());

	// Blanks only: Create is enabled by a single blank but changes nothing.
	ASSERT_TRUE(chooseMenu(row->getHoverselObj(), tr("IDS_PB_OPT_CUSTOM")));
	Evas_Object* entry = popupEntry();
	ASSERT_NE(nullptr, entry);
	type(entry, " ");
	create = m_screen->findButton(tr("IDS_PB_SK_CREATE_ABB"));
	EXPECT_FALSE(ScreenHarness::isDisabled(create));
	type(entry, "  ");
	ASSERT_TRUE(ScreenHarness::click(create));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(nullptr, m_screen->findButton(tr("IDS_PB_SK_CREATE_ABB")));
	EXPECT_EQ(CONTACTS_NUMBER_TYPE_CELL, numberType());

	// A word in blanks is stored as the word; the menu then offers it first.
	ASSERT_TRUE(chooseMenu(row->getHoverselObj(), tr("IDS_PB_OPT_CUSTOM")));
	type(popupEntry(), "  Boat <&>  ");
	ASSERT_TRUE(ScreenHarness::click(m_screen->findButton(tr("IDS_PB_SK_CREATE_ABB"))));
	m_screen->pumpUntilIdle();
	EXPECT_EQ(CONTACTS_NUMBER_TYPE_CUSTOM, numberType());
	EXPECT_EQ("Boat <&>", numberLabel());
	EXPECT_EQ("Boat <&>", ScreenHarness::buttonLabel(row->getHoverselObj()));
	EXPECT_TRUE(row->getIsChanged());
	elm_genlist_item_update(row->getElmObjectItem());
	m_screen->pumpUntilIdle();
	EXPECT_EQ("Boat <&>", menuLabels(row->getHoverselObj()).front());

	// Saved and reopened, the label is still there.
	ASSERT_EQ(CONTACTS_ERROR_NONE, m_data->updateContact());
	reopenStore();
	contacts_record_h contact = readContact(m_data->getContactId());
	EXPECT_EQ("Boat <&>", textOf(childAt(contact, _contacts_contact.number, 0), _contacts_number.label));
	contacts_record_destroy(contact, true);
}

TEST_F(TypePopupTest, ReturnKeySavesAndALongLabelStopsAtTheLimitWithOneNotice)
{
	CtInputViewNumberItem* row = showNumber(CONTACTS_NUMBER_TYPE_CELL);
	ASSERT_TRUE(chooseMenu(row->getHoverselObj(), tr("IDS_PB_OPT_CUSTOM")));
	Evas_Object* entry = popupEntry();
	ASSERT_NE(nullptr, entry);
	ScreenHarness::clearNotices();
	std::string label(1200, 'x');
	type(entry, label.c_str());
	type(entry, "y");
	EXPECT_EQ(1000u, CtInputViewGenlistItem::getEntryUtf8(entry).size());
	EXPECT_EQ((Strings{tr("IDS_PB_POP_MAXIMUM_NUMBER_OF_CHARACTERS_REACHED")}), ScreenHarness::notices());
	evas_object_smart_callback_call(entry, "activated", nullptr);
	m_screen->pumpUntilIdle();
	EXPECT_EQ(std::string(1000, 'x'), numberLabel());
	EXPECT_EQ(nullptr, m_screen->findButton(tr("IDS_PB_SK_CREATE_ABB")));
}

TEST_F(TypePopupTest, LabelTrimmingTable)
{
	struct Case {
		const char* in;
		const char* out;
	};
	const Case cases[] = {{"  Boat  ", "Boat"}, {"   ", ""}, {"", ""}, {"a", "a"}, {" \tb c\n", "b c"}, {nullptr, ""}};
	for (const Case& c : cases)
		EXPECT_EQ(c.out, CtInputDataTypeCustomPopup::trimLabel(c.in)) << (c.in ? c.in : "null");
}
