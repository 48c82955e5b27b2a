#ifndef _CT_INPUT_VIEW_RINGTONE_ITEM_H_
#define _CT_INPUT_VIEW_RINGTONE_ITEM_H_

#include "CtData.h"
#include "CtInputViewGenlistItem.h"
#include "CtInputViewItemCallbacks.h"

#include <functional>
#include <memory>

// The contact's ringtone: its file name (or "Default") under the label, the
// ringtone icon and a delete button that goes back to the default ringtone.
// Selecting the row runs the owner's picker.
class CtInputViewRingtoneItem : public CtInputViewGenlistItem {
public:
	CtInputViewRingtoneItem(std::shared_ptr<CtData> data, CtInputViewItemCallbacks callbacks,
			std::function<void()> selected);

	// The name shown for the current ringtone.
	std::string getRingtoneName();
	void deleteRow();

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;
	void onSelect(Elm_Object_Item* item) override;

protected:
	std::string getText(Evas_Object* genlist, const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	static void __deleteClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::shared_ptr<CtData> m_data;
	CtInputViewItemCallbacks m_callbacks;
	std::function<void()> m_selected;
};

#endif
