#ifndef _CT_INPUT_VIEW_WEBSITE_ITEM_H_
#define _CT_INPUT_VIEW_WEBSITE_ITEM_H_

#include "CtInputViewFieldItem.h"

// A web address.
class CtInputViewWebsiteItem : public CtInputViewFieldItem {
public:
	// Add-kind code of a row the user added (its entry takes the focus when first shown).
	static constexpr int kAddKind = 7;

	CtInputViewWebsiteItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind, CtInputViewItemCallbacks callbacks,
			const char* initialText);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected: // CtInputViewFieldItem
	EntryTraits getEntryTraits() const override { return {"IDS_PB_OPT_WEB_ADDRESS_ABB", false, 1000, ELM_INPUT_PANEL_LAYOUT_URL, true, "elm.icon.2", kAddKind}; }
	std::string readText() override;
	void writeText(const char* text) override;
};

#endif
