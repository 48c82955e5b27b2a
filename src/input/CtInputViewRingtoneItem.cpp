#include "CtInputViewRingtoneItem.h"

#include "ContactsDebug.h"
#include "CtCommonTextUtil.h"
#include "CtCommonWidgetUtil.h"

#include <cstring>

namespace {

const int kFileNameBytes = 1024;

} // namespace

CtInputViewRingtoneItem::CtInputViewRingtoneItem(std::shared_ptr<CtData> data, CtInputViewItemCallbacks callbacks,
		std::function<void()> selected)
	: CtInputViewGenlistItem(data ? data->getRingtone() : nullptr), m_data(std::move(data)),
	  m_callbacks(std::move(callbacks)), m_selected(std::move(selected))
{
	updateChangedState(m_data->getRingtone());
}

Elm_Genlist_Item_Class* CtInputViewRingtoneItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("2line.bottom");
	return itc;
}

std::string CtInputViewRingtoneItem::getRingtoneName()
{
	const char* path = m_data->getRingtone();
	if (!path || !*path)
		return translate("IDS_PB_BODY_DEFAULT");
	char name[kFileNameBytes] = {};
	ctCommonGetDisplayfileName(path, name, sizeof(name));
	return name;
}

std::string CtInputViewRingtoneItem::getText(Evas_Object*, const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0)
		return translate("IDS_PB_OPT_RINGTONE");
	if (strcmp(part, "elm.text.main.left.bottom") == 0)
		return ctCommonUtf8ToMarkup(getRingtoneName().c_str());
	return std::string();
}

Evas_Object* CtInputViewRingtoneItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.1") == 0)
		return ctCommonCreateLayout(genlist, "contacts/detail_layout.edj", "list/C/ringtone/icon");
	if (strcmp(part, "elm.icon.2") == 0)
		return ctCommonCreateDeleteImage(genlist, __deleteClickedCb, this);
	return nullptr;
}

void CtInputViewRingtoneItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	if (m_selected)
		m_selected();
}

void CtInputViewRingtoneItem::deleteRow()
{
	Elm_Object_Item* item = getElmObjectItem();
	WPRET_M(!item, "item is NULL");
	m_data->setRingtone(nullptr);
	updateChangedState(nullptr);
	if (m_callbacks.deleted)
		m_callbacks.deleted(item, getIsChanged(), nullptr);
	elm_object_item_del(item); // deletes this row
}

void CtInputViewRingtoneItem::__deleteClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<CtInputViewRingtoneItem*>(data)->deleteRow();
}
