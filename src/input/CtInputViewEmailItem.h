#ifndef _CT_INPUT_VIEW_EMAIL_ITEM_H_
#define _CT_INPUT_VIEW_EMAIL_ITEM_H_

#include "CtInputViewFieldItem.h"

// An e-mail address with its type (home, work, other or a custom label).
class CtInputViewEmailItem : public CtInputViewFieldItem {
public:
	// Add-kind code of a row the user added (its entry takes the focus when first shown).
	static constexpr int kAddKind = 5;

	CtInputViewEmailItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind, CtInputViewItemCallbacks callbacks,
			const char* initialText);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected: // CtInputViewFieldItem
	EntryTraits getEntryTraits() const override { return {"IDS_PB_BUTTON_EMAIL_ABB3", false, 1000, ELM_INPUT_PANEL_LAYOUT_EMAIL, true, "elm.icon.2", kAddKind}; }
	std::string readText() override;
	void writeText(const char* text) override;
	bool hasTypes() const override { return true; }
	std::vector<CtInputViewTypeSelector::Choice> getTypeChoices() override;
	std::string getTypeLabel() override;
	int getCustomType() const override;
	void writeType(int type, const char* label) override;
	void onTextChanged(Evas_Object* entry) override;
};

#endif
