#include "WView.h"

#include "ContactsDebug.h"
#include "WNaviframe.h"

namespace app_assist {

namespace {

const char* const kInstanceKey = "__WView_instance";
const char* const kMoreButtonPart = "toolbar_more_btn";

} // namespace

WView::WView() = default;

WView::WView(const char* name)
{
	setName(name);
}

WView::~WView() = default;

bool WView::create(Evas_Object* parent, void* param)
{
	if (!WControl::create(parent, param))
		return false;
	evas_object_data_set(getEvasObj(), kInstanceKey, this);
	return true;
}

void WView::destroy()
{
	// Destroying inside onPop: let the pop finish, it deletes the item.
	if (m_inPop) {
		m_destroyAfterPop = true;
		return;
	}
	if (m_naviItem && !isDestroying()) {
		Elm_Object_Item* item = m_naviItem;
		m_naviItem = nullptr;
		std::weak_ptr<WControl> alive = getWeakPtr();
		elm_object_item_del(item);
		if (alive.expired() || isDestroying())
			return;
	}
	WControl::destroy();
}

const char* WView::getClassName()
{
	return "WView";
}

WNaviframe* WView::getNaviframe() const
{
	return static_cast<WNaviframe*>(m_naviframe.lock().get());
}

void WView::popOut()
{
	if (auto owner = m_pageOwner.lock()) {
		static_cast<WView*>(owner.get())->popOut();
		return;
	}
	WNaviframe* naviframe = getNaviframe();
	if (!m_naviItem || !naviframe) {
		WWARNING("%s is not in a naviframe; destroying it", getClassName());
		destroy();
		return;
	}
	if (m_inPop)
		return;
	if (elm_naviframe_top_item_get(naviframe->getEvasObj()) == m_naviItem)
		elm_naviframe_item_pop(naviframe->getEvasObj());
	else
		destroy();
}

bool WView::enableMoreButton(Elm_Object_Item* naviItem, Evas_Smart_Cb callback, void* data)
{
	WPRET_VM(!naviItem || !callback, false, "Invalid param : naviItem or callback is null");
	m_moreCallback = callback;
	m_moreData = data;
	if (elm_object_item_part_content_get(naviItem, kMoreButtonPart))
		return true;
	Evas_Object* button = elm_button_add(elm_object_item_widget_get(naviItem));
	elm_object_style_set(button, "naviframe/more/default");
	evas_object_smart_callback_add(button, "clicked", __moreButtonClickedCb, this);
	elm_object_item_part_content_set(naviItem, kMoreButtonPart, button);
	// Themes without the part leave the button out; the more key still works.
	if (elm_object_item_part_content_get(naviItem, kMoreButtonPart) != button)
		evas_object_del(button);
	return true;
}

void WView::setTitle(const char* title)
{
	m_title = title ? title : "";
	if (m_naviItem)
		elm_object_item_text_set(m_naviItem, m_title.c_str());
}

void WView::setName(const char* name)
{
	m_name = name ? name : "";
}

void WView::onSetContainerProperties(IWWindow*, WNaviframe*, Evas_Object*)
{
}

void WView::onPushToNaviframe(Evas_Object* naviframeObj)
{
	elm_naviframe_item_push(naviframeObj, m_title.empty() ? nullptr : m_title.c_str(), nullptr, nullptr,
		getEvasObj(), nullptr);
}

void WView::onPushed(Elm_Object_Item*)
{
}

bool WView::onPop()
{
	return true;
}

void WView::onBecomeTop()
{
}

void WView::onSetAsPageContent(Evas_Object*)
{
}

Evas_Object* WView::getPopupParent()
{
	if (m_window && m_window->getEvasObj())
		return m_window->getEvasObj();
	return getEvasObj();
}

void WView::__moreButtonClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<WView*>(data)->__runMoreCallback();
}

void WView::__runMoreCallback()
{
	if (!m_moreCallback) {
		WDEBUG("%s has no more menu", getClassName());
		return;
	}
	m_moreCallback(m_moreData, getEvasObj(), m_naviItem);
}

bool WView::__runOnPop()
{
	m_inPop = true;
	bool pop = onPop();
	m_inPop = false;
	if (m_destroyAfterPop) {
		m_destroyAfterPop = false;
		return true;
	}
	return pop;
}

} // namespace app_assist

app_assist::WView* WView_getInstanceFromEvasObj(Evas_Object* obj)
{
	if (!obj)
		return nullptr;
	return static_cast<app_assist::WView*>(evas_object_data_get(obj, app_assist::kInstanceKey));
}

Evas_Object* WView_getWindowEvasObj(app_assist::WView* view)
{
	WPRET_VM(!view, nullptr, "Invalid param : view");
	return view->getWindow() ? view->getWindow()->getEvasObj() : nullptr;
}

Evas_Object* WView_getWindowBaseLayoutEvasObj(app_assist::WView* view)
{
	WPRET_VM(!view, nullptr, "Invalid param : view");
	return view->getWindow() ? view->getWindow()->getBaseLayoutEvasObj() : nullptr;
}
