#include "WGenlistItem.h"

#include "ContactsDebug.h"

namespace app_assist {

WGenlistItem::WGenlistItem() = default;

WGenlistItem::~WGenlistItem()
{
	if (m_item) {
		// Deleted by its owner while still listed: the item must not point here.
		elm_object_item_del_cb_set(m_item, nullptr);
		elm_object_item_data_set(m_item, nullptr);
	}
	if (m_ownedClass)
		elm_genlist_item_class_free(m_ownedClass);
}

Elm_Genlist_Item_Class* WGenlistItem::getItemClassStatic()
{
	return nullptr;
}

Elm_Genlist_Item_Class* WGenlistItem::getItemClassNew()
{
	return nullptr;
}

void WGenlistItem::onSelect(Elm_Object_Item*)
{
}

void WGenlistItem::onSetElmObjectItem(Elm_Object_Item*)
{
}

Elm_Genlist_Item_Class* WGenlistItem::getItemClass()
{
	if (Elm_Genlist_Item_Class* shared = getItemClassStatic())
		return shared;
	if (!m_ownedClass)
		m_ownedClass = getItemClassNew();
	return m_ownedClass;
}

void WGenlistItem::setElmObjectItem(Elm_Object_Item* item)
{
	WPRET_M(!item, "Invalid param : item (append failed?)");
	m_item = item;
	const Elm_Genlist_Item_Class* itc = elm_genlist_item_item_class_get(item);
	if (!itc || !itc->func.del)
		elm_object_item_del_cb_set(item, __itemDelCb);
	onSetElmObjectItem(item);
}

void WGenlistItem::attachToView(WControl* view)
{
	m_view = view ? view->getWeakPtr() : std::weak_ptr<WControl>();
}

void WGenlistItem::deleteRowCb(void* data, Evas_Object*)
{
	auto* row = static_cast<WGenlistItem*>(data);
	if (!row)
		return;
	row->m_item = nullptr;
	delete row;
}

void WGenlistItem::__selectCb(void*, Evas_Object*, void* eventInfo)
{
	auto* item = static_cast<Elm_Object_Item*>(eventInfo);
	WPRET_M(!item, "event_info is NULL");
	auto* row = static_cast<WGenlistItem*>(elm_object_item_data_get(item));
	WPRET_M(!row, "elm_object_item_data_get() is fail");
	if (!row->m_item)
		row->m_item = item;
	row->onSelect(item);
}

void WGenlistItem::__itemDelCb(void* data, Evas_Object*, void*)
{
	deleteRowCb(data, nullptr);
}

} // namespace app_assist
