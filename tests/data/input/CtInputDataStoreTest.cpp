// The editable contact against the store: loading from records and launch
// requests, storage choice, saving (atomic under write faults), SIM saving,
// groups, emergency number and change notification.
#include "CtInputData.h"
#include "CtCommonAddressbookUtil.h"
#include "InputTestStore.h"

#include "LogSink.h"
#include "SqliteFaultInjector.h"

#include <sqlite3.h>

#include <cstdlib>
#include <fstream>

using namespace ct::test;

namespace {

// A stored phone contact "Ada Byron" with one mobile number; returns its id.
int storeAda()
{
	contacts_record_h contact = newContact(0, "Ada");
	contacts_record_set_str(childAt(contact, _contacts_contact.name, 0), _contacts_name.last, "Byron");
	addNumber(contact, "0101", CONTACTS_NUMBER_TYPE_CELL);
	return store(contact);
}

// The stored contact as "first|last|numbers|e-mails|notes|ringtone" (lists
// joined by commas), or "<gone>".
std::string snapshot(int contactId)
{
	contacts_record_h contact = readContact(contactId);
	if (!contact)
		return "<gone>";
	contacts_record_h name = childAt(contact, _contacts_contact.name, 0);
	std::string out = textOf(name, _contacts_name.first) + "|" + textOf(name, _contacts_name.last);
	const std::pair<unsigned int, unsigned int> lists[] = {{_contacts_contact.number, _contacts_number.number},
		{_contacts_contact.email, _contacts_email.email}, {_contacts_contact.note, _contacts_note.note}};
	for (const auto& [list, text] : lists) {
		out += "|";
		for (int i = 0; contacts_record_h child = childAt(contact, list, i); ++i)
			out += (i ? "," : "") + textOf(child, text);
	}
	out += "|" + textOf(contact, _contacts_contact.ringtone_path);
	contacts_record_destroy(contact, true);
	return out;
}

// The list's length; frees the list (not its records).
size_t countOf(Eina_List* list)
{
	size_t count = eina_list_count(list);
	eina_list_free(list);
	return count;
}

// The contact's stored ringtone as "path|flag|position" ("<null>" path when none).
std::string ringtoneInfo(int contactId)
{
	char* path = nullptr;
	int flag = -1;
	long long position = -1;
	contacts_utils_get_ringtone_info(CONTACTS_RINGTONE_KIND_CONTACT, contactId, &path, &flag, &position);
	std::string out = str(path) + "|" + std::to_string(flag) + "|" + std::to_string(position);
	free(path);
	return out;
}

int countContacts()
{
	int count = 0;
	contacts_db_get_count(_contacts_contact._uri, &count);
	return count;
}

// Runs save() with the Nth write failing, N = 1, 2, ... until it succeeds;
// every failed run must leave state() (read after a reopen) as it was.
template <typename Save, typename State>
void expectSavedDespiteWriteFaults(Save save, State state)
{
	const std::string before = state();
	for (int n = 1; n < 50; ++n) {
		int err;
		{
			ct::db::ScopedWriteFailure failure(n);
			err = save();
		}
		reopenStore();
		if (err == 0)
			return;
		EXPECT_EQ(state(), before) << "write " << n << " error " << err;
	}
	ADD_FAILURE() << "never saved";
}

} // namespace

using CtInputDataStoreTest = InputStoreTest;

TEST_F(CtInputDataStoreTest, InsertedContactIsStoredUnlinkedWithItsRingtoneCustomTypesAndLunarDates)
{
	int first = personOf(storeAda());
	int id = 0;
	{
		CtInputData data(nullptr);
		data.setFullName("Ada Byron");
		data.addNumber("0101");
		data.setRingtone("/snd/bell.ogg", "2500");
		// Every kind with a custom type (a negative type and a label).
		data.setNumberType(data.getDefaultNumber(), -1, "Boat");
		data.setEmailType(data.addEmail("a@x"), -1, "Club");
		data.setAddressType(data.addAddress("1 Main St"), -1, "Cabin");
		data.setMessengerType(data.addMessenger("ada"), -1, "Pager");
		data.setRelationshipType(data.addRelationship("Bo"), -1, "Mentor");
		contacts_record_h lunar = data.addEvent(20200115);
		data.setEventType(lunar, -1, "Feast");
		data.setCalendarType(lunar, CONTACTS_EVENT_CALENDAR_TYPE_LUNAR);
		data.setIsLeapMonth(lunar, true);
		data.addEvent(19991231);
		ASSERT_EQ(data.insertContact(&id), 0);
	}
	reopenStore();
	// Link mode "ignore once": the store must not join it to the other Ada.
	contacts_record_h stored = readContact(id);
	int linkMode = -1;
	contacts_record_get_int(stored, _contacts_contact.link_mode, &linkMode);
	contacts_record_destroy(stored, true);
	EXPECT_EQ(linkMode, CONTACTS_CONTACT_LINK_MODE_IGNORE_ONCE);
	EXPECT_NE(personOf(id), first);
	EXPECT_EQ(snapshot(id), "Ada|Byron|0101|a@x||/snd/bell.ogg");
	EXPECT_EQ(ringtoneInfo(id), "/snd/bell.ogg|1|2500");

	CtInputData loaded(readContact(id));
	std::vector<std::string> types;
	const std::pair<Eina_List*, std::pair<unsigned int, unsigned int>> kinds[] = {
		{loaded.getNumberList(), {_contacts_number.type, _contacts_number.label}},
		{loaded.getEmailList(), {_contacts_email.type, _contacts_email.label}},
		{loaded.getAddressList(), {_contacts_address.type, _contacts_address.label}},
		{loaded.getMessengerList(), {_contacts_messenger.type, _contacts_messenger.label}},
		{loaded.getRelationshipList(), {_contacts_relationship.type, _contacts_relationship.label}},
		{loaded.getEventList(), {_contacts_event.type, _contacts_event.label}}};
	for (const auto& [list, properties] : kinds) {
		auto record = static_cast<contacts_record_h>(eina_list_data_get(list));
		types.push_back(std::to_string(loaded.getDataType(record, properties.first)) + ":"
			+ str(loaded.getDataTypeCustom(record, properties.second)));
		eina_list_free(list);
	}
	EXPECT_EQ(types, (std::vector<std::string>{"1:Boat", "1:Club", "1:Cabin", "1:Pager", "15:Mentor", "1:Feast"}));

	// {date, calendar, leap month} of each event, read back.
	std::vector<std::string> events;
	Eina_List* list = loaded.getEventList();
	for (Eina_List* l = list; l; l = eina_list_next(l)) {
		auto event = static_cast<contacts_record_h>(eina_list_data_get(l));
		events.push_back(std::to_string(loaded.getEventEvent(event)) + "/" + std::to_string(loaded.getCalendarType(event))
			+ "/" + std::to_string(loaded.getIsLeapMonth(event)));
	}
	eina_list_free(list);
	EXPECT_EQ(events, (std::vector<std::string>{"20200115/1/1", "19991231/0/0"}));
}

TEST_F(CtInputDataStoreTest, EditLoadsThePersonAndUpdatesOneField)
{
	int id = storeAda();
	auto edit = request(APP_CONTROL_OPERATION_EDIT, {{APP_CONTROL_DATA_ID, std::to_string(personOf(id))},
		{APP_CONTROL_DATA_PHONE, "0202"}, {APP_CONTROL_DATA_URL, "example.org"}});
	{
		CtInputData data(nullptr, edit.get());
		EXPECT_EQ(data.getContactId(), id);
		EXPECT_EQ(data.getPersonId(), personOf(id));
		EXPECT_EQ(data.getFullName(), "Ada Byron");
		EXPECT_EQ(countOf(data.getNumberList()), 2u);
		data.setLastName("Lovelace");
		ASSERT_EQ(data.updateContact(), 0);
	}
	reopenStore();
	EXPECT_EQ(snapshot(id), "Ada|Lovelace|0101,0202|||");
}

TEST_F(CtInputDataStoreTest, LaunchRequestsWithBadOrMissingIdsGiveANewContact)
{
	int person = personOf(storeAda());
	ASSERT_EQ(contacts_db_delete_record(_contacts_person._uri, person), 0);
	for (const std::string& badId : {std::string(), std::string("abc"), std::string("12abc"),
			 std::string("99999999999999"), std::to_string(person)}) {
		CtInputData data(nullptr, request(APP_CONTROL_OPERATION_EDIT, {{APP_CONTROL_DATA_ID, badId}}).get());
		EXPECT_EQ(data.getContactId(), 0) << badId;
		EXPECT_EQ(data.getFullName(), "") << badId;
	}
	ct::log::clear();
	CtInputData data(nullptr, request(APP_CONTROL_OPERATION_PICK, {{"name", "Nobody"}}).get());
	EXPECT_TRUE(ct::log::contains("* Critical * wrong operation requested " APP_CONTROL_OPERATION_PICK));
	EXPECT_EQ(data.getContactId(), 0);
	EXPECT_EQ(data.getFullName(), "");
	EXPECT_EQ(CtInputData(nullptr, nullptr).getContactId(), 0);
}

TEST_F(CtInputDataStoreTest, AddAndSocialRequestsApplyTheirExtras)
{
	CtInputData data(nullptr, request(APP_CONTROL_OPERATION_ADD, {{APP_CONTROL_DATA_PHONE, "555"},
		{APP_CONTROL_DATA_EMAIL, "a@x"}, {APP_CONTROL_DATA_URL, "w.org"},
		{APP_CONTROL_DATA_NAME, "Grace Brewster Hopper"}}).get());
	EXPECT_EQ(str(data.getNumberNumber(data.getDefaultNumber())), "555");
	EXPECT_EQ(str(data.getEmailEmail(data.getDefaultEmail())), "a@x");
	EXPECT_EQ(str(data.getMiddleName()), "Brewster");
	Eina_List* sites = data.getWebsiteList();
	ASSERT_EQ(eina_list_count(sites), 1u);
	EXPECT_EQ(str(data.getWebsiteWebsite(static_cast<contacts_record_h>(eina_list_data_get(sites)))), "w.org");
	eina_list_free(sites);

	CtInputData fromSocial(nullptr, request(APP_CONTROL_OPERATION_SOCIAL_ADD, {{APP_CONTROL_DATA_SOCIAL_PHONE,
		"777"}, {APP_CONTROL_DATA_PHONE, "ignored"}, {APP_CONTROL_DATA_NAME, "ignored"}}).get());
	EXPECT_EQ(countOf(fromSocial.getNumberList()), 1u);
	EXPECT_EQ(str(fromSocial.getNumberNumber(fromSocial.getDefaultNumber())), "777");
	EXPECT_EQ(fromSocial.getFullName(), "");

	int id = storeAda();
	CtInputData edited(nullptr, request(APP_CONTROL_OPERATION_SOCIAL_EDIT, {{APP_CONTROL_DATA_SOCIAL_ITEM_ID,
		std::to_string(personOf(id))}, {APP_CONTROL_DATA_SOCIAL_EMAIL, "ada@x"}}).get());
	EXPECT_EQ(edited.getContactId(), id);
	EXPECT_EQ(str(edited.getEmailEmail(edited.getDefaultEmail())), "ada@x");
}

TEST_F(CtInputDataStoreTest, OwnKeysOfTheContactsApplicationAndThePrimaryEdit)
{
	int id = storeAda();
	std::string person = std::to_string(personOf(id));
	auto plain = request(nullptr, {{"person_id", person}, {"ct_num", "0303"}, {"ct_address", "1 Main St"},
		{"ct_phonetic_name", "A Da"}, {"name", "Ada King"}});
	CtInputData data(nullptr, plain.get());
	EXPECT_EQ(data.getContactId(), id);
	EXPECT_EQ(data.getFullName() + "|" + data.getPhoneticFullName(), "Ada King|A Da");
	EXPECT_EQ((std::vector<size_t>{countOf(data.getNumberList()), countOf(data.getAddressList())}), (std::vector<size_t>{2, 1}));

	// Types 21 to 23 on a stored contact take no numbers, e-mails or sites; on a new one they do.
	CtInputData limited(nullptr, request(APP_CONTROL_OPERATION_DEFAULT, {{"person_id", person}, {"type", "22"},
		{"ct_num", "0303"}, {"ct_email", "x@y"}}).get());
	EXPECT_EQ(limited.getInputType(), 22);
	EXPECT_EQ(countOf(limited.getNumberList()), 1u);
	EXPECT_EQ(limited.getDefaultEmail(), nullptr);
	CtInputData created(nullptr, request(nullptr, {{"type", "21"}, {"ct_num", "0404"}}).get());
	EXPECT_EQ(str(created.getNumberNumber(created.getDefaultNumber())), "0404");

	// A person id passed by the caller wins over the request's.
	EXPECT_EQ(CtInputData(nullptr, plain.get(), 424242).getContactId(), 0);

	// Type 112 edits the person's display contact.
	CtInputData display(nullptr, request(nullptr, {{"person_id", person}, {"type", "112"}}).get());
	EXPECT_EQ(display.getContactId(), id);
	display.setFirstName("Augusta");
	ASSERT_EQ(display.updateContact(), 0);
	reopenStore();
	EXPECT_EQ(snapshot(id), "Augusta|Byron|0101|||");
}

TEST_F(CtInputDataStoreTest, PrimaryEditOfALinkedPersonPutsThePictureOnItsWritableContact)
{
	// The display contact lives in a read-only account; the phone contact linked to it can be written.
	int readOnly = addAddressbook("ro@example.com", CONTACTS_ADDRESS_BOOK_MODE_READONLY, 9, "Social");
	int shown = store(newContact(readOnly, "Shown"));
	int writable = store(newContact(0, "Writable"));
	int person = linkContacts({shown, writable});
	auto imagePath = [](int contactId) {
		contacts_record_h contact = readContact(contactId);
		std::string path = textOf(childAt(contact, _contacts_contact.image, 0), _contacts_image.path);
		contacts_record_destroy(contact, true);
		return path;
	};
	{
		CtInputData data(nullptr, request(nullptr, {{"person_id", std::to_string(person)}, {"type", "112"}}).get());
		ASSERT_EQ(data.getContactId(), shown);
		ASSERT_EQ(data.setImage(nullptr, "/pics/p.jpg", 0), 0);
		EXPECT_EQ(str(data.getImagePath()), "/pics/p.jpg");
		data.setFirstName("Shown Again");
		ASSERT_EQ(data.updateContact(), 0);
	}
	reopenStore();
	EXPECT_EQ((std::vector<std::string>{imagePath(shown), imagePath(writable), snapshot(shown), snapshot(writable)}),
		(std::vector<std::string>{"", "/pics/p.jpg", "Shown Again|||||", "Writable|||||"}));
}

TEST_F(CtInputDataStoreTest, GoogleStorageJoinsItsDefaultGroupOnceAndGroupNamesShowTheEmergencyGroup)
{
	int google = addAddressbook("g@example.com", 0, 7, "Google");
	int other = addAddressbook("o@example.com", 0, 7, "Other");
	int myContacts = addGroup(google, "My Contacts", "contacts");
	addGroup(other, "Theirs", "contacts");
	CtInputData data(nullptr);
	data.setAddressbookInfo(other);
	std::vector<int> groups;
	data.getAllGroupsId(groups);
	EXPECT_TRUE(groups.empty());
	EXPECT_EQ(str(data.getAddressbookName()), "Other");
	data.setAddressbookInfo(google);
	data.setAddressbookInfo(google);
	data.getAllGroupsId(groups);
	EXPECT_EQ(groups, std::vector<int>{myContacts});
	data.updateGroupsName();
	EXPECT_EQ(data.getGroupsName(), ctCommonGetDisplayGroupName("contacts"));
	data.removeAllGroups();

	int friends = addGroup(0, "Friends");
	int emergency = addGroup(0, "Emergency", "emergency");
	int twin = addGroup(0, "Friends");
	for (int group : {friends, emergency, twin})
		data.addGroupRelation(group);
	data.updateGroupsName();
	EXPECT_TRUE(data.isInEmergencyGroup());
	EXPECT_EQ(data.getGroupsName(), "Friends, " + ctCommonGetDisplayGroupName("emergency"));
	groups = {99};
	data.getAllGroupsId(groups);
	EXPECT_EQ(groups, (std::vector<int>{99, twin, emergency, friends}));
}

TEST_F(CtInputDataStoreTest, BaseStorageComesFromThePreferenceWithSimPowerChecksExceptForEmergencyContacts)
{
	std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\n[SIM2]\nname_max=9\n";
	reopenStore();
	int account = addAddressbook("work@example.com", 0, 7, "Exchange");
	int sim1 = ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME);
	int sim2 = ctCommonGetAddressBookId(CONTACTS_SIM2_ADDRESS_BOOK_NAME);
	ASSERT_GT(sim1, 0);
	ASSERT_GT(sim2, 0);
	// {chosen last time, SIM 1 power, SIM 2 power, storage of a new contact, its SIM number, its name length}
	struct Choice {
		const char* preference;
		int power1, power2, expected, simNo, nameMax;
	} choices[] = {{"work@example.com", 1, 0, account, 0, 0}, {CONTACTS_SIM1_ADDRESS_BOOK_NAME, 1, 0, sim1, 1, 14},
		{CONTACTS_SIM2_ADDRESS_BOOK_NAME, 1, 0, 0, 0, 0}, {CONTACTS_SIM2_ADDRESS_BOOK_NAME, 0, 1, sim2, 2, 9},
		{CONTACTS_SIM1_ADDRESS_BOOK_NAME, 0, 1, 0, 0, 0}, {"gone@example.com", 1, 1, 0, 0, 0}, {"", 1, 1, 0, 0, 0}};
	for (const Choice& c : choices) {
		preference_set_string("input_base_addressbook", c.preference);
		vconf_set_int("db/telephony/sim_power_state1", c.power1);
		vconf_set_int("db/telephony/sim_power_state2", c.power2);
		CtInputData data(nullptr);
		EXPECT_EQ((std::vector<int>{data.getAddressbookId(), data.getSimNo(), data.getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_NAME)}),
			(std::vector<int>{c.expected, c.simNo, c.nameMax})) << c.preference << " " << c.power1 << c.power2;
	}

	// An emergency contact (type 126) stays on the phone whatever is chosen.
	preference_set_string("input_base_addressbook", "work@example.com");
	CtInputData data(nullptr, request(nullptr, {{"type", "126"}}).get());
	EXPECT_EQ(data.getAddressbookId(), 0);
	data.setAddressbookInfo(account);
	EXPECT_EQ(data.getAddressbookId(), 0);
	data.setFullName("Help");
	int id = 0;
	ASSERT_EQ(data.insertContact(&id), 0);
	EXPECT_EQ(CtInputData(readContact(id)).getAddressbookId(), 0);
}

TEST_F(CtInputDataStoreTest, SimContactKeepsTheSecondOfExactlyTwoNumbers)
{
	// A new contact goes to the SIM chosen last time.
	preference_set_string("input_base_addressbook", CONTACTS_SIM1_ADDRESS_BOOK_NAME);
	int sim1 = ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME);
	contacts_record_h two = newContact(sim1, "Two");
	addNumber(two, "111", CONTACTS_NUMBER_TYPE_CELL);
	addNumber(two, "222", CONTACTS_NUMBER_TYPE_CELL);
	addEmail(two, "a@x");
	addEmail(two, "b@x");
	CtInputData data(two);
	EXPECT_EQ(data.getSimNo(), 1);
	ASSERT_EQ(countOf(data.getNumberList()), 1u);
	EXPECT_EQ(str(data.getNumberNumber(data.getDefaultNumber())), "222");
	EXPECT_EQ(str(data.getEmailEmail(data.getDefaultEmail())), "b@x");

	for (int count : {1, 3}) {
		contacts_record_h contact = newContact(sim1, "Other");
		for (int i = 0; i < count; ++i)
			addNumber(contact, "333", CONTACTS_NUMBER_TYPE_CELL);
		EXPECT_EQ(countOf(CtInputData(contact).getNumberList()), static_cast<size_t>(count));
	}
	preference_set_string("input_base_addressbook", "");
	contacts_record_h phone = newContact(0, "Phone");
	addNumber(phone, "1", CONTACTS_NUMBER_TYPE_CELL);
	addNumber(phone, "2", CONTACTS_NUMBER_TYPE_CELL);
	EXPECT_EQ(countOf(CtInputData(phone).getNumberList()), 2u);
}

TEST_F(CtInputDataStoreTest, SimSaveStoresTheWholeNameAndACleanNumber)
{
	CtInputData data(nullptr);
	data.setAddressbookInfo(ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME));
	EXPECT_EQ(data.getSimNo(), 1);
	EXPECT_EQ(data.getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_NAME), 14);
	EXPECT_TRUE(data.getSimFieldStatus(CONTACTS_SIM_FIELD_EMAIL));
	data.setFullName("Jo Ann Lee");
	data.addNumber("+1 (555) 010-99");
	data.addEmail("jo@x");
	data.setNote(data.addNote("dropped"), "dropped");
	int id = 0;
	ASSERT_EQ(data.insertSIMContact(&id), 0);
	reopenStore();
	EXPECT_EQ(snapshot(id), "Jo Ann Lee||+155501099|jo@x||");

	CtInputData edit(readContact(id));
	edit.setFullName("Jo Lee");
	edit.setNumberNumber(edit.getDefaultNumber(), "0-800");
	ASSERT_EQ(edit.updateSIMContact(), 0);
	reopenStore();
	EXPECT_EQ(snapshot(id), "Jo Lee||0800|jo@x||");
}

TEST_F(CtInputDataStoreTest, SimThatIsOffOrFullRefusesTheSave)
{
	std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\ncapacity=1\n";
	reopenStore();
	int sim1 = ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME);
	ASSERT_GT(sim1, 0);
	auto simContact = [&](const char* name) {
		auto data = std::make_unique<CtInputData>(nullptr);
		data->setAddressbookInfo(sim1);
		data->setFullName(name);
		data->addNumber("123");
		return data;
	};
	int before = countContacts();
	vconf_set_int("db/telephony/sim_power_state1", 0);
	int id = -5;
	EXPECT_EQ(simContact("Off")->insertSIMContact(&id), CONTACTS_ERROR_NOT_SUPPORTED);
	EXPECT_EQ(id, -5);
	EXPECT_EQ(countContacts(), before);

	vconf_set_int("db/telephony/sim_power_state1", 1);
	ASSERT_EQ(simContact("First")->insertSIMContact(&id), 0);
	auto second = simContact("Second Person");
	second->addNote("kept");
	EXPECT_EQ(second->insertSIMContact(&id), CONTACTS_ERROR_FILE_NO_SPACE);
	EXPECT_EQ(countContacts(), before + 1);

	// The refused contact is whole and can go to the phone instead.
	second->setAddressbookInfo(0);
	ASSERT_EQ(second->insertContact(&id), 0);
	EXPECT_EQ(snapshot(id), "Second|Person|123||kept|");
}

TEST_F(CtInputDataStoreTest, SimWithoutTextLimitsGetsTheDefaultLengthAndStoresNoEmail)
{
	std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\nname_max=0\nnumber_max=0\nemail_max=0\n";
	reopenStore();
	CtInputData data(nullptr);
	data.setAddressbookInfo(ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME));
	EXPECT_EQ(data.getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_NAME), 20);
	EXPECT_EQ(data.getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_NUMBER), 20);
	EXPECT_EQ(data.getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_EMAIL), 0);

	std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\nemail_max=0\n";
	reopenStore();
	data.setAddressbookInfo(ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME));
	data.setFullName("Mail Less");
	data.addNumber("12");
	data.addEmail("dropped@x");
	int id = 0;
	ASSERT_EQ(data.insertSIMContact(&id), 0);
	EXPECT_EQ(snapshot(id), "Mail Less||12|||");
}

TEST_F(CtInputDataStoreTest, RingtoneInfoIsWrittenOnlyWhenItChanged)
{
	int id = storeAda();
	auto edit = [id](auto change) {
		CtInputData data(readContact(id));
		change(data);
		EXPECT_EQ(data.updateContact(), 0);
	};
	edit([](CtInputData& d) { d.setRingtone("/snd/a.ogg", "10"); });
	EXPECT_EQ(ringtoneInfo(id), "/snd/a.ogg|1|10");

	// Someone else clears the stored flag; an edit that keeps the ringtone
	// (same path, position read back at load) still notices it.
	contacts_utils_set_ringtone_info(CONTACTS_RINGTONE_KIND_CONTACT, id, "/snd/a.ogg", 0, 10);
	edit([](CtInputData&) {});
	EXPECT_EQ(ringtoneInfo(id), "/snd/a.ogg|1|10");
	edit([](CtInputData& d) { d.setRingtone("/snd/a.ogg", "99"); });
	EXPECT_EQ(ringtoneInfo(id), "/snd/a.ogg|1|99");
	// A position that is no position starts the ringtone from its beginning.
	for (const char* position : {"-5", "x7"}) {
		edit([position](CtInputData& d) { d.setRingtone("/snd/b.ogg", position); });
		EXPECT_EQ(ringtoneInfo(id), "/snd/b.ogg|1|0") << position;
	}
	edit([](CtInputData& d) { d.setRingtone(nullptr); });
	EXPECT_EQ(ringtoneInfo(id).rfind("<null>|", 0), 0u);
	EXPECT_EQ(snapshot(id), "Ada|Byron|0101|||");
}

TEST_F(CtInputDataStoreTest, FailedSavesLeaveTheStoredContactAsItWas)
{
	int id = storeAda();
	expectSavedDespiteWriteFaults([id] {
		CtInputData data(readContact(id));
		data.setLastName("Lovelace");
		data.addNumber("0202");
		return data.updateContact();
	}, [id] { return snapshot(id); });
	EXPECT_EQ(snapshot(id), "Ada|Lovelace|0101,0202|||");

	// The ringtone is written after the contact: an update whose ringtone
	// write failed must not report success.
	expectSavedDespiteWriteFaults([id] {
		CtInputData data(readContact(id));
		data.setRingtone("/snd/new.ogg", "7");
		return data.updateContact();
	}, [id] { return ringtoneInfo(id); });
	EXPECT_EQ(ringtoneInfo(id), "/snd/new.ogg|1|7");

	// An insert either stores the contact and reports success, or stores nothing.
	int count = countContacts();
	expectSavedDespiteWriteFaults([] {
		CtInputData data(nullptr);
		data.setFullName("New One");
		data.setRingtone("/snd/r.ogg", "5");
		int newId = 0;
		return data.insertContact(&newId);
	}, [] { return std::to_string(countContacts()); });
	EXPECT_EQ(countContacts(), count + 1);
}

TEST_F(CtInputDataStoreTest, EmergencyNumberAndStatusComeFromThePerson)
{
	int id = storeAda();
	contacts_record_h contact = readContact(id);
	int numberId = 0;
	contacts_record_get_int(childAt(contact, _contacts_contact.number, 0), _contacts_number.id, &numberId);
	contacts_record_destroy(contact, true);
	contacts_record_h emergency = nullptr;
	contacts_record_create(_contacts_emergency._uri, &emergency);
	contacts_record_set_int(emergency, _contacts_emergency.person_id, personOf(id));
	contacts_record_set_int(emergency, _contacts_emergency.number_id, numberId);
	contacts_record_set_int(emergency, _contacts_emergency.value, 1);
	ASSERT_EQ(contacts_db_insert_record(emergency, nullptr), 0);
	contacts_record_destroy(emergency, true);

	CtInputData data(readContact(id));
	contacts_record_h copy = data.getEmergencyNumber();
	ASSERT_NE(copy, nullptr);
	EXPECT_EQ(textOf(copy, _contacts_number.number), "0101");

	// The copy's text reaches the stored number on update; asking again
	// keeps the handle and the edit.
	contacts_record_set_str(copy, _contacts_number.number, "0999");
	EXPECT_EQ(data.getEmergencyNumber(), copy);
	EXPECT_EQ(textOf(copy, _contacts_number.number), "0999");
	ASSERT_EQ(data.updateContact(), 0);
	reopenStore();
	EXPECT_EQ(snapshot(id), "Ada|Byron|0999|||");

	// The status is the person's (written by the service, not through records).
	sqlite3* db = nullptr;
	ASSERT_EQ(sqlite3_open(m_dir.file("contacts.db").c_str(), &db), SQLITE_OK);
	std::string sql = "UPDATE persons SET status = 'On holiday' WHERE id = " + std::to_string(personOf(id));
	ASSERT_EQ(sqlite3_exec(db, sql.c_str(), nullptr, nullptr, nullptr), SQLITE_OK);
	sqlite3_close(db);
	char* status = const_cast<char*>(data.getStatus());
	EXPECT_EQ(str(status), "On holiday");
	free(status);
	EXPECT_EQ(CtInputData(nullptr).getStatus(), nullptr);
}

TEST_F(CtInputDataStoreTest, DeletedFlagFollowsChangesFromAnotherProcess)
{
	int otherId = storeAda();
	int id = storeAda();
	CtInputData data(readContact(id));
	RecordingListener listener;
	data.attachListener(&listener);
	data.attachListener(nullptr); // ignored

	// An update elsewhere is heard but is no deletion.
	addNumberToStoredContact(id, "0303");
	ASSERT_TRUE(pumpUntil([&] { return !listener.uris.empty(); }, 3.0));
	EXPECT_FALSE(data.checkChangedTypeIsDeleted());

	// Another process (the command-line tool) deletes the person.
	const char* binDir = getenv("CONTACTS_TEST_BIN_DIR");
	ASSERT_NE(binDir, nullptr);
	ASSERT_EQ(std::system((std::string(binDir) + "/tools/contacts-ctl contacts delete "
		+ std::to_string(personOf(id))).c_str()), 0);
	EXPECT_TRUE(pumpUntil([&] { return data.checkChangedTypeIsDeleted(); }, 5.0));
	EXPECT_GE(listener.uris.size(), 2u);
	EXPECT_EQ(listener.uris.back(), _contacts_contact._uri);

	// Unrelated changes after the delete neither notify nor clear the flag;
	// once detached, the listener hears nothing more.
	size_t calls = listener.uris.size();
	addNumberToStoredContact(otherId, "0404");
	settle(0.8);
	EXPECT_EQ(listener.uris.size(), calls);
	EXPECT_TRUE(data.checkChangedTypeIsDeleted());
	data.detachListener();
}
