#ifndef _CT_RELATIONSHIP_PICKER_VIEW_H_
#define _CT_RELATIONSHIP_PICKER_VIEW_H_

#include "CtPersonPickerView.h"

// Picks the person a relationship names: the choice is told through the
// registry change signal (CT_REGISTRY_KEY_RELATIONSHIP_PERSON, value the
// person id), then the view closes.
class CtRelationshipPickerView : public CtPersonPickerView {
public:
	CtRelationshipPickerView();

protected:
	~CtRelationshipPickerView() override = default;

	// CtPersonPickerView
	std::vector<Entry> loadEntries() override;
	void onChosen(const Entry& entry) override;
};

#endif
