#include "CtInputData.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonRecordUtil.h"
#include "CtCommonTextUtil.h"
#include "CtDataTextRules.h"
#include "CtDbChangeSubscription.h"
#include "ICtChangeListener.h"

#include <app_preference.h>
#include <glib.h>
#include <vconf.h>

#include <cerrno>
#include <climits>
#include <cstdlib>
#include <cstring>

using namespace CtDataType;

namespace {

constexpr size_t kTextBufferSize = 1024;
constexpr int kSimTextDefaultMaxLen = 20;

constexpr int kInputTypePrimaryEdit = 112;
constexpr int kInputTypeEmergency = 126;

const char* const kGoogleProvider = "Google";
const char* const kDefaultGroupSystemId = "contacts";
const char* const kEmergencyGroupSystemId = "emergency";

// The text cut to what a 1024-byte buffer holds, never inside a character.
const char* textOf(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	if (!record || contacts_record_get_str_p(record, property, &value) != CONTACTS_ERROR_NONE)
		return nullptr;
	return value;
}

int intOf(contacts_record_h record, unsigned int property)
{
	int value = 0;
	if (record)
		contacts_record_get_int(record, property, &value);
	return value;
}

bool isEmpty(const char* text)
{
	return !text || !*text;
}

// Blank-joined non-empty parts.
std::string joinParts(std::initializer_list<const char*> parts)
{
	std::string out;
	for (const char* part : parts)
		if (!isEmpty(part))
			out += (out.empty() ? "" : " ") + std::string(part);
	return out;
}

// Sets a text property; a null text is ignored.
int setTextIfGiven(contacts_record_h record, unsigned int property, const char* text)
{
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	if (!text)
		return CONTACTS_ERROR_NONE;
	int err = contacts_record_set_str(record, property, text);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_set_str", err);
	return err;
}

// A negative type stores custom; a label is stored as the custom label.
int setTypeAndLabel(contacts_record_h record, unsigned int typeProperty, unsigned int labelProperty, int type,
	const char* label, int customType)
{
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	int err = contacts_record_set_int(record, typeProperty, type < 0 ? customType : type);
	if (err == CONTACTS_ERROR_NONE && label)
		err = contacts_record_set_str(record, labelProperty, label);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_set", err);
	return err;
}

// Strict decimal id: the whole text must be a number in int range, else 0.
int parseId(const char* text)
{
	if (isEmpty(text))
		return 0;
	errno = 0;
	char* end = nullptr;
	long value = strtol(text, &end, 10);
	if (errno || *end || value < INT_MIN || value > INT_MAX) {
		WERROR("not a number : %s", text);
		return 0;
	}
	return static_cast<int>(value);
}

// The extra's value as a new string the caller frees; null when absent.
char* extraOf(app_control_h request, const char* key)
{
	char* value = nullptr;
	if (app_control_get_extra_data(request, key, &value) != APP_CONTROL_ERROR_NONE)
		return nullptr;
	return value;
}

bool sameText(const char* a, const char* b)
{
	return (isEmpty(a) && isEmpty(b)) || (a && b && !strcmp(a, b));
}

int groupIdBySystemId(int addressbookId, const char* systemId)
{
	contacts_query_h query = nullptr;
	contacts_filter_h filter = nullptr;
	contacts_list_h list = nullptr;
	contacts_query_create(_contacts_group._uri, &query);
	contacts_filter_create(_contacts_group._uri, &filter);
	contacts_filter_add_int(filter, _contacts_group.address_book_id, CONTACTS_MATCH_EQUAL, addressbookId);
	contacts_filter_add_operator(filter, CONTACTS_FILTER_OPERATOR_AND);
	contacts_filter_add_str(filter, _contacts_group.system_id, CONTACTS_MATCH_EXACTLY, systemId);
	contacts_query_set_filter(query, filter);
	int err = contacts_db_get_records_with_query(query, 0, 1, &list);
	contacts_filter_destroy(filter);
	contacts_query_destroy(query);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_records_with_query", err);
		return 0;
	}
	contacts_record_h group = nullptr;
	int id = 0;
	if (contacts_list_get_current_record_p(list, &group) == CONTACTS_ERROR_NONE)
		id = intOf(group, _contacts_group.id);
	contacts_list_destroy(list, true);
	return id;
}

// Number id registered as the person's emergency number; 0 when none.
int emergencyNumberId(int personId)
{
	contacts_query_h query = nullptr;
	contacts_filter_h filter = nullptr;
	contacts_list_h list = nullptr;
	contacts_query_create(_contacts_emergency._uri, &query);
	contacts_filter_create(_contacts_emergency._uri, &filter);
	contacts_filter_add_int(filter, _contacts_emergency.person_id, CONTACTS_MATCH_EQUAL, personId);
	contacts_query_set_filter(query, filter);
	int err = contacts_db_get_records_with_query(query, 0, 1, &list);
	contacts_filter_destroy(filter);
	contacts_query_destroy(query);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_records_with_query", err);
		return 0;
	}
	contacts_record_h match = nullptr;
	int numberId = 0;
	if (contacts_list_get_current_record_p(list, &match) == CONTACTS_ERROR_NONE)
		numberId = intOf(match, _contacts_emergency.number_id);
	contacts_list_destroy(list, true);
	return numberId;
}

// The number child with this id among the contacts, or null.
contacts_record_h findNumber(Eina_List* contacts, int numberId, contacts_record_h* owner)
{
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(contacts, l, data) {
		contacts_record_h contact = static_cast<contacts_record_h>(data);
		int count = 0;
		contacts_record_get_child_record_count(contact, _contacts_contact.number, &count);
		for (int i = 0; i < count; ++i) {
			contacts_record_h number = nullptr;
			contacts_record_get_child_record_at_p(contact, _contacts_contact.number, i, &number);
			if (intOf(number, _contacts_number.id) == numberId) {
				if (owner)
					*owner = contact;
				return number;
			}
		}
	}
	return nullptr;
}

} // namespace

CtInputData::CtInputData(contacts_record_h record)
{
	WENTER();
	int err = contacts_connect();
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_connect", err);
	m_connected = err == CONTACTS_ERROR_NONE;
	m_contactRecord = record;
	__init();
	__initAsSimContact();
}

CtInputData::CtInputData(contacts_record_h record, app_control_h request, int personId)
{
	WENTER();
	int err = contacts_connect();
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_connect", err);
	m_connected = err == CONTACTS_ERROR_NONE;
	m_contactRecord = record;
	__initContact(request, personId);
	__init();
	__initAsSimContact();
}

CtInputData::~CtInputData()
{
	m_changeSubscription.reset();
	if (m_emergencyNumber)
		contacts_record_destroy(m_emergencyNumber, true);
	if (m_writableContact)
		contacts_record_destroy(m_writableContact, true);
	free(m_addressbookName);
	free(m_userName);
	if (m_contactRecord)
		contacts_record_destroy(m_contactRecord, true);
	if (m_connected)
		contacts_disconnect();
}

// Construction

void CtInputData::__initContact(app_control_h request, int personId)
{
	WPRET_M(!request, "Invalid param : request");
	char* operation = nullptr;
	app_control_get_operation(request, &operation);
	std::string op = operation ? operation : "";
	free(operation);

	if (op.empty() || op == APP_CONTROL_OPERATION_DEFAULT) {
		__initFromOwnKeys(request, personId);
		return;
	}
	bool social = op == APP_CONTROL_OPERATION_SOCIAL_EDIT || op == APP_CONTROL_OPERATION_SOCIAL_ADD;
	bool edit = op == APP_CONTROL_OPERATION_EDIT || op == APP_CONTROL_OPERATION_SOCIAL_EDIT;
	if (!social && !edit && op != APP_CONTROL_OPERATION_ADD) {
		WERROR("wrong operation requested %s", op.c_str());
		return;
	}
	int id = 0;
	if (edit) {
		char* text = extraOf(request, social ? APP_CONTROL_DATA_SOCIAL_ITEM_ID : APP_CONTROL_DATA_ID);
		id = parseId(text);
		free(text);
	}
	__setContactInfo(id);
	setAddressbookInfo(intOf(m_contactRecord, _contacts_contact.address_book_id));
	if (social) {
		__applyExtras(request, APP_CONTROL_DATA_SOCIAL_PHONE, APP_CONTROL_DATA_SOCIAL_EMAIL, APP_CONTROL_DATA_SOCIAL_URL);
		return;
	}
	__applyExtras(request, APP_CONTROL_DATA_PHONE, APP_CONTROL_DATA_EMAIL, APP_CONTROL_DATA_URL);
	if (op == APP_CONTROL_OPERATION_ADD) {
		char* name = extraOf(request, APP_CONTROL_DATA_NAME);
		if (name)
			setFullName(name);
		free(name);
	}
}

void CtInputData::__initFromOwnKeys(app_control_h request, int personId)
{
	if (personId <= 0) {
		char* text = extraOf(request, "person_id");
		personId = parseId(text);
		free(text);
	}
	char* type = extraOf(request, "type");
	m_inputType = parseId(type);
	free(type);

	if (m_inputType == kInputTypePrimaryEdit) {
		m_isPrimaryEdit = true;
		__setContactInfoForPrimaryEdit(personId);
	} else {
		__setContactInfo(personId);
	}
	setAddressbookInfo(intOf(m_contactRecord, _contacts_contact.address_book_id));

	char* name = extraOf(request, "name");
	if (name)
		setFullName(name);
	free(name);
	bool restricted = m_inputType == 21 || m_inputType == 22 || m_inputType == 23;
	if (!(m_isExisting && restricted))
		__applyExtras(request, "ct_num", "ct_email", "ct_web");
	char* address = extraOf(request, "ct_address");
	if (address)
		addAddress(address);
	free(address);
	char* phonetic = extraOf(request, "ct_phonetic_name");
	if (phonetic)
		setPhoneticFullName(phonetic);
	free(phonetic);
}

void CtInputData::__applyExtras(app_control_h request, const char* phoneKey, const char* emailKey, const char* urlKey)
{
	char* phone = extraOf(request, phoneKey);
	if (phone)
		addNumber(phone);
	free(phone);
	char* email = extraOf(request, emailKey);
	if (email)
		addEmail(email);
	free(email);
	char* url = extraOf(request, urlKey);
	if (url)
		addWebsite(url);
	free(url);
}

void CtInputData::__setContactInfo(int personId)
{
	if (personId > 0) {
		if (m_contactRecord)
			contacts_record_destroy(m_contactRecord, true);
		m_contactRecord = nullptr;
		Eina_List* writable = ctCommonGetWritableContactList(personId, 1);
		if (writable) {
			contacts_record_clone(static_cast<contacts_record_h>(eina_list_data_get(writable)), &m_contactRecord);
			ctCommonDestroyRecordList(writable);
		} else {
			WERROR("no writable contact of person %d", personId);
		}
	}
	if (!m_contactRecord) {
		__createNewContact();
		return;
	}
	__readLoadedContact();
	m_isExisting = true;
}

void CtInputData::__setContactInfoForPrimaryEdit(int personId)
{
	if (personId > 0) {
		contacts_record_h person = nullptr;
		int err = contacts_db_get_record(_contacts_person._uri, personId, &person);
		if (err == CONTACTS_ERROR_NONE) {
			int displayContactId = intOf(person, _contacts_person.display_contact_id);
			contacts_record_destroy(person, true);
			contacts_record_h contact = nullptr;
			err = contacts_db_get_record(_contacts_contact._uri, displayContactId, &contact);
			if (err == CONTACTS_ERROR_NONE) {
				if (m_contactRecord)
					contacts_record_destroy(m_contactRecord, true);
				m_contactRecord = contact;
			}
		}
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_db_get_record", err);
	}
	if (!m_contactRecord || intOf(m_contactRecord, _contacts_contact.id) <= 0) {
		__createNewContact();
		return;
	}
	__readLoadedContact();
	m_isExisting = true;
}

void CtInputData::__createNewContact()
{
	if (m_contactRecord)
		contacts_record_destroy(m_contactRecord, true);
	m_contactRecord = nullptr;
	int err = contacts_record_create(_contacts_contact._uri, &m_contactRecord);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_create", err);
		return;
	}
	m_contactId = 0;
	m_personId = 0;
	m_isFavorite = false;
	m_isExisting = false;
	contacts_record_set_int(m_contactRecord, _contacts_contact.address_book_id, __getBaseAddressbookId());
}

void CtInputData::__readLoadedContact()
{
	m_contactId = intOf(m_contactRecord, _contacts_contact.id);
	m_personId = intOf(m_contactRecord, _contacts_contact.person_id);
	bool favorite = false;
	contacts_record_get_bool(m_contactRecord, _contacts_contact.is_favorite, &favorite);
	m_isFavorite = favorite;
}

int CtInputData::__getBaseAddressbookId()
{
	char* name = nullptr;
	if (preference_get_string(PREFERENCE_KEY_INPUT_BASE_ADDRESSBOOK, &name) != PREFERENCE_ERROR_NONE || isEmpty(name)) {
		free(name);
		return 0;
	}
	std::string stored = name;
	free(name);
	const struct {
		const char* book;
		const char* powerKey;
	} sims[] = {
		{CONTACTS_SIM1_ADDRESS_BOOK_NAME, "db/telephony/sim_power_state1"},
		{CONTACTS_SIM2_ADDRESS_BOOK_NAME, "db/telephony/sim_power_state2"},
	};
	for (const auto& sim : sims) {
		if (stored != sim.book)
			continue;
		int power = 0;
		if (vconf_get_int(sim.powerKey, &power) != 0 || power == 0) {
			WDEBUG("%s is off", sim.book);
			return 0;
		}
	}
	int id = ctCommonGetAddressBookId(stored.c_str());
	return id < 0 ? 0 : id;
}

void CtInputData::__init()
{
	int addressbookId = 0;
	if (m_contactRecord) {
		__readLoadedContact();
		m_isExisting = m_contactId > 0;
		addressbookId = m_contactId < 1 ? __getBaseAddressbookId()
										: intOf(m_contactRecord, _contacts_contact.address_book_id);
		if (m_isPrimaryEdit && m_personId > 0) {
			Eina_List* writable = ctCommonGetWritableContactList(m_personId, 1);
			auto first = static_cast<contacts_record_h>(eina_list_data_get(writable));
			if (first && intOf(first, _contacts_contact.id) != m_contactId)
				contacts_record_clone(first, &m_writableContact);
			ctCommonDestroyRecordList(writable);
		}
	} else {
		if (m_contactId < 1
			|| contacts_db_get_record(_contacts_contact._uri, m_contactId, &m_contactRecord) != CONTACTS_ERROR_NONE)
			__createNewContact();
		addressbookId = intOf(m_contactRecord, _contacts_contact.address_book_id);
	}
	int err = contacts_db_get_current_version(&m_dbVersion);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_db_get_current_version", err);
	m_changeSubscription = std::make_unique<CtDbChangeSubscription>(_contacts_contact._uri, __onPersonChanged, this);

	setAddressbookInfo(addressbookId);
	updateGroupsName();
	if (m_contactId > 0) {
		char* path = nullptr;
		int flag = 0;
		err = contacts_utils_get_ringtone_info(CONTACTS_RINGTONE_KIND_CONTACT, m_contactId, &path, &flag,
			&m_ringtonePosition);
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_utils_get_ringtone_info", err);
		free(path);
	}
}

void CtInputData::__initAsSimContact()
{
	m_isSim = ctCommonIsSimAddressbook(m_addressbookId);
	if (!m_isSim)
		return;
	for (unsigned int property : {_contacts_contact.number, _contacts_contact.email}) {
		int count = 0;
		contacts_record_get_child_record_count(m_contactRecord, property, &count);
		if (count == 2)
			__removeChild(property, __firstChild(property, false));
	}
}

// Storage

void CtInputData::setAddressbookInfo(int addressbookId)
{
	m_addressbookId = m_inputType == kInputTypeEmergency ? 0 : addressbookId;
	free(m_addressbookName);
	free(m_userName);
	m_addressbookName = nullptr;
	m_userName = nullptr;
	int err = ctCommonGetProviderNameByAddressbookId(m_addressbookId, &m_addressbookName, &m_userName);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("ctCommonGetProviderNameByAddressbookId", err);
	if (m_addressbookName && !strcmp(m_addressbookName, kGoogleProvider))
		__joinGoogleDefaultGroup();
}

void CtInputData::__joinGoogleDefaultGroup()
{
	int groupId = groupIdBySystemId(m_addressbookId, kDefaultGroupSystemId);
	if (groupId < 1)
		return;
	std::vector<int> groups;
	getAllGroupsId(groups);
	for (int id : groups)
		if (id == groupId)
			return; // already a member: a second relation would be a duplicate row
	addGroupRelation(groupId);
}

bool CtInputData::checkAddressbookIsSimOrNot(int addressbookId)
{
	return ctCommonIsSimAddressbook(addressbookId);
}

void CtInputData::setPreferenceHideStoragePopup(bool hide)
{
	int err = preference_set_boolean(PREFERENCE_KEY_HIDE_STORAGE_POPUP, hide);
	if (err != PREFERENCE_ERROR_NONE)
		WFAILED("preference_set_boolean", err);
}

bool CtInputData::getIsFavorite() { return m_isFavorite; }
int CtInputData::getPersonId() { return m_personId; }
int CtInputData::getAddressbookId() { return m_addressbookId; }
const char* CtInputData::getAddressbookName() { return m_addressbookName; }
const char* CtInputData::getUserName() { return m_userName; }
int CtInputData::getContactId() { return m_contactId; }
bool CtInputData::checkChangedTypeIsDeleted() { return m_isDeleted; }
void CtInputData::setAddressbookItemShown(bool shown) { m_addressbookItemShown = shown; }
bool CtInputData::getAddressbookItemShown() { return m_addressbookItemShown; }
bool CtInputData::isInEmergencyGroup() { return m_inEmergencyGroup; }
std::string CtInputData::getGroupsName() { return m_groupsName; }

void CtInputData::attachListener(ICtChangeListener* listener)
{
	if (listener)
		m_listener = listener;
}

void CtInputData::detachListener()
{
	m_listener = nullptr;
}

contacts_record_h CtInputData::getEmergencyNumber()
{
	int numberId = m_personId > 0 ? emergencyNumberId(m_personId) : 0;
	if (numberId <= 0)
		return m_emergencyNumber;
	// Callers keep the handle and edit it: the same number keeps its copy.
	if (m_emergencyNumber && intOf(m_emergencyNumber, _contacts_number.id) == numberId)
		return m_emergencyNumber;
	Eina_List* contacts = ctCommonGetContactsList(m_personId);
	contacts_record_h number = findNumber(contacts, numberId, nullptr);
	if (number) {
		if (m_emergencyNumber)
			contacts_record_destroy(m_emergencyNumber, true);
		m_emergencyNumber = nullptr;
		contacts_record_clone(number, &m_emergencyNumber);
	}
	ctCommonDestroyRecordList(contacts);
	return m_emergencyNumber;
}

// Child records

contacts_record_h CtInputData::__firstChild(unsigned int property, bool create)
{
	WPRET_VM(!m_contactRecord, nullptr, "Invalid param : contact record");
	contacts_record_h child = nullptr;
	if (contacts_record_get_child_record_at_p(m_contactRecord, property, 0, &child) == CONTACTS_ERROR_NONE)
		return child;
	if (!create)
		return nullptr;
	const char* uri = property == _contacts_contact.name ? _contacts_name._uri
		: property == _contacts_contact.company ? _contacts_company._uri
		: property == _contacts_contact.nickname ? _contacts_nickname._uri
		: _contacts_note._uri;
	return __addChild(property, uri);
}

contacts_record_h CtInputData::__addChild(unsigned int property, const char* childUri)
{
	WPRET_VM(!m_contactRecord, nullptr, "Invalid param : contact record");
	contacts_record_h child = nullptr;
	int err = contacts_record_create(childUri, &child);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_create", err);
		return nullptr;
	}
	err = contacts_record_add_child_record(m_contactRecord, property, child);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_add_child_record", err);
		contacts_record_destroy(child, true);
		return nullptr;
	}
	return child;
}

contacts_record_h CtInputData::__addTextChild(unsigned int property, const char* childUri, unsigned int textProperty,
		const char* text, unsigned int typeProperty, int type)
{
	contacts_record_h child = __addChild(property, childUri);
	if (!child)
		return nullptr;
	if (typeProperty)
		contacts_record_set_int(child, typeProperty, type);
	setTextIfGiven(child, textProperty, text);
	return child;
}

int CtInputData::__removeChild(unsigned int property, contacts_record_h child)
{
	WPRET_VM(!child || !m_contactRecord, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	int err = contacts_record_remove_child_record(m_contactRecord, property, child);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_remove_child_record", err);
		return err;
	}
	contacts_record_destroy(child, true);
	return CONTACTS_ERROR_NONE;
}

std::vector<int> CtInputData::__childTypes(unsigned int property, unsigned int typeProperty)
{
	std::vector<int> types;
	int count = 0;
	contacts_record_get_child_record_count(m_contactRecord, property, &count);
	for (int i = 0; i < count; ++i) {
		contacts_record_h child = nullptr;
		contacts_record_get_child_record_at_p(m_contactRecord, property, i, &child);
		types.push_back(intOf(child, typeProperty));
	}
	return types;
}

namespace {

Eina_List* childList(contacts_record_h contact, unsigned int property)
{
	Eina_List* list = nullptr;
	int count = 0;
	contacts_record_get_child_record_count(contact, property, &count);
	for (int i = 0; i < count; ++i) {
		contacts_record_h child = nullptr;
		if (contacts_record_get_child_record_at_p(contact, property, i, &child) == CONTACTS_ERROR_NONE)
			list = eina_list_append(list, child);
	}
	return list;
}

} // namespace

// Names

int CtInputData::__setNamePart(unsigned int property, const char* text)
{
	return setTextIfGiven(__firstChild(_contacts_contact.name, true), property, text ? text : "");
}

const char* CtInputData::__getNamePart(unsigned int property)
{
	return textOf(__firstChild(_contacts_contact.name, false), property);
}

int CtInputData::separateFullName(contacts_record_h nameRecord, const char* fullName)
{
	return CtDataTextRules::separateFullName(nameRecord, fullName);
}

int CtInputData::separatePhoneticFullName(contacts_record_h nameRecord, const char* fullName)
{
	return CtDataTextRules::separatePhoneticFullName(nameRecord, fullName);
}

int CtInputData::setFullName(const char* text)
{
	return separateFullName(__firstChild(_contacts_contact.name, true), text);
}

int CtInputData::setPhoneticFullName(const char* text)
{
	return separatePhoneticFullName(__firstChild(_contacts_contact.name, true), text);
}

int CtInputData::setPrefixName(const char* text) { return __setNamePart(_contacts_name.prefix, text); }
int CtInputData::setSuffixName(const char* text) { return __setNamePart(_contacts_name.suffix, text); }
int CtInputData::setFirstName(const char* text) { return __setNamePart(_contacts_name.first, text); }
int CtInputData::setMiddleName(const char* text) { return __setNamePart(_contacts_name.addition, text); }
int CtInputData::setLastName(const char* text) { return __setNamePart(_contacts_name.last, text); }
int CtInputData::setPhoneticFirstName(const char* text) { return __setNamePart(_contacts_name.phonetic_first, text); }
int CtInputData::setPhoneticMiddleName(const char* text) { return __setNamePart(_contacts_name.phonetic_middle, text); }
int CtInputData::setPhoneticLastName(const char* text) { return __setNamePart(_contacts_name.phonetic_last, text); }

int CtInputData::setNickname(const char* text)
{
	return setTextIfGiven(__firstChild(_contacts_contact.nickname, true), _contacts_nickname.name, text ? text : "");
}

int CtInputData::setCompany(const char* text)
{
	contacts_record_h company = __firstChild(_contacts_contact.company, true);
	int err = setTextIfGiven(company, _contacts_company.name, text ? text : "");
	return err ? err : contacts_record_set_str(company, _contacts_company.department, nullptr);
}

int CtInputData::setJobTitle(const char* text)
{
	return setTextIfGiven(__firstChild(_contacts_contact.company, true), _contacts_company.job_title, text ? text : "");
}

const char* CtInputData::getPrefixName() { return __getNamePart(_contacts_name.prefix); }
const char* CtInputData::getSuffixName() { return __getNamePart(_contacts_name.suffix); }
const char* CtInputData::getFirstName() { return __getNamePart(_contacts_name.first); }
const char* CtInputData::getMiddleName() { return __getNamePart(_contacts_name.addition); }
const char* CtInputData::getLastName() { return __getNamePart(_contacts_name.last); }
const char* CtInputData::getPhoneticFirstName() { return __getNamePart(_contacts_name.phonetic_first); }
const char* CtInputData::getPhoneticMiddleName() { return __getNamePart(_contacts_name.phonetic_middle); }
const char* CtInputData::getPhoneticLastName() { return __getNamePart(_contacts_name.phonetic_last); }

std::string CtInputData::getPhoneticFullName()
{
	return joinParts({getPhoneticFirstName(), getPhoneticMiddleName(), getPhoneticLastName()});
}

std::string CtInputData::getFullName()
{
	std::string name = joinParts({getPrefixName(), getFirstName(), getMiddleName(), getLastName()});
	const char* suffix = getSuffixName();
	if (!isEmpty(suffix))
		name += (name.empty() ? "" : ", ") + std::string(suffix);
	return name;
}

const char* CtInputData::getNickname()
{
	return textOf(__firstChild(_contacts_contact.nickname, false), _contacts_nickname.name);
}

std::string CtInputData::getCompany()
{
	contacts_record_h company = __firstChild(_contacts_contact.company, false);
	const char* name = textOf(company, _contacts_company.name);
	const char* department = textOf(company, _contacts_company.department);
	std::string out = name ? name : "";
	if (!isEmpty(department))
		out += (out.empty() ? "" : " ") + std::string(department);
	return out;
}

const char* CtInputData::getJobTitle()
{
	return textOf(__firstChild(_contacts_contact.company, false), _contacts_company.job_title);
}

// Numbers

Eina_List* CtInputData::getNumberList() { return childList(m_contactRecord, _contacts_contact.number); }

contacts_record_h CtInputData::addNumber(const char* number)
{
	int type = getNextNumberType();
	return __addTextChild(_contacts_contact.number, _contacts_number._uri, _contacts_number.number, number, _contacts_number.type, type);
}

int CtInputData::setNumberNumber(contacts_record_h record, const char* number)
{
	return setTextIfGiven(record, _contacts_number.number, number);
}

int CtInputData::getDataType(contacts_record_h record, unsigned int propertyId) { return intOf(record, propertyId); }

const char* CtInputData::getDataTypeCustom(contacts_record_h record, unsigned int propertyId)
{
	return textOf(record, propertyId);
}

int CtInputData::setNumberType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_number.type, _contacts_number.label, type, label,
		CONTACTS_NUMBER_TYPE_CUSTOM);
}

int CtInputData::removeNumber(contacts_record_h record) { return __removeChild(_contacts_contact.number, record); }
const char* CtInputData::getNumberNumber(contacts_record_h record) { return textOf(record, _contacts_number.number); }
int CtInputData::getNumberTypeByIndex(int index) { return numberTypeByIndex(index); }
int CtInputData::getNumberIndexType(int type) { return numberIndexByType(type); }

int CtInputData::getNextNumberType()
{
	return nextNumberType(__childTypes(_contacts_contact.number, _contacts_number.type));
}

contacts_record_h CtInputData::getDefaultNumber() { return __firstChild(_contacts_contact.number, false); }

// E-mails

Eina_List* CtInputData::getEmailList() { return childList(m_contactRecord, _contacts_contact.email); }

contacts_record_h CtInputData::addEmail(const char* email)
{
	int type = getNextEmailType();
	return __addTextChild(_contacts_contact.email, _contacts_email._uri, _contacts_email.email, email, _contacts_email.type, type);
}

int CtInputData::setEmailEmail(contacts_record_h record, const char* email)
{
	return setTextIfGiven(record, _contacts_email.email, email);
}

int CtInputData::setEmailType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_email.type, _contacts_email.label, type, label, CONTACTS_EMAIL_TYPE_CUSTOM);
}

const char* CtInputData::getEmailEmail(contacts_record_h record) { return textOf(record, _contacts_email.email); }

int CtInputData::getNextEmailType()
{
	return nextHomeWorkType(__childTypes(_contacts_contact.email, _contacts_email.type));
}

int CtInputData::removeEmail(contacts_record_h record) { return __removeChild(_contacts_contact.email, record); }
contacts_record_h CtInputData::getDefaultEmail() { return __firstChild(_contacts_contact.email, false); }

// Note

Eina_List* CtInputData::getNoteList() { return childList(m_contactRecord, _contacts_contact.note); }
contacts_record_h CtInputData::getNoteRecord() { return __firstChild(_contacts_contact.note, false); }

contacts_record_h CtInputData::addNote(const char* note)
{
	return __addTextChild(_contacts_contact.note, _contacts_note._uri, _contacts_note.note, note);
}

int CtInputData::setNote(contacts_record_h record, const char* note) { return setTextIfGiven(record, _contacts_note.note, note); }
const char* CtInputData::getNote(contacts_record_h record) { return textOf(record, _contacts_note.note); }
int CtInputData::removeNote(contacts_record_h record) { return __removeChild(_contacts_contact.note, record); }

// Addresses

Eina_List* CtInputData::getAddressList() { return childList(m_contactRecord, _contacts_contact.address); }

contacts_record_h CtInputData::addAddress(const char* address)
{
	int type = getNextAddressType();
	contacts_record_h child = __addChild(_contacts_contact.address, _contacts_address._uri);
	if (child) {
		contacts_record_set_int(child, _contacts_address.type, type);
		if (address)
			setAddressAddress(child, address);
	}
	return child;
}

int CtInputData::setAddressAddress(contacts_record_h record, const char* address)
{
	return CtDataTextRules::setAddressText(record, address);
}

int CtInputData::setAddressType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_address.type, _contacts_address.label, type, label,
		CONTACTS_ADDRESS_TYPE_CUSTOM);
}

int CtInputData::getAddressAddress(contacts_record_h record, char* buffer, unsigned int size)
{
	return CtDataTextRules::getAddressText(record, buffer, size);
}

int CtInputData::getNextAddressType()
{
	return nextHomeWorkType(__childTypes(_contacts_contact.address, _contacts_address.type));
}

int CtInputData::removeAddress(contacts_record_h record) { return __removeChild(_contacts_contact.address, record); }

// Messengers

Eina_List* CtInputData::getMessengerList() { return childList(m_contactRecord, _contacts_contact.messenger); }

contacts_record_h CtInputData::addMessenger(const char* messenger)
{
	int type = getNextMessengerType();
	return __addTextChild(_contacts_contact.messenger, _contacts_messenger._uri, _contacts_messenger.im_id, messenger, _contacts_messenger.type, type);
}

int CtInputData::setMessengerMessenger(contacts_record_h record, const char* messenger)
{
	return setTextIfGiven(record, _contacts_messenger.im_id, messenger);
}

int CtInputData::setMessengerType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_messenger.type, _contacts_messenger.label, type, label,
		CONTACTS_MESSENGER_TYPE_CUSTOM);
}

int CtInputData::getMessengerIndexType(int type) { return messengerIndexByType(type); }
int CtInputData::getMessengerTypeByIndex(int index) { return messengerTypeByIndex(index); }

const char* CtInputData::getMessengerMessenger(contacts_record_h record)
{
	return textOf(record, _contacts_messenger.im_id);
}

int CtInputData::getNextMessengerType()
{
	return nextMessengerType(__childTypes(_contacts_contact.messenger, _contacts_messenger.type));
}

int CtInputData::removeMessenger(contacts_record_h record) { return __removeChild(_contacts_contact.messenger, record); }

// Websites

Eina_List* CtInputData::getWebsiteList() { return childList(m_contactRecord, _contacts_contact.url); }

contacts_record_h CtInputData::addWebsite(const char* website)
{
	return __addTextChild(_contacts_contact.url, _contacts_url._uri, _contacts_url.url, website);
}

int CtInputData::setWebsiteWebsite(contacts_record_h record, const char* website)
{
	return setTextIfGiven(record, _contacts_url.url, website);
}

const char* CtInputData::getWebsiteWebsite(contacts_record_h record) { return textOf(record, _contacts_url.url); }
int CtInputData::removeWebsite(contacts_record_h record) { return __removeChild(_contacts_contact.url, record); }

// Relationships

Eina_List* CtInputData::getRelationshipList() { return childList(m_contactRecord, _contacts_contact.relationship); }

contacts_record_h CtInputData::addRelationship(const char* relationship)
{
	int type = getNextRelationshipType();
	return __addTextChild(_contacts_contact.relationship, _contacts_relationship._uri, _contacts_relationship.name, relationship, _contacts_relationship.type, type);
}

int CtInputData::setRelationshipRelationship(contacts_record_h record, const char* relationship)
{
	return setTextIfGiven(record, _contacts_relationship.name, relationship);
}

int CtInputData::setRelationshipType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_relationship.type, _contacts_relationship.label, type, label,
		CONTACTS_RELATIONSHIP_TYPE_CUSTOM);
}

const char* CtInputData::getRelationshipRelationship(contacts_record_h record)
{
	return textOf(record, _contacts_relationship.name);
}

int CtInputData::getNextRelationshipType()
{
	return nextRelationshipType(__childTypes(_contacts_contact.relationship, _contacts_relationship.type));
}

int CtInputData::removeRelationship(contacts_record_h record)
{
	return __removeChild(_contacts_contact.relationship, record);
}

// Events

Eina_List* CtInputData::getEventList() { return childList(m_contactRecord, _contacts_contact.event); }

contacts_record_h CtInputData::addEvent(int date)
{
	int type = getNextEventType();
	contacts_record_h child = __addChild(_contacts_contact.event, _contacts_event._uri);
	if (child) {
		contacts_record_set_int(child, _contacts_event.type, type);
		contacts_record_set_int(child, _contacts_event.date, date);
	}
	return child;
}

int CtInputData::setEventEvent(contacts_record_h record, int date)
{
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	return contacts_record_set_int(record, _contacts_event.date, date);
}

int CtInputData::setEventType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_event.type, _contacts_event.label, type, label, CONTACTS_EVENT_TYPE_CUSTOM);
}

int CtInputData::getEventEvent(contacts_record_h record) { return intOf(record, _contacts_event.date); }

int CtInputData::getNextEventType()
{
	return nextEventType(__childTypes(_contacts_contact.event, _contacts_event.type));
}

int CtInputData::removeEvent(contacts_record_h record) { return __removeChild(_contacts_contact.event, record); }

int CtInputData::setCalendarType(contacts_record_h event, int calendarType)
{
	WPRET_VM(!event, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : event");
	bool known = calendarType == CONTACTS_EVENT_CALENDAR_TYPE_LUNAR;
	return contacts_record_set_int(event, _contacts_event.calendar_type,
		known ? calendarType : CONTACTS_EVENT_CALENDAR_TYPE_GREGORIAN);
}

int CtInputData::getCalendarType(contacts_record_h event) { return intOf(event, _contacts_event.calendar_type); }

int CtInputData::setIsLeapMonth(contacts_record_h event, bool isLeapMonth)
{
	WPRET_VM(!event, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : event");
	return contacts_record_set_bool(event, _contacts_event.is_leap_month, isLeapMonth);
}

bool CtInputData::getIsLeapMonth(contacts_record_h event)
{
	bool leap = false;
	if (event)
		contacts_record_get_bool(event, _contacts_event.is_leap_month, &leap);
	return leap;
}

// Ringtone, status, groups

const char* CtInputData::getRingtone() { return textOf(m_contactRecord, _contacts_contact.ringtone_path); }

int CtInputData::setRingtone(const char* path, const char* position)
{
	WPRET_VM(!m_contactRecord, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : contact record");
	long long value = position ? strtoll(position, nullptr, 10) : 0;
	m_ringtonePosition = value > 0 ? value : 0;
	int err = contacts_record_set_str(m_contactRecord, _contacts_contact.ringtone_path, path);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_set_str", err);
	return err;
}

void CtInputData::setStatusText(const char*) {}
void CtInputData::setStatus(const char*) {}

const char* CtInputData::getStatus()
{
	contacts_record_h person = nullptr;
	int err = contacts_db_get_record(_contacts_person._uri, m_personId, &person);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_record", err);
		return nullptr;
	}
	const char* status = textOf(person, _contacts_person.status);
	char* copy = status ? strdup(status) : nullptr;
	contacts_record_destroy(person, true);
	return copy;
}

contacts_record_h CtInputData::addGroupRelation(int groupId)
{
	contacts_record_h relation = __addChild(_contacts_contact.group_relation, _contacts_group_relation._uri);
	if (relation)
		contacts_record_set_int(relation, _contacts_group_relation.group_id, groupId);
	return relation;
}

void CtInputData::removeAllGroups()
{
	int count = 0;
	contacts_record_get_child_record_count(m_contactRecord, _contacts_contact.group_relation, &count);
	for (int i = count - 1; i >= 0; --i) {
		contacts_record_h relation = nullptr;
		contacts_record_get_child_record_at_p(m_contactRecord, _contacts_contact.group_relation, i, &relation);
		__removeChild(_contacts_contact.group_relation, relation);
	}
}

void CtInputData::getAllGroupsId(std::vector<int>& groupIds)
{
	std::vector<int> ids = __childTypes(_contacts_contact.group_relation, _contacts_group_relation.group_id);
	groupIds.insert(groupIds.end(), ids.rbegin(), ids.rend());
}

void CtInputData::updateGroupsName()
{
	m_groupsName.clear();
	m_inEmergencyGroup = false;
	std::vector<int> groupIds;
	getAllGroupsId(groupIds);
	std::vector<std::string> names;
	for (int groupId : groupIds) {
		contacts_record_h group = nullptr;
		if (contacts_db_get_record(_contacts_group._uri, groupId, &group) != CONTACTS_ERROR_NONE)
			continue;
		const char* systemId = textOf(group, _contacts_group.system_id);
		const char* groupName = textOf(group, _contacts_group.name);
		std::string name = isEmpty(systemId) ? (groupName ? groupName : "") : ctCommonGetDisplayGroupName(systemId);
		if (systemId && !strcmp(systemId, kEmergencyGroupSystemId))
			m_inEmergencyGroup = true;
		contacts_record_destroy(group, true);
		bool seen = false;
		for (const auto& n : names)
			seen |= n == name;
		if (!name.empty() && !seen)
			names.push_back(name);
	}
	for (const auto& name : names)
		m_groupsName += (m_groupsName.empty() ? "" : ", ") + name;
	if (m_groupsName.empty())
		m_groupsName = ContactsCommon::translate("IDS_PB_BODY_NOT_ASSIGNED");
}

// Images: the writable contact carries the picture in primary edit.

contacts_record_h CtInputData::__imageOwner() { return m_writableContact ? m_writableContact : m_contactRecord; }

contacts_record_h CtInputData::getImageRecord()
{
	contacts_record_h image = nullptr;
	contacts_record_get_child_record_at_p(__imageOwner(), _contacts_contact.image, 0, &image);
	return image;
}

const char* CtInputData::getImagePath() { return textOf(getImageRecord(), _contacts_image.path); }
const char* CtInputData::getImagePath(int) { return nullptr; }
contacts_record_h CtInputData::getImageRecord(int) { return nullptr; }
int CtInputData::getImageOrder(int) { return 0; }
void CtInputData::setImageOrder(int, int) {}
int CtInputData::getImageIndex(int) { return -1; }
int CtInputData::getImageCount() { return 0; }

int CtInputData::setImage(contacts_record_h image, const char* path, int type)
{
	if (isEmpty(path))
		return CONTACTS_ERROR_NONE;
	if (!image) {
		int err = contacts_record_create(_contacts_image._uri, &image);
		if (err == CONTACTS_ERROR_NONE)
			err = contacts_record_add_child_record(__imageOwner(), _contacts_contact.image, image);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_record_add_child_record", err);
			if (image)
				contacts_record_destroy(image, true);
			return err;
		}
	}
	int err = contacts_record_set_int(image, _contacts_image.type, type);
	return err ? err : contacts_record_set_str(image, _contacts_image.path, path);
}

int CtInputData::removeImage(contacts_record_h image)
{
	WPRET_VM(!image, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : image");
	int err = contacts_record_remove_child_record(__imageOwner(), _contacts_contact.image, image);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_remove_child_record", err);
		return err;
	}
	contacts_record_destroy(image, true);
	return CONTACTS_ERROR_NONE;
}

// SIM facts

int CtInputData::__simSlot()
{
	if (!m_addressbookName)
		return -1;
	if (!strcmp(m_addressbookName, CONTACTS_SIM_PROVIDER_NAME) || !strcmp(m_addressbookName, CONTACTS_SIM1_PROVIDER_NAME))
		return 0;
	return strcmp(m_addressbookName, CONTACTS_SIM2_PROVIDER_NAME) ? -1 : 1;
}

int CtInputData::getSimNo() { return __simSlot() + 1; }

int CtInputData::getSimUnusedFieldCount(int fieldType)
{
	int count = 0;
	int slot = __simSlot();
	if (slot < 0)
		return 0;
	int err = contacts_sim_get_unused_field_count(slot, static_cast<contacts_sim_field_e>(fieldType), &count);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_sim_get_unused_field_count", err);
	return count;
}

int CtInputData::getSimFieldTextMaxLen(int fieldType)
{
	int maxLen = 0;
	int slot = __simSlot();
	if (slot < 0)
		return 0;
	int err = contacts_sim_get_field_text_max_len(slot, static_cast<contacts_sim_field_e>(fieldType), &maxLen);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_sim_get_field_text_max_len", err);
	bool nameOrNumber = fieldType == CONTACTS_SIM_FIELD_NAME || fieldType == CONTACTS_SIM_FIELD_NUMBER;
	return (maxLen == 0 && nameOrNumber) ? kSimTextDefaultMaxLen : maxLen;
}

bool CtInputData::getSimFieldStatus(int fieldType)
{
	bool supported = false;
	int slot = __simSlot();
	if (slot < 0)
		return false;
	int err = contacts_sim_get_field_status(slot, static_cast<contacts_sim_field_e>(fieldType), &supported);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_sim_get_field_status", err);
	return supported;
}

// Saving

int CtInputData::insertContact(int* outId)
{
	WENTER();
	WPRET_VM(!m_contactRecord, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : contact record");
	contacts_record_set_int(m_contactRecord, _contacts_contact.address_book_id, m_addressbookId);
	contacts_record_set_int(m_contactRecord, _contacts_contact.link_mode, CONTACTS_CONTACT_LINK_MODE_IGNORE_ONCE);
	int id = 0;
	int err = contacts_db_insert_record(m_contactRecord, &id);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_insert_record", err);
		return err;
	}
	if (outId)
		*outId = id;
	// The contact (with its ringtone path) is stored: a failed ringtone-info
	// write is logged but not reported, or a retry would store it twice.
	if (getRingtone())
		__saveRingtoneInfo(id);
	return err;
}

bool CtInputData::__ringtoneChanged()
{
	char* storedPath = nullptr;
	int storedFlag = 0;
	long long int storedPosition = 0;
	int err = contacts_utils_get_ringtone_info(CONTACTS_RINGTONE_KIND_CONTACT, m_contactId, &storedPath, &storedFlag,
		&storedPosition);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_utils_get_ringtone_info", err);
	const char* path = getRingtone();
	bool changed = path ? (!sameText(path, storedPath) || storedFlag != 1 || storedPosition != m_ringtonePosition)
						: !isEmpty(storedPath);
	free(storedPath);
	return changed;
}

int CtInputData::__saveRingtoneInfo(int contactId)
{
	int err = contacts_utils_set_ringtone_info(CONTACTS_RINGTONE_KIND_CONTACT, contactId, getRingtone(), 1,
		m_ringtonePosition);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_utils_set_ringtone_info", err);
	return err;
}

int CtInputData::updateContact()
{
	WENTER();
	WPRET_VM(!m_contactRecord, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : contact record");
	bool ringtoneChanged = __ringtoneChanged();
	int err = contacts_db_update_record(m_contactRecord);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_update_record", err);
		return err;
	}
	// A failed ringtone write is reported: the caller must not tell the user all was saved.
	int ringtoneErr = ringtoneChanged ? __saveRingtoneInfo(m_contactId) : CONTACTS_ERROR_NONE;
	__updatePrimaryRecord();
	return ringtoneErr;
}

void CtInputData::__updatePrimaryRecord()
{
	if (m_emergencyNumber) {
		Eina_List* contacts = ctCommonGetContactsList(m_personId);
		contacts_record_h owner = nullptr;
		contacts_record_h number = findNumber(contacts, intOf(m_emergencyNumber, _contacts_number.id), &owner);
		if (number) {
			contacts_record_set_str(number, _contacts_number.number, textOf(m_emergencyNumber, _contacts_number.number));
			int err = contacts_db_update_record(owner);
			if (err != CONTACTS_ERROR_NONE)
				WFAILED("contacts_db_update_record", err);
		}
		ctCommonDestroyRecordList(contacts);
	}
	if (m_writableContact) {
		int err = contacts_db_update_record(m_writableContact);
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_db_update_record", err);
	}
}

int CtInputData::__convertSIMRecord(contacts_record_h* converted)
{
	*converted = nullptr;
	contacts_record_h sim = nullptr;
	int err = contacts_record_create(_contacts_contact._uri, &sim);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_create", err);
		return err;
	}
	contacts_record_set_int(sim, _contacts_contact.address_book_id, m_addressbookId);
	// The SIM keeps one name field: the whole name goes into it, nothing is dropped.
	std::string name = joinParts({getFirstName(), getMiddleName(), getLastName()});
	contacts_record_h child = nullptr;
	if (!name.empty() && (err = contacts_record_create(_contacts_name._uri, &child)) == CONTACTS_ERROR_NONE) {
		contacts_record_set_str(child, _contacts_name.first, name.c_str());
		err = contacts_record_add_child_record(sim, _contacts_contact.name, child);
	}
	const char* number = getNumberNumber(getDefaultNumber());
	if (err == CONTACTS_ERROR_NONE && !isEmpty(number)) {
		char cleaned[kTextBufferSize];
		ctCommonCleanNumberForSim(number, cleaned, sizeof(cleaned));
		if ((err = contacts_record_create(_contacts_number._uri, &child)) == CONTACTS_ERROR_NONE) {
			contacts_record_set_str(child, _contacts_number.number, cleaned);
			contacts_record_set_int(child, _contacts_number.type, CONTACTS_NUMBER_TYPE_CELL);
			err = contacts_record_add_child_record(sim, _contacts_contact.number, child);
		}
	}
	const char* email = getEmailEmail(getDefaultEmail());
	bool emailFits = getSimFieldTextMaxLen(CONTACTS_SIM_FIELD_EMAIL) > 0
		&& getSimUnusedFieldCount(CONTACTS_SIM_FIELD_EMAIL) > 0;
	if (err == CONTACTS_ERROR_NONE && !isEmpty(email) && emailFits) {
		if ((err = contacts_record_create(_contacts_email._uri, &child)) == CONTACTS_ERROR_NONE) {
			contacts_record_set_str(child, _contacts_email.email, email);
			contacts_record_set_int(child, _contacts_email.type, CONTACTS_EMAIL_TYPE_HOME);
			err = contacts_record_add_child_record(sim, _contacts_contact.email, child);
		}
	}
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("SIM record conversion", err);
		contacts_record_destroy(sim, true);
		return err;
	}
	*converted = sim;
	return CONTACTS_ERROR_NONE;
}

int CtInputData::insertSIMContact(int* outId)
{
	WENTER();
	WPRET_VM(!m_contactRecord, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : contact record");
	contacts_record_h sim = nullptr;
	int err = __convertSIMRecord(&sim);
	if (err != CONTACTS_ERROR_NONE)
		return err; // nothing is written after a failed conversion
	int id = 0;
	err = contacts_sim_insert(sim, &id);
	if (err != CONTACTS_ERROR_NONE) {
		// The full contact stays held, so it can still be saved elsewhere.
		WFAILED("contacts_sim_insert", err);
		contacts_record_destroy(sim, true);
		return err;
	}
	contacts_record_destroy(m_contactRecord, true);
	m_contactRecord = sim;
	if (outId)
		*outId = id;
	return err;
}

int CtInputData::updateSIMContact()
{
	WENTER();
	WPRET_VM(!m_contactRecord, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : contact record");
	contacts_record_h nameRecord = __firstChild(_contacts_contact.name, false);
	if (nameRecord) {
		std::string name = joinParts({getFirstName(), getMiddleName(), getLastName()});
		contacts_record_set_str(nameRecord, _contacts_name.first, name.empty() ? nullptr : name.c_str());
		contacts_record_set_str(nameRecord, _contacts_name.addition, nullptr);
		contacts_record_set_str(nameRecord, _contacts_name.last, nullptr);
	}
	contacts_record_h number = getDefaultNumber();
	const char* text = getNumberNumber(number);
	if (text) {
		char cleaned[kTextBufferSize];
		ctCommonCleanNumberForSim(text, cleaned, sizeof(cleaned));
		contacts_record_set_str(number, _contacts_number.number, cleaned);
	}
	int err = contacts_sim_update(m_contactRecord);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_sim_update", err);
	return err;
}

// Change notification

void CtInputData::__onPersonChanged(const char* viewUri, void* data)
{
	WHIT();
	static_cast<CtInputData*>(data)->__handlePersonChanged(viewUri);
}

void CtInputData::__handlePersonChanged(const char* viewUri)
{
	if (m_contactId <= 0)
		return;
	contacts_list_h changes = nullptr;
	int currentVersion = 0;
	int err = contacts_db_get_changes_by_version(_contacts_contact_updated_info._uri, m_addressbookId, m_dbVersion,
		&changes, &currentVersion);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_changes_by_version", err);
		return;
	}
	bool found = false;
	contacts_record_h change = nullptr;
	// The latest change wins: an update followed by a delete in one batch is a delete.
	while (contacts_list_get_current_record_p(changes, &change) == CONTACTS_ERROR_NONE) {
		if (intOf(change, _contacts_contact_updated_info.contact_id) == m_contactId) {
			found = true;
			m_isDeleted = intOf(change, _contacts_contact_updated_info.type) == CONTACTS_CHANGE_DELETED;
		}
		if (contacts_list_next(changes) != CONTACTS_ERROR_NONE)
			break;
	}
	contacts_list_destroy(changes, true);
	if (currentVersion > 0)
		m_dbVersion = currentVersion;
	if (found && m_listener)
		m_listener->onDbChanged(viewUri);
}
