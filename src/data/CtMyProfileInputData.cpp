#include "CtMyProfileInputData.h"

#include "ContactsDebug.h"
#include "CtDataTextRules.h"

#include <cstring>

using namespace CtDataType;

namespace {

constexpr int kMinImageOrder = 1;
constexpr int kMaxImageOrder = 5;
const char* const kOwnNumberLabel = "sim_card_number";

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

std::string joinParts(std::initializer_list<const char*> parts)
{
	std::string out;
	for (const char* part : parts)
		if (!isEmpty(part))
			out += (out.empty() ? "" : " ") + std::string(part);
	return out;
}

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

bool isOwnNumber(contacts_record_h number)
{
	bool isDefault = false;
	contacts_record_get_bool(number, _contacts_number.is_default, &isDefault);
	const char* label = textOf(number, _contacts_number.label);
	return isDefault && label && !strcmp(label, kOwnNumberLabel);
}

bool isValidOrder(int order)
{
	return order >= kMinImageOrder && order <= kMaxImageOrder;
}

} // namespace

CtMyProfileInputData::CtMyProfileInputData()
	: CtMyProfileInputData(nullptr)
{
}

CtMyProfileInputData::CtMyProfileInputData(contacts_record_h record)
{
	WENTER();
	int err = contacts_connect();
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_connect", err);
	m_connected = err == CONTACTS_ERROR_NONE;
	m_profileRecord = record;
	__init();
}

CtMyProfileInputData::~CtMyProfileInputData()
{
	if (m_profileRecord)
		contacts_record_destroy(m_profileRecord, true);
	if (m_connected)
		contacts_disconnect();
}

void CtMyProfileInputData::__init()
{
	contacts_list_h list = nullptr;
	int err = contacts_db_get_all_records(_contacts_my_profile._uri, 0, 0, &list);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_db_get_all_records", err);
	contacts_record_h stored = nullptr;
	int count = 0;
	if (list && contacts_list_get_count(list, &count) == CONTACTS_ERROR_NONE && count > 0
		&& contacts_list_get_current_record_p(list, &stored) == CONTACTS_ERROR_NONE) {
		m_profileId = intOf(stored, _contacts_my_profile.id);
	}
	if (list)
		contacts_list_destroy(list, true);
	if (m_profileId > 0) {
		// Records of a list come without their children: the profile is read whole.
		contacts_record_h whole = nullptr;
		err = contacts_db_get_record(_contacts_my_profile._uri, m_profileId, &whole);
		if (err == CONTACTS_ERROR_NONE) {
			if (m_profileRecord)
				contacts_record_destroy(m_profileRecord, true);
			m_profileRecord = whole;
		} else {
			WFAILED("contacts_db_get_record", err);
		}
	}
	if (!m_profileRecord) {
		err = contacts_record_create(_contacts_my_profile._uri, &m_profileRecord);
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_record_create", err);
	}
}

// Child records

contacts_record_h CtMyProfileInputData::__firstChild(unsigned int property, bool create)
{
	WPRET_VM(!m_profileRecord, nullptr, "Invalid param : profile record");
	contacts_record_h child = nullptr;
	if (contacts_record_get_child_record_at_p(m_profileRecord, property, 0, &child) == CONTACTS_ERROR_NONE)
		return child;
	if (!create)
		return nullptr;
	const char* uri = property == _contacts_my_profile.name ? _contacts_name._uri
		: property == _contacts_my_profile.company ? _contacts_company._uri
		: property == _contacts_my_profile.nickname ? _contacts_nickname._uri
		: _contacts_note._uri;
	return __addChild(property, uri);
}

contacts_record_h CtMyProfileInputData::__addChild(unsigned int property, const char* childUri)
{
	WPRET_VM(!m_profileRecord, nullptr, "Invalid param : profile record");
	contacts_record_h child = nullptr;
	int err = contacts_record_create(childUri, &child);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_create", err);
		return nullptr;
	}
	err = contacts_record_add_child_record(m_profileRecord, property, child);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_add_child_record", err);
		contacts_record_destroy(child, true);
		return nullptr;
	}
	return child;
}

contacts_record_h CtMyProfileInputData::__addTextChild(unsigned int property, const char* childUri,
	unsigned int textProperty, const char* text, unsigned int typeProperty, int type)
{
	contacts_record_h child = __addChild(property, childUri);
	if (!child)
		return nullptr;
	if (typeProperty)
		contacts_record_set_int(child, typeProperty, type);
	setTextIfGiven(child, textProperty, text);
	return child;
}

int CtMyProfileInputData::__removeChild(unsigned int property, contacts_record_h child)
{
	WPRET_VM(!child || !m_profileRecord, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	int err = contacts_record_remove_child_record(m_profileRecord, property, child);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_remove_child_record", err);
		return err;
	}
	contacts_record_destroy(child, true);
	return CONTACTS_ERROR_NONE;
}

std::vector<int> CtMyProfileInputData::__childTypes(unsigned int property, unsigned int typeProperty)
{
	std::vector<int> types;
	int count = 0;
	contacts_record_get_child_record_count(m_profileRecord, property, &count);
	for (int i = 0; i < count; ++i) {
		contacts_record_h child = nullptr;
		contacts_record_get_child_record_at_p(m_profileRecord, property, i, &child);
		types.push_back(intOf(child, typeProperty));
	}
	return types;
}

Eina_List* CtMyProfileInputData::__childList(unsigned int property, contacts_record_h skipped)
{
	Eina_List* list = nullptr;
	int count = 0;
	contacts_record_get_child_record_count(m_profileRecord, property, &count);
	for (int i = 0; i < count; ++i) {
		contacts_record_h child = nullptr;
		if (contacts_record_get_child_record_at_p(m_profileRecord, property, i, &child) == CONTACTS_ERROR_NONE
			&& child != skipped)
			list = eina_list_append(list, child);
	}
	return list;
}

// Names

int CtMyProfileInputData::__setNamePart(unsigned int property, const char* text)
{
	return setTextIfGiven(__firstChild(_contacts_my_profile.name, true), property, text ? text : "");
}

const char* CtMyProfileInputData::__getNamePart(unsigned int property)
{
	return textOf(__firstChild(_contacts_my_profile.name, false), property);
}

int CtMyProfileInputData::separateFullName(contacts_record_h nameRecord, const char* fullName)
{
	return CtDataTextRules::separateFullName(nameRecord, fullName);
}

int CtMyProfileInputData::separatePhoneticFullName(contacts_record_h nameRecord, const char* fullName)
{
	return CtDataTextRules::separatePhoneticFullName(nameRecord, fullName);
}

int CtMyProfileInputData::setFullName(const char* text)
{
	return separateFullName(__firstChild(_contacts_my_profile.name, true), text);
}

int CtMyProfileInputData::setPhoneticFullName(const char* text)
{
	return separatePhoneticFullName(__firstChild(_contacts_my_profile.name, true), text);
}

int CtMyProfileInputData::setPrefixName(const char* text) { return __setNamePart(_contacts_name.prefix, text); }
int CtMyProfileInputData::setSuffixName(const char* text) { return __setNamePart(_contacts_name.suffix, text); }
int CtMyProfileInputData::setFirstName(const char* text) { return __setNamePart(_contacts_name.first, text); }
int CtMyProfileInputData::setMiddleName(const char* text) { return __setNamePart(_contacts_name.addition, text); }
int CtMyProfileInputData::setLastName(const char* text) { return __setNamePart(_contacts_name.last, text); }
int CtMyProfileInputData::setPhoneticFirstName(const char* text) { return __setNamePart(_contacts_name.phonetic_first, text); }
int CtMyProfileInputData::setPhoneticMiddleName(const char* text) { return __setNamePart(_contacts_name.phonetic_middle, text); }
int CtMyProfileInputData::setPhoneticLastName(const char* text) { return __setNamePart(_contacts_name.phonetic_last, text); }

int CtMyProfileInputData::setNickname(const char* text)
{
	return setTextIfGiven(__firstChild(_contacts_my_profile.nickname, true), _contacts_nickname.name, text ? text : "");
}

int CtMyProfileInputData::setCompany(const char* text)
{
	contacts_record_h company = __firstChild(_contacts_my_profile.company, true);
	int err = setTextIfGiven(company, _contacts_company.name, text ? text : "");
	return err ? err : contacts_record_set_str(company, _contacts_company.department, nullptr);
}

int CtMyProfileInputData::setJobTitle(const char* text)
{
	return setTextIfGiven(__firstChild(_contacts_my_profile.company, true), _contacts_company.job_title,
		text ? text : "");
}

const char* CtMyProfileInputData::getPrefixName() { return __getNamePart(_contacts_name.prefix); }
const char* CtMyProfileInputData::getSuffixName() { return __getNamePart(_contacts_name.suffix); }
const char* CtMyProfileInputData::getFirstName() { return __getNamePart(_contacts_name.first); }
const char* CtMyProfileInputData::getMiddleName() { return __getNamePart(_contacts_name.addition); }
const char* CtMyProfileInputData::getLastName() { return __getNamePart(_contacts_name.last); }
const char* CtMyProfileInputData::getPhoneticFirstName() { return __getNamePart(_contacts_name.phonetic_first); }
const char* CtMyProfileInputData::getPhoneticMiddleName() { return __getNamePart(_contacts_name.phonetic_middle); }
const char* CtMyProfileInputData::getPhoneticLastName() { return __getNamePart(_contacts_name.phonetic_last); }

std::string CtMyProfileInputData::getPhoneticFullName()
{
	return joinParts({getPhoneticFirstName(), getPhoneticMiddleName(), getPhoneticLastName()});
}

std::string CtMyProfileInputData::getFullName()
{
	std::string name = joinParts({getPrefixName(), getFirstName(), getMiddleName(), getLastName()});
	const char* suffix = getSuffixName();
	if (!isEmpty(suffix))
		name += (name.empty() ? "" : ", ") + std::string(suffix);
	return name;
}

const char* CtMyProfileInputData::getNickname()
{
	return textOf(__firstChild(_contacts_my_profile.nickname, false), _contacts_nickname.name);
}

std::string CtMyProfileInputData::getCompany()
{
	contacts_record_h company = __firstChild(_contacts_my_profile.company, false);
	return joinParts({textOf(company, _contacts_company.name), textOf(company, _contacts_company.department)});
}

const char* CtMyProfileInputData::getJobTitle()
{
	return textOf(__firstChild(_contacts_my_profile.company, false), _contacts_company.job_title);
}

// Facts that a profile does not have

bool CtMyProfileInputData::getIsFavorite() { return false; }
int CtMyProfileInputData::getPersonId() { return 0; }
int CtMyProfileInputData::getAddressbookId() { return 0; }
const char* CtMyProfileInputData::getAddressbookName() { return nullptr; }
const char* CtMyProfileInputData::getUserName() { return nullptr; }
void CtMyProfileInputData::setAddressbookInfo(int) { WDEBUG("a profile has no storage"); }
bool CtMyProfileInputData::checkAddressbookIsSimOrNot(int) { return false; }
void CtMyProfileInputData::setPreferenceHideStoragePopup(bool) { WDEBUG("a profile has no storage"); }
contacts_record_h CtMyProfileInputData::getEmergencyNumber() { return nullptr; }
const char* CtMyProfileInputData::getRingtone() { return nullptr; }
int CtMyProfileInputData::setRingtone(const char*, const char*) { return 0; }
int CtMyProfileInputData::getContactId() { return m_profileId; }
contacts_record_h CtMyProfileInputData::getDefaultEmail() { return nullptr; }
bool CtMyProfileInputData::checkChangedTypeIsDeleted() { return false; }
void CtMyProfileInputData::attachListener(ICtChangeListener*) { WDEBUG("the profile form is not told of changes"); }
void CtMyProfileInputData::detachListener() { WDEBUG("the profile form is not told of changes"); }
int CtMyProfileInputData::getSimUnusedFieldCount(int) { return 0; }
int CtMyProfileInputData::getSimFieldTextMaxLen(int) { return 0; }
bool CtMyProfileInputData::getSimFieldStatus(int) { return true; }
contacts_record_h CtMyProfileInputData::addGroupRelation(int) { return nullptr; }
void CtMyProfileInputData::setAddressbookItemShown(bool) {}
bool CtMyProfileInputData::getAddressbookItemShown() { return false; }
int CtMyProfileInputData::getSimNo() { return 0; }
void CtMyProfileInputData::removeAllGroups() {}
void CtMyProfileInputData::getAllGroupsId(std::vector<int>&) {}
void CtMyProfileInputData::updateGroupsName() {}
std::string CtMyProfileInputData::getGroupsName() { return std::string(); }
bool CtMyProfileInputData::isInEmergencyGroup() { return false; }
int CtMyProfileInputData::insertSIMContact(int*) { return 0; }
int CtMyProfileInputData::updateSIMContact() { return 0; }

// Numbers: the phone's own number is kept apart from the list.

Eina_List* CtMyProfileInputData::getNumberList()
{
	return __childList(_contacts_my_profile.number, getDefaultNumber());
}

contacts_record_h CtMyProfileInputData::getDefaultNumber()
{
	int count = 0;
	contacts_record_get_child_record_count(m_profileRecord, _contacts_my_profile.number, &count);
	for (int i = 0; i < count; ++i) {
		contacts_record_h number = nullptr;
		contacts_record_get_child_record_at_p(m_profileRecord, _contacts_my_profile.number, i, &number);
		if (isOwnNumber(number))
			return number;
	}
	return nullptr;
}

contacts_record_h CtMyProfileInputData::addNumber(const char* number)
{
	int type = getNextNumberType();
	return __addTextChild(_contacts_my_profile.number, _contacts_number._uri, _contacts_number.number, number,
		_contacts_number.type, type);
}

int CtMyProfileInputData::setNumberNumber(contacts_record_h record, const char* number)
{
	return setTextIfGiven(record, _contacts_number.number, number);
}

int CtMyProfileInputData::getDataType(contacts_record_h record, unsigned int propertyId) { return intOf(record, propertyId); }

const char* CtMyProfileInputData::getDataTypeCustom(contacts_record_h record, unsigned int propertyId)
{
	return textOf(record, propertyId);
}

int CtMyProfileInputData::setNumberType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_number.type, _contacts_number.label, type, label,
		CONTACTS_NUMBER_TYPE_CUSTOM);
}

int CtMyProfileInputData::removeNumber(contacts_record_h record) { return __removeChild(_contacts_my_profile.number, record); }
const char* CtMyProfileInputData::getNumberNumber(contacts_record_h record) { return textOf(record, _contacts_number.number); }
int CtMyProfileInputData::getNumberTypeByIndex(int index) { return numberTypeByIndex(index); }

int CtMyProfileInputData::getNumberIndexType(int type)
{
	int index = numberIndexByType(type, NUMBER_MENU_OTHER_OR_CUSTOM);
	if (index != numberIndexByType(type))
		WDEBUG("Not handled case numberType=%d", type);
	return index;
}

int CtMyProfileInputData::getNextNumberType()
{
	return nextNumberType(__childTypes(_contacts_my_profile.number, _contacts_number.type));
}

// E-mails

Eina_List* CtMyProfileInputData::getEmailList() { return __childList(_contacts_my_profile.email); }

contacts_record_h CtMyProfileInputData::addEmail(const char* email)
{
	int type = getNextEmailType();
	return __addTextChild(_contacts_my_profile.email, _contacts_email._uri, _contacts_email.email, email,
		_contacts_email.type, type);
}

int CtMyProfileInputData::setEmailEmail(contacts_record_h record, const char* email)
{
	return setTextIfGiven(record, _contacts_email.email, email);
}

int CtMyProfileInputData::setEmailType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_email.type, _contacts_email.label, type, label, CONTACTS_EMAIL_TYPE_CUSTOM);
}

const char* CtMyProfileInputData::getEmailEmail(contacts_record_h record) { return textOf(record, _contacts_email.email); }

int CtMyProfileInputData::getNextEmailType()
{
	return nextHomeWorkType(__childTypes(_contacts_my_profile.email, _contacts_email.type));
}

int CtMyProfileInputData::removeEmail(contacts_record_h record) { return __removeChild(_contacts_my_profile.email, record); }

// Note

Eina_List* CtMyProfileInputData::getNoteList() { return __childList(_contacts_my_profile.note); }
contacts_record_h CtMyProfileInputData::getNoteRecord() { return __firstChild(_contacts_my_profile.note, false); }

contacts_record_h CtMyProfileInputData::addNote(const char* note)
{
	return __addTextChild(_contacts_my_profile.note, _contacts_note._uri, _contacts_note.note, note);
}

int CtMyProfileInputData::setNote(contacts_record_h record, const char* note) { return setTextIfGiven(record, _contacts_note.note, note); }
const char* CtMyProfileInputData::getNote(contacts_record_h record) { return textOf(record, _contacts_note.note); }
int CtMyProfileInputData::removeNote(contacts_record_h record) { return __removeChild(_contacts_my_profile.note, record); }

// Addresses

Eina_List* CtMyProfileInputData::getAddressList() { return __childList(_contacts_my_profile.address); }

contacts_record_h CtMyProfileInputData::addAddress(const char* address)
{
	int type = getNextAddressType();
	contacts_record_h child = __addChild(_contacts_my_profile.address, _contacts_address._uri);
	if (child) {
		contacts_record_set_int(child, _contacts_address.type, type);
		if (address)
			setAddressAddress(child, address);
	}
	return child;
}

int CtMyProfileInputData::setAddressAddress(contacts_record_h record, const char* address)
{
	return CtDataTextRules::setAddressText(record, address);
}

int CtMyProfileInputData::setAddressType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_address.type, _contacts_address.label, type, label,
		CONTACTS_ADDRESS_TYPE_CUSTOM);
}

int CtMyProfileInputData::getAddressAddress(contacts_record_h record, char* buffer, unsigned int size)
{
	return CtDataTextRules::getAddressText(record, buffer, size);
}

int CtMyProfileInputData::getNextAddressType()
{
	return nextHomeWorkType(__childTypes(_contacts_my_profile.address, _contacts_address.type));
}

int CtMyProfileInputData::removeAddress(contacts_record_h record) { return __removeChild(_contacts_my_profile.address, record); }

// Messengers: position 5 is Jabber and Hangouts sits with the others at 7.

Eina_List* CtMyProfileInputData::getMessengerList() { return __childList(_contacts_my_profile.messenger); }

contacts_record_h CtMyProfileInputData::addMessenger(const char* messenger)
{
	int type = getNextMessengerType();
	return __addTextChild(_contacts_my_profile.messenger, _contacts_messenger._uri, _contacts_messenger.im_id,
		messenger, _contacts_messenger.type, type);
}

int CtMyProfileInputData::setMessengerMessenger(contacts_record_h record, const char* messenger)
{
	return setTextIfGiven(record, _contacts_messenger.im_id, messenger);
}

int CtMyProfileInputData::setMessengerType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_messenger.type, _contacts_messenger.label, type, label,
		CONTACTS_MESSENGER_TYPE_CUSTOM);
}

// Jabber and Hangouts trade places both ways, so that choosing the shown
// position again keeps the stored type.
int CtMyProfileInputData::getMessengerIndexType(int type)
{
	if (type == CONTACTS_MESSENGER_TYPE_JABBER)
		return MESSENGER_MENU_HANGOUTS;
	return messengerIndexByType(type, MESSENGER_MENU_JABBER);
}

int CtMyProfileInputData::getMessengerTypeByIndex(int index)
{
	if (index == MESSENGER_MENU_JABBER)
		return CONTACTS_MESSENGER_TYPE_GOOGLE;
	return messengerTypeByIndex(index, CONTACTS_MESSENGER_TYPE_JABBER);
}

const char* CtMyProfileInputData::getMessengerMessenger(contacts_record_h record)
{
	return textOf(record, _contacts_messenger.im_id);
}

int CtMyProfileInputData::getNextMessengerType()
{
	bool taken[MESSENGER_MENU_JABBER + 1] = {};
	for (int type : __childTypes(_contacts_my_profile.messenger, _contacts_messenger.type))
		taken[getMessengerIndexType(type)] = true;
	for (int i = MESSENGER_MENU_AIM; i <= MESSENGER_MENU_JABBER; ++i)
		if (!taken[i])
			return getMessengerTypeByIndex(i);
	return CONTACTS_MESSENGER_TYPE_CUSTOM;
}

int CtMyProfileInputData::removeMessenger(contacts_record_h record) { return __removeChild(_contacts_my_profile.messenger, record); }

// Websites

Eina_List* CtMyProfileInputData::getWebsiteList() { return __childList(_contacts_my_profile.url); }

contacts_record_h CtMyProfileInputData::addWebsite(const char* website)
{
	return __addTextChild(_contacts_my_profile.url, _contacts_url._uri, _contacts_url.url, website);
}

int CtMyProfileInputData::setWebsiteWebsite(contacts_record_h record, const char* website)
{
	return setTextIfGiven(record, _contacts_url.url, website);
}

const char* CtMyProfileInputData::getWebsiteWebsite(contacts_record_h record) { return textOf(record, _contacts_url.url); }
int CtMyProfileInputData::removeWebsite(contacts_record_h record) { return __removeChild(_contacts_my_profile.url, record); }

// Relationships: a profile keeps none.

Eina_List* CtMyProfileInputData::getRelationshipList() { return nullptr; }
contacts_record_h CtMyProfileInputData::addRelationship(const char*) { return nullptr; }
int CtMyProfileInputData::setRelationshipRelationship(contacts_record_h, const char*) { return 0; }
int CtMyProfileInputData::setRelationshipType(contacts_record_h, int, const char*) { return 0; }
const char* CtMyProfileInputData::getRelationshipRelationship(contacts_record_h) { return nullptr; }
int CtMyProfileInputData::getNextRelationshipType() { return 0; }
int CtMyProfileInputData::removeRelationship(contacts_record_h) { return 0; }

// Events: birthday, then anniversary; "other" is never proposed.

Eina_List* CtMyProfileInputData::getEventList() { return __childList(_contacts_my_profile.event); }

contacts_record_h CtMyProfileInputData::addEvent(int date)
{
	int type = getNextEventType();
	contacts_record_h child = __addChild(_contacts_my_profile.event, _contacts_event._uri);
	if (child) {
		contacts_record_set_int(child, _contacts_event.type, type);
		contacts_record_set_int(child, _contacts_event.date, date);
	}
	return child;
}

int CtMyProfileInputData::setEventEvent(contacts_record_h record, int date)
{
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	return contacts_record_set_int(record, _contacts_event.date, date);
}

int CtMyProfileInputData::setEventType(contacts_record_h record, int type, const char* label)
{
	return setTypeAndLabel(record, _contacts_event.type, _contacts_event.label, type, label,
		CONTACTS_EVENT_TYPE_CUSTOM);
}

int CtMyProfileInputData::getEventEvent(contacts_record_h record) { return intOf(record, _contacts_event.date); }

int CtMyProfileInputData::getNextEventType()
{
	for (int type : __childTypes(_contacts_my_profile.event, _contacts_event.type))
		if (type == CONTACTS_EVENT_TYPE_BIRTH)
			return CONTACTS_EVENT_TYPE_ANNIVERSARY;
	return CONTACTS_EVENT_TYPE_BIRTH;
}

int CtMyProfileInputData::removeEvent(contacts_record_h record) { return __removeChild(_contacts_my_profile.event, record); }

int CtMyProfileInputData::setCalendarType(contacts_record_h event, int calendarType)
{
	WPRET_VM(!event, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : event");
	return contacts_record_set_int(event, _contacts_event.calendar_type, calendarType);
}

int CtMyProfileInputData::getCalendarType(contacts_record_h event) { return intOf(event, _contacts_event.calendar_type); }

int CtMyProfileInputData::setIsLeapMonth(contacts_record_h event, bool isLeapMonth)
{
	WPRET_VM(!event, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : event");
	return contacts_record_set_bool(event, _contacts_event.is_leap_month, isLeapMonth);
}

bool CtMyProfileInputData::getIsLeapMonth(contacts_record_h event)
{
	bool leap = false;
	if (event)
		contacts_record_get_bool(event, _contacts_event.is_leap_month, &leap);
	return leap;
}

// Status

void CtMyProfileInputData::setStatus(const char* status)
{
	WPRET_M(!m_profileRecord, "Invalid param : profile record");
	if (!status)
		return;
	int err = contacts_record_set_str(m_profileRecord, _contacts_my_profile_ex.status, status);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_set_str", err);
}

void CtMyProfileInputData::setStatusText(const char* status) { setStatus(status); }
const char* CtMyProfileInputData::getStatus() { return textOf(m_profileRecord, _contacts_my_profile_ex.status); }

// Images: up to five, each with its order from 1 to 5.

contacts_record_h CtMyProfileInputData::__imageAt(int index)
{
	contacts_record_h image = nullptr;
	if (!m_profileRecord || index < 0)
		return nullptr;
	contacts_record_get_child_record_at_p(m_profileRecord, _contacts_my_profile.image, index, &image);
	return image;
}

contacts_record_h CtMyProfileInputData::__imageOfOrder(int order)
{
	int index = getImageIndex(order);
	return index < 0 ? nullptr : __imageAt(index);
}

int CtMyProfileInputData::getImageCount()
{
	int count = 0;
	int err = contacts_record_get_child_record_count(m_profileRecord, _contacts_my_profile.image, &count);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_get_child_record_count", err);
		return -1;
	}
	return count;
}

contacts_record_h CtMyProfileInputData::getImageRecord()
{
	if (contacts_record_h first = __imageAt(0))
		return first;
	contacts_record_h image = __addChild(_contacts_my_profile.image, _contacts_image._uri);
	if (image)
		contacts_record_set_int(image, _contacts_image_ex.order, kMinImageOrder);
	return image;
}

const char* CtMyProfileInputData::getImagePath() { return textOf(__imageAt(0), _contacts_image.path); }

contacts_record_h CtMyProfileInputData::getImageRecord(int order)
{
	WPRET_VM(!isValidOrder(order), nullptr, "Invalid Param : order : %d", order);
	if (contacts_record_h image = __imageOfOrder(order))
		return image;
	contacts_record_h image = __addChild(_contacts_my_profile.image, _contacts_image._uri);
	if (image)
		contacts_record_set_int(image, _contacts_image_ex.order, order);
	return image;
}

const char* CtMyProfileInputData::getImagePath(int order)
{
	WPRET_VM(!isValidOrder(order), nullptr, "Invalid Param : order : %d", order);
	return textOf(__imageOfOrder(order), _contacts_image.path);
}

int CtMyProfileInputData::getImageIndex(int order)
{
	if (!isValidOrder(order))
		return -1;
	for (int i = 0; contacts_record_h image = __imageAt(i); ++i) {
		int imageOrder = 0;
		if (contacts_record_get_int(image, _contacts_image_ex.order, &imageOrder) != CONTACTS_ERROR_NONE)
			return -1;
		if (imageOrder == order)
			return i;
	}
	return -1;
}

int CtMyProfileInputData::getImageOrder(int index)
{
	WPRET_VM(index < 0, -1, "Invalid Param : index : %d", index);
	contacts_record_h image = __imageAt(index);
	int order = -1;
	if (!image || contacts_record_get_int(image, _contacts_image_ex.order, &order) != CONTACTS_ERROR_NONE)
		return -1;
	return order;
}

void CtMyProfileInputData::setImageOrder(int index, int order)
{
	WPRET_M(index < 0, "Invalid Param : index : %d", index);
	WPRET_M(!isValidOrder(order), "Invalid Param : order : %d", order);
	contacts_record_h image = __imageAt(index);
	WPRET_M(!image, "no image at %d", index);
	contacts_record_set_int(image, _contacts_image_ex.order, order);
}

int CtMyProfileInputData::setImage(contacts_record_h image, const char* path, int type)
{
	if (isEmpty(path))
		return CONTACTS_ERROR_NONE;
	WPRET_VM(!image, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : image");
	int err = contacts_record_set_int(image, _contacts_image.type, type);
	return err ? err : contacts_record_set_str(image, _contacts_image.path, path);
}

int CtMyProfileInputData::removeImage(contacts_record_h image)
{
	WPRET_VM(!image, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : image");
	int removedOrder = intOf(image, _contacts_image_ex.order);
	int err = __removeChild(_contacts_my_profile.image, image);
	if (err != CONTACTS_ERROR_NONE)
		return err;
	for (int i = 0; contacts_record_h other = __imageAt(i); ++i) {
		int order = intOf(other, _contacts_image_ex.order);
		if (order > removedOrder)
			contacts_record_set_int(other, _contacts_image_ex.order, order - 1);
	}
	return CONTACTS_ERROR_NONE;
}

// Saving

int CtMyProfileInputData::insertContact(int* outId)
{
	WENTER();
	WPRET_VM(!m_profileRecord, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : profile record");
	int id = 0;
	int err = contacts_db_insert_record(m_profileRecord, &id);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_insert_record", err);
		return err;
	}
	m_profileId = id;
	if (outId)
		*outId = id;
	return err;
}

int CtMyProfileInputData::updateContact()
{
	WENTER();
	WPRET_VM(!m_profileRecord, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : profile record");
	for (int i = 0; contacts_record_h image = __imageAt(i); ++i) {
		int order = 0;
		int err = contacts_record_get_int(image, _contacts_image_ex.order, &order);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_record_get_int", err);
			return err;
		}
	}
	int err = contacts_db_update_record(m_profileRecord);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_db_update_record", err);
	return err;
}
