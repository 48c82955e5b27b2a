#include "WGengridItem.h"

#include "ContactsDebug.h"

namespace app_assist {

WGengridItem::WGengridItem() = default;

WGengridItem::~WGengridItem()
{
	if (m_item) {
		// Deleted by its owner while still in the grid: the item must not point here.
		elm_object_item_del_cb_set(m_item, nullptr);
		elm_object_item_data_set(m_item, nullptr);
	}
	if (m_ownedClass)
		elm_gengrid_item_class_free(m_ownedClass);
}

Elm_Gengrid_Item_Class* WGengridItem::getItemClassStatic()
{
	return nullptr;
}

Elm_Gengrid_Item_Class* WGengridItem::getItemClassNew()
{
	return nullptr;
}

void WGengridItem::onSelect(Elm_Object_Item*)
{
}

void WGengridItem::onSetElmObjectItem(Elm_Object_Item*)
{
}

Elm_Gengrid_Item_Class* WGengridItem::getItemClass()
{
	if (Elm_Gengrid_Item_Class* shared = getItemClassStatic())
		return shared;
	if (!m_ownedClass)
		m_ownedClass = getItemClassNew();
	return m_ownedClass;
}

void WGengridItem::setElmObjectItem(Elm_Object_Item* item)
{
	WPRET_M(!item, "Invalid param : item (append failed?)");
	m_item = item;
	const Elm_Gengrid_Item_Class* itc = elm_gengrid_item_item_class_get(item);
	if (!itc || !itc->func.del)
		elm_object_item_del_cb_set(item, __itemDelCb);
	onSetElmObjectItem(item);
}

void WGengridItem::attachToView(WControl* view)
{
	m_view = view ? view->getWeakPtr() : std::weak_ptr<WControl>();
}

void WGengridItem::deleteRowCb(void* data, Evas_Object*)
{
	auto* row = static_cast<WGengridItem*>(data);
	if (!row)
		return;
	row->m_item = nullptr;
	delete row;
}

void WGengridItem::__selectCb(void*, Evas_Object*, void* eventInfo)
{
	auto* item = static_cast<Elm_Object_Item*>(eventInfo);
	WPRET_M(!item, "event_info is NULL");
	auto* row = static_cast<WGengridItem*>(elm_object_item_data_get(item));
	WPRET_M(!row, "elm_object_item_data_get() is fail");
	if (!row->m_item)
		row->m_item = item;
	row->onSelect(item);
}

void WGengridItem::__itemDelCb(void* data, Evas_Object*, void*)
{
	deleteRowCb(data, nullptr);
}

} // namespace app_assist
