#ifndef _CT_UNLINK_CONTACT_VIEW_H_
#define _CT_UNLINK_CONTACT_VIEW_H_

#include "CtPersonPickerView.h"

// The contacts linked into one person; choosing one unlinks it into a person
// of its own. The view closes when one contact is left.
class CtUnlinkContactView : public CtPersonPickerView {
public:
	explicit CtUnlinkContactView(int personId);

	int getPersonId() const { return m_personId; }

protected:
	~CtUnlinkContactView() override = default;

	// CtPersonPickerView
	std::vector<Entry> loadEntries() override;
	void onChosen(const Entry& entry) override;

private:
	int m_personId;
};

#endif
