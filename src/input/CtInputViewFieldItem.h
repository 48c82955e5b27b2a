#ifndef _CT_INPUT_VIEW_FIELD_ITEM_H_
#define _CT_INPUT_VIEW_FIELD_ITEM_H_

#include "CtData.h"
#include "CtInputViewGenlistItem.h"
#include "CtInputViewItemCallbacks.h"
#include "CtInputViewTypeSelector.h"

#include "WControl.h"

#include <memory>
#include <string>
#include <vector>

// A field row of the edit list: an entry writing every change into one
// child record of the contact, an optional type selector (with the custom
// label popup) and a delete button. The concrete rows say which field.
class CtInputViewFieldItem : public CtInputViewGenlistItem {
public:
	~CtInputViewFieldItem() override;

	contacts_record_h getRecord() const { return m_record; }
	// The row's entry while realized (null otherwise).
	Evas_Object* getEntry() const { return m_entry; }
	// Chooses the type of menu value `value`, as the menu does.
	void selectType(int value);
	// Custom-label result: stores `label` with the custom type.
	void setCustomType(const char* label);
	// Presses the delete button.
	void deleteRow();
	// Whether the contact lies in the profile-sharing storage (rows are read-only).
	bool isProfileSharingStorage() const;

public: // CtInputViewGenlistItem
	const char* getEntryPartName() override { return "elm.icon.entry"; }
	Evas_Object* getHoverselObj() override { return m_hoversel; }

protected:
	struct EntryTraits {
		const char* guideTextId;
		bool multiline;
		int maxChars;
		Elm_Input_Panel_Layout panelLayout;
		bool passesReturnKey;
		const char* deletePart; // null: no delete button
		int focusAddKind;       // add-kind code that focuses the entry on first show; 0: never
	};

	// `record` belongs to `data`'s contact; `initialText` is the stored text
	// (null for a row the user added).
	CtInputViewFieldItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
			CtInputViewItemCallbacks callbacks, const char* initialText);

	virtual EntryTraits getEntryTraits() const = 0;
	virtual std::string readText() = 0;
	virtual void writeText(const char* text) = 0;
	// Type menu in order (none: the row has no selector), the selector's label
	// and the type writer. Value -1 stands for the current custom label.
	virtual std::vector<CtInputViewTypeSelector::Choice> getTypeChoices() { return {}; }
	virtual std::string getTypeLabel() { return std::string(); }
	virtual int getCustomType() const { return CONTACTS_NUMBER_TYPE_CUSTOM; }
	virtual void writeType(int /*type*/, const char* /*label*/) {}
	virtual bool hasTypes() const { return false; }
	// Menu value -> type (the number menu lists positions, the others types).
	virtual int mapChoiceToType(int value) { return value; }
	// Reacts to a text change of the entry; the default writes it as typed.
	virtual void onTextChanged(Evas_Object* entry);
	// An extra part of the row (location button, contact picker, ...).
	virtual Evas_Object* getExtraContent(Evas_Object* /*genlist*/, const char* /*part*/) { return nullptr; }

	// The custom label of the record when its type is custom and the label
	// is not empty, as a first menu choice (value -1).
	void addCurrentCustomChoice(std::vector<CtInputViewTypeSelector::Choice>& choices, unsigned int typeProperty,
			unsigned int labelProperty, int customType);
	static CtInputViewTypeSelector::Choice choice(const char* textId, int value);
	void notifyChanged();
	void showGuideWhenEmpty(Evas_Object* entry);

	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

	std::shared_ptr<CtData> m_data;
	contacts_record_h m_record;
	// The text last written into the record (or read from it).
	std::string m_lastText;
	int m_addKind;
	CtInputViewItemCallbacks m_callbacks;

private:
	Evas_Object* __createEntry(Evas_Object* genlist);
	Evas_Object* __createSelector(Evas_Object* genlist);
	void __onTypeSelected(int value);
	void __openCustomPopup();
	static void __entryChangedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __entryActivatedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __entryFocusedCb(void* data, Evas_Object* obj, void* eventInfo);
	void __focusOnFirstShow(Evas_Object* entry);
	static void __entryDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __hoverselDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __deleteClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	Evas_Object* m_entry = nullptr;
	Evas_Object* m_hoversel = nullptr;
	bool m_focusedOnShow = false;
	std::weak_ptr<app_assist::WControl> m_customPopup;
};

#endif
