// The navigation frame: an elm_naviframe that owns the views pushed on it.
// The back key and the title back button pop the top view through its onPop;
// a popped view is destroyed.
#pragma once

#include "WView.h"

#include <functional>

namespace app_assist {

class WNaviframe : public WView {
public:
	explicit WNaviframe(IWWindow* window = nullptr);

	const char* getClassName() override;

	// Builds `view` under the naviframe and pushes it; the naviframe owns it
	// from here on, and destroys it when the push fails. Returns success.
	bool push(WView* view, const char* name = nullptr, void* param = nullptr);
	// Pops the top view through its onPop. Returns false, logged, when empty
	// or refused.
	bool pop();
	WView* getTopView() const;
	int getViewCount() const;
	// Runs instead of popping when back is pressed on the only view; the
	// handler sets *popOut to pop it anyway.
	void setOnLastViewBack(std::function<void(bool* popOut)> handler);

protected:
	~WNaviframe() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onDestroy() override;

private:
	static Eina_Bool __popCb(void* data, Elm_Object_Item* item);
	static void __itemDelCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __backCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __moreCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __transitionFinishedCb(void* data, Evas_Object* obj, void* eventInfo);
	Elm_Object_Item* __findItemOf(WView* view) const;
	void __adopt(WView* view, Elm_Object_Item* item);
	void __onBack();

	IWWindow* m_ownWindow;
	std::function<void(bool*)> m_onLastViewBack;
};

} // namespace app_assist
