// A screen. Pushed on a WNaviframe, it lives until it is popped (its onPop
// may refuse) or destroyed; the framework then runs onDestroy and deletes it.
// Order: constructor, onCreate, onCreated, onSetContainerProperties,
// onPushToNaviframe, onPushed, [onBecomeTop], onPop, onDestroy, destructor.
#pragma once

#include "IWWindow.h"
#include "WControl.h"

#include <string>

namespace app_assist {

class WNaviframe;

class WView : public WControl {
public:
	WView();
	explicit WView(const char* name);

	bool create(Evas_Object* parent, void* param) override;
	void destroy() override;
	const char* getClassName() override;

	WNaviframe* getNaviframe() const;
	Elm_Object_Item* getNaviItem() const { return m_naviItem; }
	IWWindow* getWindow() const { return m_window; }

	// Leaves the naviframe the way the back key does (onPop may refuse).
	void popOut();
	// Shows a more button on `naviItem` and routes the more key of this view
	// to `callback(data, obj, naviItem)`. Returns false, logged, for bad input.
	bool enableMoreButton(Elm_Object_Item* naviItem, Evas_Smart_Cb callback, void* data);
	void setTitle(const char* title);
	const char* getTitle() const { return m_title.c_str(); }
	void setName(const char* name);
	const char* getName() const { return m_name.c_str(); }

protected:
	~WView() override;
	virtual void onSetContainerProperties(IWWindow* window, WNaviframe* naviframe, Evas_Object* naviframeObj);
	// Default: pushes the view's object with its title.
	virtual void onPushToNaviframe(Evas_Object* naviframeObj);
	virtual void onPushed(Elm_Object_Item* naviItem);
	// Returns true to let the pop proceed.
	virtual bool onPop();
	virtual void onBecomeTop();
	virtual void onSetAsPageContent(Evas_Object* pageObj);

	Evas_Object* getPopupParent() override;

private:
	friend class WNaviframe;
	friend class WPageSlideView;
	static void __moreButtonClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	void __runMoreCallback();
	bool __runOnPop();

	std::string m_name;
	std::string m_title;
	IWWindow* m_window = nullptr;
	std::weak_ptr<WControl> m_naviframe;
	std::weak_ptr<WControl> m_pageOwner;
	Elm_Object_Item* m_naviItem = nullptr;
	Evas_Smart_Cb m_moreCallback = nullptr;
	void* m_moreData = nullptr;
	bool m_inPop = false;
	bool m_destroyAfterPop = false;
};

} // namespace app_assist

// The view whose root object is `obj` (null when none).
app_assist::WView* WView_getInstanceFromEvasObj(Evas_Object* obj);
// The window object of the view's window (null when it has none).
Evas_Object* WView_getWindowEvasObj(app_assist::WView* view);
Evas_Object* WView_getWindowBaseLayoutEvasObj(app_assist::WView* view);
