#ifndef _CT_INPUT_VIEW_IMPORTANT_FIELDS_ITEM_H_
#define _CT_INPUT_VIEW_IMPORTANT_FIELDS_ITEM_H_

#include "CtInputViewGenlistItem.h"

#include <array>
#include <functional>

// The add buttons under the fields: phone, e-mail, notes and more. Each
// button can be disabled on its own (notes while a note row exists).
class CtInputViewImportantFieldsItem : public CtInputViewGenlistItem {
public:
	enum Button { PHONE = 0, EMAIL = 1, NOTE = 2, MORE = 3, BUTTON_COUNT = 4 };

	// `pressed[i]` runs when button i is pressed.
	explicit CtInputViewImportantFieldsItem(std::array<std::function<void()>, BUTTON_COUNT> pressed);
	~CtInputViewImportantFieldsItem() override;

	void setButtonDisabled(Button button, bool disabled);
	bool isButtonDisabled(Button button) const { return m_disabled[button]; }
	Evas_Object* getButton(Button button) const { return m_buttons[button]; }

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected:
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	struct Slot {
		CtInputViewImportantFieldsItem* row;
		Button button;
	};
	static void __clickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __buttonDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);

	std::array<std::function<void()>, BUTTON_COUNT> m_pressed;
	std::array<bool, BUTTON_COUNT> m_disabled = {};
	std::array<Evas_Object*, BUTTON_COUNT> m_buttons = {};
	std::array<Slot, BUTTON_COUNT> m_slots;
};

#endif
