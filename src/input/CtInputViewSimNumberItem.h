#ifndef _CT_INPUT_VIEW_SIM_NUMBER_ITEM_H_
#define _CT_INPUT_VIEW_SIM_NUMBER_ITEM_H_

#include "CtInputViewSimFieldItem.h"

// The number of a SIM contact (its first number record), kept to the
// characters a number may hold; a leading '+' takes no room on the card.
class CtInputViewSimNumberItem : public CtInputViewSimFieldItem {
public:
	// `record` is the contact's first number; `emptied` is told whether the
	// number became empty (true) or not after each accepted change.
	CtInputViewSimNumberItem(std::shared_ptr<CtData> data, contacts_record_h record, std::function<void()> changed,
			std::function<void(bool empty)> emptied, const char* initialText);

	contacts_record_h getRecord() const { return m_record; }

protected: // CtInputViewSimFieldItem
	const char* getGuideTextId() const override { return "IDS_PB_BODY_PHONE_NUMBER_ABB"; }
	Elm_Input_Panel_Layout getPanelLayout() const override { return ELM_INPUT_PANEL_LAYOUT_PHONENUMBER; }
	std::string readText() override;
	void writeText(const char* text) override;
	int measure(const std::string& text) override;
	int limitFor(const std::string& text) override;
	void onTextChanged(Evas_Object* entry) override;

private:
	contacts_record_h m_record;
	std::function<void(bool)> m_emptied;
};

#endif
