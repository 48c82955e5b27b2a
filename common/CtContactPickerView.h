#ifndef _CT_CONTACT_PICKER_VIEW_H_
#define _CT_CONTACT_PICKER_VIEW_H_

#include "CtPersonPickerView.h"

#include <app_control.h>

// The contact picker driven by an app-control request. Extras read:
// "type" (131: link the chosen person into "ct_selected_person_id"),
// "ct_selected_person_id" (left out of the list), "ct_max" (how many more
// may be chosen; 0 refuses every choice). The chosen person id goes back as
// the reply to the request (APP_CONTROL_DATA_SELECTED and APP_CONTROL_DATA_ID).
class CtContactPickerView : public CtPersonPickerView {
public:
	static constexpr int kTypeLinkContacts = 131;

	// Works on a copy of `request` (may be null: a plain picker).
	explicit CtContactPickerView(app_control_h request);

	int getLaunchType() const { return m_type; }
	int getBasePersonId() const { return m_basePersonId; }
	int getMaxCount() const { return m_maxCount; }

protected:
	~CtContactPickerView() override;

	// CtPersonPickerView
	std::vector<Entry> loadEntries() override;
	void onChosen(const Entry& entry) override;

private:
	bool __linkIntoBasePerson(int personId);
	void __reply(int personId);

	app_control_h m_request = nullptr;
	int m_type = -1;
	int m_basePersonId = 0;
	int m_maxCount = -1;
};

#endif
