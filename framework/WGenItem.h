// A genlist or gengrid row object: the item's data. It is deleted with its
// item (by the item class's del function when it has one, else by the
// framework). Append with the row as item data and getSelectCb() as
// selection callback, then hand the new item to setElmObjectItem().
#pragma once

#include "WControl.h"

#include <Elementary.h>

#include <memory>

namespace app_assist {

class WGenItem {
public:
	virtual ~WGenItem();

	// The row class's shared item class; null makes getItemClass() ask for a new one.
	virtual Elm_Gen_Item_Class* getItemClassStatic();
	// A new item class, freed by the framework with the row.
	virtual Elm_Gen_Item_Class* getItemClassNew();
	virtual void onSelect(Elm_Object_Item* item);
	virtual void onSetElmObjectItem(Elm_Object_Item* item);

	// The class to append with: the static one, else a new one owned by the row.
	Elm_Gen_Item_Class* getItemClass();
	Elm_Object_Item* getElmObjectItem() const { return m_item; }
	void setElmObjectItem(Elm_Object_Item* item);
	Evas_Smart_Cb getSelectCb() const { return __selectCb; }
	// The control (usually a view) this row works for; null once it died.
	void attachToView(WControl* view);
	WControl* getAttachedView() const { return m_view.lock().get(); }

	// Item-class del function that deletes the row; for row classes that
	// set one themselves.
	static void deleteRowCb(void* data, Evas_Object* obj);

protected:
	enum class Widget { Genlist, Gengrid };
	explicit WGenItem(Widget widget);

private:
	static void __selectCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __itemDelCb(void* data, Evas_Object* obj, void* eventInfo);

	Widget m_widget;
	Elm_Object_Item* m_item = nullptr;
	Elm_Gen_Item_Class* m_ownedClass = nullptr;
	std::weak_ptr<WControl> m_view;

	WGenItem(const WGenItem&) = delete;
	WGenItem& operator=(const WGenItem&) = delete;
};

} // namespace app_assist
