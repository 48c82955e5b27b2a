#ifndef _CT_INPUT_VIEW_GENLIST_ITEM_H_
#define _CT_INPUT_VIEW_GENLIST_ITEM_H_

#include "WGenlistItem.h"
#include "WUiTimer.h"

#include <string>

// Base of every row of the contact and my-profile edit lists. A row knows
// whether its text differs from the text it was made with (changed) and
// whether it is empty; it builds its parts each time it is realized, from
// the current record values.
class CtInputViewGenlistItem : public app_assist::WGenlistItem {
public:
	// `initialText` (copied; null for rows the user adds) is the text the
	// row was made with.
	explicit CtInputViewGenlistItem(const char* initialText = nullptr);
	~CtInputViewGenlistItem() override;

	virtual bool getIsChanged() { return m_isChanged; }
	virtual bool getIsEmpty() { return m_isEmpty; }
	// The part that holds the row's entry; null when it has none.
	virtual const char* getEntryPartName() { return nullptr; }
	// The row's type selector while realized; null when it has none.
	virtual Evas_Object* getHoverselObj() { return nullptr; }

	// An edit field (single- or multi-line) whose entry refuses more than
	// `maxChars` characters and posts the character-limit notice (at most
	// once per 3.5 s). `guideTextId` may be null.
	Evas_Object* createEditField(Evas_Object* parent, const char* guideTextId, bool multiline, int maxChars);
	// Makes `entry` refuse more than `maxChars` characters (a longer insert
	// is cut on a whole character and "maxlength,reached" is raised).
	static void addLengthLimit(Evas_Object* entry, int maxChars);
	// Shows the UTF-8 `text` in `entry` with the cursor after it. A stored
	// text longer than the entry's limit is shown whole (the limit only
	// stops further typing).
	static void setEntryText(Evas_Object* entry, const char* text);
	// Empty and changed states for the row's current `text` (null: empty).
	void updateChangedState(const char* text);
	void setIsChanged(bool changed) { m_isChanged = changed; }
	void setIsPrefilled(bool prefilled) { m_isPrefilled = prefilled; }
	bool getIsPrefilled() const { return m_isPrefilled; }
	const std::string* getInitialText() const { return m_hasInitialText ? &m_initialText : nullptr; }

	// Whether the entry holds no text. (elm_entry_is_empty() moves the
	// entry's cursor when called from a change callback.)
	static bool isEntryEmpty(Evas_Object* entry);
	// The entry's text as plain UTF-8 ("" when it has none).
	static std::string getEntryUtf8(Evas_Object* entry);
	static const char* translate(const char* textId);

protected:
	// A genlist item class of `style` whose texts and contents come from
	// getText/getContent and whose del function deletes the row. Made once
	// per row class (kept for the life of the program).
	static Elm_Genlist_Item_Class* createItemClass(const char* style);
	virtual std::string getText(Evas_Object* genlist, const char* part);
	virtual Evas_Object* getContent(Evas_Object* genlist, const char* part);

private:
	static char* __textGetCb(void* data, Evas_Object* obj, const char* part);
	static Evas_Object* __contentGetCb(void* data, Evas_Object* obj, const char* part);
	static void __editfieldTextMaxReachedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __selectionStartCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __selectionClearedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __backKeyCb(void* data, Evas_Object* obj, void* eventInfo);

	bool m_isChanged = false;
	bool m_isEmpty = true;
	bool m_hasInitialText = false;
	std::string m_initialText;
	bool m_isPrefilled = false;
	app_assist::WUiTimerHandle m_notificationTimer;
};

#endif
