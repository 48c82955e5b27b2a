// The demo's own screen: every person of the store, sorted by name, with
// picture and favourite star. Choosing one runs the host's handler; a long
// press runs the edit handler, and the title's Create button the create
// handler (each when given). The list follows changes of the store.
#pragma once

#include "PersonListItem.h"
#include "WView.h"

#include <functional>
#include <vector>

namespace ct::demo {

class PersonListView : public app_assist::WView {
public:
	explicit PersonListView(PersonListItem::SelectHandler onSelect, std::function<void()> onCreate = nullptr,
		PersonListItem::SelectHandler onEdit = nullptr);

	const char* getClassName() override { return "PersonListView"; }
	// What the list shows now, in list order.
	const std::vector<PersonSummary>& persons() const { return m_persons; }

protected:
	~PersonListView() override;

	// WView
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onPushed(Elm_Object_Item* naviItem) override;
	void onDestroy() override;

private:
	static void __onPersonsChangedCb(const char* viewUri, void* data);
	static void __createClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __longpressedCb(void* data, Evas_Object* obj, void* eventInfo);
	void __reload();
	void __unsubscribe();

	PersonListItem::SelectHandler m_onSelect;
	std::function<void()> m_onCreate;
	PersonListItem::SelectHandler m_onEdit;
	Evas_Object* m_genlist = nullptr;
	std::vector<PersonSummary> m_persons;
	bool m_subscribed = false;
};

} // namespace ct::demo
