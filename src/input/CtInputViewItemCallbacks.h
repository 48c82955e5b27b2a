#ifndef _CT_INPUT_VIEW_ITEM_CALLBACKS_H_
#define _CT_INPUT_VIEW_ITEM_CALLBACKS_H_

#include <Elementary.h>
#include <contacts.h>

#include <functional>

// What a field row of the edit list asks of the control that owns it. Every
// callback may be empty.
struct CtInputViewItemCallbacks {
	// The row's text or type changed (the owner updates its Save button).
	std::function<void()> changed;
	// The delete button was pressed; `heldText` is true when the row had been
	// made with a stored text. The owner removes `record` from the contact;
	// the row's genlist item is deleted right after.
	std::function<void(Elm_Object_Item* item, bool heldText, contacts_record_h record)> deleted;
	// The return key was pressed in `entry` (the owner moves to the next entry).
	std::function<void(Evas_Object* entry, Elm_Object_Item* item)> activated;
	// An entry of the row took the focus (true) or is about to take it on show (false).
	std::function<void(bool focused)> focus;
};

#endif
