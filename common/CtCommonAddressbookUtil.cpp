#include "CtCommonAddressbookUtil.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonRecordUtil.h"

#include <cstdlib>
#include <cstring>

namespace {

// A record read by id, destroyed with the scope.
class ScopedRecord {
public:
	ScopedRecord(const char* viewUri, int id)
	{
		m_err = contacts_db_get_record(viewUri, id, &m_record);
		if (m_err != CONTACTS_ERROR_NONE)
			m_record = nullptr;
	}
	~ScopedRecord()
	{
		if (m_record)
			contacts_record_destroy(m_record, true);
	}
	ScopedRecord(const ScopedRecord&) = delete;
	ScopedRecord& operator=(const ScopedRecord&) = delete;

	contacts_record_h get() const { return m_record; }
	int error() const { return m_err; }

private:
	contacts_record_h m_record = nullptr;
	int m_err = CONTACTS_ERROR_NONE;
};

char* dupOrNull(const char* text)
{
	return text ? strdup(text) : nullptr;
}

const char* textOf(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	contacts_record_get_str_p(record, property, &value);
	return value;
}

bool isSimName(const char* name)
{
	return name && (!strcmp(name, SIM_ADDRESSBOOK_NAME) || !strcmp(name, CONTACTS_SIM1_ADDRESS_BOOK_NAME) ||
		       !strcmp(name, CONTACTS_SIM2_ADDRESS_BOOK_NAME));
}

// Parts of the names of the device and SIM books that no account book has.
const char* const kBuiltInNameMarks[] = {"addressbook/phone", "addressbook/sim"};

int groupIdBySystemId(int addressbookId, const char* systemId)
{
	contacts_filter_h filter = nullptr;
	contacts_query_h query = nullptr;
	contacts_list_h list = nullptr;
	contacts_filter_create(_contacts_group._uri, &filter);
	contacts_filter_add_int(filter, _contacts_group.address_book_id, CONTACTS_MATCH_EQUAL, addressbookId);
	contacts_filter_add_operator(filter, CONTACTS_FILTER_OPERATOR_AND);
	contacts_filter_add_str(filter, _contacts_group.system_id, CONTACTS_MATCH_EXACTLY, systemId);
	contacts_query_create(_contacts_group._uri, &query);
	contacts_query_set_filter(query, filter);
	int err = contacts_db_get_records_with_query(query, 0, 1, &list);
	contacts_query_destroy(query);
	contacts_filter_destroy(filter);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_records_with_query", err);
		return 0;
	}
	int groupId = 0;
	contacts_record_h group = nullptr;
	if (contacts_list_get_current_record_p(list, &group) == CONTACTS_ERROR_NONE)
		contacts_record_get_int(group, _contacts_group.id, &groupId);
	contacts_list_destroy(list, true);
	return groupId;
}

} // namespace

bool ctCommonIsSimAddressbook(int addressbookId)
{
	if (addressbookId <= 0)
		return false;
	ScopedRecord book(_contacts_address_book._uri, addressbookId);
	return book.get() && isSimName(textOf(book.get(), _contacts_address_book.name));
}

bool ctCommonIsAccountAddressbookName(const char* addressbookName)
{
	if (!addressbookName)
		return false;
	for (const char* mark : kBuiltInNameMarks)
		if (strstr(addressbookName, mark))
			return false;
	return true;
}

int ctCommonGetAddressBookId(const char* addressbookName)
{
	WPRET_VM(!addressbookName, -1, "Invalid param : addressbookName");
	contacts_list_h list = nullptr;
	int err = contacts_db_get_all_records(_contacts_address_book._uri, 0, 0, &list);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_all_records", err);
		return -1;
	}
	int found = -1;
	contacts_record_h book = nullptr;
	do {
		if (contacts_list_get_current_record_p(list, &book) != CONTACTS_ERROR_NONE)
			break;
		const char* name = textOf(book, _contacts_address_book.name);
		if (name && !strcmp(name, addressbookName))
			contacts_record_get_int(book, _contacts_address_book.id, &found);
	} while (found < 0 && contacts_list_next(list) == CONTACTS_ERROR_NONE);
	contacts_list_destroy(list, true);
	return found;
}

char* ctCommonGetAddressBookName(int addressbookId)
{
	ScopedRecord book(_contacts_address_book._uri, addressbookId);
	if (!book.get()) {
		WFAILED("contacts_db_get_record", book.error());
		return nullptr;
	}
	return dupOrNull(textOf(book.get(), _contacts_address_book.name));
}

int ctCommonGetProviderNameByAddressbookId(int addressbookId, char** providerName, char** userName)
{
	WPRET_VM(!providerName || !userName, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : out");
	*providerName = nullptr;
	*userName = nullptr;
	ScopedRecord book(_contacts_address_book._uri, addressbookId);
	if (!book.get()) {
		WFAILED("contacts_db_get_record", book.error());
		return book.error();
	}
	if (addressbookId == 0)
		*providerName = strdup(ContactsCommon::translate("IDS_PB_OPT_DEVICE"));
	else
		*providerName = dupOrNull(textOf(book.get(), _contacts_address_book.provider_name));
	*userName = dupOrNull(textOf(book.get(), _contacts_address_book.user_name));
	return CONTACTS_ERROR_NONE;
}

int ctCommonGetAccountInforByAddressbookId(int addressbookId, char** firstText, char** secondText)
{
	WPRET_VM(!firstText || !secondText, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : out");
	*firstText = nullptr;
	*secondText = nullptr;
	ScopedRecord book(_contacts_address_book._uri, addressbookId);
	if (!book.get()) {
		WFAILED("contacts_db_get_record", book.error());
		return book.error();
	}
	if (addressbookId == 0)
		*firstText = strdup("IDS_PB_OPT_DEVICE");
	else if (isSimName(textOf(book.get(), _contacts_address_book.name)))
		*firstText = strdup("IDS_PB_OPT_SIM_CARD");
	else
		*firstText = dupOrNull(textOf(book.get(), _contacts_address_book.provider_name));
	*secondText = dupOrNull(textOf(book.get(), _contacts_address_book.user_name));
	return CONTACTS_ERROR_NONE;
}

std::string ctCommonGetAccountIconPathByAddressbookId(int addressbookId)
{
	if (addressbookId == 0)
		return ContactsCommon::getAppImagePath("contacts_list_ic_device.png", false);
	ScopedRecord book(_contacts_address_book._uri, addressbookId);
	const char* name = book.get() ? textOf(book.get(), _contacts_address_book.name) : nullptr;
	if (!name)
		return "";
	if (!strcmp(name, CONTACTS_SIM1_ADDRESS_BOOK_NAME))
		return ContactsCommon::getAppImagePath("logs_icon_sim_1_62.png", false);
	if (!strcmp(name, CONTACTS_SIM2_ADDRESS_BOOK_NAME))
		return ContactsCommon::getAppImagePath("logs_icon_sim_2_62.png", false);
	if (!strcmp(name, SIM_ADDRESSBOOK_NAME))
		return ContactsCommon::getAppImagePath("logs_icon_sim_62.png", false);
	return "";
}

Eina_List* ctCommonGetWritableContactList(int personId, int maxCount)
{
	Eina_List* contacts = ctCommonGetContactsList(personId);
	Eina_List* writable = nullptr;
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(contacts, l, data) {
		contacts_record_h contact = static_cast<contacts_record_h>(data);
		int addressbookId = 0;
		contacts_record_get_int(contact, _contacts_contact.address_book_id, &addressbookId);
		ScopedRecord book(_contacts_address_book._uri, addressbookId);
		int mode = CONTACTS_ADDRESS_BOOK_MODE_READONLY;
		if (book.get())
			contacts_record_get_int(book.get(), _contacts_address_book.mode, &mode);
		bool full = maxCount > 0 && (int)eina_list_count(writable) >= maxCount;
		if (!(mode & CONTACTS_ADDRESS_BOOK_MODE_READONLY) && !full) {
			writable = eina_list_append(writable, contact);
			l->data = nullptr;
		}
	}
	ctCommonDestroyRecordList(contacts);
	return writable;
}

std::string ctCommonGetDisplayGroupName(const char* systemId)
{
	if (!systemId)
		return "";
	static const struct {
		const char* systemId;
		const char* textId;
	} kSystemGroups[] = {
		{"coworkers", "IDS_PB_BODY_CO_WORKERS"},
		{"family", "IDS_PB_BODY_FAMILY"},
		{"friends", "IDS_PB_OPT_FRIENDS"},
		{"emergency", "IDS_PB_HEADER_EMERGENCY_CONTACTS"},
		{"contacts", "IDS_PB_BODY_MY_CONTACTS"},
	};
	for (const auto& group : kSystemGroups)
		if (!strcmp(group.systemId, systemId))
			return ContactsCommon::translate(group.textId);
	return systemId;
}

int ctCommonGetEasDefaultGroupId(int addressbookId)
{
	if (addressbookId <= 0)
		return 0;
	return groupIdBySystemId(addressbookId, "contacts");
}
