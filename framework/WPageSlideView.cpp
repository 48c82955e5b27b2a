#include "WPageSlideView.h"

#include "ContactsDebug.h"
#include "WNaviframe.h"
#include "WUiTimer.h"

namespace app_assist {

WPageSlideView::WPageSlideView() = default;

WPageSlideView::~WPageSlideView()
{
	if (m_scroller) {
		evas_object_event_callback_del_full(m_scroller, EVAS_CALLBACK_RESIZE, __scrollerResizeCb, this);
		evas_object_event_callback_del_full(m_scroller, EVAS_CALLBACK_DEL, __scrollerDelCb, this);
		evas_object_event_callback_del_full(m_box, EVAS_CALLBACK_RESIZE, __boxResizeCb, this);
		evas_object_smart_callback_del_full(m_scroller, "scroll,drag,start", __dragStartCb, this);
	}
}

const char* WPageSlideView::getClassName()
{
	return "WPageSlideView";
}

Evas_Object* WPageSlideView::onCreate(Evas_Object* parent, void*)
{
	return createPageSlideContent(parent);
}

Evas_Object* WPageSlideView::createPageSlideContent(Evas_Object* parent)
{
	WPRET_VM(!parent, nullptr, "Invalid param : parent");
	WPRET_VM(m_scroller, m_scroller, "the page scroller exists already");
	m_scroller = elm_scroller_add(parent);
	elm_scroller_page_relative_set(m_scroller, 1.0, 0.0);
	elm_scroller_loop_set(m_scroller, EINA_FALSE, EINA_FALSE);
	elm_scroller_policy_set(m_scroller, ELM_SCROLLER_POLICY_OFF, ELM_SCROLLER_POLICY_OFF);
	evas_object_size_hint_weight_set(m_scroller, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_scroller, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_event_callback_add(m_scroller, EVAS_CALLBACK_RESIZE, __scrollerResizeCb, this);
	evas_object_event_callback_add(m_scroller, EVAS_CALLBACK_DEL, __scrollerDelCb, this);
	// Once the user moves the pages, a page asked for earlier is no longer kept.
	evas_object_smart_callback_add(m_scroller, "scroll,drag,start", __dragStartCb, this);

	m_box = elm_box_add(m_scroller);
	evas_object_event_callback_add(m_box, EVAS_CALLBACK_RESIZE, __boxResizeCb, this);
	elm_box_horizontal_set(m_box, EINA_TRUE);
	elm_box_homogeneous_set(m_box, EINA_TRUE);
	elm_object_content_set(m_scroller, m_box);
	evas_object_show(m_box);
	if (m_onInitScroller)
		m_onInitScroller(m_scroller);
	evas_object_show(m_scroller);
	return m_scroller;
}

int WPageSlideView::appendPage(const char* name)
{
	WPRET_VM(!m_box, -1, "appendPage() before the page scroller exists");
	// A table page: its invisible spacer gives it the scroller's size, which
	// containers would otherwise override with their own minimum.
	Evas_Object* page = elm_table_add(m_box);
	evas_object_size_hint_weight_set(page, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(page, EVAS_HINT_FILL, EVAS_HINT_FILL);
	Evas_Object* spacer = evas_object_rectangle_add(evas_object_evas_get(page));
	evas_object_color_set(spacer, 0, 0, 0, 0);
	elm_table_pack(page, spacer, 0, 0, 1, 1);
	elm_box_pack_end(m_box, page);
	evas_object_show(page);
	m_pages.push_back({ page, spacer, name ? name : "", {} });
	__resizePages();
	return static_cast<int>(m_pages.size()) - 1;
}

bool WPageSlideView::setPageContent(int index, WView* view)
{
	WPRET_VM(!view, false, "Invalid param : view");
	if (index < 0 || index >= getPageCount()) {
		WERROR("Invalid param : page index %d of %d", index, getPageCount());
		view->destroy();
		return false;
	}
	Page& page = m_pages[index];
	WPRET_VM(!page.view.expired(), false, "page %d already has content", index);
	if (!view->isCreated() && !view->create(page.obj, nullptr)) {
		view->destroy();
		return false;
	}
	view->m_window = getWindow();
	view->m_naviframe = getNaviframe() ? getNaviframe()->getWeakPtr() : std::weak_ptr<WControl>();
	view->m_pageOwner = getWeakPtr();
	if (!page.name.empty() && !*view->getName())
		view->setName(page.name.c_str());
	Evas_Object* content = view->getEvasObj();
	evas_object_size_hint_weight_set(content, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(content, EVAS_HINT_FILL, EVAS_HINT_FILL);
	elm_table_pack(page.obj, content, 0, 0, 1, 1);
	evas_object_show(content);
	view->onSetAsPageContent(page.obj);
	page.view = view->getWeakPtr();
	adoptControl(view);
	return true;
}

WView* WPageSlideView::getPageContent(int index) const
{
	if (index < 0 || index >= getPageCount())
		return nullptr;
	return static_cast<WView*>(m_pages[index].view.lock().get());
}

void WPageSlideView::showPage(int index, bool animate)
{
	WPRET_M(index < 0 || index >= getPageCount(), "Invalid param : page index %d of %d", index, getPageCount());
	m_requestedPage = index;
	__scrollToPage(index, animate);
	// Pages added just now are laid out on the next loop pass; show again then.
	WUiTimer::destroy(m_reshowIdler);
	m_reshowIdler = WUiTimer::addIdler([this, animate](void*) {
		if (m_requestedPage >= 0 && m_requestedPage < getPageCount())
			__scrollToPage(m_requestedPage, animate);
		return false;
	}, nullptr, this);
}

int WPageSlideView::getCurrentPage() const
{
	int h = 0, v = 0;
	if (m_scroller)
		elm_scroller_current_page_get(m_scroller, &h, &v);
	return h;
}

void WPageSlideView::setOnInitScroller(std::function<void(Evas_Object* scroller)> onInit)
{
	m_onInitScroller = std::move(onInit);
}

void WPageSlideView::__scrollerResizeCb(void* data, Evas*, Evas_Object*, void*)
{
	auto* self = static_cast<WPageSlideView*>(data);
	self->__resizePages();
	__boxResizeCb(data, nullptr, nullptr, nullptr);
}

void WPageSlideView::__scrollToPage(int index, bool animate)
{
	int w = 0, h = 0;
	evas_object_geometry_get(m_scroller, nullptr, nullptr, &w, &h);
	if (animate)
		elm_scroller_region_bring_in(m_scroller, index * w, 0, w, h);
	else
		elm_scroller_region_show(m_scroller, index * w, 0, w, h);
}

void WPageSlideView::__boxResizeCb(void* data, Evas*, Evas_Object*, void*)
{
	// Pages grew after a page was asked for: show it again at the new size.
	// The scroller learns the new content size in its own calculation, after
	// this callback: showing the page now would be clamped to the old size.
	auto* self = static_cast<WPageSlideView*>(data);
	if (self->m_requestedPage < 0)
		return;
	WUiTimer::destroy(self->m_reshowIdler);
	self->m_reshowIdler = WUiTimer::addIdler([self](void*) {
		if (self->m_requestedPage >= 0 && self->m_requestedPage < self->getPageCount())
			self->__scrollToPage(self->m_requestedPage, false);
		return false;
	}, nullptr, self);
}

void WPageSlideView::__dragStartCb(void* data, Evas_Object*, void*)
{
	static_cast<WPageSlideView*>(data)->m_requestedPage = -1;
}

void WPageSlideView::__scrollerDelCb(void* data, Evas*, Evas_Object*, void*)
{
	auto* self = static_cast<WPageSlideView*>(data);
	self->m_scroller = nullptr;
	self->m_box = nullptr;
	self->m_pages.clear();
}

void WPageSlideView::__resizePages()
{
	int w = 0, h = 0;
	evas_object_geometry_get(m_scroller, nullptr, nullptr, &w, &h);
	for (Page& page : m_pages)
		evas_object_size_hint_min_set(page.spacer, w, h);
}

} // namespace app_assist
