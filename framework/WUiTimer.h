// Idlers, timers and animators owned by a control (or by an Evas object):
// they are cancelled when the owner dies, and callers hold them only through
// weak handles. The callback returns true to run again.
#pragma once

#include <Ecore.h>
#include <Evas.h>

#include <functional>
#include <memory>

namespace app_assist {

class WControl;
class WUiTimer;

using WUiTimerHandle = std::weak_ptr<WUiTimer>;

class WUiTimer : public std::enable_shared_from_this<WUiTimer> {
public:
	using Callback = std::function<bool(void* data)>;

	// Each returns an expired handle, logged, for a null callback or owner.
	static WUiTimerHandle addIdler(Callback callback, void* data, WControl* owner);
	static WUiTimerHandle addTimer(double seconds, Callback callback, void* data, WControl* owner);
	static WUiTimerHandle addAnimator(Callback callback, void* data, WControl* owner);
	static WUiTimerHandle addIdler(Callback callback, void* data, Evas_Object* owner);
	static WUiTimerHandle addTimer(double seconds, Callback callback, void* data, Evas_Object* owner);
	static WUiTimerHandle addAnimator(Callback callback, void* data, Evas_Object* owner);
	// Cancels the timer; an expired handle is ignored.
	static void destroy(const WUiTimerHandle& handle);
	static bool isAlive(const WUiTimerHandle& handle) { return !handle.expired(); }

	enum class Kind { Idler, Timer, Animator };
	WUiTimer(Kind kind, Callback callback, void* data);
	~WUiTimer();
	WUiTimer(const WUiTimer&) = delete;
	WUiTimer& operator=(const WUiTimer&) = delete;

private:
	friend class WControl;
	static WUiTimerHandle __add(Kind kind, double seconds, Callback callback, void* data, WControl* control,
		Evas_Object* object);
	static Eina_Bool __tickCb(void* data);
	static void __ownerObjDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	bool __start(double seconds);
	bool __fire();
	void __cancel();
	void __detachFromOwner();
	void __deleteEcoreHandle();

	Kind m_kind;
	Callback m_callback;
	void* m_data;
	void* m_ecoreHandle = nullptr;
	WControl* m_ownerControl = nullptr;
	Evas_Object* m_ownerObj = nullptr;
	bool m_firing = false;
	bool m_cancelled = false;
};

} // namespace app_assist
