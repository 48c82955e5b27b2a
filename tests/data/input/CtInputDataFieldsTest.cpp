// The editable contact in memory: type tables, next types, name splits and
// composed texts, addresses, bad texts.
#include "CtInputData.h"
#include "ContactsCommon.h"
#include "InputTestStore.h"

#include <glib.h>

using namespace ct::test;
using namespace CtDataType;

namespace {

class CtInputDataFieldsTest : public InputStoreTest {
protected:
	void SetUp() override
	{
		InputStoreTest::SetUp();
		m_data = std::make_unique<CtInputData>(nullptr);
	}
	void TearDown() override
	{
		m_data.reset();
		InputStoreTest::TearDown();
	}

	contacts_record_h name()
	{
		return childAt(m_data->getContactRecord(), _contacts_contact.name, 0);
	}

	// "prefix|first|middle|last|suffix" of the edited name.
	std::string nameParts()
	{
		return str(m_data->getPrefixName()) + "|" + str(m_data->getFirstName()) + "|" + str(m_data->getMiddleName())
			+ "|" + str(m_data->getLastName()) + "|" + str(m_data->getSuffixName());
	}

	std::unique_ptr<CtInputData> m_data;
};

} // namespace

TEST(CtDataTypeTables, NumberAndMessengerPositionsBothWays)
{
	// Past the tables the type is the index itself; the jabber row sits on the custom one.
	EXPECT_EQ(numberTypeByIndex(-3), -3);
	EXPECT_EQ(messengerTypeByIndex(-1), -1);
	EXPECT_EQ(messengerTypeByIndex(5, CONTACTS_MESSENGER_TYPE_JABBER), 9);

	// Custom bit first, cell before voice; unknown bits are custom.
	const std::pair<int, int> numberIndexes[] = {{1 | 64, 9}, {64 | 8, 2}, {10, 4}, {12, 3}, {8, 2}, {18, 7},
		{20, 6}, {16, 2}, {128, 8}, {1 << 29, 5}, {2, 4}, {4, 3}, {0, 9}, {1 << 12, 9}};
	for (const auto& [type, index] : numberIndexes)
		EXPECT_EQ(numberIndexByType(type), index) << type;
	EXPECT_EQ(numberIndexByType(8, 9), 9); // the profile's rule for plain voice and fax
	const std::pair<int, int> messengerIndexes[] = {{1, 0}, {2, 5}, {4, 2}, {6, 6}, {7, 1}, {8, 4}, {10, 3},
		{3, 7}, {5, 7}, {9, 7}, {0, 7}, {11, 7}};
	for (const auto& [type, index] : messengerIndexes)
		EXPECT_EQ(messengerIndexByType(type), index) << type;
	EXPECT_EQ(messengerIndexByType(2, 7), 7);

	// The profile's menu: {position or type, contact's answer, profile's answer}.
	struct Both {
		int given, contact, profile;
	};
	for (const Both& c : {Both{5, 2, 9}, Both{4, 8, 8}, Both{7, 9, 9}})
		EXPECT_EQ((std::pair{messengerTypeByIndex(c.given, kContactMessengerMenu),
			messengerTypeByIndex(c.given, kProfileMessengerMenu)}), (std::pair{c.contact, c.profile})) << c.given;
	for (const Both& c : {Both{2, 5, 7}, Both{9, 7, 7}, Both{10, 3, 3}})
		EXPECT_EQ((std::pair{messengerIndexByType(c.given, kContactMessengerMenu),
			messengerIndexByType(c.given, kProfileMessengerMenu)}), (std::pair{c.contact, c.profile})) << c.given;
}

TEST(CtDataTypeTables, NextTypes)
{
	std::vector<int> allRelationships;
	for (int t = 1; t <= 14; ++t)
		allRelationships.push_back(t);
	const std::vector<int> sixMessengers = {7, 4, 10, 8, 2, 6};
	// {what the helper gives, what it should give}
	const std::pair<int, int> cases[] = {{nextNumberType({}), 64}, {nextNumberType({64, 12, 10}), 1 << 29},
		{nextNumberType({64, 12, 10, 1 << 29, 20, 18, 128}), 0}, {nextNumberType({64, 12, 10, 1 << 29, 20, 18}), 128},
		{nextHomeWorkType({}), 2}, {nextHomeWorkType({2 | 1}), 4}, {nextHomeWorkType({6}), 0},
		{nextEventType({}), 2}, {nextEventType({2}), 3}, {nextEventType({3, 2}), 0}, {nextEventType({3}), 2},
		{nextRelationshipType({}), 1}, {nextRelationshipType({1, 2, 0, 15, -4}), 3},
		{nextRelationshipType(allRelationships), 14}, {nextMessengerType({}), 7}, {nextMessengerType({7, 4}), 10},
		{nextMessengerType(sixMessengers), 9}, {nextMessengerType(sixMessengers, CONTACTS_MESSENGER_TYPE_CUSTOM), 1},
		{nextMessengerType({7, 4, 10, 8, 9, 6}, kContactMessengerMenu), 2},
		{nextMessengerType({7, 4, 10, 8, 9, 6}, kProfileMessengerMenu), 9},
		{nextMessengerType(sixMessengers, kProfileMessengerMenu), 9}};
	for (size_t i = 0; i < std::size(cases); ++i)
		EXPECT_EQ(cases[i].first, cases[i].second) << "case " << i;
}

TEST_F(CtInputDataFieldsTest, AddedChildrenTakeTheNextFreeType)
{
	for (const char* n : {"1", "2", "3"})
		m_data->addNumber(n);
	contacts_record_h fourth = m_data->addNumber("4");
	EXPECT_EQ(m_data->getDataType(fourth, _contacts_number.type), 1 << 29);
	for (const char* n : {"5", "6", "7"})
		m_data->addNumber(n);
	EXPECT_EQ(m_data->getNextNumberType(), 0);

	// {e-mail added, next e-mail, event added, next event, relationship added, messenger added, next address}
	EXPECT_EQ((std::vector<int>{2, 4, 2, 3, 1, 7, 2}), (std::vector<int>{
		m_data->getDataType(m_data->addEmail("a@x"), _contacts_email.type), m_data->getNextEmailType(),
		m_data->getDataType(m_data->addEvent(20010203), _contacts_event.type), m_data->getNextEventType(),
		m_data->getDataType(m_data->addRelationship("Bo"), _contacts_relationship.type),
		m_data->getDataType(m_data->addMessenger("im"), _contacts_messenger.type), m_data->getNextAddressType()}));

	// A negative type stores custom with its label.
	ASSERT_EQ(m_data->setNumberType(fourth, -1, "Boat"), 0);
	EXPECT_EQ(m_data->getDataType(fourth, _contacts_number.type), 1);
	EXPECT_EQ(str(m_data->getDataTypeCustom(fourth, _contacts_number.label)), "Boat");
	EXPECT_EQ(m_data->getNumberIndexType(m_data->getDataType(fourth, _contacts_number.type)), 9);

	Eina_List* numbers = m_data->getNumberList();
	EXPECT_EQ(eina_list_count(numbers), 7u);
	EXPECT_EQ(eina_list_nth(numbers, 3), fourth);
	eina_list_free(numbers);
	EXPECT_EQ(m_data->removeNumber(fourth), 0);
	EXPECT_EQ(m_data->getNextNumberType(), 1 << 29);
	EXPECT_NE(m_data->removeNumber(nullptr), 0);
}

TEST_F(CtInputDataFieldsTest, FullNameSplitsFromTheBackAndPhoneticNameFromTheFront)
{
	// The prefix set before goes with the old name.
	m_data->setPrefixName("Dr.");
	struct Split {
		const char* full;
		const char* parts;
		const char* shown;
	} splits[] = {{"Anna Maria Lopez Diaz, Jr. PhD", "<null>|Anna Maria|Lopez|Diaz|Jr. PhD", "Anna Maria Lopez Diaz, Jr. PhD"},
		{",Jr", "<null>|<null>|<null>|<null>|Jr", "Jr"}, {"  Kim   Lee  ", "<null>|Kim|<null>|Lee|<null>", "Kim Lee"},
		{"Cher, a, b", "<null>|Cher|<null>|<null>|a, b", "Cher, a, b"}};
	for (const Split& split : splits) {
		ASSERT_EQ(m_data->setFullName(split.full), 0);
		EXPECT_EQ(nameParts(), split.parts) << split.full;
		EXPECT_EQ(m_data->getFullName(), split.shown);
	}
	EXPECT_EQ(m_data->separateFullName(nullptr, "x"), -1);
	EXPECT_EQ(m_data->separateFullName(name(), nullptr), -1);

	const std::pair<const char*, const char*> phonetics[] = {{"Ho Yun Jae Min", "Ho|Yun|Jae Min"},
		{"Ho Yun", "Ho|<null>|Yun"}, {"Ho", "Ho|<null>|<null>"}};
	for (const auto& [full, parts] : phonetics) {
		ASSERT_EQ(m_data->setPhoneticFullName(full), 0);
		EXPECT_EQ(str(m_data->getPhoneticFirstName()) + "|" + str(m_data->getPhoneticMiddleName()) + "|"
				+ str(m_data->getPhoneticLastName()), parts);
		EXPECT_EQ(m_data->getPhoneticFullName(), full);
	}
	m_data->setPhoneticFullName(nullptr);
	EXPECT_EQ(m_data->getPhoneticFullName(), "");
	EXPECT_EQ(m_data->separatePhoneticFullName(nullptr, "x"), -1);
}

TEST_F(CtInputDataFieldsTest, LongAndInvalidTextsAreCutOrRefused)
{
	std::string longName = std::string(1020, 'a') + " \xC3\xA9\xC3\xA9\xC3\xA9 tail";
	ASSERT_EQ(m_data->setFullName(longName.c_str()), 0);
	std::string full = m_data->getFullName();
	EXPECT_LT(full.size(), 1024u);
	EXPECT_TRUE(g_utf8_validate(full.c_str(), -1, nullptr));
	EXPECT_EQ(full.find("tail"), std::string::npos);

	m_data->setFullName("Dr Kept Name, Sr");
	EXPECT_NE(m_data->setFullName("Bad\xFF" "Name"), 0);
	EXPECT_NE(m_data->setPhoneticFullName("\xC3"), 0);
	EXPECT_EQ(m_data->getFullName(), "Dr Kept Name, Sr"); // nothing half-applied
	contacts_record_h number = m_data->addNumber("123");
	EXPECT_NE(m_data->setNumberNumber(number, "1\xFE"), 0);
	EXPECT_EQ(str(m_data->getNumberNumber(number)), "123");
	EXPECT_EQ(m_data->setNumberNumber(number, nullptr), 0);
	EXPECT_EQ(str(m_data->getNumberNumber(number)), "123");
}

TEST_F(CtInputDataFieldsTest, CompanyAndAddressTexts)
{
	m_data->setCompany("Acme");
	contacts_record_h company = childAt(m_data->getContactRecord(), _contacts_contact.company, 0);
	contacts_record_set_str(company, _contacts_company.department, "Labs");
	EXPECT_EQ(m_data->getCompany(), "Acme Labs");
	m_data->setCompany("");
	contacts_record_set_str(company, _contacts_company.department, "Labs");
	EXPECT_EQ(m_data->getCompany(), "Labs");
	m_data->setCompany("Acme");
	EXPECT_EQ(m_data->getCompany(), "Acme");

	contacts_record_h address = m_data->addAddress("1 Main St");
	contacts_record_set_str(address, _contacts_address.postal_code, "12345");
	contacts_record_set_str(address, _contacts_address.country, "Utopia");
	char buffer[64];
	ASSERT_EQ(m_data->getAddressAddress(address, buffer, sizeof(buffer)), 0);
	EXPECT_STREQ(buffer, "12345\n1 Main St\nUtopia");
	ASSERT_EQ(m_data->getAddressAddress(address, buffer, 8), 0);
	EXPECT_STREQ(buffer, "12345\n1");
	m_data->setAddressAddress(address, "Elsewhere");
	ASSERT_EQ(m_data->getAddressAddress(address, buffer, sizeof(buffer)), 0);
	EXPECT_STREQ(buffer, "Elsewhere");
	EXPECT_NE(m_data->getAddressAddress(address, nullptr, 10), 0);
}

TEST_F(CtInputDataFieldsTest, ImagesEventsGroupsAndEmergencyOfANewContact)
{
	EXPECT_EQ(m_data->setImage(nullptr, "", 0), 0);
	EXPECT_EQ(m_data->getImageRecord(), nullptr);
	ASSERT_EQ(m_data->setImage(nullptr, "/pics/a.jpg", 0), 0);
	EXPECT_EQ(str(m_data->getImagePath()), "/pics/a.jpg");
	EXPECT_EQ(m_data->removeImage(m_data->getImageRecord()), 0);
	EXPECT_EQ(m_data->getImagePath(), nullptr);

	contacts_record_h event = m_data->addEvent(19991231);
	EXPECT_EQ(m_data->getEventEvent(event), 19991231);
	m_data->setCalendarType(event, 7); // no such calendar
	EXPECT_EQ(m_data->getCalendarType(event), 0);
	EXPECT_EQ(m_data->getEventEvent(nullptr), 0);

	EXPECT_EQ(m_data->getGroupsName(), ContactsCommon::translate("IDS_PB_BODY_NOT_ASSIGNED"));
	EXPECT_EQ(m_data->getEmergencyNumber(), nullptr);
}
