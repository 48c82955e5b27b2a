#ifndef _CT_INPUT_VIEW_NOTE_ITEM_H_
#define _CT_INPUT_VIEW_NOTE_ITEM_H_

#include "CtInputViewFieldItem.h"

// The contact's note (multi-line).
class CtInputViewNoteItem : public CtInputViewFieldItem {
public:
	// Add-kind code of a row the user added (its entry takes the focus when first shown).
	static constexpr int kAddKind = 6;

	CtInputViewNoteItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind, CtInputViewItemCallbacks callbacks,
			const char* initialText);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected: // CtInputViewFieldItem
	EntryTraits getEntryTraits() const override { return {"IDS_PB_BUTTON_NOTES", true, 1000, ELM_INPUT_PANEL_LAYOUT_NORMAL, false, "elm.icon.edit", kAddKind}; }
	std::string readText() override;
	void writeText(const char* text) override;
};

#endif
