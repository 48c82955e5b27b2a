#include "CtDetailData.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"
#include "CtCommonRecordUtil.h"
#include "CtContactsAgentMgr.h"
#include "CtDbChangeSubscription.h"
#include "CtEsuAgentMgr.h"
#include "CtRegistryMgr.h"

#include <glib.h>
#include <unistd.h>

#include <cstdlib>
#include <cstring>
#include <string>

namespace {

const int kGalPersonId = -2;
const size_t kMaxExtraNameLength = 1024;
const size_t kMaxAddressPartLength = 1023;

char* dupOrNull(const char* text)
{
	return text ? strdup(text) : nullptr;
}

bool isEmpty(const char* text)
{
	return !text || !*text;
}

// A copy with invalid UTF-8 sequences replaced; null for null. The caller frees it.
char* validUtf8OrNull(const char* text)
{
	if (!text)
		return nullptr;
	gchar* valid = g_utf8_make_valid(text, -1);
	char* copy = strdup(valid);
	g_free(valid);
	return copy;
}

void freeText(char*& text)
{
	free(text);
	text = nullptr;
}

// A copy of the text property (null when unset); the caller frees it.
char* copyText(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	int err = contacts_record_get_str(record, property, &value);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_get_str", err);
	return value;
}

const char* borrowText(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	int err = contacts_record_get_str_p(record, property, &value);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_get_str_p", err);
	return value;
}

// Cuts `text` to at most `maxBytes` bytes without splitting a UTF-8 sequence.
void cutUtf8(std::string& text, size_t maxBytes)
{
	if (text.size() <= maxBytes)
		return;
	size_t end = maxBytes;
	while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80)
		--end;
	text.resize(end);
}

// "phonetic, nickname" when both are set, else the one that is; null when none.
char* joinExtraNames(const char* phonetic, const char* nickname)
{
	std::string joined;
	if (!isEmpty(phonetic) && !isEmpty(nickname))
		joined = std::string(phonetic) + ", " + nickname;
	else if (!isEmpty(phonetic))
		joined = phonetic;
	else if (!isEmpty(nickname))
		joined = nickname;
	cutUtf8(joined, kMaxExtraNameLength);
	return joined.empty() ? nullptr : strdup(joined.c_str());
}

void freeListOnly(Eina_List*& list)
{
	list = eina_list_free(list);
}

// Address-book mode of the contact's book; false when it cannot be read.
bool readAddressbookMode(contacts_record_h contact, int* mode, int* accountId)
{
	int addressbookId = 0;
	int err = contacts_record_get_int(contact, _contacts_contact.address_book_id, &addressbookId);
	contacts_record_h book = nullptr;
	if (err == CONTACTS_ERROR_NONE)
		err = contacts_db_get_record(_contacts_address_book._uri, addressbookId, &book);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_record", err);
		return false;
	}
	contacts_record_get_int(book, _contacts_address_book.mode, mode);
	if (accountId)
		contacts_record_get_int(book, _contacts_address_book.account_id, accountId);
	contacts_record_destroy(book, true);
	return true;
}

bool isReadOnlyMode(int mode)
{
	return mode & CONTACTS_ADDRESS_BOOK_MODE_READONLY;
}

bool isSocialMode(int mode)
{
	return mode == CT_ADDRESSBOOK_MODE_SOCIAL;
}

} // namespace

CtDetailData::CtDetailData(int personId)
{
	WENTER();
	m_personId = personId;
	init();
}

CtDetailData::CtDetailData(const CtGalSearchData* galData)
{
	WENTER();
	__loadGal(galData);
}

CtDetailData::~CtDetailData()
{
	deInit();
}

void CtDetailData::attachListener(ICtChangeListener* listener)
{
	WPRET_M(!listener, "listener is NULL");
	m_listener = listener;
}

void CtDetailData::detachListener()
{
	m_listener = nullptr;
}

void CtDetailData::init()
{
	WENTER();
	int personId = m_personId;
	deInit();
	__connect();
	if (personId > 0) {
		int err = contacts_db_get_record(_contacts_person._uri, personId, &m_personRecord);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_db_get_record", err);
			m_personRecord = nullptr;
		}
	}
	if (m_personRecord) {
		m_personId = personId;
		contacts_record_get_int(m_personRecord, _contacts_person.changed_ver, &m_changeMarker);
		m_contactsList = ctCommonGetContactsList(m_personId);
		if (!m_contactsList)
			WERROR("listContacts is NULL");
		__loadBasicInfo();
		__loadChildLists();
		__loadDefaultIds(&m_defaultImageId, &m_nameContactId);
	}
	int err = contacts_db_get_current_version(&m_version);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_db_get_current_version", err);
	__subscribe();
	if (m_personRecord)
		__loadGroupNames();
}

i18n_udate_h CtDetailData::getTimeFormatter()
{
	if (!m_timeFormatter && m_personRecord)
		m_timeFormatter = CtCommonGetTimeFormatter();
	return m_timeFormatter;
}

i18n_udate_h CtDetailData::getTimeFormatterWithoutYear()
{
	if (!m_timeFormatterWithoutYear && m_personRecord)
		m_timeFormatterWithoutYear = CtCommonGetTimeFormatterWithoutYear();
	return m_timeFormatterWithoutYear;
}

void CtDetailData::deInit()
{
	m_personSubscription.reset();
	m_phoneLogSubscription.reset();
	__freeTexts();
	if (m_personId == kGalPersonId) {
		ctCommonDestroyRecordList(m_numberList);
		ctCommonDestroyRecordList(m_emailList);
		m_numberList = m_emailList = nullptr;
	}
	for (Eina_List** list : {&m_numberList, &m_emailList, &m_addressList, &m_messengerList, &m_urlList,
		     &m_relationshipList, &m_eventList, &m_noteList, &m_nameList, &m_imageList})
		freeListOnly(*list);
	ctCommonDestroyRecordList(m_contactsList);
	if (m_personRecord)
		contacts_record_destroy(m_personRecord, true);
	if (m_timeFormatter)
		i18n_udate_destroy(m_timeFormatter);
	if (m_timeFormatterWithoutYear)
		i18n_udate_destroy(m_timeFormatterWithoutYear);
	if (m_connected) {
		int err = contacts_disconnect();
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_disconnect", err);
	}
	__clear();
}

void CtDetailData::__clear()
{
	m_version = 0;
	m_personId = 0;
	m_nameContactId = 0;
	m_defaultImageId = 0;
	m_personRecord = nullptr;
	m_changeMarker = 0;
	m_isFavorite = false;
	m_contactsList = nullptr;
	m_timeFormatter = nullptr;
	m_timeFormatterWithoutYear = nullptr;
	m_groupNames.clear();
	m_connected = false;
}

void CtDetailData::__freeTexts()
{
	for (char** text : {&m_thumbnailPath, &m_displayName, &m_extraName2, &m_extraName1Second, &m_extraName1First,
		     &m_company, &m_ringtonePath, &m_messageAlert, &m_vibration, &m_status})
		freeText(*text);
}

void CtDetailData::__connect()
{
	int err = contacts_connect();
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_connect", err);
	m_connected = err == CONTACTS_ERROR_NONE;
}

void CtDetailData::__subscribe()
{
	m_personSubscription.reset(new CtDbChangeSubscription(_contacts_person._uri, __onDbChangedCb, this));
	m_phoneLogSubscription.reset(new CtDbChangeSubscription(_contacts_phone_log._uri, __onDbChangedCb, this));
}

void CtDetailData::__loadBasicInfo()
{
	char* displayName = copyText(m_personRecord, _contacts_person.display_name);
	m_displayName = ctCommonRemoveNewline(displayName);
	free(displayName);
	m_thumbnailPath = copyText(m_personRecord, _contacts_person.image_thumbnail_path);
	m_ringtonePath = copyText(m_personRecord, _contacts_person.ringtone_path);
	m_vibration = copyText(m_personRecord, _contacts_person.vibration);
	m_messageAlert = copyText(m_personRecord, _contacts_person.message_alert);
	int err = contacts_record_get_bool(m_personRecord, _contacts_person.is_favorite, &m_isFavorite);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_get_bool", err);
	m_status = copyText(m_personRecord, _contacts_person.status);
	m_company = CtCommonGetCompany(m_contactsList);
	__loadExtraNames();
	__checkRingtoneFile();
}

void CtDetailData::__loadExtraNames()
{
	CtCommonGetExtraName1(m_contactsList, &m_extraName1First, &m_extraName1Second);
	m_extraName2 = joinExtraNames(m_extraName1Second, m_extraName1First);
}

// A ringtone whose file is gone would play nothing: forget it in the store too.
void CtDetailData::__checkRingtoneFile()
{
	if (isEmpty(m_ringtonePath) || access(m_ringtonePath, F_OK) == 0)
		return;
	WDEBUG("ringtone file is gone: %s", m_ringtonePath);
	freeText(m_ringtonePath);
	int err = contacts_record_set_str(m_personRecord, _contacts_person.ringtone_path, nullptr);
	if (err == CONTACTS_ERROR_NONE)
		err = contacts_db_update_record(m_personRecord);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_update_record", err);
		return;
	}
	// Our own write moved the change marker; it is not a change to report.
	contacts_record_h fresh = nullptr;
	if (contacts_db_get_record(_contacts_person._uri, m_personId, &fresh) == CONTACTS_ERROR_NONE) {
		contacts_record_destroy(m_personRecord, true);
		m_personRecord = fresh;
		contacts_record_get_int(m_personRecord, _contacts_person.changed_ver, &m_changeMarker);
	}
}

void CtDetailData::__loadChildLists()
{
	m_numberList = CtCommonGetChildDataList(m_contactsList, _contacts_contact.number);
	m_emailList = CtCommonGetChildDataList(m_contactsList, _contacts_contact.email);
	m_addressList = CtCommonGetChildDataList(m_contactsList, _contacts_contact.address);
	m_messengerList = CtCommonGetChildDataList(m_contactsList, _contacts_contact.messenger);
	m_urlList = CtCommonGetChildDataList(m_contactsList, _contacts_contact.url);
	m_relationshipList = CtCommonGetChildDataList(m_contactsList, _contacts_contact.relationship);
	m_eventList = CtCommonGetChildDataList(m_contactsList, _contacts_contact.event);
	m_noteList = CtCommonGetChildDataList(m_contactsList, _contacts_contact.note);
	m_nameList = CtCommonGetChildDataList(m_contactsList, _contacts_contact.name);
	m_imageList = CtCommonGetChildDataList(m_contactsList, _contacts_contact.image);
}

void CtDetailData::__loadDefaultIds(int* defaultImageId, int* nameContactId)
{
	*defaultImageId = 0;
	*nameContactId = 0;
	int err = contacts_person_get_default_property(CONTACTS_PERSON_PROPERTY_IMAGE, m_personId, defaultImageId);
	if (err != CONTACTS_ERROR_NONE && err != CONTACTS_ERROR_NO_DATA)
		WFAILED("contacts_person_get_default_property", err);
	err = contacts_person_get_default_property(CONTACTS_PERSON_PROPERTY_NAME_CONTACT, m_personId, nameContactId);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_person_get_default_property", err);
}

void CtDetailData::__loadGroupNames()
{
	m_groupNames = ctCommonGetGroupNames(m_contactsList);
	if (m_groupNames.empty())
		m_groupNames = ContactsCommon::translate("IDS_PB_BODY_NOT_ASSIGNED");
}

void CtDetailData::__loadGal(const CtGalSearchData* galData)
{
	__connect();
	__subscribe();
	m_personId = kGalPersonId;
	m_galData = galData;
	WPRET_M(!galData, "Invalid param : galData");
	char* displayName = validUtf8OrNull(galData->displayName);
	m_displayName = ctCommonRemoveNewline(displayName);
	free(displayName);
	m_thumbnailPath = dupOrNull(galData->imagePath);
	m_company = validUtf8OrNull(galData->company);
	__addGalNumber(galData->phone1, CONTACTS_NUMBER_TYPE_WORK);
	__addGalNumber(galData->phone2, CONTACTS_NUMBER_TYPE_CELL);
	__addGalNumber(galData->phone3, CONTACTS_NUMBER_TYPE_HOME);
	__addGalEmail(galData->email);
}

void CtDetailData::__addGalNumber(const char* number, int type)
{
	if (isEmpty(number))
		return;
	contacts_record_h record = nullptr;
	int err = contacts_record_create(_contacts_number._uri, &record);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_create", err);
		return;
	}
	contacts_record_set_int(record, _contacts_number.type, type);
	err = contacts_record_set_str(record, _contacts_number.number, number);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_set_str", err);
		contacts_record_destroy(record, true);
		return;
	}
	m_numberList = eina_list_append(m_numberList, record);
}

void CtDetailData::__addGalEmail(const char* email)
{
	if (isEmpty(email))
		return;
	contacts_record_h record = nullptr;
	int err = contacts_record_create(_contacts_email._uri, &record);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_create", err);
		return;
	}
	contacts_record_set_int(record, _contacts_email.type, CONTACTS_EMAIL_TYPE_WORK);
	err = contacts_record_set_str(record, _contacts_email.email, email);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_set_str", err);
		contacts_record_destroy(record, true);
		return;
	}
	m_emailList = eina_list_append(m_emailList, record);
}

void CtDetailData::__onDbChangedCb(const char* viewUri, void* data)
{
	WHIT();
	CtDetailData* self = static_cast<CtDetailData*>(data);
	if (viewUri && !strcmp(viewUri, _contacts_phone_log._uri)) {
		CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_PHONELOG_CHANGED, 0);
		return;
	}
	bool changed = self->__isPersonChanged();
	// Without contacts (no person, GAL entry) there is nothing to match.
	if (self->m_contactsList)
		changed = self->__hasContactChangedSinceVersion() || changed;
	// The listener may delete this object: nothing may follow the call.
	if (changed && self->m_listener)
		self->m_listener->onDbChanged(viewUri);
}

bool CtDetailData::__isPersonChanged()
{
	if (!m_personRecord)
		return false;
	contacts_record_h fresh = nullptr;
	int err = contacts_db_get_record(_contacts_person._uri, m_personId, &fresh);
	if (err != CONTACTS_ERROR_NONE) {
		// Gone: report it once, then there is no person left to watch.
		WFAILED("contacts_db_get_record", err);
		contacts_record_destroy(m_personRecord, true);
		m_personRecord = nullptr;
		return true;
	}
	contacts_record_destroy(m_personRecord, true);
	m_personRecord = fresh;
	int marker = 0;
	contacts_record_get_int(m_personRecord, _contacts_person.changed_ver, &marker);
	int defaultImageId = 0;
	int nameContactId = 0;
	__loadDefaultIds(&defaultImageId, &nameContactId);
	bool changed = marker != m_changeMarker || defaultImageId != m_defaultImageId || nameContactId != m_nameContactId;
	m_changeMarker = marker;
	m_defaultImageId = defaultImageId;
	m_nameContactId = nameContactId;
	return changed;
}

bool CtDetailData::__hasContactChangedSinceVersion()
{
	contacts_list_h changes = nullptr;
	int currentVersion = 0;
	int err = contacts_db_get_changes_by_version(
		_contacts_contact_updated_info._uri, -1, m_version, &changes, &currentVersion);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_changes_by_version", err);
		return false;
	}
	bool changed = false;
	contacts_record_h change = nullptr;
	while (!changed && contacts_list_get_current_record_p(changes, &change) == CONTACTS_ERROR_NONE) {
		int contactId = 0;
		contacts_record_get_int(change, _contacts_contact_updated_info.contact_id, &contactId);
		changed = __isPersonContact(contactId);
		if (contacts_list_next(changes) != CONTACTS_ERROR_NONE)
			break;
	}
	contacts_list_destroy(changes, true);
	if (currentVersion > 0)
		m_version = currentVersion;
	return changed;
}

bool CtDetailData::__isPersonContact(int contactId)
{
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(m_contactsList, l, data) {
		int id = 0;
		contacts_record_get_int(static_cast<contacts_record_h>(data), _contacts_contact.id, &id);
		if (id == contactId)
			return true;
	}
	return false;
}

void CtDetailData::setFavorite(bool isFavorite)
{
	WENTER();
	WPRET_M(!m_personRecord, "Invalid param : no person");
	int err = contacts_record_set_bool(m_personRecord, _contacts_person.is_favorite, isFavorite);
	if (err == CONTACTS_ERROR_NONE)
		err = contacts_db_update_record(m_personRecord);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_update_record", err);
		contacts_record_set_bool(m_personRecord, _contacts_person.is_favorite, m_isFavorite);
		return;
	}
	m_isFavorite = isFavorite;
	if (CtEsuAgentMgr::getInstance()->getEasySignUpCscFeatureEnabled())
		CtContactsAgentMgr::getInstance()->syncDataStart(m_personId, nullptr, nullptr);
}

void CtDetailData::setRingtone(const char* path)
{
	WENTER();
	WPRET_M(!m_personRecord, "Invalid param : no person");
	int err = contacts_record_set_str(m_personRecord, _contacts_person.ringtone_path, path);
	if (err == CONTACTS_ERROR_NONE)
		err = contacts_db_update_record(m_personRecord);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_update_record", err);
		contacts_record_set_str(m_personRecord, _contacts_person.ringtone_path, m_ringtonePath);
		return;
	}
	free(m_ringtonePath);
	m_ringtonePath = dupOrNull(path);
}

char* CtDetailData::getImagePath(int order)
{
	WPRET_VM(order < 1 || order > 5, nullptr, "Invalid Param : order : %d", order);
	// A directory entry has no image records: its one picture is its own.
	if (m_personId == kGalPersonId)
		return order == 1 && !isEmpty(m_thumbnailPath) ? strdup(m_thumbnailPath) : nullptr;
	const char* path = nullptr;
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(m_imageList, l, data) {
		contacts_record_h image = static_cast<contacts_record_h>(data);
		int imageOrder = 0;
		if (contacts_record_get_int(image, _contacts_image_ex.order, &imageOrder) != CONTACTS_ERROR_NONE)
			return nullptr;
		if (imageOrder == order)
			path = borrowText(image, _contacts_image.path);
	}
	return dupOrNull(path);
}

int CtDetailData::getDataType(contacts_record_h record, int property)
{
	int value = 0;
	int err = contacts_record_get_int(record, property, &value);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_get_int", err);
	return value;
}

const char* CtDetailData::getDataTypeCustom(contacts_record_h record, int property)
{
	return borrowText(record, property);
}

const char* CtDetailData::getNumber(contacts_record_h record)
{
	return borrowText(record, _contacts_number.number);
}

const char* CtDetailData::getEmail(contacts_record_h record)
{
	return borrowText(record, _contacts_email.email);
}

void CtDetailData::getAddress(contacts_record_h record, char* buf, int size)
{
	WPRET_M(!buf || size < 1, "Invalid param : buf");
	const unsigned int parts[] = {_contacts_address.postbox, _contacts_address.postal_code, _contacts_address.region,
		_contacts_address.locality, _contacts_address.street, _contacts_address.country, _contacts_address.extended};
	std::string text;
	for (unsigned int property : parts) {
		char* value = nullptr;
		if (contacts_record_get_str_p(record, property, &value) != CONTACTS_ERROR_NONE || isEmpty(value))
			continue;
		std::string part(value);
		cutUtf8(part, kMaxAddressPartLength);
		text += (text.empty() ? "" : "\n") + part;
	}
	cutUtf8(text, static_cast<size_t>(size) - 1);
	memcpy(buf, text.c_str(), text.size() + 1);
}

const char* CtDetailData::getMessenger(contacts_record_h record)
{
	return borrowText(record, _contacts_messenger.im_id);
}

const char* CtDetailData::getUrl(contacts_record_h record)
{
	return borrowText(record, _contacts_url.url);
}

const char* CtDetailData::getRelationship(contacts_record_h record)
{
	return borrowText(record, _contacts_relationship.name);
}

int CtDetailData::getEvent(contacts_record_h record)
{
	return getDataType(record, _contacts_event.date);
}

const char* CtDetailData::getNote(contacts_record_h record)
{
	return borrowText(record, _contacts_note.note);
}

int CtDetailData::getCalendarType(contacts_record_h record)
{
	return getDataType(record, _contacts_event.calendar_type);
}

bool CtDetailData::getIsLeapMonth(contacts_record_h record)
{
	bool value = false;
	int err = contacts_record_get_bool(record, _contacts_event.is_leap_month, &value);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_get_bool", err);
	return value;
}

bool CtDetailData::__addressbooksAllMatch(bool (*test)(int mode))
{
	if (!m_contactsList) {
		WERROR("listContacts is NULL");
		return true;
	}
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(m_contactsList, l, data) {
		int mode = 0;
		if (!readAddressbookMode(static_cast<contacts_record_h>(data), &mode, nullptr) || !test(mode))
			return false;
	}
	return true;
}

bool CtDetailData::getReadOnlyMode()
{
	return __addressbooksAllMatch(isReadOnlyMode);
}

bool CtDetailData::getFacebookMode()
{
	return __addressbooksAllMatch(isSocialMode);
}

Eina_List* CtDetailData::getContactsWithoutFacebook()
{
	Eina_List* result = nullptr;
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(m_contactsList, l, data) {
		contacts_record_h contact = static_cast<contacts_record_h>(data);
		int mode = 0;
		if (readAddressbookMode(contact, &mode, nullptr) && isSocialMode(mode))
			continue;
		contacts_record_h clone = nullptr;
		int err = contacts_record_clone(contact, &clone);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_record_clone", err);
			continue;
		}
		result = eina_list_append(result, clone);
	}
	return result;
}

bool CtDetailData::isSimContact()
{
	if (eina_list_count(m_contactsList) != 1)
		return false;
	contacts_record_h contact = static_cast<contacts_record_h>(eina_list_data_get(m_contactsList));
	int addressbookId = 0;
	contacts_record_get_int(contact, _contacts_contact.address_book_id, &addressbookId);
	int mode = 0;
	int accountId = 1;
	return addressbookId != 0 && readAddressbookMode(contact, &mode, &accountId) && accountId < 1;
}

bool CtDetailData::isCurrentPersonValid()
{
	if (m_personId < 1)
		return false;
	contacts_record_h person = nullptr;
	int err = contacts_db_get_record(_contacts_person._uri, m_personId, &person);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_record", err);
		return false;
	}
	contacts_record_destroy(person, true);
	return true;
}

char* CtDetailData::getVcardStream()
{
	WPRET_VM(!m_personRecord, nullptr, "Invalid param : no person");
	char* stream = nullptr;
	int err = contacts_vcard_make_from_person(m_personRecord, &stream);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_vcard_make_from_person", err);
		return nullptr;
	}
	return stream;
}
