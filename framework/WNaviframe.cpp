#include "WNaviframe.h"

#include "ContactsDebug.h"
#include "WClippedSmartData.h"
#include "efl_extension.h"

namespace app_assist {

namespace {

// Item data: the view, weakly, since the item outlives its content while
// it is being deleted.
struct ItemLink {
	std::weak_ptr<WControl> view;
};

WView* viewOf(Elm_Object_Item* item)
{
	auto* link = item ? static_cast<ItemLink*>(elm_object_item_data_get(item)) : nullptr;
	return link ? static_cast<WView*>(link->view.lock().get()) : nullptr;
}

// The naviframe's page that holds `content` with the title's buttons, or
// null when `content` is not on a page of `naviframe`.
Evas_Object* pageOf(Evas_Object* content, Evas_Object* naviframe)
{
	for (Evas_Object* obj = content; obj; obj = evas_object_smart_parent_get(obj)) {
		if (evas_object_smart_parent_get(obj) == naviframe)
			return obj;
	}
	return nullptr;
}

} // namespace

WNaviframe::WNaviframe(IWWindow* window)
	: m_ownWindow(window)
{
}

WNaviframe::~WNaviframe() = default;

const char* WNaviframe::getClassName()
{
	return "WNaviframe";
}

Evas_Object* WNaviframe::onCreate(Evas_Object* parent, void*)
{
	Evas_Object* naviframe = elm_naviframe_add(parent);
	WPRET_VM(!naviframe, nullptr, "elm_naviframe_add() failed");
	evas_object_size_hint_weight_set(naviframe, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(naviframe, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_naviframe_prev_btn_auto_pushed_set(naviframe, EINA_TRUE);
	eext_object_event_callback_add(naviframe, EEXT_CALLBACK_BACK, __backCb, this);
	eext_object_event_callback_add(naviframe, EEXT_CALLBACK_MORE, __moreCb, this);
	evas_object_smart_callback_add(naviframe, "transition,finished", __transitionFinishedCb, this);
	evas_object_show(naviframe);
	m_window = m_ownWindow;
	return naviframe;
}

void WNaviframe::onDestroy()
{
	// Views may still use the naviframe in their onDestroy: end them first.
	Evas_Object* naviframe = getEvasObj();
	while (Elm_Object_Item* top = elm_naviframe_top_item_get(naviframe)) {
		WView* view = viewOf(top);
		if (view)
			view->destroy();
		else
			elm_object_item_del(top);
		if (elm_naviframe_top_item_get(naviframe) == top)
			elm_object_item_del(top);
	}
}

bool WNaviframe::push(WView* view, const char* name, void* param)
{
	WPRET_VM(!view, false, "Invalid param : view");
	WPRET_VM(!getEvasObj(), false, "naviframe is not created; %s not pushed", view->getClassName());
	WPRET_VM(view->isCreated(), false, "%s is already created; not pushed", view->getClassName());
	if (name)
		view->setName(name);
	Evas_Object* naviframe = getEvasObj();
	if (!view->create(naviframe, param)) {
		view->destroy();
		return false;
	}
	view->m_window = m_window;
	view->m_naviframe = getWeakPtr();
	view->onSetContainerProperties(m_window, this, naviframe);
	view->onPushToNaviframe(naviframe);
	Elm_Object_Item* item = __findItemOf(view);
	if (!item) {
		WERROR("%s did not push its object", view->getClassName());
		view->destroy();
		return false;
	}
	__adopt(view, item);
	WClippedSmartData::reclaimWhenDeleted(pageOf(view->getEvasObj(), naviframe));
	std::weak_ptr<WControl> alive = view->getWeakPtr();
	view->onPushed(item);
	if (!alive.expired() && elm_naviframe_bottom_item_get(naviframe) == item)
		view->onBecomeTop();
	return true;
}

bool WNaviframe::pop()
{
	Evas_Object* naviframe = getEvasObj();
	WPRET_VM(!naviframe || !elm_naviframe_top_item_get(naviframe), false, "naviframe is empty; nothing to pop");
	Elm_Object_Item* top = elm_naviframe_top_item_get(naviframe);
	elm_naviframe_item_pop(naviframe);
	return elm_naviframe_top_item_get(naviframe) != top;
}

WView* WNaviframe::getTopView() const
{
	Evas_Object* naviframe = const_cast<WNaviframe*>(this)->getEvasObj();
	return naviframe ? viewOf(elm_naviframe_top_item_get(naviframe)) : nullptr;
}

int WNaviframe::getViewCount() const
{
	Evas_Object* naviframe = const_cast<WNaviframe*>(this)->getEvasObj();
	if (!naviframe)
		return 0;
	Eina_List* items = elm_naviframe_items_get(naviframe);
	int count = static_cast<int>(eina_list_count(items));
	eina_list_free(items);
	return count;
}

void WNaviframe::setOnLastViewBack(std::function<void(bool* popOut)> handler)
{
	m_onLastViewBack = std::move(handler);
}

Elm_Object_Item* WNaviframe::__findItemOf(WView* view) const
{
	Evas_Object* naviframe = const_cast<WNaviframe*>(this)->getEvasObj();
	Elm_Object_Item* top = elm_naviframe_top_item_get(naviframe);
	return top && elm_object_item_content_get(top) == view->getEvasObj() ? top : nullptr;
}

void WNaviframe::__adopt(WView* view, Elm_Object_Item* item)
{
	view->m_naviItem = item;
	elm_object_item_data_set(item, new ItemLink { view->getWeakPtr() });
	elm_object_item_del_cb_set(item, __itemDelCb);
	elm_naviframe_item_pop_cb_set(item, __popCb, nullptr);
}

Eina_Bool WNaviframe::__popCb(void*, Elm_Object_Item* item)
{
	WView* view = viewOf(item);
	return !view || view->__runOnPop() ? EINA_TRUE : EINA_FALSE;
}

void WNaviframe::__itemDelCb(void* data, Evas_Object*, void*)
{
	auto* link = static_cast<ItemLink*>(data);
	if (!link)
		return;
	if (auto view = link->view.lock())
		static_cast<WView*>(view.get())->m_naviItem = nullptr;
	delete link;
}

void WNaviframe::__backCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<WNaviframe*>(data)->__onBack();
}

void WNaviframe::__onBack()
{
	int count = getViewCount();
	if (count == 0) {
		WWARNING("back on an empty naviframe");
		return;
	}
	if (count == 1 && m_onLastViewBack) {
		bool popOut = false;
		std::weak_ptr<WControl> alive = getWeakPtr();
		m_onLastViewBack(&popOut);
		if (!popOut || alive.expired())
			return;
	}
	pop();
}

void WNaviframe::__moreCb(void* data, Evas_Object*, void*)
{
	WHIT();
	WView* top = static_cast<WNaviframe*>(data)->getTopView();
	if (top)
		top->__runMoreCallback();
}

void WNaviframe::__transitionFinishedCb(void* data, Evas_Object*, void* eventInfo)
{
	auto* self = static_cast<WNaviframe*>(data);
	WView* top = self->getTopView();
	if (top && top->getNaviItem() == static_cast<Elm_Object_Item*>(eventInfo))
		top->onBecomeTop();
}

} // namespace app_assist
