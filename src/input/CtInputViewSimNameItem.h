#ifndef _CT_INPUT_VIEW_SIM_NAME_ITEM_H_
#define _CT_INPUT_VIEW_SIM_NAME_ITEM_H_

#include "CtInputViewSimFieldItem.h"

// The name of a SIM contact, in one field, measured as the card stores it.
class CtInputViewSimNameItem : public CtInputViewSimFieldItem {
public:
	CtInputViewSimNameItem(std::shared_ptr<CtData> data, std::function<void()> changed, const char* initialText);

protected: // CtInputViewSimFieldItem
	const char* getGuideTextId() const override { return "IDS_PB_BODY_NAME"; }
	Elm_Input_Panel_Layout getPanelLayout() const override { return ELM_INPUT_PANEL_LAYOUT_NORMAL; }
	std::string readText() override;
	void writeText(const char* text) override;
	void onTextChanged(Evas_Object* entry) override;
};

#endif
