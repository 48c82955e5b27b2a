#include "WUiTimer.h"

#include "ContactsDebug.h"
#include "WControl.h"

#include <algorithm>
#include <vector>

namespace app_assist {

namespace {

const char* const kOwnedTimersKey = "__WUiTimer_owned";
using TimerList = std::vector<std::shared_ptr<WUiTimer>>;

} // namespace

WUiTimerHandle WUiTimer::addIdler(Callback callback, void* data, WControl* owner)
{
	return __add(Kind::Idler, 0.0, std::move(callback), data, owner, nullptr);
}

WUiTimerHandle WUiTimer::addTimer(double seconds, Callback callback, void* data, WControl* owner)
{
	return __add(Kind::Timer, seconds, std::move(callback), data, owner, nullptr);
}

WUiTimerHandle WUiTimer::addAnimator(Callback callback, void* data, WControl* owner)
{
	return __add(Kind::Animator, 0.0, std::move(callback), data, owner, nullptr);
}

WUiTimerHandle WUiTimer::addIdler(Callback callback, void* data, Evas_Object* owner)
{
	return __add(Kind::Idler, 0.0, std::move(callback), data, nullptr, owner);
}

WUiTimerHandle WUiTimer::addTimer(double seconds, Callback callback, void* data, Evas_Object* owner)
{
	return __add(Kind::Timer, seconds, std::move(callback), data, nullptr, owner);
}

WUiTimerHandle WUiTimer::addAnimator(Callback callback, void* data, Evas_Object* owner)
{
	return __add(Kind::Animator, 0.0, std::move(callback), data, nullptr, owner);
}

void WUiTimer::destroy(const WUiTimerHandle& handle)
{
	if (auto timer = handle.lock())
		timer->__cancel();
}

WUiTimer::WUiTimer(Kind kind, Callback callback, void* data)
	: m_kind(kind)
	, m_callback(std::move(callback))
	, m_data(data)
{
}

WUiTimer::~WUiTimer()
{
	__deleteEcoreHandle();
}

WUiTimerHandle WUiTimer::__add(Kind kind, double seconds, Callback callback, void* data, WControl* control,
	Evas_Object* object)
{
	WPRET_VM(!callback, WUiTimerHandle(), "Invalid param : callback is null");
	WPRET_VM(!control && !object, WUiTimerHandle(), "Invalid param : owner is null");
	auto timer = std::make_shared<WUiTimer>(kind, std::move(callback), data);
	if (!timer->__start(seconds)) {
		WFAILED(kind == Kind::Timer ? "ecore_timer_add" : kind == Kind::Idler ? "ecore_idler_add" : "ecore_animator_add",
			-1);
		return WUiTimerHandle();
	}
	if (control) {
		timer->m_ownerControl = control;
		control->__addTimer(timer);
	} else {
		timer->m_ownerObj = object;
		auto* list = static_cast<TimerList*>(evas_object_data_get(object, kOwnedTimersKey));
		if (!list) {
			list = new TimerList();
			evas_object_data_set(object, kOwnedTimersKey, list);
			evas_object_event_callback_add(object, EVAS_CALLBACK_DEL, __ownerObjDelCb, nullptr);
		}
		list->push_back(timer);
	}
	return timer;
}

bool WUiTimer::__start(double seconds)
{
	switch (m_kind) {
	case Kind::Idler:
		m_ecoreHandle = ecore_idler_add(__tickCb, this);
		break;
	case Kind::Timer:
		m_ecoreHandle = ecore_timer_add(seconds, __tickCb, this);
		break;
	case Kind::Animator:
		m_ecoreHandle = ecore_animator_add(__tickCb, this);
		break;
	}
	return m_ecoreHandle != nullptr;
}

Eina_Bool WUiTimer::__tickCb(void* data)
{
	return static_cast<WUiTimer*>(data)->__fire() ? ECORE_CALLBACK_RENEW : ECORE_CALLBACK_CANCEL;
}

bool WUiTimer::__fire()
{
	// The callback may destroy the owner, and with it the last reference.
	std::shared_ptr<WUiTimer> self = shared_from_this();
	m_firing = true;
	bool again = m_callback(m_data);
	m_firing = false;
	if (again && !m_cancelled)
		return true;
	// Returning "cancel" makes the main loop delete the ecore object.
	m_ecoreHandle = nullptr;
	if (!m_cancelled) {
		m_cancelled = true;
		__detachFromOwner();
	}
	return false;
}

void WUiTimer::__cancel()
{
	if (m_cancelled)
		return;
	m_cancelled = true;
	if (!m_firing)
		__deleteEcoreHandle();
	__detachFromOwner();
}

void WUiTimer::__detachFromOwner()
{
	WControl* control = m_ownerControl;
	Evas_Object* object = m_ownerObj;
	m_ownerControl = nullptr;
	m_ownerObj = nullptr;
	if (control) {
		control->__removeTimer(this);
	} else if (object) {
		auto* list = static_cast<TimerList*>(evas_object_data_get(object, kOwnedTimersKey));
		if (list) {
			auto keep = shared_from_this();
			list->erase(std::remove(list->begin(), list->end(), keep), list->end());
		}
	}
}

void WUiTimer::__deleteEcoreHandle()
{
	if (!m_ecoreHandle)
		return;
	switch (m_kind) {
	case Kind::Idler:
		ecore_idler_del(static_cast<Ecore_Idler*>(m_ecoreHandle));
		break;
	case Kind::Timer:
		ecore_timer_del(static_cast<Ecore_Timer*>(m_ecoreHandle));
		break;
	case Kind::Animator:
		ecore_animator_del(static_cast<Ecore_Animator*>(m_ecoreHandle));
		break;
	}
	m_ecoreHandle = nullptr;
}

void WUiTimer::__ownerObjDelCb(void*, Evas*, Evas_Object* obj, void*)
{
	auto* list = static_cast<TimerList*>(evas_object_data_del(obj, kOwnedTimersKey));
	if (!list)
		return;
	TimerList timers = std::move(*list);
	delete list;
	for (auto& timer : timers)
		timer->__cancel();
}

} // namespace app_assist
