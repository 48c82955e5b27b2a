#include "ContactsSim.h"

#include "ContactsDebug.h"
#include "ContactsList.h"
#include "ContactsRawValue.h"
#include "ContactsRecord.h"
#include "ContactsWriter.h"
#include "DataDir.h"
#include "contacts_list.h"
#include "contacts_record.h"
#include "contacts_service.h"
#include "vconf.h"

#include <glib.h>

#include <memory>

namespace ct::contacts {
namespace {

int readInt(GKeyFile* file, const char* group, const char* key, int fallback)
{
	GError* error = nullptr;
	int value = g_key_file_get_integer(file, group, key, &error);
	if (error) {
		g_error_free(error);
		return fallback;
	}
	return value;
}

// The one place that reads the SIM power state.
bool simPowered(int slotNo)
{
	int state = 0;
	const char* key = slotNo == 0 ? VCONFKEY_TELEPHONY_SIM_POWER_STATE1 : VCONFKEY_TELEPHONY_SIM_POWER_STATE2;
	if (vconf_get_int(key, &state) != VCONF_OK) {
		WFAILED("vconf_get_int", -1);
		return false;
	}
	return state != 0;
}

} // namespace

const char* ContactsSim::bookName(int slotNo)
{
	return slotNo == 0 ? CONTACTS_SIM1_ADDRESS_BOOK_NAME : CONTACTS_SIM2_ADDRESS_BOOK_NAME;
}

const char* ContactsSim::providerName(int slotNo)
{
	return slotNo == 0 ? CONTACTS_SIM1_PROVIDER_NAME : CONTACTS_SIM2_PROVIDER_NAME;
}

ContactsSim::Slot ContactsSim::slot(int slotNo)
{
	Slot s;
	if (slotNo < 0 || slotNo >= kSlots)
		return s;
	std::unique_ptr<GKeyFile, decltype(&g_key_file_free)> file(g_key_file_new(), g_key_file_free);
	std::string path = platform::dataPath("sim.conf");
	if (!g_key_file_load_from_file(file.get(), path.c_str(), G_KEY_FILE_NONE, nullptr)) {
		s.present = slotNo == 0;
		return s;
	}
	const char* group = providerName(slotNo);
	s.present = g_key_file_has_group(file.get(), group) && readInt(file.get(), group, "present", 1) != 0;
	s.capacity = readInt(file.get(), group, "capacity", s.capacity);
	s.nameMax = readInt(file.get(), group, "name_max", s.nameMax);
	s.numberMax = readInt(file.get(), group, "number_max", s.numberMax);
	s.emailMax = readInt(file.get(), group, "email_max", s.emailMax);
	s.emailCapacity = readInt(file.get(), group, "email_capacity", s.emailCapacity);
	return s;
}

bool ContactsSim::isReady(int slotNo)
{
	return slot(slotNo).present && simPowered(slotNo);
}

int ContactsSim::addressBookOf(ContactsConnection& conn, int slotNo)
{
	if (slotNo < 0 || slotNo >= kSlots)
		return -1;
	CachedStatement st(conn.statement("SELECT id FROM address_books WHERE name = ? AND account_id = 0"));
	return st->bind(1, bookName(slotNo)).step() == SQLITE_ROW ? st->columnInt(0) : -1;
}

int ContactsSim::slotOf(ContactsConnection& conn, int addressBookId)
{
	for (int i = 0; i < kSlots; ++i)
		if (addressBookId > 0 && addressBookOf(conn, i) == addressBookId)
			return i;
	return -1;
}

int ContactsSim::ensureAddressBooks(ContactsConnection& conn)
{
	for (int i = 0; i < kSlots; ++i) {
		if (!slot(i).present || addressBookOf(conn, i) >= 0)
			continue;
		db::Transaction tx(conn.database());
		CachedStatement st(conn.statement(
			"INSERT INTO address_books(account_id, name, mode, provider_name) VALUES (0, ?, 0, ?)"));
		int rc = st->bind(1, bookName(i)).bind(2, providerName(i)).run();
		if (rc != SQLITE_DONE)
			return conn.failed("SIM address book", rc);
		rc = tx.commit();
		if (rc != SQLITE_OK)
			return conn.failed("COMMIT", rc);
	}
	return CONTACTS_ERROR_NONE;
}

} // namespace ct::contacts

using namespace ct::contacts;

namespace {

int fieldMaxLen(const ContactsSim::Slot& s, int field)
{
	switch (field) {
	case CONTACTS_SIM_FIELD_NAME: return s.nameMax;
	case CONTACTS_SIM_FIELD_NUMBER: return s.numberMax;
	case CONTACTS_SIM_FIELD_EMAIL: return s.emailMax;
	default: return 0;
	}
}

int countIn(ContactsConnection& conn, const char* sql, int book)
{
	CachedStatement st(conn.statement(sql));
	return st->bind(1, book).step() == SQLITE_ROW ? st->columnInt(0) : 0;
}

const char* firstText(const contacts_record_s& contact, const char* child, const char* prop)
{
	const auto* list = contact.children(child);
	return list && !list->empty() ? list->front()->getStr(prop) : nullptr;
}

bool fits(const char* text, int maxLen)
{
	return !text || g_utf8_strlen(text, -1) <= maxLen;
}

// Checks a contact against the SIM of its address book; *slotNo gets the slot.
int checkSimContact(ContactsConnection& conn, const contacts_record_s& contact, int* slotNo)
{
	WPRET_VM(contact.view->number != kContactView, CONTACTS_ERROR_INVALID_PARAMETER, "not a contact record");
	*slotNo = ContactsSim::slotOf(conn, contact.getInt("address_book_id"));
	WPRET_VM(*slotNo < 0, CONTACTS_ERROR_INVALID_PARAMETER, "address book %d is not a SIM",
		contact.getInt("address_book_id"));
	WPRET_VM(!ContactsSim::isReady(*slotNo), CONTACTS_ERROR_NOT_SUPPORTED, "SIM %d is not ready", *slotNo + 1);
	ContactsSim::Slot s = ContactsSim::slot(*slotNo);
	WPRET_VM(!fits(firstText(contact, "name", "first"), s.nameMax), CONTACTS_ERROR_INVALID_PARAMETER,
		"name too long for the SIM");
	// A leading '+' is kept in the number's type of number, not among its digits.
	const char* number = firstText(contact, "number", "number");
	if (number && *number == '+')
		++number;
	WPRET_VM(!fits(number, s.numberMax), CONTACTS_ERROR_INVALID_PARAMETER, "number too long for the SIM");
	WPRET_VM(!fits(firstText(contact, "email", "email"), s.emailMax), CONTACTS_ERROR_INVALID_PARAMETER,
		"e-mail too long for the SIM");
	return CONTACTS_ERROR_NONE;
}

// A copy holding only what a SIM stores: first name, first number, first e-mail.
contacts_record_s* simCopy(const contacts_record_s& contact)
{
	auto* copy = new contacts_record_s(*contact.view);
	copy->values = contact.values;
	for (const char* child : { "name", "number", "email" }) {
		const auto* list = contact.children(child);
		if (list && !list->empty()) {
			contacts_record_s* c = list->front()->clone();
			c->parent = copy;
			copy->children(child)->push_back(c);
		}
	}
	return copy;
}

ContactsConnection* connectionOrLog()
{
	ContactsConnection* conn = ContactsConnection::current();
	if (!conn)
		WERROR("not connected");
	return conn;
}

} // namespace

extern "C" {

int contacts_sim_is_ready(int sim_slot_no, bool* is_ready)
{
	WPRET_VM(!is_ready || sim_slot_no < 0 || sim_slot_no >= ContactsSim::kSlots, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : slot %d", sim_slot_no);
	*is_ready = ContactsSim::isReady(sim_slot_no);
	return CONTACTS_ERROR_NONE;
}

int contacts_sim_get_field_text_max_len(int sim_slot_no, contacts_sim_field_e field, int* max_len)
{
	WPRET_VM(!max_len || sim_slot_no < 0 || sim_slot_no >= ContactsSim::kSlots, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : slot %d", sim_slot_no);
	ContactsSim::Slot s = ContactsSim::slot(sim_slot_no);
	*max_len = s.present ? fieldMaxLen(s, rawValue(field)) : 0;
	return CONTACTS_ERROR_NONE;
}

int contacts_sim_get_field_status(int sim_slot_no, contacts_sim_field_e field, bool* supported)
{
	int maxLen = 0;
	int err = contacts_sim_get_field_text_max_len(sim_slot_no, field, &maxLen);
	if (supported)
		*supported = err == CONTACTS_ERROR_NONE && maxLen > 0;
	return err;
}

int contacts_sim_get_unused_field_count(int sim_slot_no, contacts_sim_field_e field, int* count)
{
	WPRET_VM(!count || sim_slot_no < 0 || sim_slot_no >= ContactsSim::kSlots, CONTACTS_ERROR_INVALID_PARAMETER,
		"Invalid param : slot %d", sim_slot_no);
	*count = 0;
	ContactsSim::Slot s = ContactsSim::slot(sim_slot_no);
	if (!s.present || fieldMaxLen(s, rawValue(field)) <= 0)
		return CONTACTS_ERROR_NONE;
	ContactsConnection* conn = connectionOrLog();
	if (!conn)
		return CONTACTS_ERROR_DB;
	int book = ContactsSim::addressBookOf(*conn, sim_slot_no);
	if (rawValue(field) == CONTACTS_SIM_FIELD_EMAIL) {
		*count = s.emailCapacity - countIn(*conn, "SELECT count(*) FROM emails e JOIN contacts c ON "
			"c.id = e.contact_id WHERE e.owner = 0 AND c.address_book_id = ?", book);
	} else {
		*count = s.capacity - countIn(*conn, "SELECT count(*) FROM contacts WHERE address_book_id = ?", book);
	}
	if (*count < 0)
		*count = 0;
	return CONTACTS_ERROR_NONE;
}

int contacts_sim_insert(contacts_record_h contact, int* contact_id)
{
	WPRET_VM(!contact, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : contact");
	ContactsConnection* conn = connectionOrLog();
	if (!conn)
		return CONTACTS_ERROR_DB;
	int slotNo = -1;
	int err = checkSimContact(*conn, *contact, &slotNo);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	int unused = 0;
	contacts_sim_get_unused_field_count(slotNo, CONTACTS_SIM_FIELD_NAME, &unused);
	WPRET_VM(unused <= 0, CONTACTS_ERROR_FILE_NO_SPACE, "SIM %d is full", slotNo + 1);
	if (firstText(*contact, "email", "email")) {
		contacts_sim_get_unused_field_count(slotNo, CONTACTS_SIM_FIELD_EMAIL, &unused);
		WPRET_VM(unused <= 0, CONTACTS_ERROR_FILE_NO_SPACE, "no room for e-mails on SIM %d", slotNo + 1);
	}
	std::unique_ptr<contacts_record_s> copy(simCopy(*contact));
	int id = 0;
	err = conn->write([&](WriteContext& ctx) { return ContactsWriter(*conn, ctx).insert(*copy, &id); });
	if (contact_id)
		*contact_id = err == CONTACTS_ERROR_NONE ? id : 0;
	if (err == CONTACTS_ERROR_NONE)
		contact->setInt("id", id);
	return err;
}

int contacts_sim_update(contacts_record_h contact)
{
	WPRET_VM(!contact, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : contact");
	ContactsConnection* conn = connectionOrLog();
	if (!conn)
		return CONTACTS_ERROR_DB;
	int slotNo = -1;
	int err = checkSimContact(*conn, *contact, &slotNo);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	std::unique_ptr<contacts_record_s> copy(simCopy(*contact));
	return conn->write([&](WriteContext& ctx) { return ContactsWriter(*conn, ctx).update(*copy); });
}

int contacts_sim_delete(int person_id)
{
	WPRET_VM(person_id <= 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : person %d", person_id);
	ContactsConnection* conn = connectionOrLog();
	if (!conn)
		return CONTACTS_ERROR_DB;
	std::vector<int> simContacts;
	for (int id : ContactsReader(*conn).contactIdsOfPerson(person_id)) {
		CachedStatement st(conn->statement("SELECT address_book_id FROM contacts WHERE id = ?"));
		if (st->bind(1, id).step() == SQLITE_ROW && ContactsSim::slotOf(*conn, st->columnInt(0)) >= 0)
			simContacts.push_back(id);
	}
	if (simContacts.empty())
		return CONTACTS_ERROR_NO_DATA;
	const ViewInfo* view = ContactsSchema::view("contacts.view.contact");
	return conn->write([&](WriteContext& ctx) {
		ContactsWriter writer(*conn, ctx);
		for (int id : simContacts) {
			int e = writer.remove(*view, id);
			if (e != CONTACTS_ERROR_NONE)
				return e;
		}
		return static_cast<int>(CONTACTS_ERROR_NONE);
	});
}

} // extern "C"
