#ifndef _CT_INPUT_VIEW_ADDRESS_ITEM_H_
#define _CT_INPUT_VIEW_ADDRESS_ITEM_H_

#include "CtInputViewFieldItem.h"

#include <functional>

// A postal address (multi-line) with its type, and a button that finds it on a map.
class CtInputViewAddressItem : public CtInputViewFieldItem {
public:
	// Add-kind code of a row the user added (its entry takes the focus when first shown).
	static constexpr int kAddKind = 8;

	CtInputViewAddressItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind, CtInputViewItemCallbacks callbacks,
			const char* initialText);
	// The location button asks the owner to pick the address on a map.
	void setLocationCallback(std::function<void(contacts_record_h record)> callback)
	{
		m_locationCallback = std::move(callback);
	}

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected: // CtInputViewFieldItem
	EntryTraits getEntryTraits() const override { return {"IDS_PB_BODY_ADDRESS_ABB2", true, 1000, ELM_INPUT_PANEL_LAYOUT_NORMAL, false, "elm.icon.2", kAddKind}; }
	std::string readText() override;
	void writeText(const char* text) override;
	bool hasTypes() const override { return true; }
	std::vector<CtInputViewTypeSelector::Choice> getTypeChoices() override;
	std::string getTypeLabel() override;
	int getCustomType() const override;
	void writeType(int type, const char* label) override;
	Evas_Object* getExtraContent(Evas_Object* genlist, const char* part) override;

private:
	static void __locationClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::function<void(contacts_record_h record)> m_locationCallback;
};

#endif
