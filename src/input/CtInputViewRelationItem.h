#ifndef _CT_INPUT_VIEW_RELATION_ITEM_H_
#define _CT_INPUT_VIEW_RELATION_ITEM_H_

#include "CtInputViewFieldItem.h"

#include <functional>

// A related person's name with the relationship (brother, manager, ... or a custom label), and a button that picks the person from the contacts.
class CtInputViewRelationItem : public CtInputViewFieldItem {
public:
	// Add-kind code of a row the user added (its entry takes the focus when first shown).
	static constexpr int kAddKind = 10;

	CtInputViewRelationItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind, CtInputViewItemCallbacks callbacks,
			const char* initialText);
	// The contact-select button asks the owner to pick the related person.
	void setContactSelectCallback(std::function<void(CtInputViewRelationItem* row)> callback)
	{
		m_contactSelectCallback = std::move(callback);
	}
	// Shows and stores the picked person's name.
	void setRelationName(const char* name);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

protected: // CtInputViewFieldItem
	EntryTraits getEntryTraits() const override { return {"IDS_PB_OPT_RELATIONSHIP_ABB2", false, 1000, ELM_INPUT_PANEL_LAYOUT_NORMAL, true, "elm.icon.2", kAddKind}; }
	std::string readText() override;
	void writeText(const char* text) override;
	bool hasTypes() const override { return true; }
	std::vector<CtInputViewTypeSelector::Choice> getTypeChoices() override;
	std::string getTypeLabel() override;
	int getCustomType() const override;
	void writeType(int type, const char* label) override;
	Evas_Object* getExtraContent(Evas_Object* genlist, const char* part) override;

private:
	static void __contactSelectClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::function<void(CtInputViewRelationItem* row)> m_contactSelectCallback;
};

#endif
