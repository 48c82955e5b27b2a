#ifndef _CT_INPUT_VIEW_MULTI_IMAGE_ITEM_H_
#define _CT_INPUT_VIEW_MULTI_IMAGE_ITEM_H_

#include "CtData.h"
#include "CtInputViewGenlistItem.h"

#include <array>
#include <functional>
#include <memory>

// The picture area of the my-profile edit form: the main picture, up to five
// picture places under it and the reorder button; an invitation to add
// pictures when there is none. Taps do nothing while power saving is on or
// for the profile-sharing storage.
class CtInputViewMultiImageItem : public CtInputViewGenlistItem {
public:
	static constexpr int kMaxPictures = 5;

	// `pictureClicked(order)` runs for a tap on the picture of that order (1
	// for the main picture and the invitation); `reorderClicked` for the button.
	CtInputViewMultiImageItem(std::shared_ptr<CtData> data, std::function<void(int order)> pictureClicked,
			std::function<void()> reorderClicked, bool large = false);
	~CtInputViewMultiImageItem() override;

	bool isPowerSaving() const;
	bool tapsAllowed() const;
	int getPictureCount() const;
	// Picture places shown under the main picture: one per picture and an
	// empty one for the next picture while there are fewer than five.
	int getPlaceCount() const;
	// Taps the picture of `order` as a person would.
	void tapPicture(int order);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassNew() override;
	void onSetElmObjectItem(Elm_Object_Item* item) override;

protected:
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	struct Slot {
		CtInputViewMultiImageItem* row;
		int order;
	};
	Evas_Object* __createMainPicture(Evas_Object* genlist);
	Evas_Object* __createInvitation(Evas_Object* genlist);
	Evas_Object* __createPlace(Evas_Object* genlist, int order);
	Evas_Object* __createReorderButton(Evas_Object* genlist);
	static void __pictureClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __reorderButtonClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::shared_ptr<CtData> m_data;
	std::function<void(int order)> m_pictureClicked;
	std::function<void()> m_reorderClicked;
	bool m_large;
	std::array<Slot, kMaxPictures + 1> m_slots;
};

#endif
