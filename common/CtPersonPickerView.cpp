#include "CtPersonPickerView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtPersonPickerItem.h"

#include <contacts.h>
#include <glib.h>

#include <memory>

namespace {

constexpr const char* kTextDomain = "contacts";

// Longer search texts cannot match a name and only cost time.
constexpr size_t kMaxSearchBytes = 256;

// Case-folded, NFKC-normalized copy of valid UTF-8 (invalid bytes become
// U+FFFD first), for matching names the way a person reads them.
std::string foldForSearch(const char* text)
{
	if (!text || !*text)
		return "";
	gchar* valid = g_utf8_make_valid(text, -1);
	gchar* folded = g_utf8_casefold(valid, -1);
	gchar* normalized = g_utf8_normalize(folded, -1, G_NORMALIZE_NFKC);
	std::string out = normalized ? normalized : "";
	g_free(normalized);
	g_free(folded);
	g_free(valid);
	return out;
}

// Cuts `text` to at most `maxBytes` without splitting a UTF-8 character.
std::string clipUtf8(const std::string& text, size_t maxBytes)
{
	if (text.size() <= maxBytes)
		return text;
	size_t end = maxBytes;
	while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80)
		--end;
	return text.substr(0, end);
}

} // namespace

CtPersonPickerView::CtPersonPickerView(const char* titleId)
	: m_titleId(titleId ? titleId : "")
{
}

CtPersonPickerView::~CtPersonPickerView()
{
	__disconnectFromStore();
}

Evas_Object* CtPersonPickerView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	__connectToStore();
	Evas_Object* layout = createBaseLayout(parent, nullptr, nullptr);
	WPRET_VM(!layout, nullptr, "createBaseLayout() is fail");
	Evas_Object* box = elm_box_add(layout);
	evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(box, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_box_pack_end(box, __createSearchEntry(box));
	elm_box_pack_end(box, __createGenlist(box));
	evas_object_show(box);
	elm_object_part_content_set(layout, "elm.swallow.content", box);
	reload();
	return layout;
}

void CtPersonPickerView::__connectToStore()
{
	int err = contacts_connect();
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_connect", err);
	m_connected = err == CONTACTS_ERROR_NONE;
	err = contacts_db_add_changed_cb(_contacts_person._uri, __personsChangedCb, this);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_db_add_changed_cb", err);
	m_watching = err == CONTACTS_ERROR_NONE;
}

void CtPersonPickerView::__disconnectFromStore()
{
	if (m_watching)
		contacts_db_remove_changed_cb(_contacts_person._uri, __personsChangedCb, this);
	m_watching = false;
	if (m_connected)
		contacts_disconnect();
	m_connected = false;
}

void CtPersonPickerView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	elm_object_item_domain_translatable_text_set(naviItem, kTextDomain, m_titleId.c_str());
}

void CtPersonPickerView::onDestroy()
{
	app_assist::WUiTimer::destroy(m_chooseIdler);
	__disconnectFromStore();
	m_entry = nullptr;
	m_genlist = nullptr;
}

void CtPersonPickerView::onLanguageChanged()
{
	if (m_genlist)
		elm_genlist_realized_items_update(m_genlist);
}

Evas_Object* CtPersonPickerView::__createSearchEntry(Evas_Object* parent)
{
	m_entry = elm_entry_add(parent);
	elm_entry_single_line_set(m_entry, EINA_TRUE);
	elm_entry_scrollable_set(m_entry, EINA_TRUE);
	elm_entry_input_panel_return_key_type_set(m_entry, ELM_INPUT_PANEL_RETURN_KEY_TYPE_SEARCH);
	evas_object_size_hint_weight_set(m_entry, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(m_entry, EVAS_HINT_FILL, 0.0);
	evas_object_smart_callback_add(m_entry, "changed", __searchChangedCb, this);
	evas_object_smart_callback_add(m_entry, "preedit,changed", __searchChangedCb, this);
	evas_object_show(m_entry);
	return m_entry;
}

Evas_Object* CtPersonPickerView::__createGenlist(Evas_Object* parent)
{
	m_genlist = elm_genlist_add(parent);
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	elm_genlist_homogeneous_set(m_genlist, EINA_TRUE);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_show(m_genlist);
	return m_genlist;
}

void CtPersonPickerView::reload()
{
	m_entries = loadEntries();
	__fillList();
}

std::vector<CtPersonPickerView::Entry> CtPersonPickerView::loadPersons(int excludedPersonId)
{
	std::vector<Entry> persons;
	contacts_query_h query = nullptr;
	contacts_list_h list = nullptr;
	contacts_query_create(_contacts_person._uri, &query);
	unsigned int projection[] = {_contacts_person.id, _contacts_person.display_name};
	contacts_query_set_projection(query, projection, 2);
	contacts_query_set_sort(query, _contacts_person.display_name, true);
	int err = contacts_db_get_records_with_query(query, 0, 0, &list);
	contacts_query_destroy(query);
	if (err != CONTACTS_ERROR_NONE) {
		WFAILED("contacts_db_get_records_with_query", err);
		return persons;
	}
	contacts_record_h record = nullptr;
	while (contacts_list_get_current_record_p(list, &record) == CONTACTS_ERROR_NONE) {
		Entry entry;
		char* name = nullptr;
		contacts_record_get_int(record, _contacts_person.id, &entry.id);
		contacts_record_get_str_p(record, _contacts_person.display_name, &name);
		entry.name = name ? name : "";
		if (entry.id != excludedPersonId)
			persons.push_back(std::move(entry));
		if (contacts_list_next(list) != CONTACTS_ERROR_NONE)
			break;
	}
	contacts_list_destroy(list, true);
	return persons;
}

void CtPersonPickerView::setSearchText(const char* text)
{
	std::string search = text ? text : "";
	if (search.size() > kMaxSearchBytes) {
		WWARNING("search text too long (%zu bytes), using the first %zu", search.size(), kMaxSearchBytes);
		search = clipUtf8(search, kMaxSearchBytes);
	}
	m_searchText = search;
	__fillList();
}

std::vector<CtPersonPickerView::Entry> CtPersonPickerView::getShownEntries() const
{
	std::string key = foldForSearch(m_searchText.c_str());
	std::vector<Entry> shown;
	for (const Entry& entry : m_entries)
		if (key.empty() || foldForSearch(entry.name.c_str()).find(key) != std::string::npos)
			shown.push_back(entry);
	return shown;
}

void CtPersonPickerView::__fillList()
{
	if (!m_genlist)
		return;
	elm_genlist_clear(m_genlist);
	for (const Entry& entry : getShownEntries()) {
		auto* row = new CtPersonPickerItem(entry.id, entry.name, entry.subText, [this](int id) { __choose(id); });
		Elm_Object_Item* item = elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr,
			ELM_GENLIST_ITEM_NONE, row->getSelectCb(), row);
		row->setElmObjectItem(item);
	}
}

void CtPersonPickerView::__choose(int id)
{
	WHIT();
	// Choosing may rebuild the list or pop the view: not inside the row's
	// own selection callback.
	app_assist::WUiTimer::destroy(m_chooseIdler);
	m_chooseIdler = app_assist::WUiTimer::addIdler(
		[this, id](void*) {
			for (const Entry& entry : m_entries)
				if (entry.id == id) {
					onChosen(entry);
					break;
				}
			return false;
		},
		nullptr, this);
}

void CtPersonPickerView::__searchChangedCb(void* data, Evas_Object* obj, void*)
{
	auto* view = static_cast<CtPersonPickerView*>(data);
	char* text = elm_entry_markup_to_utf8(elm_entry_entry_get(obj));
	view->setSearchText(text);
	free(text);
}

void CtPersonPickerView::__personsChangedCb(const char*, void* data)
{
	WHIT();
	static_cast<CtPersonPickerView*>(data)->reload();
}
