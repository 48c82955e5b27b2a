#include "CtPersonPickerItem.h"

#include "ContactsCommon.h"

#include <cstring>
#include <string>

namespace {

// Plain text as genlist markup: only the markup's own characters escaped.
char* toMarkup(const char* text)
{
	std::string out;
	for (const char* p = text; *p; ++p) {
		switch (*p) {
		case '<': out += "&lt;"; break;
		case '>': out += "&gt;"; break;
		case '&': out += "&amp;"; break;
		default: out += *p;
		}
	}
	return strdup(out.c_str());
}

} // namespace

CtPersonPickerItem::CtPersonPickerItem(int id, std::string name, std::string subText, Chooser chooser)
	: m_id(id)
	, m_name(std::move(name))
	, m_subText(std::move(subText))
	, m_chooser(std::move(chooser))
{
}

Elm_Genlist_Item_Class* CtPersonPickerItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class oneLine = [] {
		Elm_Genlist_Item_Class itc = {};
		itc.version = ELM_GENLIST_ITEM_CLASS_VERSION;
		itc.item_style = "default";
		itc.func.text_get = __getTextCb;
		return itc;
	}();
	static Elm_Genlist_Item_Class twoLine = [] {
		Elm_Genlist_Item_Class itc = {};
		itc.version = ELM_GENLIST_ITEM_CLASS_VERSION;
		itc.item_style = "double_label";
		itc.func.text_get = __getTextCb;
		return itc;
	}();
	return m_subText.empty() ? &oneLine : &twoLine;
}

void CtPersonPickerItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	if (m_chooser)
		m_chooser(m_id);
}

char* CtPersonPickerItem::__getTextCb(void* data, Evas_Object*, const char* part)
{
	auto* row = static_cast<CtPersonPickerItem*>(data);
	// The names come from the store as plain text; the genlist shows markup.
	if (!strcmp(part, "elm.text"))
		return toMarkup(row->m_name.empty() ? ContactsCommon::translate("IDS_LOGS_MBODY_UNKNOWN") : row->m_name.c_str());
	if (!strcmp(part, "elm.text.sub") && !row->m_subText.empty())
		return toMarkup(row->m_subText.c_str());
	return nullptr;
}
