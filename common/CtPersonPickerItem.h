#ifndef _CT_PERSON_PICKER_ITEM_H_
#define _CT_PERSON_PICKER_ITEM_H_

#include "WGenlistItem.h"

#include <functional>
#include <string>

// One row of a picker list: an id (person or contact), its name and an
// optional second line. Selecting it runs the chooser with the id.
class CtPersonPickerItem : public app_assist::WGenlistItem {
public:
	using Chooser = std::function<void(int id)>;

	CtPersonPickerItem(int id, std::string name, std::string subText, Chooser chooser);

	int getId() const { return m_id; }
	const std::string& getName() const { return m_name; }
	const std::string& getSubText() const { return m_subText; }

	// app_assist::WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;
	void onSelect(Elm_Object_Item* item) override;

private:
	static char* __getTextCb(void* data, Evas_Object* obj, const char* part);

	int m_id;
	std::string m_name;
	std::string m_subText;
	Chooser m_chooser;
};

#endif
