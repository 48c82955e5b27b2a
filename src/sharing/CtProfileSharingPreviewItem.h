#ifndef _CT_PROFILE_SHARING_PREVIEW_ITEM_H_
#define _CT_PROFILE_SHARING_PREVIEW_ITEM_H_

#include "CtProfileSharingRow.h"
#include "ICtChangeListener.h"

#include <memory>
#include <string>
#include <vector>

class CtMyProfileDetailData;

// "What others will see": the profile card as a contact receives it, the
// name, status and picture, and only the fields chosen for sharing. It reads
// the stored profile (again when it changes) and the choices whenever it is
// drawn.
class CtProfileSharingPreviewItem : public CtProfileSharingRow, public ICtChangeListener {
public:
	CtProfileSharingPreviewItem();
	~CtProfileSharingPreviewItem() override;

	std::string getName() const;
	// The status, then one line per shared field that has a value.
	std::vector<std::string> getLines() const;

public: // ICtChangeListener
	void onDbChanged(const char* viewUri) override;
	void onCompleteGetContacts() override {}
	void onConditionChagned() override {}

private:
	std::string __fieldText(int property) const;
	std::string __birthday() const;
	Evas_Object* __createPicture(Evas_Object* parent) const;

	std::unique_ptr<CtMyProfileDetailData> m_data;
};

#endif
