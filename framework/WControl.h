// Base of every framework object that owns an Evas object: popups, list
// controls and (through WView) screens. Deleting the Evas object, or
// destroy(), ends the control: its timers and attached popup go first, then
// onDestroy, then the destructor.
#pragma once

#include <Elementary.h>

#include <memory>
#include <vector>

namespace app_assist {

class WUiTimer;

class WControl {
public:
	WControl();

	// Builds the control under `parent` (onCreate, then onCreated). Returns
	// false, logged, for a null parent, a second call or a null root object.
	virtual bool create(Evas_Object* parent, void* param);
	// Ends the control; safe to call again while it is already ending.
	virtual void destroy();
	virtual Evas_Object* getEvasObj();

protected:
	// Controls are ended through destroy(), never deleted from outside.
	virtual ~WControl();

public:
	virtual const char* getClassName();

	// Expires when the control is destroyed (once no caller holds it locked);
	// late callbacks check it.
	std::weak_ptr<WControl> getWeakPtr() const { return m_self; }
	bool isCreated() const { return m_evasObj != nullptr; }
	// True from the start of destroy() (or of the object's deletion) on.
	bool isDestroying() const { return m_ending; }

	// Creates `popup` (when not yet created) and keeps it as the one popup of
	// this control, destroying the one before. The popup dies with the control.
	void attachPopup(WControl* popup);
	void destroyPopup();
	WControl* getPopup() const;

protected:
	virtual Evas_Object* onCreate(Evas_Object* parent, void* param);
	virtual void onCreated();
	virtual void onDestroy();
	// The object that popups of this control are made on.
	virtual Evas_Object* getPopupParent();
	// `child` is destroyed (newest first) before this control's onDestroy.
	void adoptControl(WControl* child);

private:
	friend class WUiTimer;
	static void __evasObjDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	void __finish();
	void __destroyChildren();
	void __addTimer(const std::shared_ptr<WUiTimer>& timer);
	void __removeTimer(const WUiTimer* timer);

	// Declared before m_self: still alive while m_self is released.
	bool m_inDestructor = false;
	std::shared_ptr<WControl> m_self;
	Evas_Object* m_evasObj = nullptr;
	bool m_created = false;
	bool m_ending = false;
	std::weak_ptr<WControl> m_popup;
	std::vector<std::weak_ptr<WControl>> m_children;
	std::vector<std::shared_ptr<WUiTimer>> m_timers;

	WControl(const WControl&) = delete;
	WControl& operator=(const WControl&) = delete;
};

} // namespace app_assist
