// The more menu of a view: a context popup at the bottom of the window with
// items in append order. Choosing an item closes the menu, then runs its
// action (which may open another popup or destroy the view). A disabled item
// is shown greyed and does nothing when chosen.
#pragma once

#include "WControl.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace app_assist {

class IWWindow;
class WNaviframe;

class WMenuPopup : public WControl {
public:
	WMenuPopup(Evas_Object* window = nullptr, Evas_Object* naviframe = nullptr);
	WMenuPopup(IWWindow* window, WNaviframe* naviframe);

	enum class ItemState { Enabled, Disabled };

	const char* getClassName() override;

	// Labels are translation ids of `domain` when one is set.
	void setTextTranslatable(const char* domain);
	void appendItem(const char* label, std::function<void()> action, ItemState state = ItemState::Enabled);
	int getItemCount() const { return static_cast<int>(m_items.size()); }

protected:
	~WMenuPopup() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;

private:
	struct Item {
		WMenuPopup* owner;
		std::string label;
		std::function<void()> action;
		ItemState state;
	};
	static void __itemSelectedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __dismissCb(void* data, Evas_Object* obj, void* eventInfo);
	void __place(Evas_Object* ctxpopup);

	Evas_Object* m_window;
	Evas_Object* m_naviframe;
	std::string m_domain;
	std::vector<std::unique_ptr<Item>> m_items;
};

} // namespace app_assist
