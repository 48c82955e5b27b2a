// The basic info row: the name expanded to its parts and collapsed again,
// the split of a typed or pasted full name, field groups, storages where the
// name is read-only, and the picture's touch area.
#include "InputRowTestSupport.h"

#include "CtInputViewBasicInfoItem.h"

#include <Edje.h>

using namespace ct::test;

namespace {

using Row = CtInputViewBasicInfoItem;
using Strings = std::vector<std::string>;

class BasicInfoRowTest : public InputRowTest {
protected:
	Row* showRow(std::shared_ptr<CtInputData> data, int launchType = 0)
	{
		Row::Callbacks callbacks;
		callbacks.changed = [this] { ++m_calls.changed; };
		callbacks.groupDeleted = [this](Row::ITEM_DELETED group) { m_deletedGroups.push_back(group); };
		callbacks.nameChanged = [this](Evas_Object*) { ++m_nameChanges; };
		callbacks.showKeypad = [this] { ++m_keypadRequests; };
		callbacks.pictureClicked = [this] { ++m_pictureClicks; };
		auto* row = new Row(data, &m_nameEntry, callbacks, launchType);
		m_item = show(row);
		return row;
	}
	// The texts of the shown fields, top to bottom, by field.
	std::vector<std::pair<Row::Field, std::string>> shownFields(Row* row)
	{
		std::vector<std::pair<Row::Field, std::string>> out;
		for (int i = 0; i < Row::FIELD_COUNT; ++i)
			if (Evas_Object* entry = row->getFieldEntry(static_cast<Row::Field>(i)))
				out.emplace_back(static_cast<Row::Field>(i), CtInputViewGenlistItem::getEntryUtf8(entry));
		return out;
	}
	void settle() { m_screen->pumpUntilIdle(); }

	Evas_Object* m_nameEntry = nullptr;
	Elm_Object_Item* m_item = nullptr;
	std::vector<Row::ITEM_DELETED> m_deletedGroups;
	int m_nameChanges = 0;
	int m_keypadRequests = 0;
	int m_pictureClicks = 0;
};

int storeNamed(const char* first, const char* last, const char* nickname = nullptr)
{
	contacts_record_h contact = newContact(0, first);
	contacts_record_set_str(childAt(contact, _contacts_contact.name, 0), _contacts_name.last, last);
	if (nickname)
		addText(contact, _contacts_contact.nickname, _contacts_nickname._uri, _contacts_nickname.name, nickname);
	return store(contact);
}

} // namespace

TEST_F(BasicInfoRowTest, ExpandingShowsTheStoredPartsAndCollapsingTheJoinedNameAgain)
{
	auto data = edit(storeNamed("Ada", "Byron"));
	Row* row = showRow(data);
	using F = Row::Field;
	EXPECT_EQ((std::vector<std::pair<F, std::string>>{{F::NAME, "Ada Byron"}}), shownFields(row));
	EXPECT_EQ(row->getFieldEntry(F::NAME), m_nameEntry);
	EXPECT_FALSE(row->getIsEmpty());
	EXPECT_FALSE(row->getIsChanged());

	row->toggleNameExpanded();
	settle();
	EXPECT_EQ((std::vector<std::pair<F, std::string>>{{F::PREFIX, ""}, {F::FIRST, "Ada"}, {F::MIDDLE, ""},
				  {F::LAST, "Byron"}, {F::SUFFIX, ""}}),
		shownFields(row));
	EXPECT_EQ(row->getFieldEntry(F::FIRST), m_nameEntry);

	type(row->getFieldEntry(F::MIDDLE), "King");
	EXPECT_TRUE(row->getIsChanged());
	ASSERT_TRUE(ScreenHarness::click(elm_object_part_content_get(
		elm_object_parent_widget_get(elm_object_parent_widget_get(row->getFieldEntry(F::PREFIX))), "elm.icon.2")));
	settle();
	EXPECT_FALSE(row->isNameExpanded());
	EXPECT_EQ((std::vector<std::pair<F, std::string>>{{F::NAME, data->getFullName()}}), shownFields(row));
	EXPECT_NE(std::string::npos, data->getFullName().find("King"));
}

TEST_F(BasicInfoRowTest, ATypedOrPastedFullNameIsSplitIntoItsParts)
{
	auto data = editNew();
	Row* row = showRow(data);
	EXPECT_TRUE(row->getIsEmpty());
	Evas_Object* name = row->getFieldEntry(Row::NAME);
	type(name, "Grace");
	type(name, " Brewster Hopper");
	EXPECT_GE(m_nameChanges, 2);
	EXPECT_FALSE(row->getIsEmpty());
	row->toggleNameExpanded();
	settle();
	auto fields = shownFields(row);
	Strings parts;
	for (const auto& field : fields)
		parts.push_back(field.second);
	EXPECT_EQ((Strings{"", "Grace", "Brewster", "Hopper", ""}), parts);

	// A paste over the whole name, with markup characters, is split and kept as typed.
	row->toggleNameExpanded();
	settle();
	replaceText(row->getFieldEntry(Row::NAME), "Ada <&> Byron");
	EXPECT_EQ("Ada <&> Byron", data->getFullName());
	replaceText(row->getFieldEntry(Row::NAME), "");
	EXPECT_TRUE(row->getIsEmpty());
}

TEST_F(BasicInfoRowTest, NicknameGroupIsShownWhenStoredAndItsDeleteAsksTheOwner)
{
	auto data = edit(storeNamed("Ada", "Byron", "Countess"));
	Row* row = showRow(data);
	EXPECT_TRUE(row->getNicknameShown());
	EXPECT_FALSE(row->getOrganisationShown());
	EXPECT_TRUE(row->groupHasText(Row::NICKNAME));
	Evas_Object* nickname = row->getFieldEntry(Row::NICKNAME_FIELD);
	ASSERT_NE(nullptr, nickname);
	Evas_Object* field = elm_object_parent_widget_get(elm_object_parent_widget_get(nickname));
	ASSERT_TRUE(ScreenHarness::click(elm_object_part_content_get(field, "elm.icon.2")));
	EXPECT_EQ((std::vector<Row::ITEM_DELETED>{Row::NICKNAME}), m_deletedGroups);

	row->removeGroup(Row::NICKNAME);
	settle();
	EXPECT_EQ(nullptr, row->getFieldEntry(Row::NICKNAME_FIELD));
	EXPECT_EQ(nullptr, data->getNickname() && *data->getNickname() ? data->getNickname() : nullptr);
	EXPECT_FALSE(row->groupHasText(Row::NICKNAME));

	// An organisation shown by the owner and left empty holds nothing.
	row->setOrganisationShown(true);
	row->setFocusGroup(Row::FOCUS_ORGANISATION);
	row->refreshFields();
	settle();
	ASSERT_NE(nullptr, row->getFieldEntry(Row::COMPANY));
	EXPECT_FALSE(row->groupHasText(Row::ORGANISATION));
	type(row->getFieldEntry(Row::JOB_TITLE), "Analyst");
	EXPECT_TRUE(row->groupHasText(Row::ORGANISATION));
	EXPECT_STREQ("Analyst", data->getJobTitle());
}

TEST_F(BasicInfoRowTest, ProfileSharingStorageShowsTheNameDisabledAndTheExpandButtonInert)
{
	int book = addAddressbook("sharing", 0, 1, ContactsCommon::translate("IDS_PB_MBODY_PROFILE_SHARING"));
	auto data = edit(store(newContact(book, "Ada")));
	Row* row = showRow(data);
	ASSERT_TRUE(row->isProfileSharingStorage());
	EXPECT_TRUE(ScreenHarness::isDisabled(row->getFieldEntry(Row::NAME)));
	row->toggleNameExpanded();
	settle();
	EXPECT_FALSE(row->isNameExpanded());
	EXPECT_NE(nullptr, row->getFieldEntry(Row::NAME));
}

TEST_F(BasicInfoRowTest, PictureIsTappableExceptForTheCallerIdFlow)
{
	for (int launchType : {0, Row::kCallerIdLaunchType}) {
		auto data = editNew();
		Row* row = showRow(data, launchType);
		Evas_Object* picture = content(m_item, "elm.icon");
		ASSERT_NE(nullptr, picture);
		edje_object_message_signal_process(elm_layout_edje_get(picture));
		double value = 0;
		std::string state = edje_object_part_state_get(elm_layout_edje_get(picture), "touch_area", &value);
		EXPECT_EQ(launchType == 0 ? "enabled" : "default", state) << launchType;
		elm_layout_signal_emit(picture, "mouse,clicked,1", "touch_area");
		edje_object_message_signal_process(elm_layout_edje_get(picture));
		EXPECT_EQ(1, m_pictureClicks) << launchType;
		elm_object_item_del(row->getElmObjectItem());
	}
}

TEST_F(BasicInfoRowTest, NewContactAsksForTheKeypadOnceWhenTheStorageQuestionIsOff)
{
	preference_set_boolean("hide_storage_popup", true);
	Row* row = showRow(editNew());
	EXPECT_EQ(1, m_keypadRequests);
	row->refreshFields();
	settle();
	EXPECT_EQ(1, m_keypadRequests);
}
