#include "CtPredictionListModel.h"

#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"

#include <glib.h>


namespace {

// Persons read per query; a page only runs short of predictions when some of
// its persons live on a SIM card.
const int kPageSize = CtPredictionListModel::kMaxPredictions;

class ScopedQuery {
public:
	explicit ScopedQuery(const char* uri)
	{
		int err = contacts_query_create(uri, &m_query);
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_query_create", err);
		err = contacts_filter_create(uri, &m_filter);
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_filter_create", err);
	}
	~ScopedQuery()
	{
		contacts_filter_destroy(m_filter);
		contacts_query_destroy(m_query);
	}
	ScopedQuery(const ScopedQuery&) = delete;
	ScopedQuery& operator=(const ScopedQuery&) = delete;

	bool isValid() const { return m_query && m_filter; }
	contacts_query_h query() const { return m_query; }
	contacts_filter_h filter() const { return m_filter; }
	// Sets the filter on the query and the projection; false when refused.
	bool finish(unsigned int* projection, int count)
	{
		int err = contacts_query_set_filter(m_query, m_filter);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_query_set_filter", err);
			return false;
		}
		err = contacts_query_set_projection(m_query, projection, count);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_query_set_projection", err);
			return false;
		}
		return true;
	}

private:
	contacts_query_h m_query = nullptr;
	contacts_filter_h m_filter = nullptr;
};

// The query's result as a list the caller destroys; null on failure.
contacts_list_h runQuery(contacts_query_h query, int offset, int limit)
{
	contacts_list_h list = nullptr;
	int err = contacts_db_get_records_with_query(query, offset, limit, &list);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_records_with_query", err);
		return nullptr;
	}
	return list;
}

std::string textOf(contacts_record_h record, unsigned int property)
{
	char* text = nullptr;
	int err = contacts_record_get_str_p(record, property, &text);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_get_str_p", err);
	return text ? text : "";
}

// Invalid UTF-8 is searched for as its valid parts (bad bytes become U+FFFD,
// which no stored name holds).
std::string validUtf8(const std::string& text)
{
	if (g_utf8_validate(text.c_str(), -1, nullptr))
		return text;
	gchar* valid = g_utf8_make_valid(text.c_str(), -1);
	std::string result = valid ? valid : "";
	g_free(valid);
	return result;
}

} // namespace

CtPredictionListModel::CtPredictionListModel(const std::string& searchName)
	: __searchName(searchName)
{
	__loadPredictionList();
}

void CtPredictionListModel::reload(const std::string& searchName)
{
	__searchName = searchName;
	__loadPredictionList();
}

contacts_record_h CtPredictionListModel::getContactRecordByContactId(int contactId)
{
	WPRET_VM(contactId <= 0, nullptr, "Invalid param : contactId %d", contactId);
	contacts_record_h record = nullptr;
	int err = contacts_db_get_record(_contacts_contact._uri, contactId, &record);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_record", err);
		return nullptr;
	}
	return record;
}

void CtPredictionListModel::__loadPredictionList()
{
	WENTER();
	m_predictions.clear();
	// A C string ends at the first NUL: nothing after it is searched for.
	std::string search = validUtf8(__searchName.c_str());
	if (search.empty()) {
		WERROR("__searchName is empty");
		return;
	}
	ScopedQuery q(_contacts_person._uri);
	WPRET_M(!q.isValid(), "query not made");
	int err = contacts_filter_add_str(q.filter(), _contacts_person.display_name, CONTACTS_MATCH_CONTAINS, search.c_str());
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_filter_add_str", err);
		return;
	}
	unsigned int projection[] = { _contacts_person.id, _contacts_person.display_name,
		_contacts_person.display_contact_id, _contacts_person.addressbook_ids, _contacts_person.image_thumbnail_path };
	if (!q.finish(projection, G_N_ELEMENTS(projection)))
		return;
	for (int offset = 0; getCount() < kMaxPredictions;) {
		int limit = offset == 0 ? kPageSize : kPageSize * 4;
		int read = __appendPage(q.query(), offset, limit);
		if (read < limit)
			break;
		offset += read;
	}
}

int CtPredictionListModel::__appendPage(contacts_query_h query, int offset, int limit)
{
	contacts_list_h list = runQuery(query, offset, limit);
	if (!list)
		return 0;
	int count = 0;
	contacts_list_get_count(list, &count);
	for (int i = 0; i < count && getCount() < kMaxPredictions; ++i) {
		contacts_record_h person = nullptr;
		int err = contacts_list_get_current_record_p(list, &person);
		if (err != CONTACTS_ERROR_NONE)
			WFAILED("contacts_list_get_current_record_p", err);
		else
			__appendPerson(person);
		contacts_list_next(list);
	}
	contacts_list_destroy(list, true);
	return count;
}

void CtPredictionListModel::__appendPerson(contacts_record_h person)
{
	Prediction prediction;
	prediction.name = textOf(person, _contacts_person.display_name);
	int err = contacts_record_get_int(person, _contacts_person.display_contact_id, &prediction.contactId);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_record_get_int", err);
		return;
	}
	int addressbookId = __getAddressbookIdByContactId(prediction.contactId);
	if (addressbookId < 0 || ctCommonIsSimAddressbook(addressbookId))
		return;
	prediction.number = __getDefaultNumberByContactId(prediction.contactId);
	m_predictions.push_back(std::move(prediction));
}

int CtPredictionListModel::__getAddressbookIdByContactId(int contactId)
{
	ScopedQuery q(_contacts_contact._uri);
	if (!q.isValid())
		return -1;
	contacts_filter_add_int(q.filter(), _contacts_contact.id, CONTACTS_MATCH_EQUAL, contactId);
	unsigned int projection[] = { _contacts_contact.address_book_id };
	if (!q.finish(projection, 1))
		return -1;
	contacts_list_h list = runQuery(q.query(), 0, 1);
	if (!list)
		return -1;
	int addressbookId = -1;
	contacts_record_h contact = nullptr;
	if (contacts_list_get_current_record_p(list, &contact) == CONTACTS_ERROR_NONE && contact)
		contacts_record_get_int(contact, _contacts_contact.address_book_id, &addressbookId);
	contacts_list_destroy(list, true);
	return addressbookId;
}

std::string CtPredictionListModel::__getDefaultNumberByContactId(int contactId)
{
	ScopedQuery q(_contacts_number._uri);
	if (!q.isValid())
		return "";
	contacts_filter_add_int(q.filter(), _contacts_number.contact_id, CONTACTS_MATCH_EQUAL, contactId);
	contacts_filter_add_operator(q.filter(), CONTACTS_FILTER_OPERATOR_AND);
	contacts_filter_add_bool(q.filter(), _contacts_number.is_default, true);
	unsigned int projection[] = { _contacts_number.number };
	if (!q.finish(projection, 1))
		return "";
	contacts_list_h list = runQuery(q.query(), 0, 1);
	if (!list)
		return "";
	std::string number;
	contacts_record_h record = nullptr;
	if (contacts_list_get_current_record_p(list, &record) == CONTACTS_ERROR_NONE && record)
		number = textOf(record, _contacts_number.number);
	contacts_list_destroy(list, true);
	return number;
}
