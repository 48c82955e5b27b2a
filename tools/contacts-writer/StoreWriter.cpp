#include "StoreWriter.h"

#include <contacts.h>
#include <unistd.h>

#include <cstdio>
#include <iostream>
#include <memory>
#include <string>

namespace ct::tools {
namespace {

// Enough persons to link and unlink among, few enough to keep every check fast.
constexpr int kMostPersons = 24;
constexpr int kLockedRetries = 200;

using Record = std::unique_ptr<contacts_record_s, void (*)(contacts_record_h)>;

void destroyWithChildren(contacts_record_h record)
{
	contacts_record_destroy(record, true);
}

Record newRecord(const char* uri)
{
	contacts_record_h record = nullptr;
	contacts_record_create(uri, &record);
	return Record(record, destroyWithChildren);
}

contacts_record_h addChild(contacts_record_h contact, unsigned property, const char* uri)
{
	contacts_record_h child = nullptr;
	contacts_record_create(uri, &child);
	contacts_record_add_child_record(contact, property, child);
	return child;
}

void removeChildren(contacts_record_h contact, unsigned property)
{
	contacts_record_h child = nullptr;
	while (contacts_record_get_child_record_at_p(contact, property, 0, &child) == CONTACTS_ERROR_NONE && child) {
		contacts_record_remove_child_record(contact, property, child);
		contacts_record_destroy(child, true);
		child = nullptr;
	}
}

// The note every written contact carries: how many numbers and e-mails it has.
std::string describe(int numbers, int emails)
{
	return "numbers=" + std::to_string(numbers) + " emails=" + std::to_string(emails);
}

void addNumbers(contacts_record_h contact, int count, int seed)
{
	for (int i = 0; i < count; ++i) {
		contacts_record_h number = addChild(contact, _contacts_contact.number, _contacts_number._uri);
		contacts_record_set_str(number, _contacts_number.number, ("+1555" + std::to_string(seed * 10 + i)).c_str());
		contacts_record_set_int(number, _contacts_number.type, CONTACTS_NUMBER_TYPE_CELL);
	}
}

void setNote(contacts_record_h contact, const std::string& text)
{
	removeChildren(contact, _contacts_contact.note);
	contacts_record_h note = addChild(contact, _contacts_contact.note, _contacts_note._uri);
	contacts_record_set_str(note, _contacts_note.note, text.c_str());
}

int lastVersion()
{
	int version = 0;
	contacts_db_get_last_change_version(&version);
	return version;
}

void say(const std::string& line)
{
	// Unbuffered: whatever was printed before a kill reaches the reader.
	std::string out = line + "\n";
	ssize_t ignored = write(STDOUT_FILENO, out.data(), out.size());
	(void)ignored;
}

} // namespace

StoreWriter::StoreWriter(unsigned seed) : m_rng(seed) {}

int StoreWriter::__pick(int count)
{
	return count > 0 ? static_cast<int>(m_rng() % static_cast<unsigned>(count)) : 0;
}

template <typename Write>
int StoreWriter::__retryLocked(Write write)
{
	int err = write();
	for (int i = 0; err == CONTACTS_ERROR_DB_LOCKED && i < kLockedRetries; ++i) {
		usleep(1000);
		err = write();
	}
	return err;
}

std::vector<std::pair<int, int>> StoreWriter::__contactsAndPersons()
{
	std::vector<std::pair<int, int>> rows;
	contacts_list_h list = nullptr;
	if (contacts_db_get_all_records(_contacts_simple_contact._uri, 0, 0, &list) != CONTACTS_ERROR_NONE)
		return rows;
	contacts_record_h record = nullptr;
	while (contacts_list_get_current_record_p(list, &record) == CONTACTS_ERROR_NONE && record) {
		int contactId = 0, personId = 0;
		contacts_record_get_int(record, _contacts_simple_contact.id, &contactId);
		contacts_record_get_int(record, _contacts_simple_contact.person_id, &personId);
		rows.emplace_back(contactId, personId);
		if (contacts_list_next(list) != CONTACTS_ERROR_NONE)
			break;
	}
	contacts_list_destroy(list, true);
	return rows;
}

int StoreWriter::__insertPerson()
{
	Record contact = newRecord(_contacts_contact._uri);
	contacts_record_set_int(contact.get(), _contacts_contact.link_mode, CONTACTS_CONTACT_LINK_MODE_IGNORE_ONCE);
	contacts_record_h name = addChild(contact.get(), _contacts_contact.name, _contacts_name._uri);
	contacts_record_set_str(name, _contacts_name.first, ("Writer" + std::to_string(m_rng() % 1000)).c_str());
	int numbers = 1 + __pick(6);
	int emails = __pick(3);
	addNumbers(contact.get(), numbers, static_cast<int>(m_rng() % 100000));
	for (int i = 0; i < emails; ++i) {
		contacts_record_h email = addChild(contact.get(), _contacts_contact.email, _contacts_email._uri);
		contacts_record_set_str(email, _contacts_email.email, ("w" + std::to_string(i) + "@example.com").c_str());
	}
	setNote(contact.get(), describe(numbers, emails));
	return contacts_db_insert_record(contact.get(), nullptr);
}

int StoreWriter::__updateContact(int contactId, const std::string& note, int numbers)
{
	contacts_record_h raw = nullptr;
	int err = contacts_db_get_record(_contacts_contact._uri, contactId, &raw);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	Record contact(raw, destroyWithChildren);
	int emails = 0;
	contacts_record_get_child_record_count(raw, _contacts_contact.email, &emails);
	removeChildren(raw, _contacts_contact.number);
	addNumbers(raw, numbers, static_cast<int>(m_rng() % 100000));
	setNote(raw, note.empty() ? describe(numbers, emails) : note);
	return contacts_db_update_record(raw);
}

int StoreWriter::__linkTwo()
{
	auto rows = __contactsAndPersons();
	if (rows.size() < 2)
		return __insertPerson();
	int base = rows[__pick(static_cast<int>(rows.size()))].second;
	int other = rows[__pick(static_cast<int>(rows.size()))].second;
	if (base == other)
		return CONTACTS_ERROR_NONE;
	return contacts_person_link_person(base, other);
}

int StoreWriter::__unlinkOne()
{
	auto rows = __contactsAndPersons();
	for (size_t i = 0; i + 1 < rows.size(); ++i) {
		for (size_t j = i + 1; j < rows.size(); ++j) {
			if (rows[i].second == rows[j].second)
				return contacts_person_unlink_contact(rows[j].second, rows[j].first, nullptr);
		}
	}
	return __linkTwo();
}

int StoreWriter::__deleteOne()
{
	auto rows = __contactsAndPersons();
	if (rows.empty())
		return __insertPerson();
	const auto& row = rows[__pick(static_cast<int>(rows.size()))];
	if (m_rng() % 2)
		return contacts_db_delete_record(_contacts_person._uri, row.second);
	return contacts_db_delete_record(_contacts_contact._uri, row.first);
}

void StoreWriter::runRandom()
{
	say("ready");
	for (;;) {
		size_t contacts = __contactsAndPersons().size();
		int choice = __pick(10);
		say("begin");
		int err = CONTACTS_ERROR_NONE;
		if (contacts >= static_cast<size_t>(kMostPersons) && choice < 4)
			err = __deleteOne();
		else if (choice < 3)
			err = __insertPerson();
		else if (choice < 5 && contacts > 0)
			err = __updateContact(__contactsAndPersons()[__pick(static_cast<int>(contacts))].first, "", 1 + __pick(6));
		else if (choice < 8)
			err = __linkTwo();
		else if (choice < 9)
			err = __unlinkOne();
		else
			err = __deleteOne();
		if (err == CONTACTS_ERROR_NONE)
			say("ok " + std::to_string(lastVersion()));
		else
			say("failed " + std::to_string(err));
	}
}

int StoreWriter::runCommands(int contactId, const std::string& tag)
{
	say("ready");
	int written = 0;
	std::string command;
	while (std::cin >> command && command != "quit") {
		int count = 0;
		if (command != "burst" || !(std::cin >> count)) {
			say("error unknown command " + command);
			return 2;
		}
		for (int i = 0; i < count; ++i) {
			std::string note = tag + " " + std::to_string(written + 1);
			int err = __retryLocked([&] { return __updateContact(contactId, note, 1 + written % 3); });
			if (err != CONTACTS_ERROR_NONE) {
				say("error " + std::to_string(err));
				return 1;
			}
			++written;
		}
		say("ok " + std::to_string(written) + " " + std::to_string(lastVersion()));
	}
	return 0;
}

} // namespace ct::tools
