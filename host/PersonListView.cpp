#include "PersonListView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"

#include <contacts.h>
#include <ui_extension.h>

namespace ct::demo {

namespace {

std::string textOf(contacts_record_h record, unsigned int property)
{
	char* text = nullptr;
	contacts_record_get_str_p(record, property, &text);
	return text ? text : "";
}

PersonSummary summaryOf(contacts_record_h person)
{
	PersonSummary summary;
	contacts_record_get_int(person, _contacts_person.id, &summary.id);
	summary.name = textOf(person, _contacts_person.display_name);
	summary.picturePath = textOf(person, _contacts_person.image_thumbnail_path);
	contacts_record_get_bool(person, _contacts_person.is_favorite, &summary.favourite);
	return summary;
}

// Every person sorted by display name; empty (logged) when the store fails.
std::vector<PersonSummary> loadPersons()
{
	std::vector<PersonSummary> persons;
	contacts_query_h query = nullptr;
	int err = contacts_query_create(_contacts_person._uri, &query);
	WPRET_VM(err != CONTACTS_ERROR_NONE, persons, "contacts_query_create() Failed(%d)", err);
	contacts_query_set_sort(query, _contacts_person.display_name, true);
	contacts_list_h list = nullptr;
	err = contacts_db_get_records_with_query(query, 0, 0, &list);
	contacts_query_destroy(query);
	WPRET_VM(err != CONTACTS_ERROR_NONE, persons, "contacts_db_get_records_with_query() Failed(%d)", err);
	int count = 0;
	contacts_list_get_count(list, &count);
	contacts_list_first(list);
	for (int i = 0; i < count; ++i, contacts_list_next(list)) {
		contacts_record_h person = nullptr;
		if (contacts_list_get_current_record_p(list, &person) == CONTACTS_ERROR_NONE)
			persons.push_back(summaryOf(person));
	}
	contacts_list_destroy(list, true);
	return persons;
}

} // namespace

PersonListView::PersonListView(PersonListItem::SelectHandler onSelect, std::function<void()> onCreate,
		PersonListItem::SelectHandler onEdit)
	: m_onSelect(std::move(onSelect)), m_onCreate(std::move(onCreate)), m_onEdit(std::move(onEdit))
{
	setTitle("Contacts");
}

PersonListView::~PersonListView()
{
	__unsubscribe();
}

Evas_Object* PersonListView::onCreate(Evas_Object* parent, void*)
{
	m_genlist = elm_genlist_add(parent);
	elm_genlist_mode_set(m_genlist, ELM_LIST_COMPRESS);
	elm_genlist_homogeneous_set(m_genlist, EINA_TRUE);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	if (m_onEdit)
		evas_object_smart_callback_add(m_genlist, "longpressed", __longpressedCb, this);
	__reload();
	int err = contacts_db_add_changed_cb(_contacts_person._uri, __onPersonsChangedCb, this);
	if (err == CONTACTS_ERROR_NONE)
		m_subscribed = true;
	else
		WFAILED("contacts_db_add_changed_cb", err);
	return m_genlist;
}

void PersonListView::onPushed(Elm_Object_Item* naviItem)
{
	elm_object_item_part_text_set(naviItem, "elm.text.title", getTitle());
	if (!m_onCreate)
		return;
	Evas_Object* create = uxt_button_add(elm_object_parent_widget_get(m_genlist), "naviframe/title_right");
	elm_object_text_set(create, ContactsCommon::translate("IDS_PB_BUTTON_CREATE_ABB2"));
	evas_object_smart_callback_add(create, "clicked", __createClickedCb, this);
	elm_object_item_part_content_set(naviItem, "title_right_btn", create);
}

void PersonListView::__createClickedCb(void* data, Evas_Object*, void*)
{
	auto* view = static_cast<PersonListView*>(data);
	if (view->m_onCreate)
		view->m_onCreate();
}

void PersonListView::__longpressedCb(void* data, Evas_Object*, void* eventInfo)
{
	auto* view = static_cast<PersonListView*>(data);
	auto* row = dynamic_cast<PersonListItem*>(
		static_cast<app_assist::WGenlistItem*>(elm_object_item_data_get(static_cast<Elm_Object_Item*>(eventInfo))));
	if (row && view->m_onEdit)
		view->m_onEdit(row->person().id);
}

void PersonListView::onDestroy()
{
	__unsubscribe();
	m_genlist = nullptr;
}

void PersonListView::__unsubscribe()
{
	if (m_subscribed)
		contacts_db_remove_changed_cb(_contacts_person._uri, __onPersonsChangedCb, this);
	m_subscribed = false;
}

void PersonListView::__onPersonsChangedCb(const char*, void* data)
{
	WHIT();
	static_cast<PersonListView*>(data)->__reload();
}

void PersonListView::__reload()
{
	if (!m_genlist)
		return;
	elm_genlist_clear(m_genlist);
	m_persons = loadPersons();
	for (const PersonSummary& person : m_persons) {
		auto* row = new PersonListItem(person, m_onSelect);
		row->attachToView(this);
		row->setElmObjectItem(elm_genlist_item_append(m_genlist, row->getItemClass(), row, nullptr,
				ELM_GENLIST_ITEM_NONE, row->getSelectCb(), row));
	}
}

} // namespace ct::demo
