#ifndef _CT_PROFILE_SHARING_PREVIEW_ITEM_H_
#define _CT_PROFILE_SHARING_PREVIEW_ITEM_H_

#include "CtProfileSharingRow.h"

#include <memory>
#include <string>
#include <vector>

class CtMyProfileDetailData;

// "What others will see": the profile card as a contact receives it, the
// name, status and picture, and only the fields chosen for sharing. It reads
// the stored profile when made and the choices whenever it is drawn.
class CtProfileSharingPreviewItem : public CtProfileSharingRow {
public:
	CtProfileSharingPreviewItem();
	~CtProfileSharingPreviewItem() override;

	std::string getName() const;
	// The status, then one line per shared field that has a value.
	std::vector<std::string> getLines() const;

private:
	std::string __fieldText(int property) const;
	std::string __birthday() const;
	Evas_Object* __createPicture(Evas_Object* parent) const;

	std::unique_ptr<CtMyProfileDetailData> m_data;
};

#endif
