#ifndef _CT_DETAIL_VIEW_ITEM_OWNER_H_
#define _CT_DETAIL_VIEW_ITEM_OWNER_H_

#include <contacts.h>

// What the detail list rows need from the screen that shows them: the
// actions that open further screens or choosers live in the screen.
class CtDetailViewItemOwner {
public:
	virtual ~CtDetailViewItemOwner() {}

	// The video-call row or its icon was tapped.
	virtual void onVideoCallSelected() = 0;
	// An address row or its map icon was tapped; `address` is owned by the data.
	virtual void onAddressSelected(contacts_record_h address) = 0;
	// The picture row was tapped while showing `page` (0 for the first picture).
	virtual void onImageSelected(int page) = 0;
};

#endif
