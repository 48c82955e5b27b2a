// One row of the demo's person list: picture, name and a favourite star.
#pragma once

#include "WGenlistItem.h"

#include <functional>
#include <string>

namespace ct::demo {

struct PersonSummary {
	int id = 0;
	std::string name;
	std::string picturePath;   // empty: the default picture
	bool favourite = false;
};

class PersonListItem : public app_assist::WGenlistItem {
public:
	using SelectHandler = std::function<void(int personId)>;

	PersonListItem(PersonSummary person, SelectHandler onSelect);

	const PersonSummary& person() const { return m_person; }

	// WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;
	void onSelect(Elm_Object_Item* item) override;

private:
	static char* __getTextCb(void* data, Evas_Object* obj, const char* part);
	static Evas_Object* __getContentCb(void* data, Evas_Object* obj, const char* part);
	Evas_Object* __makeIcon(Evas_Object* parent, const std::string& path, int size) const;

	PersonSummary m_person;
	SelectHandler m_onSelect;
};

} // namespace ct::demo
