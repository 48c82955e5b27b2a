// Every row kind of the edit form in one picture, for review, and the rows
// that only show what the owner picked (ringtone, groups, add buttons,
// add-field entries, the profile's number, the emergency rows).
#include "InputRowTestSupport.h"

#include "CtInputViewAddressItem.h"
#include "CtInputViewBasicInfoItem.h"
#include "CtInputViewEmailItem.h"
#include "CtInputViewEventItem.h"
#include "CtInputViewGroupsItem.h"
#include "CtInputViewImportantFieldsItem.h"
#include "CtInputViewImportantSubItem.h"
#include "CtInputViewMessengerItem.h"
#include "CtInputViewMsisdnItem.h"
#include "CtInputViewMultiImageItem.h"
#include "CtMyProfileInputData.h"
#include "CtInputViewNoteItem.h"
#include "CtInputViewNumberItem.h"
#include "CtInputViewRelationItem.h"
#include "CtInputViewRingtoneItem.h"
#include "CtInputViewStatusItem.h"
#include "CtInputViewWebsiteItem.h"
#include "CtPrimaryInputViewNameItem.h"
#include "CtPrimaryInputViewNumberItem.h"
#include "UsageLog.h"

#include <filesystem>

using namespace ct::test;

namespace {

using Strings = std::vector<std::string>;

contacts_record_h first(Eina_List* list)
{
	auto record = static_cast<contacts_record_h>(eina_list_data_get(list));
	eina_list_free(list);
	return record;
}

// A contact with a value in every field.
int storeFullContact(int groupId)
{
	contacts_record_h contact = newContact(0, "Ada");
	contacts_record_h name = childAt(contact, _contacts_contact.name, 0);
	contacts_record_set_str(name, _contacts_name.last, "Lovelace");
	contacts_record_set_str(name, _contacts_name.phonetic_first, "Ei-da");
	addText(contact, _contacts_contact.nickname, _contacts_nickname._uri, _contacts_nickname.name, "Countess");
	contacts_record_h company = addText(contact, _contacts_contact.company, _contacts_company._uri,
			_contacts_company.name, "Analytical Engines");
	contacts_record_set_str(company, _contacts_company.job_title, "Programmer");
	addNumber(contact, "020-7946-0018", CONTACTS_NUMBER_TYPE_CELL);
	addEmail(contact, "ada@example.com");
	contacts_record_h address = addText(contact, _contacts_contact.address, _contacts_address._uri,
			_contacts_address.street, "12 St James's Square");
	contacts_record_set_int(address, _contacts_address.type, CONTACTS_ADDRESS_TYPE_HOME);
	contacts_record_h messenger = addText(contact, _contacts_contact.messenger, _contacts_messenger._uri,
			_contacts_messenger.im_id, "ada.l");
	contacts_record_set_int(messenger, _contacts_messenger.type, CONTACTS_MESSENGER_TYPE_SKYPE);
	addText(contact, _contacts_contact.url, _contacts_url._uri, _contacts_url.url, "www.example.com/ada");
	contacts_record_h relation = addText(contact, _contacts_contact.relationship, _contacts_relationship._uri,
			_contacts_relationship.name, "Charles Babbage");
	contacts_record_set_int(relation, _contacts_relationship.type, CONTACTS_RELATIONSHIP_TYPE_FRIEND);
	contacts_record_h event = addChild(contact, _contacts_contact.event, _contacts_event._uri);
	contacts_record_set_int(event, _contacts_event.date, 18151210);
	contacts_record_set_int(event, _contacts_event.type, CONTACTS_EVENT_TYPE_BIRTH);
	addText(contact, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, "First programmer");
	contacts_record_set_str(contact, _contacts_contact.ringtone_path, "/usr/share/sounds/Over the horizon.ogg");
	contacts_record_h relationGroup = addChild(contact, _contacts_contact.group_relation, _contacts_group_relation._uri);
	contacts_record_set_int(relationGroup, _contacts_group_relation.group_id, groupId);
	return store(contact);
}

class FormRowsShotTest : public InputRowTest {
protected:
	template <class Row, class... Args>
	Row* add(Args&&... args)
	{
		auto* row = new Row(std::forward<Args>(args)...);
		m_view->append(row);
		return row;
	}
	std::string text(CtInputViewGenlistItem* row, const char* part)
	{
		return ScreenHarness::itemText(row->getElmObjectItem(), part);
	}
};

} // namespace

TEST_F(FormRowsShotTest, EveryRowKindOfTheFormInOnePicture)
{
	vconf_set_str(VCONFKEY_REGIONFORMAT, "en_US.UTF-8");
	// One tall window of the phone's width, so that every row is drawn.
	m_screen = std::make_unique<ScreenHarness>(360, 1780);
	m_view = new InputRowHostView();
	ASSERT_TRUE(m_screen->push(m_view));
	int groupId = addGroup(0, "Friends");
	auto data = edit(storeFullContact(groupId));
	auto calls = m_calls.callbacks();
	auto birthday = std::make_shared<bool>(true);

	add<CtInputViewBasicInfoItem>(data, nullptr, CtInputViewBasicInfoItem::Callbacks{}, 0);
	add<CtInputViewNumberItem>(data, first(data->getNumberList()), 0, calls, "020-7946-0018");
	add<CtInputViewEmailItem>(data, first(data->getEmailList()), 0, calls, "ada@example.com");
	add<CtInputViewNoteItem>(data, first(data->getNoteList()), 0, calls, "First programmer");
	add<CtInputViewAddressItem>(data, first(data->getAddressList()), 0, calls, "12 St James's Square");
	add<CtInputViewEventItem>(data, first(data->getEventList()), "18151210", birthday, calls, nullptr);
	add<CtInputViewRelationItem>(data, first(data->getRelationshipList()), 0, calls, "Charles Babbage");
	add<CtInputViewWebsiteItem>(data, first(data->getWebsiteList()), 0, calls, "www.example.com/ada");
	add<CtInputViewMessengerItem>(data, first(data->getMessengerList()), 0, calls, "ada.l");
	add<CtInputViewStatusItem>(data, nullptr, 0, calls, nullptr);
	auto* ringtone = add<CtInputViewRingtoneItem>(data, calls, nullptr);
	auto* groups = add<CtInputViewGroupsItem>(data, nullptr);
	add<CtInputViewImportantFieldsItem>(std::array<std::function<void()>, 4>{});
	add<CtInputViewImportantSubItem>(3, CtInputViewImportantSubItem::Mode::Contact);
	add<CtInputViewMsisdnItem>(data, first(data->getNumberList()));
	add<CtPrimaryInputViewNameItem>(data, CtPrimaryInputViewNameItem::Callbacks{}, 0);
	add<CtPrimaryInputViewNumberItem>(data, data->addNumber("112"), calls, "112");
	add<CtInputViewMultiImageItem>(std::make_shared<CtMyProfileInputData>(nullptr), nullptr, nullptr);
	m_screen->pumpUntilIdle();

	EXPECT_EQ("Over the horizon", text(ringtone, "elm.text.main.left.bottom"));
	EXPECT_EQ((std::vector<int>{groupId}), groups->getGroupIds());
	EXPECT_EQ("Friends", text(groups, "elm.text.main.left.bottom"));
	std::string dir = std::string(getenv("CONTACTS_TEST_BIN_DIR") ? getenv("CONTACTS_TEST_BIN_DIR") : "/tmp")
		+ "/test-output/input";
	std::filesystem::create_directories(dir);
	EXPECT_TRUE(m_screen->savePng(dir + "/form_rows.png"));
}

TEST_F(FormRowsShotTest, RingtoneDeleteGoesBackToTheDefaultAndCountsAsChanged)
{
	contacts_record_h contact = newContact(0, "Ada");
	contacts_record_set_str(contact, _contacts_contact.ringtone_path, "/sounds/Bell.ogg");
	auto data = edit(store(contact));
	int selections = 0;
	auto* row = add<CtInputViewRingtoneItem>(data, m_calls.callbacks(), [&selections] { ++selections; });
	m_screen->pumpUntilIdle();
	EXPECT_EQ("Bell", row->getRingtoneName());
	ScreenHarness::selectItem(row->getElmObjectItem());
	EXPECT_EQ(1, selections);
	ASSERT_TRUE(ScreenHarness::click(content(row->getElmObjectItem(), "elm.icon.2")));
	m_screen->pumpUntilIdle();
	ASSERT_EQ(1u, m_calls.deleted.size());
	EXPECT_TRUE(m_calls.deleted[0].heldText);
	EXPECT_EQ(nullptr, data->getRingtone() && *data->getRingtone() ? data->getRingtone() : nullptr);
}

TEST_F(FormRowsShotTest, AddButtonsRunTheOwnersActionsUnlessDisabled)
{
	Strings pressed;
	std::array<std::function<void()>, 4> actions;
	const char* names[] = {"phone", "email", "note", "more"};
	for (int i = 0; i < 4; ++i)
		actions[i] = [&pressed, name = names[i]] { pressed.push_back(name); };
	auto* row = add<CtInputViewImportantFieldsItem>(actions);
	m_screen->pumpUntilIdle();
	row->setButtonDisabled(CtInputViewImportantFieldsItem::NOTE, true);
	for (int i = 0; i < 4; ++i)
		ScreenHarness::click(row->getButton(static_cast<CtInputViewImportantFieldsItem::Button>(i)));
	EXPECT_EQ((Strings{"phone", "email", "more"}), pressed);
	// The disabled state survives a rebuild of the row.
	elm_genlist_item_update(row->getElmObjectItem());
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(ScreenHarness::isDisabled(row->getButton(CtInputViewImportantFieldsItem::NOTE)));
}

TEST_F(FormRowsShotTest, AddFieldEntriesFollowTheModesLabelSets)
{
	using Sub = CtInputViewImportantSubItem;
	EXPECT_STREQ("IDS_PB_HEADER_SAVE_CONTACTS_TO_ABB", Sub::getTextId(1, Sub::Mode::Contact));
	EXPECT_STREQ("IDS_PB_OPT_RINGTONE", Sub::getTextId(11, Sub::Mode::Contact));
	EXPECT_STREQ("IDS_PB_BODY_ADDRESS_ABB2", Sub::getTextId(1, Sub::Mode::MyProfile));
	EXPECT_STREQ("IDS_PB_BODY_PHONETIC_NAME_ABB", Sub::getTextId(7, Sub::Mode::MyProfile));
	for (auto [entry, mode] : {std::make_pair(0, Sub::Mode::Contact), std::make_pair(12, Sub::Mode::Contact),
			 std::make_pair(8, Sub::Mode::MyProfile)})
		EXPECT_EQ(nullptr, Sub::getTextId(entry, mode)) << entry;
	auto* row = add<Sub>(4, Sub::Mode::MyProfile);
	m_screen->pumpUntilIdle();
	EXPECT_EQ(tr("IDS_PB_OPT_ORGANISATION_ABB"), text(row, "elm.text.main.left"));
}

TEST_F(FormRowsShotTest, EmergencyNumberRowFormatsAndLogsItsUse)
{
	vconf_set_str(VCONFKEY_REGIONFORMAT, "en_US.UTF-8");
	auto data = editNew();
	contacts_record_h number = data->addNumber("");
	auto* row = add<CtPrimaryInputViewNumberItem>(data, number, m_calls.callbacks(), nullptr);
	m_screen->pumpUntilIdle();
	ASSERT_NE(nullptr, row->getEntry());
	EXPECT_EQ(nullptr, row->getHoverselObj());
	type(row->getEntry(), "6502530000");
	EXPECT_STREQ("650-253-0000", data->getNumberNumber(number));
	bool logged = false;
	for (const ct::usagelog::Record& record : ct::usagelog::records())
		logged |= record.feature == "0041";
	EXPECT_TRUE(logged);

	auto* name = add<CtPrimaryInputViewNameItem>(data, CtPrimaryInputViewNameItem::Callbacks{}, 0);
	m_screen->pumpUntilIdle();
	EXPECT_TRUE(name->getIsEmpty());
	type(name->getEntry(), "Mum");
	EXPECT_EQ("Mum", data->getFullName());
	EXPECT_TRUE(name->getIsChanged());
}
