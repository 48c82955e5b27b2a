#include "WGenItem.h"

#include "ContactsDebug.h"

namespace app_assist {

WGenItem::WGenItem(Widget widget)
	: m_widget(widget)
{
}

WGenItem::~WGenItem()
{
	if (m_item) {
		// Deleted by its owner while still shown: the item must not point here.
		elm_object_item_del_cb_set(m_item, nullptr);
		elm_object_item_data_set(m_item, nullptr);
	}
	if (m_ownedClass && m_widget == Widget::Genlist)
		elm_genlist_item_class_free(m_ownedClass);
	else if (m_ownedClass)
		elm_gengrid_item_class_free(m_ownedClass);
}

Elm_Gen_Item_Class* WGenItem::getItemClassStatic()
{
	return nullptr;
}

Elm_Gen_Item_Class* WGenItem::getItemClassNew()
{
	return nullptr;
}

void WGenItem::onSelect(Elm_Object_Item*)
{
}

void WGenItem::onSetElmObjectItem(Elm_Object_Item*)
{
}

Elm_Gen_Item_Class* WGenItem::getItemClass()
{
	if (Elm_Gen_Item_Class* shared = getItemClassStatic())
		return shared;
	if (!m_ownedClass)
		m_ownedClass = getItemClassNew();
	return m_ownedClass;
}

void WGenItem::setElmObjectItem(Elm_Object_Item* item)
{
	WPRET_M(!item, "Invalid param : item (append failed?)");
	m_item = item;
	const Elm_Gen_Item_Class* itc = m_widget == Widget::Genlist ? elm_genlist_item_item_class_get(item)
		: elm_gengrid_item_item_class_get(item);
	if (!itc || !itc->func.del)
		elm_object_item_del_cb_set(item, __itemDelCb);
	onSetElmObjectItem(item);
}

void WGenItem::attachToView(WControl* view)
{
	m_view = view ? view->getWeakPtr() : std::weak_ptr<WControl>();
}

void WGenItem::deleteRowCb(void* data, Evas_Object*)
{
	auto* row = static_cast<WGenItem*>(data);
	if (!row)
		return;
	row->m_item = nullptr;
	delete row;
}

void WGenItem::__selectCb(void*, Evas_Object*, void* eventInfo)
{
	auto* item = static_cast<Elm_Object_Item*>(eventInfo);
	WPRET_M(!item, "event_info is NULL");
	auto* row = static_cast<WGenItem*>(elm_object_item_data_get(item));
	WPRET_M(!row, "elm_object_item_data_get() is fail");
	if (!row->m_item)
		row->m_item = item;
	row->onSelect(item);
}

void WGenItem::__itemDelCb(void* data, Evas_Object*, void*)
{
	deleteRowCb(data, nullptr);
}

} // namespace app_assist
