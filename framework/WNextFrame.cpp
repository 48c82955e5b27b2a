#include "WNextFrame.h"

#include "ContactsDebug.h"

#include <utility>

namespace app_assist {

WNextFrame::WNextFrame(Evas_Object* object, std::function<void()> callback)
	: m_callback(std::move(callback))
{
	Evas* canvas = object ? evas_object_evas_get(object) : nullptr;
	WPRET_M(!canvas || !m_callback, "Invalid param : object without a canvas, or no callback");
	m_object = object;
	m_canvas = canvas;
	evas_event_callback_add(m_canvas, EVAS_CALLBACK_RENDER_POST, __renderPostCb, this);
	evas_object_event_callback_add(m_object, EVAS_CALLBACK_DEL, __objectDelCb, this);
}

WNextFrame::~WNextFrame()
{
	__unregister();
}

void WNextFrame::__unregister()
{
	if (!m_canvas)
		return;
	evas_event_callback_del_full(m_canvas, EVAS_CALLBACK_RENDER_POST, __renderPostCb, this);
	evas_object_event_callback_del_full(m_object, EVAS_CALLBACK_DEL, __objectDelCb, this);
	m_canvas = nullptr;
	m_object = nullptr;
}

void WNextFrame::__renderPostCb(void* data, Evas*, void*)
{
	auto* self = static_cast<WNextFrame*>(data);
	// The callback may destroy the waiter: nothing of it is used afterwards.
	std::function<void()> callback = std::move(self->m_callback);
	self->__unregister();
	callback();
}

void WNextFrame::__objectDelCb(void* data, Evas*, Evas_Object*, void*)
{
	static_cast<WNextFrame*>(data)->__unregister();
}

} // namespace app_assist
