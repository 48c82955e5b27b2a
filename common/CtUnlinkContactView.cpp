#include "CtUnlinkContactView.h"

#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonRecordUtil.h"

#include <contacts.h>

#include <cstdlib>

namespace {

std::string addressbookNameOf(int addressbookId)
{
	char* first = nullptr;
	char* second = nullptr;
	std::string name;
	if (ctCommonGetAccountInforByAddressbookId(addressbookId, &first, &second) == CONTACTS_ERROR_NONE && first)
		name = first;
	free(first);
	free(second);
	return name;
}

} // namespace

CtUnlinkContactView::CtUnlinkContactView(int personId)
	: CtPersonPickerView("IDS_PB_OPT_MANAGE_LINKED_CONTACTS_ABB2")
	, m_personId(personId)
{
	if (personId < 1)
		WERROR("Invalid param : personId %d", personId);
}

std::vector<CtPersonPickerView::Entry> CtUnlinkContactView::loadEntries()
{
	std::vector<Entry> entries;
	Eina_List* contacts = ctCommonGetContactsList(m_personId);
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(contacts, l, data) {
		auto contact = static_cast<contacts_record_h>(data);
		Entry entry;
		char* name = nullptr;
		int addressbookId = 0;
		contacts_record_get_int(contact, _contacts_contact.id, &entry.id);
		contacts_record_get_str_p(contact, _contacts_contact.display_name, &name);
		contacts_record_get_int(contact, _contacts_contact.address_book_id, &addressbookId);
		entry.name = name ? name : "";
		entry.subText = addressbookNameOf(addressbookId);
		entries.push_back(std::move(entry));
	}
	ctCommonDestroyRecordList(contacts);
	return entries;
}

void CtUnlinkContactView::onChosen(const Entry& entry)
{
	// A person of one contact has nothing to unlink from.
	if (loadEntries().size() < 2) {
		WERROR("only one contact left in person %d", m_personId);
		return;
	}
	int unlinkedPersonId = 0;
	int err = contacts_person_unlink_contact(m_personId, entry.id, &unlinkedPersonId);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_person_unlink_contact", err);
		return;
	}
	WDEBUG("contact %d is now person %d", entry.id, unlinkedPersonId);
	reload();
	if (loadEntries().size() < 2)
		popOut();
}
