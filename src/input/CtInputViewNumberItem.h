#ifndef _CT_INPUT_VIEW_NUMBER_ITEM_H_
#define _CT_INPUT_VIEW_NUMBER_ITEM_H_

#include "CtInputViewFieldItem.h"

// A phone number with its type. Digits are shown with the region's dashes
// while typed; typing anything but a digit or '+' keeps the row's text as
// typed until it is emptied.
class CtInputViewNumberItem : public CtInputViewFieldItem {
public:
	static constexpr int kAddKind = 4;
	static constexpr int kMaxChars = 1000;

	CtInputViewNumberItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
			CtInputViewItemCallbacks callbacks, const char* initialText);

	bool isFormatting() const { return m_formatting; }

	// The number for the region with dashes: cleaned, dashes removed, added again.
	static std::string formatNumber(const char* text);
	// Character position in `to` that follows as many digits (and other
	// characters but '(', ')', ' ', '-') as come before character `cursor`
	// of `from`. Used to keep the cursor on the same digit after formatting.
	static int mapCursor(const std::string& from, int cursor, const std::string& to);
	// Whether `now` is `before` with exactly one character inserted that is
	// neither a digit nor '+'.
	static bool insertedNonDialChar(const std::string& before, const std::string& now);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected: // CtInputViewFieldItem
	EntryTraits getEntryTraits() const override
	{
		return {"IDS_PB_BODY_PHONE_NUMBER_ABB", false, kMaxChars, ELM_INPUT_PANEL_LAYOUT_PHONENUMBER, true, "elm.icon.2",
			kAddKind};
	}
	std::string readText() override;
	void writeText(const char* text) override;
	bool hasTypes() const override { return true; }
	std::vector<CtInputViewTypeSelector::Choice> getTypeChoices() override;
	std::string getTypeLabel() override;
	int getCustomType() const override { return CONTACTS_NUMBER_TYPE_CUSTOM; }
	int mapChoiceToType(int value) override;
	void writeType(int type, const char* label) override;
	void onTextChanged(Evas_Object* entry) override;

private:
	bool m_formatting = true;
};

#endif
