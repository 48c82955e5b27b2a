#include "CtCommonRecordUtil.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"

#include "RegionDateFormat.h"

#include <cstdlib>
#include <cstring>
#include <vector>

namespace {

const char* textOf(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	contacts_record_get_str_p(record, property, &value);
	return value;
}

bool isEmpty(const char* text)
{
	return !text || !*text;
}

void appendPart(std::string& out, const char* part, const char* separator)
{
	if (isEmpty(part))
		return;
	if (!out.empty())
		out += separator;
	out += part;
}

char* dupOrNull(const std::string& text)
{
	return text.empty() ? nullptr : strdup(text.c_str());
}

// First child of that kind over the contacts, still owned by its contact.
contacts_record_h firstChild(Eina_List* contacts, unsigned int property)
{
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(contacts, l, data) {
		contacts_record_h child = nullptr;
		if (contacts_record_get_child_record_at_p(static_cast<contacts_record_h>(data), property, 0, &child) ==
			CONTACTS_ERROR_NONE)
			return child;
	}
	return nullptr;
}

std::string phoneticNameOf(contacts_record_h name)
{
	const char* first = textOf(name, _contacts_name.phonetic_first);
	const char* middle = textOf(name, _contacts_name.phonetic_middle);
	const char* last = textOf(name, _contacts_name.phonetic_last);
	contacts_name_display_order_e order = CONTACTS_NAME_DISPLAY_ORDER_FIRSTLAST;
	contacts_setting_get_name_display_order(&order);
	std::string out;
	const char* parts[3] = {first, middle, last};
	if (order == CONTACTS_NAME_DISPLAY_ORDER_LASTFIRST) {
		parts[0] = last;
		parts[1] = first;
		parts[2] = middle;
	}
	for (const char* part : parts)
		appendPart(out, part, " ");
	return out;
}

void appendChildLines(std::string& out, contacts_record_h contact, unsigned int childProperty, unsigned int textProperty)
{
	int count = 0;
	contacts_record_get_child_record_count(contact, childProperty, &count);
	for (int i = 0; i < count; ++i) {
		contacts_record_h child = nullptr;
		if (contacts_record_get_child_record_at_p(contact, childProperty, i, &child) == CONTACTS_ERROR_NONE)
			appendPart(out, textOf(child, textProperty), "\n");
	}
}

const char* tr(const char* textId)
{
	return ContactsCommon::translate(textId);
}

const char* customOr(const char* customLabel)
{
	return isEmpty(customLabel) ? tr("IDS_PB_OPT_CUSTOM") : customLabel;
}

const char* labelOf(contacts_record_h record, unsigned int labelProperty)
{
	return record ? textOf(record, labelProperty) : nullptr;
}

} // namespace

Eina_List* ctCommonGetContactsList(int personId)
{
	WPRET_VM(personId < 1, nullptr, "Invalid param : personId %d", personId);
	contacts_filter_h filter = nullptr;
	contacts_query_h query = nullptr;
	contacts_list_h ids = nullptr;
	contacts_filter_create(_contacts_simple_contact._uri, &filter);
	contacts_filter_add_int(filter, _contacts_simple_contact.person_id, CONTACTS_MATCH_EQUAL, personId);
	contacts_query_create(_contacts_simple_contact._uri, &query);
	contacts_query_set_filter(query, filter);
	unsigned int projection[] = {_contacts_simple_contact.id};
	contacts_query_set_projection(query, projection, 1);
	contacts_query_set_sort(query, _contacts_simple_contact.id, true);
	int err = contacts_db_get_records_with_query(query, 0, 0, &ids);
	contacts_query_destroy(query);
	contacts_filter_destroy(filter);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_records_with_query", err);
		return nullptr;
	}
	Eina_List* contacts = nullptr;
	contacts_record_h idRecord = nullptr;
	while (contacts_list_get_current_record_p(ids, &idRecord) == CONTACTS_ERROR_NONE) {
		int contactId = 0;
		contacts_record_get_int(idRecord, _contacts_simple_contact.id, &contactId);
		contacts_record_h contact = nullptr;
		err = contacts_db_get_record(_contacts_contact._uri, contactId, &contact);
		if (err == CONTACTS_ERROR_NONE)
			contacts = eina_list_append(contacts, contact);
		else
			WFAILED("contacts_db_get_record", err);
		if (contacts_list_next(ids) != CONTACTS_ERROR_NONE)
			break;
	}
	contacts_list_destroy(ids, true);
	return contacts;
}

Eina_List* CtCommonGetChildDataList(Eina_List* contacts, unsigned int property)
{
	Eina_List* children = nullptr;
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(contacts, l, data) {
		contacts_record_h contact = static_cast<contacts_record_h>(data);
		int count = 0;
		contacts_record_get_child_record_count(contact, property, &count);
		for (int i = 0; i < count; ++i) {
			contacts_record_h child = nullptr;
			if (contacts_record_get_child_record_at_p(contact, property, i, &child) == CONTACTS_ERROR_NONE)
				children = eina_list_append(children, child);
		}
	}
	return children;
}

void ctCommonDestroyRecordList(Eina_List* records)
{
	void* data = nullptr;
	EINA_LIST_FREE(records, data) {
		if (data)
			contacts_record_destroy(static_cast<contacts_record_h>(data), true);
	}
}

bool ctCommonIsSimContact(int personId)
{
	Eina_List* contacts = ctCommonGetContactsList(personId);
	bool isSim = false;
	if (eina_list_count(contacts) == 1) {
		int addressbookId = 0;
		contacts_record_get_int(static_cast<contacts_record_h>(eina_list_data_get(contacts)),
			_contacts_contact.address_book_id, &addressbookId);
		isSim = ctCommonIsSimAddressbook(addressbookId);
	}
	ctCommonDestroyRecordList(contacts);
	return isSim;
}

char* CtCommonGetCompany(Eina_List* contacts)
{
	contacts_record_h company = firstChild(contacts, _contacts_contact.company);
	if (!company)
		return nullptr;
	std::string line;
	appendPart(line, textOf(company, _contacts_company.name), "");
	appendPart(line, textOf(company, _contacts_company.department), " ");
	appendPart(line, textOf(company, _contacts_company.job_title), ", ");
	return dupOrNull(line);
}

void CtCommonGetExtraName1(Eina_List* contacts, char** first, char** second)
{
	WPRET_M(!first || !second, "Invalid param : out");
	*first = nullptr;
	*second = nullptr;
	contacts_record_h nickname = firstChild(contacts, _contacts_contact.nickname);
	if (nickname && !isEmpty(textOf(nickname, _contacts_nickname.name)))
		*first = strdup(textOf(nickname, _contacts_nickname.name));
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(contacts, l, data) {
		contacts_record_h name = nullptr;
		contacts_record_get_child_record_at_p(static_cast<contacts_record_h>(data), _contacts_contact.name, 0, &name);
		std::string phonetic = name ? phoneticNameOf(name) : "";
		if (!phonetic.empty()) {
			*second = strdup(phonetic.c_str());
			return;
		}
	}
}

char* ctCommonRemoveNewline(const char* text)
{
	if (!text)
		return nullptr;
	char* copy = strdup(text);
	for (char* p = copy; *p; ++p)
		if (*p == '\n' || *p == '\r')
			*p = ' ';
	return copy;
}

char* CtCommonGetShareText(int personId)
{
	contacts_record_h person = nullptr;
	int err = contacts_db_get_record(_contacts_person._uri, personId, &person);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_record", err);
		return nullptr;
	}
	std::string text;
	appendPart(text, textOf(person, _contacts_person.display_name), "\n");
	contacts_record_destroy(person, true);

	Eina_List* contacts = ctCommonGetContactsList(personId);
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(contacts, l, data) {
		contacts_record_h contact = static_cast<contacts_record_h>(data);
		appendChildLines(text, contact, _contacts_contact.number, _contacts_number.number);
		appendChildLines(text, contact, _contacts_contact.email, _contacts_email.email);
		appendChildLines(text, contact, _contacts_contact.url, _contacts_url.url);
	}
	ctCommonDestroyRecordList(contacts);
	return strdup(text.c_str());
}

i18n_udate_h CtCommonGetTimeFormatter()
{
	return ct::i18n::createEventDateFormatter(ct::i18n::Year::Shown);
}

i18n_udate_h CtCommonGetTimeFormatterWithoutYear()
{
	return ct::i18n::createEventDateFormatter(ct::i18n::Year::Hidden);
}

std::string CtCommonGetDatetimeStr(i18n_udate_h formatter, int year, int month, int day)
{
	WPRET_VM(!formatter, "", "Invalid param : formatter");
	return ct::i18n::formatEventDate(formatter, year * 10000 + month * 100 + day);
}

std::string ctCommonGetGroupNames(Eina_List* contacts)
{
	std::vector<std::string> names;
	Eina_List* relations = CtCommonGetChildDataList(contacts, _contacts_contact.group_relation);
	void* data = nullptr;
	EINA_LIST_FREE(relations, data) {
		int groupId = 0;
		contacts_record_get_int(static_cast<contacts_record_h>(data), _contacts_group_relation.group_id, &groupId);
		contacts_record_h group = nullptr;
		int err = contacts_db_get_record(_contacts_group._uri, groupId, &group);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_db_get_record", err);
			continue;
		}
		const char* systemId = textOf(group, _contacts_group.system_id);
		std::string name = isEmpty(systemId) ? (textOf(group, _contacts_group.name) ?: "")
						     : ctCommonGetDisplayGroupName(systemId);
		contacts_record_destroy(group, true);
		bool known = false;
		for (const std::string& seen : names)
			known = known || seen == name;
		if (!name.empty() && !known)
			names.push_back(name);
	}
	std::string joined;
	for (const std::string& name : names)
		appendPart(joined, name.c_str(), ", ");
	return joined;
}

const char* CtCommonGetNumberTypeStr(int type, const char* customLabel)
{
	if (type & CONTACTS_NUMBER_TYPE_CUSTOM)
		return customOr(customLabel);
	if (type & CONTACTS_NUMBER_TYPE_FAX)
		return tr(type & CONTACTS_NUMBER_TYPE_HOME ? "IDS_PB_OPT_FAX_HHOME_ABB" : "IDS_PB_OPT_FAX_HWORK_ABB");
	if (type & CONTACTS_NUMBER_TYPE_CELL)
		return tr("IDS_PB_OPT_MOBILE");
	if (type & CONTACTS_NUMBER_TYPE_PAGER)
		return tr("IDS_PB_OPT_PAGER");
	if (type & CONTACTS_NUMBER_TYPE_ASSISTANT)
		return tr("IDS_PB_OPT_ASSISTANT_M_CONTACTS");
	if (type & CONTACTS_NUMBER_TYPE_HOME)
		return tr("IDS_PB_OPT_HOME_ABB2");
	if (type & CONTACTS_NUMBER_TYPE_WORK)
		return tr("IDS_PB_OPT_WORK");
	return tr("IDS_PB_OPT_OTHER");
}

const char* CtCommonGetNumberTypeStr(contacts_record_h record, int type)
{
	return CtCommonGetNumberTypeStr(type, labelOf(record, _contacts_number.label));
}

const char* CtCommonGetEmailTypeStr(int type, const char* customLabel)
{
	if (type & CONTACTS_EMAIL_TYPE_CUSTOM)
		return customOr(customLabel);
	if (type & CONTACTS_EMAIL_TYPE_HOME)
		return tr("IDS_PB_OPT_HOME_ABB2");
	if (type & CONTACTS_EMAIL_TYPE_WORK)
		return tr("IDS_PB_OPT_WORK");
	if (type & CONTACTS_EMAIL_TYPE_MOBILE)
		return tr("IDS_PB_OPT_MOBILE");
	return tr("IDS_PB_OPT_OTHER");
}

const char* CtCommonGetEmailTypeStr(contacts_record_h record, int type)
{
	return CtCommonGetEmailTypeStr(type, labelOf(record, _contacts_email.label));
}

const char* CtCommonGetAddressTypeStr(int type, const char* customLabel)
{
	if (type & CONTACTS_ADDRESS_TYPE_CUSTOM)
		return customOr(customLabel);
	if (type & CONTACTS_ADDRESS_TYPE_HOME)
		return tr("IDS_PB_OPT_HOME_ABB2");
	if (type & CONTACTS_ADDRESS_TYPE_WORK)
		return tr("IDS_PB_OPT_WORK");
	return tr("IDS_PB_OPT_OTHER");
}

const char* CtCommonGetAddressTypeStr(contacts_record_h record, int type)
{
	return CtCommonGetAddressTypeStr(type, labelOf(record, _contacts_address.label));
}

const char* CtCommonGetMessengerTypeStr(int type, const char* customLabel)
{
	static const char* const kIds[] = {"IDS_PB_OPT_OTHER", nullptr, "IDS_PB_OPT_HANGOUTS",
		"IDS_PB_OPT_WINDOWS_LIVE_MESSENGER", "IDS_PB_OPT_YAHOO_E", "IDS_PB_OPT_FACEBOOK", "IDS_PB_OPT_ICQ",
		"IDS_PB_OPT_AIM", "IDS_PB_OPT_QQ", "IDS_PB_OPT_JABBER", "IDS_PB_BODY_SKYPE", "IDS_PB_OPT_IRC"};
	if (type == CONTACTS_MESSENGER_TYPE_CUSTOM)
		return customOr(customLabel);
	if (type < 0 || type >= (int)(sizeof(kIds) / sizeof(kIds[0])))
		return tr("IDS_PB_OPT_OTHER");
	return tr(kIds[type]);
}

const char* CtCommonGetMessengerTypeStr(contacts_record_h record, int type)
{
	return CtCommonGetMessengerTypeStr(type, labelOf(record, _contacts_messenger.label));
}

const char* CtCommonGetUrlTypeStr(int type, const char* customLabel)
{
	switch (type) {
	case CONTACTS_URL_TYPE_CUSTOM:
		return customOr(customLabel);
	case CONTACTS_URL_TYPE_HOME:
		return tr("IDS_PB_OPT_HOME_ABB2");
	case CONTACTS_URL_TYPE_WORK:
		return tr("IDS_PB_OPT_WORK");
	default:
		return tr("IDS_PB_OPT_OTHER");
	}
}

const char* CtCommonGetUrlTypeStr(contacts_record_h record, int type)
{
	return CtCommonGetUrlTypeStr(type, labelOf(record, _contacts_url.label));
}

const char* CtCommonGetRelationshipTypeStr(int type, const char* customLabel)
{
	static const char* const kIds[] = {"IDS_PB_OPT_OTHER", "IDS_PB_OPT_ASSISTANT_M_CONTACTS", "IDS_PB_OPT_BROTHER",
		"IDS_PB_OPT_CHILD", "IDS_PB_OPT_DOMESTIC_PARTNER_ABB2", "IDS_PB_OPT_FATHER", "IDS_PB_OPT_FRIEND",
		"IDS_PB_OPT_MANAGER", "IDS_PB_OPT_MOTHER", "IDS_PB_OPT_PARENT", "IDS_PB_OPT_PARTNER",
		"IDS_PB_OPT_REFERRED_BY_ABB", "IDS_PB_OPT_RELATIVE", "IDS_PB_OPT_SISTER", "IDS_PB_OPT_SPOUSE"};
	if (type == CONTACTS_RELATIONSHIP_TYPE_CUSTOM)
		return customOr(customLabel);
	if (type < 0 || type >= (int)(sizeof(kIds) / sizeof(kIds[0])))
		return tr("IDS_PB_OPT_OTHER");
	return tr(kIds[type]);
}

const char* CtCommonGetRelationshipTypeStr(contacts_record_h record, int type)
{
	return CtCommonGetRelationshipTypeStr(type, labelOf(record, _contacts_relationship.label));
}

const char* CtCommonGetEventTypeStr(int type, const char* customLabel)
{
	switch (type) {
	case CONTACTS_EVENT_TYPE_CUSTOM:
		return customOr(customLabel);
	case CONTACTS_EVENT_TYPE_BIRTH:
		return tr("IDS_PB_OPT_BIRTHDAY");
	case CONTACTS_EVENT_TYPE_ANNIVERSARY:
		return tr("IDS_PB_OPT_ANNIVERSARY_ABB");
	default:
		return tr("IDS_PB_OPT_OTHER");
	}
}

const char* CtCommonGetEventTypeStr(contacts_record_h record, int type)
{
	return CtCommonGetEventTypeStr(type, labelOf(record, _contacts_event.label));
}
