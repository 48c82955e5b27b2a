#ifndef _CT_DETAIL_VIEW_MULTI_IMAGE_ITEM_H_
#define _CT_DETAIL_VIEW_MULTI_IMAGE_ITEM_H_

#include "CtDetailViewGenlistItem.h"

class CtDetailViewItemOwner;

// The picture row: the default picture, the one picture, or a pager over
// up to five pictures with a page indicator. Selecting it opens the
// picture view at the shown page; copying copies the shown picture.
class CtDetailViewMultiImageItem : public CtDetailViewGenlistItem {
public:
	static constexpr int kMaxPictures = 5;

	// `owner` is not owned and may be null (selection then does nothing).
	// `isLowSize`: the single picture is smaller than the picture area.
	CtDetailViewMultiImageItem(CtDetailViewItemOwner* owner, CtDetailDataBase* data, bool isLowSize);
	~CtDetailViewMultiImageItem() override;

	// The page shown by the pager (0 without a pager).
	int getCurrentPage() const;
	// The pager, while the row is realized with two or more pictures.
	Evas_Object* getPager() const { return m_scroller; }

public: // CtDetailViewGenlistItem
	// Path of the picture on the shown page; empty without a picture.
	std::string getCopyText() override;
	int getItemType() override { return DETAIL_ITEM_MULTI_IMAGE; }
	void onSelect(Elm_Object_Item* item) override;

protected:
	const char* getItemStyle() override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	Evas_Object* __createDefaultPicture(Evas_Object* parent);
	Evas_Object* __createSinglePicture(Evas_Object* parent, const char* path, const char* group);
	Evas_Object* __createPager(Evas_Object* parent);
	void __forgetPager();
	static void __pagerDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __pageChangedCb(void* data, Evas_Object* obj, void* eventInfo);

	CtDetailViewItemOwner* m_owner;
	bool m_isLowSize;
	Evas_Object* m_scroller = nullptr;
};

#endif
