#ifndef _CT_INPUT_VIEW_SIM_EMAIL_ITEM_H_
#define _CT_INPUT_VIEW_SIM_EMAIL_ITEM_H_

#include "CtInputViewSimFieldItem.h"

// The e-mail of a SIM contact (its first e-mail record), measured as the
// card stores it.
class CtInputViewSimEmailItem : public CtInputViewSimFieldItem {
public:
	// `record` is the contact's first e-mail.
	CtInputViewSimEmailItem(std::shared_ptr<CtData> data, contacts_record_h record, std::function<void()> changed,
			const char* initialText);

	contacts_record_h getRecord() const { return m_record; }

protected: // CtInputViewSimFieldItem
	const char* getGuideTextId() const override { return "IDS_PB_BUTTON_EMAIL_ABB3"; }
	Elm_Input_Panel_Layout getPanelLayout() const override { return ELM_INPUT_PANEL_LAYOUT_EMAIL; }
	std::string readText() override;
	void writeText(const char* text) override;

private:
	contacts_record_h m_record;
};

#endif
