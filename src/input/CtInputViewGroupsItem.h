#ifndef _CT_INPUT_VIEW_GROUPS_ITEM_H_
#define _CT_INPUT_VIEW_GROUPS_ITEM_H_

#include "CtData.h"
#include "CtInputViewGenlistItem.h"

#include <functional>
#include <memory>
#include <vector>

// The contact's groups: their names under the label. Selecting the row runs
// the owner's group picker; the row keeps the contact's group ids, sorted.
class CtInputViewGroupsItem : public CtInputViewGenlistItem {
public:
	CtInputViewGroupsItem(std::shared_ptr<CtData> data, std::function<void()> selected);

	const std::vector<int>& getGroupIds() const { return m_groupIds; }
	// Reads the groups again after the picker changed them.
	void updateGroups();

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;
	void onSelect(Elm_Object_Item* item) override;

protected:
	std::string getText(Evas_Object* genlist, const char* part) override;

private:
	std::shared_ptr<CtData> m_data;
	std::function<void()> m_selected;
	std::vector<int> m_groupIds;
};

#endif
