// The editable contact against the store: loading from records and launch
// requests, storage choice, saving (atomic under write faults), SIM saving,
// groups, emergency number and change notification.
#include "CtInputData.h"
#include "CtCommonAddressbookUtil.h"
#include "ICtChangeListener.h"
#include "InputTestStore.h"

#include "LogSink.h"
#include "SqliteFaultInjector.h"

#include <sys/wait.h>
#include <unistd.h>

#include <cstdlib>
#include <fstream>
#include <memory>

using namespace ct::test;

namespace {

class RecordingListener : public ICtChangeListener {
public:
	void onDbChanged(const char* viewUri) override { uris.push_back(viewUri ? viewUri : ""); }
	void onCompleteGetContacts() override {}
	void onConditionChagned() override {}
	std::vector<std::string> uris;
};

std::string str(const char* text)
{
	return text ? text : "<null>";
}

// A stored phone contact "Ada Byron" with one mobile number; returns its id.
int storeAda(int addressbookId = 0)
{
	contacts_record_h contact = newContact(addressbookId, "Ada");
	contacts_record_set_str(childAt(contact, _contacts_contact.name, 0), _contacts_name.last, "Byron");
	addNumber(contact, "0101", CONTACTS_NUMBER_TYPE_CELL);
	return store(contact);
}

// The stored contact's name and numbers as one comparable text.
std::string snapshot(int contactId)
{
	contacts_record_h contact = readContact(contactId);
	if (!contact)
		return "<gone>";
	std::string out = textOf(childAt(contact, _contacts_contact.name, 0), _contacts_name.first) + "|"
		+ textOf(childAt(contact, _contacts_contact.name, 0), _contacts_name.last);
	for (int i = 0; i < childCount(contact, _contacts_contact.number); ++i)
		out += "|" + textOf(childAt(contact, _contacts_contact.number, i), _contacts_number.number);
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

// The contact's stored ringtone path ("<null>" when none), flag and position.
std::string ringtoneInfo(int contactId, int* flag, long long* position)
{
	char* path = nullptr;
	contacts_utils_get_ringtone_info(CONTACTS_RINGTONE_KIND_CONTACT, contactId, &path, flag, position);
	std::string out = str(path);
	free(path);
	return out;
}

int countContacts()
{
	int count = 0;
	contacts_db_get_count(_contacts_contact._uri, &count);
	return count;
}

} // namespace

using CtInputDataStoreTest = InputStoreTest;

TEST_F(CtInputDataStoreTest, InsertedContactIsStoredUnlinkedWithItsRingtone)
{
	int first = personOf(storeAda());
	int id = 0;
	{
		CtInputData data(nullptr);
		data.setFullName("Ada Byron");
		data.addNumber("0101");
		data.setRingtone("/snd/bell.ogg", "2500");
		ASSERT_EQ(data.insertContact(&id), 0);
	}
	reopen();
	EXPECT_NE(personOf(id), first); // link mode 1: same name, still a person of its own
	EXPECT_EQ(snapshot(id), "Ada|Byron|0101|/snd/bell.ogg");
	int flag = 0;
	long long position = 0;
	EXPECT_EQ(ringtoneInfo(id, &flag, &position), "/snd/bell.ogg");
	EXPECT_EQ(flag, 1);
	EXPECT_EQ(position, 2500);
}

TEST_F(CtInputDataStoreTest, EditLoadsThePersonAndUpdatesOneField)
{
	int id = storeAda();
	Request request(APP_CONTROL_OPERATION_EDIT, {{APP_CONTROL_DATA_ID, std::to_string(personOf(id))},
		{APP_CONTROL_DATA_PHONE, "0202"}, {APP_CONTROL_DATA_URL, "example.org"}});
	{
		CtInputData data(nullptr, request.get());
		EXPECT_EQ(data.getContactId(), id);
		EXPECT_EQ(data.getPersonId(), personOf(id));
		EXPECT_EQ(data.getFullName(), "Ada Byron");
		EXPECT_EQ(countOf(data.getNumberList()), 2u);
		data.setLastName("Lovelace");
		ASSERT_EQ(data.updateContact(), 0);
	}
	reopen();
	EXPECT_EQ(snapshot(id), "Ada|Lovelace|0101|0202|");
}

TEST_F(CtInputDataStoreTest, LaunchRequestsWithBadOrMissingIdsGiveANewContact)
{
	int id = storeAda();
	int person = personOf(id);
	ASSERT_EQ(contacts_db_delete_record(_contacts_person._uri, person), 0);
	const std::string deleted = std::to_string(person);
	for (const std::string& badId : {std::string(), std::string("abc"), std::string("12abc"),
			 std::string("99999999999999"), deleted}) {
		Request request(APP_CONTROL_OPERATION_EDIT, {{APP_CONTROL_DATA_ID, badId}});
		CtInputData data(nullptr, request.get());
		EXPECT_EQ(data.getContactId(), 0) << badId;
		EXPECT_EQ(data.getFullName(), "") << badId;
	}
	Request unknown(APP_CONTROL_OPERATION_PICK, {{"name", "Nobody"}});
	ct::log::clear();
	CtInputData data(nullptr, unknown.get());
	EXPECT_TRUE(ct::log::contains("* Critical * wrong operation requested " APP_CONTROL_OPERATION_PICK));
	EXPECT_EQ(data.getContactId(), 0);
	EXPECT_EQ(data.getFullName(), "");
	CtInputData noRequest(nullptr, nullptr);
	EXPECT_EQ(noRequest.getContactId(), 0);
}

TEST_F(CtInputDataStoreTest, AddAndSocialRequestsApplyTheirExtras)
{
	Request add(APP_CONTROL_OPERATION_ADD, {{APP_CONTROL_DATA_PHONE, "555"}, {APP_CONTROL_DATA_EMAIL, "a@x"},
		{APP_CONTROL_DATA_URL, "w.org"}, {APP_CONTROL_DATA_NAME, "Grace Brewster Hopper"}});
	CtInputData data(nullptr, add.get());
	EXPECT_EQ(str(data.getNumberNumber(data.getDefaultNumber())), "555");
	EXPECT_EQ(str(data.getEmailEmail(data.getDefaultEmail())), "a@x");
	EXPECT_EQ(str(data.getMiddleName()), "Brewster");
	Eina_List* sites = data.getWebsiteList();
	ASSERT_EQ(eina_list_count(sites), 1u);
	EXPECT_EQ(str(data.getWebsiteWebsite(static_cast<contacts_record_h>(eina_list_data_get(sites)))), "w.org");
	eina_list_free(sites);

	Request social(APP_CONTROL_OPERATION_SOCIAL_ADD, {{APP_CONTROL_DATA_SOCIAL_PHONE, "777"},
		{APP_CONTROL_DATA_PHONE, "ignored"}, {APP_CONTROL_DATA_NAME, "ignored"}});
	CtInputData fromSocial(nullptr, social.get());
	EXPECT_EQ(countOf(fromSocial.getNumberList()), 1u);
	EXPECT_EQ(str(fromSocial.getNumberNumber(fromSocial.getDefaultNumber())), "777");
	EXPECT_EQ(fromSocial.getFullName(), "");

	int id = storeAda();
	Request socialEdit(APP_CONTROL_OPERATION_SOCIAL_EDIT, {{APP_CONTROL_DATA_SOCIAL_ITEM_ID,
		std::to_string(personOf(id))}, {APP_CONTROL_DATA_SOCIAL_EMAIL, "ada@x"}});
	CtInputData edited(nullptr, socialEdit.get());
	EXPECT_EQ(edited.getContactId(), id);
	EXPECT_EQ(str(edited.getEmailEmail(edited.getDefaultEmail())), "ada@x");
}

TEST_F(CtInputDataStoreTest, OwnKeysOfTheContactsApplicationAndThePrimaryEdit)
{
	int id = storeAda();
	std::string person = std::to_string(personOf(id));
	Request plain(nullptr, {{"person_id", person}, {"ct_num", "0303"}, {"ct_address", "1 Main St"},
		{"ct_phonetic_name", "A Da"}, {"name", "Ada King"}});
	CtInputData data(nullptr, plain.get());
	EXPECT_EQ(data.getContactId(), id);
	EXPECT_EQ(data.getFullName(), "Ada King");
	EXPECT_EQ(data.getPhoneticFullName(), "A Da");
	EXPECT_EQ(countOf(data.getNumberList()), 2u);
	EXPECT_EQ(countOf(data.getAddressList()), 1u);

	// Types 21 to 23 on a stored contact take no numbers, e-mails or sites.
	Request restricted(APP_CONTROL_OPERATION_DEFAULT, {{"person_id", person}, {"type", "22"},
		{"ct_num", "0303"}, {"ct_email", "x@y"}});
	CtInputData limited(nullptr, restricted.get());
	EXPECT_EQ(limited.getInputType(), 22);
	EXPECT_EQ(countOf(limited.getNumberList()), 1u);
	EXPECT_EQ(limited.getDefaultEmail(), nullptr);

	// The same type on a new contact takes them.
	Request fresh(nullptr, {{"type", "21"}, {"ct_num", "0404"}});
	CtInputData created(nullptr, fresh.get());
	EXPECT_EQ(str(created.getNumberNumber(created.getDefaultNumber())), "0404");

	// A person id passed by the caller wins over the request's.
	CtInputData passed(nullptr, plain.get(), 424242);
	EXPECT_EQ(passed.getContactId(), 0);

	// Type 112 edits the person's display contact.
	Request primary(nullptr, {{"person_id", person}, {"type", "112"}});
	CtInputData display(nullptr, primary.get());
	EXPECT_EQ(display.getContactId(), id);
	display.setFirstName("Augusta");
	ASSERT_EQ(display.updateContact(), 0);
	reopen();
	EXPECT_EQ(snapshot(id), "Augusta|Byron|0101|");
}

TEST_F(CtInputDataStoreTest, EmergencyTypeKeepsThePhoneStorage)
{
	int google = addAddressbook("g@example.com", 0, 7, "Google");
	Request request(nullptr, {{"type", "126"}});
	CtInputData data(nullptr, request.get());
	EXPECT_EQ(data.getAddressbookId(), 0);
	data.setAddressbookInfo(google);
	EXPECT_EQ(data.getAddressbookId(), 0);
	data.setFullName("Help");
	int id = 0;
	ASSERT_EQ(data.insertContact(&id), 0);
	contacts_record_h stored = readContact(id);
	int book = -1;
	contacts_record_get_int(stored, _contacts_contact.address_book_id, &book);
	EXPECT_EQ(book, 0);
	contacts_record_destroy(stored, true);
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

	int friends = addGroup(0, "Friends", nullptr);
	int emergency = addGroup(0, "Emergency", "emergency");
	int twin = addGroup(0, "Friends", nullptr);
	for (int group : {friends, emergency, twin})
		data.addGroupRelation(group);
	data.updateGroupsName();
	EXPECT_TRUE(data.isInEmergencyGroup());
	EXPECT_EQ(data.getGroupsName(), "Friends, " + ctCommonGetDisplayGroupName("emergency"));
	groups = {99};
	data.getAllGroupsId(groups);
	EXPECT_EQ(groups, (std::vector<int>{99, twin, emergency, friends}));
}

TEST_F(CtInputDataStoreTest, BaseStorageComesFromThePreferenceWithSimPowerChecks)
{
	int account = addAddressbook("work@example.com", 0, 7, "Exchange");
	int sim1 = addressbookIdByName("SIM1");
	ASSERT_GT(sim1, 0);

	const std::pair<const char*, int> choices[] = {{"work@example.com", account}, {"SIM1", sim1},
		{"SIM2", 0}, {"gone@example.com", 0}, {"", 0}};
	for (const auto& [preference, expected] : choices) {
		preference_set_string("input_base_addressbook", preference);
		EXPECT_EQ(CtInputData(nullptr).getAddressbookId(), expected) << preference;
	}
	preference_set_string("input_base_addressbook", "SIM1");
	vconf_set_int("db/telephony/sim_power_state1", 0);
	EXPECT_EQ(CtInputData(nullptr).getAddressbookId(), 0) << "a SIM that is off";
}

TEST_F(CtInputDataStoreTest, SimContactKeepsTheSecondOfExactlyTwoNumbers)
{
	// A new contact goes to the SIM chosen last time.
	preference_set_string("input_base_addressbook", "SIM1");
	int sim1 = addressbookIdByName("SIM1");
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
		CtInputData other(contact);
		EXPECT_EQ(countOf(other.getNumberList()), static_cast<size_t>(count));
	}
	preference_set_string("input_base_addressbook", "");
	contacts_record_h phone = newContact(0, "Phone");
	addNumber(phone, "1", CONTACTS_NUMBER_TYPE_CELL);
	addNumber(phone, "2", CONTACTS_NUMBER_TYPE_CELL);
	CtInputData onPhone(phone);
	EXPECT_EQ(countOf(onPhone.getNumberList()), 2u);
}

TEST_F(CtInputDataStoreTest, SimSaveStoresTheWholeNameAndACleanNumber)
{
	int sim1 = addressbookIdByName("SIM1");
	CtInputData data(nullptr);
	data.setAddressbookInfo(sim1);
	EXPECT_EQ(data.getSimNo(), 1);
	EXPECT_EQ(data.getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_NAME), 14);
	EXPECT_TRUE(data.getSimFieldStatus(CONTACTS_SIM_FIELD_EMAIL));
	data.setFullName("Jo Ann Lee");
	data.addNumber("+1 (555) 010-99");
	data.addEmail("jo@x");
	data.setNote(data.addNote("dropped"), "dropped");
	int id = 0;
	ASSERT_EQ(data.insertSIMContact(&id), 0);
	reopen();
	contacts_record_h stored = readContact(id);
	ASSERT_NE(stored, nullptr);
	EXPECT_EQ(textOf(childAt(stored, _contacts_contact.name, 0), _contacts_name.first), "Jo Ann Lee");
	EXPECT_EQ(textOf(childAt(stored, _contacts_contact.number, 0), _contacts_number.number), "+155501099");
	EXPECT_EQ(textOf(childAt(stored, _contacts_contact.email, 0), _contacts_email.email), "jo@x");
	EXPECT_EQ(childCount(stored, _contacts_contact.note), 0);

	// Editing the stored SIM entry.
	CtInputData edit(stored);
	edit.setFullName("Jo Lee");
	edit.setNumberNumber(edit.getDefaultNumber(), "0-800");
	ASSERT_EQ(edit.updateSIMContact(), 0);
	reopen();
	stored = readContact(id);
	EXPECT_EQ(textOf(childAt(stored, _contacts_contact.name, 0), _contacts_name.first), "Jo Lee");
	EXPECT_EQ(textOf(childAt(stored, _contacts_contact.number, 0), _contacts_number.number), "0800");
	contacts_record_destroy(stored, true);
}

TEST_F(CtInputDataStoreTest, SimThatIsOffOrFullRefusesTheSave)
{
	std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\ncapacity=1\n";
	reopen();
	int sim1 = addressbookIdByName("SIM1");
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
	contacts_record_h stored = readContact(id);
	EXPECT_EQ(textOf(childAt(stored, _contacts_contact.name, 0), _contacts_name.last), "Person");
	EXPECT_EQ(textOf(childAt(stored, _contacts_contact.note, 0), _contacts_note.note), "kept");
	contacts_record_destroy(stored, true);
}

TEST_F(CtInputDataStoreTest, SimWithoutTextLimitsGetsTheDefaultLengthAndStoresNoEmail)
{
	std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\nname_max=0\nnumber_max=0\nemail_max=0\n";
	reopen();
	CtInputData data(nullptr);
	data.setAddressbookInfo(addressbookIdByName("SIM1"));
	EXPECT_EQ(data.getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_NAME), 20);
	EXPECT_EQ(data.getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_NUMBER), 20);
	EXPECT_EQ(data.getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_EMAIL), 0);

	std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\nemail_max=0\n";
	reopen();
	data.setAddressbookInfo(addressbookIdByName("SIM1"));
	data.setFullName("Mail Less");
	data.addNumber("12");
	data.addEmail("dropped@x");
	int id = 0;
	ASSERT_EQ(data.insertSIMContact(&id), 0);
	contacts_record_h stored = readContact(id);
	EXPECT_EQ(childCount(stored, _contacts_contact.email), 0);
	EXPECT_EQ(childCount(stored, _contacts_contact.number), 1);
	contacts_record_destroy(stored, true);
}

TEST_F(CtInputDataStoreTest, RingtoneInfoIsWrittenOnlyWhenItChanged)
{
	int id = storeAda();
	auto edit = [id](auto change) {
		CtInputData data(readContact(id));
		change(data);
		EXPECT_EQ(data.updateContact(), 0);
	};
	int flag = 0;
	long long position = 0;
	edit([](CtInputData& d) { d.setRingtone("/snd/a.ogg", "10"); });
	EXPECT_EQ(ringtoneInfo(id, &flag, &position), "/snd/a.ogg");
	EXPECT_EQ(flag, 1);
	EXPECT_EQ(position, 10);

	// Someone else marks the stored info; an edit that keeps the ringtone
	// (same path, position read back at load) still notices the flag.
	contacts_utils_set_ringtone_info(CONTACTS_RINGTONE_KIND_CONTACT, id, "/snd/a.ogg", 0, 10);
	edit([](CtInputData&) {});
	ringtoneInfo(id, &flag, &position);
	EXPECT_EQ(flag, 1);
	edit([](CtInputData& d) { d.setRingtone("/snd/a.ogg", "99"); });
	ringtoneInfo(id, &flag, &position);
	EXPECT_EQ(position, 99);
	edit([](CtInputData& d) { d.setRingtone(nullptr); });
	EXPECT_EQ(ringtoneInfo(id, &flag, &position), "<null>");
	EXPECT_EQ(snapshot(id), "Ada|Byron|0101|");
}

TEST_F(CtInputDataStoreTest, FailedSavesLeaveTheStoredContactAsItWas)
{
	int id = storeAda();
	const std::string before = snapshot(id);
	bool saved = false;
	for (int n = 1; !saved && n < 50; ++n) {
		CtInputData data(readContact(id));
		data.setLastName("Lovelace");
		data.addNumber("0202");
		int err;
		{
			ct::db::ScopedWriteFailure failure(n);
			err = data.updateContact();
		}
		reopen();
		if (err == 0) {
			saved = true;
			EXPECT_EQ(snapshot(id), "Ada|Lovelace|0101|0202|");
		} else {
			EXPECT_EQ(snapshot(id), before) << "write " << n;
		}
	}
	EXPECT_TRUE(saved);

	// An insert either stores the contact and reports success, or stores nothing.
	bool inserted = false;
	for (int n = 1; !inserted && n < 50; ++n) {
		int count = countContacts();
		CtInputData data(nullptr);
		data.setFullName("New One");
		data.setRingtone("/snd/r.ogg", "5");
		int err, newId = 0;
		{
			ct::db::ScopedWriteFailure failure(n);
			err = data.insertContact(&newId);
		}
		reopen();
		inserted = err == 0;
		EXPECT_EQ(countContacts(), count + (inserted ? 1 : 0)) << "write " << n << " error " << err;
	}
	EXPECT_TRUE(inserted);
}

TEST_F(CtInputDataStoreTest, EmergencyNumberAndStatusComeFromThePerson)
{
	int id = storeAda();
	int person = personOf(id);
	contacts_record_h contact = readContact(id);
	int numberId = 0;
	contacts_record_get_int(childAt(contact, _contacts_contact.number, 0), _contacts_number.id, &numberId);
	contacts_record_destroy(contact, true);
	contacts_record_h emergency = nullptr;
	contacts_record_create(_contacts_emergency._uri, &emergency);
	contacts_record_set_int(emergency, _contacts_emergency.person_id, person);
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
	reopen();
	EXPECT_EQ(snapshot(id), "Ada|Byron|0999|");

	const char* status = data.getStatus();
	free(const_cast<char*>(status));
}

TEST_F(CtInputDataStoreTest, DeletedFlagFollowsChangesFromAnotherProcess)
{
	int otherId = storeAda();
	int id = storeAda();
	int person = personOf(id);
	CtInputData data(readContact(id));
	RecordingListener listener;
	data.attachListener(&listener);
	data.attachListener(nullptr); // ignored

	// An update elsewhere is heard but is no deletion.
	contacts_record_h contact = readContact(id);
	addNumber(contact, "0303", CONTACTS_NUMBER_TYPE_CELL);
	ASSERT_EQ(contacts_db_update_record(contact), 0);
	contacts_record_destroy(contact, true);
	ASSERT_TRUE(pumpUntil([&] { return !listener.uris.empty(); }, 3.0));
	EXPECT_FALSE(data.checkChangedTypeIsDeleted());

	// Another process (the command-line tool) deletes the person.
	const char* binDir = getenv("CONTACTS_TEST_BIN_DIR");
	ASSERT_NE(binDir, nullptr);
	std::string tool = std::string(binDir) + "/tools/contacts-ctl";
	std::string personText = std::to_string(person);
	pid_t child = fork();
	ASSERT_GE(child, 0);
	if (child == 0) {
		execl(tool.c_str(), tool.c_str(), "contacts", "delete", personText.c_str(), static_cast<char*>(nullptr));
		_exit(127);
	}
	int status = 0;
	waitpid(child, &status, 0);
	ASSERT_TRUE(WIFEXITED(status));
	ASSERT_EQ(WEXITSTATUS(status), 0);
	EXPECT_TRUE(pumpUntil([&] { return data.checkChangedTypeIsDeleted(); }, 5.0));
	EXPECT_GE(listener.uris.size(), 2u);
	EXPECT_EQ(listener.uris.back(), _contacts_contact._uri);

	// Unrelated changes after the delete neither notify nor clear the flag.
	size_t calls = listener.uris.size();
	data.detachListener();
	contacts_record_h other = readContact(otherId);
	addNumber(other, "0404", CONTACTS_NUMBER_TYPE_CELL);
	ASSERT_EQ(contacts_db_update_record(other), 0);
	contacts_record_destroy(other, true);
	settle(0.8);
	EXPECT_EQ(listener.uris.size(), calls);
	EXPECT_TRUE(data.checkChangedTypeIsDeleted());
}
