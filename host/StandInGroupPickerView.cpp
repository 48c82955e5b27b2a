#include "StandInGroupPickerView.h"

#include "ContactsDebug.h"
#include "CtGroupGroupInfo.h"

#include <contacts.h>
#include <glib.h>

#include <algorithm>
#include <cstdint>
#include <cstring>

namespace ct::demo {

namespace {

struct Group {
	int id = 0;
	std::string name;
	std::string book;
};

std::string textOf(contacts_record_h record, unsigned int property)
{
	char* text = nullptr;
	contacts_record_get_str_p(record, property, &text);
	return text ? text : "";
}

std::string addressbookName(int addressbookId)
{
	contacts_record_h book = nullptr;
	if (contacts_db_get_record(_contacts_address_book._uri, addressbookId, &book) != CONTACTS_ERROR_NONE)
		return "";
	std::string name = textOf(book, _contacts_address_book.name);
	contacts_record_destroy(book, true);
	return name;
}

// Every group of the store by shown name; the phone's own book unnamed.
std::vector<Group> loadGroups()
{
	std::vector<Group> groups;
	contacts_list_h list = nullptr;
	int err = contacts_db_get_all_records(_contacts_group._uri, 0, 0, &list);
	WPRET_VM(err != CONTACTS_ERROR_NONE, groups, "contacts_db_get_all_records() Failed(%d)", err);
	contacts_record_h record = nullptr;
	while (contacts_list_get_current_record_p(list, &record) == CONTACTS_ERROR_NONE && record) {
		Group group;
		int book = 0;
		contacts_record_get_int(record, _contacts_group.id, &group.id);
		contacts_record_get_int(record, _contacts_group.address_book_id, &book);
		std::string name = textOf(record, _contacts_group.name), systemId = textOf(record, _contacts_group.system_id);
		group.name = CtGroupGroupInfo::getDisplayName(name.c_str(), systemId.c_str());
		group.book = book == 0 ? "" : addressbookName(book);
		groups.push_back(group);
		if (contacts_list_next(list) != CONTACTS_ERROR_NONE)
			break;
	}
	contacts_list_destroy(list, true);
	std::stable_sort(groups.begin(), groups.end(), [](const Group& a, const Group& b) { return a.name < b.name; });
	return groups;
}

} // namespace

StandInGroupPickerView::StandInGroupPickerView(app_control_h request, ct::appcontrol::Reply reply)
	: StandInView(request, std::move(reply), "Groups", "Check the groups of this contact, then Done.")
{
}

std::string StandInGroupPickerView::encodeIds(const std::vector<int>& ids)
{
	std::vector<int32_t> raw(ids.begin(), ids.end());
	gchar* text = g_base64_encode(reinterpret_cast<const guchar*>(raw.data()), raw.size() * sizeof(int32_t));
	std::string out = text ? text : "";
	g_free(text);
	return out;
}

std::vector<int> StandInGroupPickerView::decodeIds(const std::string& base64)
{
	std::vector<int> ids;
	if (base64.empty() || base64.size() % 4 != 0)
		return ids;
	gsize length = 0;
	guchar* raw = g_base64_decode(base64.c_str(), &length);
	for (gsize i = 0; raw && i + sizeof(int32_t) <= length; i += sizeof(int32_t)) {
		int32_t id = 0;
		memcpy(&id, raw + i, sizeof(id));
		ids.push_back(id);
	}
	g_free(raw);
	return ids;
}

Evas_Object* StandInGroupPickerView::createContent(Evas_Object* parent)
{
	std::string selectedText = getExtra("selected_group_id_list");
	std::vector<int> selected = decodeIds(selectedText);
	if (selected.empty() && !selectedText.empty())
		WERROR("selected_group_id_list is not a list of ids: %s", selectedText.c_str());
	std::vector<Group> groups = loadGroups();
	if (groups.empty())
		setCaption("There are no groups in the contacts store.");
	Evas_Object* list = createList(parent);
	for (const Group& group : groups) {
		auto* row = appendRow(new StandInListItem(group.name, group.book, "", nullptr));
		row->setTag(group.id);
		row->setMark(StandInListItem::Mark::Check,
				std::find(selected.begin(), selected.end(), group.id) != selected.end());
		m_rows.push_back(row);
	}
	addButton("Cancel", __cancelClickedCb);
	addButton("Done", __doneClickedCb, true);
	return list;
}

void StandInGroupPickerView::__doneClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<StandInGroupPickerView*>(data);
	std::vector<int> chosen;
	for (StandInListItem* row : self->m_rows)
		if (row->isMarked())
			chosen.push_back(row->getTag());
	if (chosen.empty())
		self->answer(nullptr);
	else
		self->answerText("group_id_list", encodeIds(chosen));
}

void StandInGroupPickerView::__cancelClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<StandInGroupPickerView*>(data)->popOut();
}

} // namespace ct::demo
