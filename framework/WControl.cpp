#include "WControl.h"

#include "ContactsDebug.h"
#include "WClippedSmartData.h"
#include "WUiTimer.h"

#include <algorithm>

namespace app_assist {

WControl::WControl()
	// Deletion waits for callers that hold a locked weak pointer right now,
	// so a control ended under them is still valid memory (in ended state).
	: m_self(this, [](WControl* control) {
		if (!control->m_inDestructor)
			delete control;
	})
{
}

// A derived constructor that threw unwinds through here with the self pointer
// still set; the failed new-expression frees the memory, so it must not.
WControl::~WControl()
{
	m_inDestructor = true;
}

bool WControl::create(Evas_Object* parent, void* param)
{
	WPRET_VM(m_created, false, "%s is already created", getClassName());
	WPRET_VM(!parent, false, "Invalid param : parent is null (%s)", getClassName());
	Evas_Object* obj = onCreate(parent, param);
	WPRET_VM(!obj, false, "onCreate() of %s returned no object", getClassName());
	m_evasObj = obj;
	m_created = true;
	evas_object_event_callback_add(obj, EVAS_CALLBACK_DEL, __evasObjDelCb, this);
	onCreated();
	return true;
}

void WControl::destroy()
{
	if (m_ending) {
		WWARNING("%s is already being destroyed", getClassName());
		return;
	}
	m_ending = true;
	if (m_evasObj)
		evas_object_del(m_evasObj); // __evasObjDelCb finishes the control
	else
		__finish();
}

Evas_Object* WControl::getEvasObj()
{
	return m_evasObj;
}

const char* WControl::getClassName()
{
	return "WControl";
}

void WControl::attachPopup(WControl* popup)
{
	WPRET_M(!popup, "Invalid param : popup");
	WPRET_M(m_ending, "%s is being destroyed; popup refused", getClassName());
	if (getPopup() != popup)
		destroyPopup();
	if (!popup->isCreated() && !popup->create(getPopupParent(), nullptr)) {
		popup->destroy();
		return;
	}
	m_popup = popup->getWeakPtr();
}

void WControl::destroyPopup()
{
	if (auto popup = m_popup.lock())
		popup->destroy();
	m_popup.reset();
}

WControl* WControl::getPopup() const
{
	return m_popup.lock().get();
}

Evas_Object* WControl::onCreate(Evas_Object*, void*)
{
	WERROR("%s does not build an object", getClassName());
	return nullptr;
}

void WControl::onCreated()
{
}

void WControl::onDestroy()
{
}

Evas_Object* WControl::getPopupParent()
{
	return m_evasObj;
}

void WControl::__evasObjDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	WClippedSmartData::reclaimOnDelete(obj);
	auto* self = static_cast<WControl*>(data);
	self->m_ending = true;
	self->__finish();
}

void WControl::__finish()
{
	std::vector<std::shared_ptr<WUiTimer>> timers = std::move(m_timers);
	m_timers.clear();
	for (auto& timer : timers)
		timer->__cancel();
	__destroyChildren();
	destroyPopup();
	if (m_created)
		onDestroy();
	m_evasObj = nullptr;
	std::shared_ptr<WControl> self = std::move(m_self);
	self.reset(); // usually deletes this

}

void WControl::adoptControl(WControl* child)
{
	WPRET_M(!child || child == this, "Invalid param : child");
	m_children.push_back(child->getWeakPtr());
}

void WControl::__destroyChildren()
{
	std::vector<std::weak_ptr<WControl>> children = std::move(m_children);
	m_children.clear();
	for (auto it = children.rbegin(); it != children.rend(); ++it) {
		if (auto child = it->lock())
			child->destroy();
	}
}

void WControl::__addTimer(const std::shared_ptr<WUiTimer>& timer)
{
	m_timers.push_back(timer);
}

void WControl::__removeTimer(const WUiTimer* timer)
{
	m_timers.erase(std::remove_if(m_timers.begin(), m_timers.end(),
		[timer](const std::shared_ptr<WUiTimer>& t) { return t.get() == timer; }), m_timers.end());
}

} // namespace app_assist
