#ifndef _CT_INPUT_VIEW_STATUS_ITEM_H_
#define _CT_INPUT_VIEW_STATUS_ITEM_H_

#include "CtInputViewFieldItem.h"

#include <functional>

// The profile's status line (at most 60 characters).
class CtInputViewStatusItem : public CtInputViewFieldItem {
public:
	// Add-kind code of a row the user added (its entry takes the focus when first shown).
	static constexpr int kAddKind = 0;
	static constexpr int kMaxChars = 60;

	CtInputViewStatusItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind, CtInputViewItemCallbacks callbacks,
			const char* initialText);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected: // CtInputViewFieldItem
	EntryTraits getEntryTraits() const override { return {"IDS_PB_MBODY_STATUS", false, kMaxChars, ELM_INPUT_PANEL_LAYOUT_NORMAL, true, nullptr, 0}; }
	std::string readText() override;
	void writeText(const char* text) override;
};

#endif
