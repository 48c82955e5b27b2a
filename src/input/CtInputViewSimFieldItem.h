#ifndef _CT_INPUT_VIEW_SIM_FIELD_ITEM_H_
#define _CT_INPUT_VIEW_SIM_FIELD_ITEM_H_

#include "CtData.h"
#include "CtInputViewGenlistItem.h"

#include <functional>
#include <memory>
#include <string>

// A field of a SIM contact: an entry that takes a text only when the card
// can store it (a refused text is put back as it was, with a notice) and,
// under it, how much of the card's room for the field is left. The concrete
// rows say which field and how a text is measured.
class CtInputViewSimFieldItem : public CtInputViewGenlistItem {
public:
	~CtInputViewSimFieldItem() override;

	// The row's entry while realized (null otherwise).
	Evas_Object* getEntry() const { return m_entry; }
	// The card's longest text for the field, and what the accepted text
	// leaves of it (below 0 when the text no longer fits, e.g. after a move
	// to a smaller card).
	int getMaxLength();
	int getRoomLeft();
	// "12 of 14 left", or how far the text is over the limit.
	std::string getCounterText();
	// Reads the card's limit again and shows the counter.
	void updateCounter();

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

public: // CtInputViewGenlistItem
	const char* getEntryPartName() override { return "elm.icon.entry"; }

protected:
	// `fieldType` is the card's field number; `initialText` the stored text
	// (null for a new contact).
	CtInputViewSimFieldItem(std::shared_ptr<CtData> data, int fieldType, std::function<void()> changed,
			const char* initialText);

	virtual const char* getGuideTextId() const = 0;
	virtual Elm_Input_Panel_Layout getPanelLayout() const = 0;
	virtual std::string readText() = 0;
	virtual void writeText(const char* text) = 0;
	// The room `text` takes on the card (-1: it cannot be stored) and the
	// room the field has for it.
	virtual int measure(const std::string& text);
	virtual int limitFor(const std::string& text);
	// Takes the entry's text when it fits, else puts the accepted text back.
	virtual void onTextChanged(Evas_Object* entry);

	// Makes `text` the accepted text: written, counted, reported.
	void accept(const std::string& text);
	// Puts `text` into the entry with the cursor at `cursor` (-1: at the end).
	void rewriteEntry(Evas_Object* entry, const std::string& text, int cursor = -1);
	static void postNotice(const char* textId);

	std::string getText(Evas_Object* genlist, const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

	std::shared_ptr<CtData> m_data;
	int m_fieldType;
	// The last text the card could take (what the record holds).
	std::string m_acceptedText;

private:
	static void __entryChangedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __entryDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);

	std::function<void()> m_changed;
	Evas_Object* m_entry = nullptr;
	bool m_rewriting = false;
};

#endif
