// The demo's own screen: every person of the store, sorted by name, with
// picture and favourite star. Choosing one runs the host's handler. The list
// follows changes of the store.
#pragma once

#include "PersonListItem.h"
#include "WView.h"

#include <vector>

namespace ct::demo {

class PersonListView : public app_assist::WView {
public:
	explicit PersonListView(PersonListItem::SelectHandler onSelect);

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
	void __reload();
	void __unsubscribe();

	PersonListItem::SelectHandler m_onSelect;
	Evas_Object* m_genlist = nullptr;
	std::vector<PersonSummary> m_persons;
	bool m_subscribed = false;
};

} // namespace ct::demo
