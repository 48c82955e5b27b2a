#ifndef _CT_DETAIL_VIEW_BASIC_INFO_ITEM_H_
#define _CT_DETAIL_VIEW_BASIC_INFO_ITEM_H_

#include "CtDetailViewGenlistItem.h"

// The name row: thumbnail with the favourite star, the display name and, in
// the four-line mode, the phonetic name, nickname and company. Tapping the
// star toggles the favourite state.
class CtDetailViewBasicInfoItem : public CtDetailViewGenlistItem {
public:
	// `mode` non-zero: the four-line style with the extra lines.
	CtDetailViewBasicInfoItem(CtDetailDataBase* data, int mode);
	~CtDetailViewBasicInfoItem() override;

	// Set by a star tap: the row selection that the same tap produces is to be
	// ignored once by the screen, which clears it.
	bool getSkipOnce() const { return m_skipOnce; }
	void clearSkipOnce() { m_skipOnce = false; }
	bool isFavorite() const { return m_isFavorite; }
	// The star, while the row is realized.
	Evas_Object* getFavoriteIcon() const { return m_star; }

public: // CtDetailViewGenlistItem
	int getItemType() override { return DETAIL_ITEM_BASIC_INFO; }

protected:
	const char* getItemStyle() override { return m_mode ? "display_name_4line" : "display_name_1line"; }
	std::string getText(const char* part) override;
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	std::string __getSubName(int line);
	Evas_Object* __createThumbnail(Evas_Object* parent);
	void __toggleFavorite();
	void __forgetStar();
	static void __mouseUpCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __starDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);

	int m_mode;
	bool m_isFavorite;
	bool m_skipOnce = false;
	Evas_Object* m_thumbnailLayout = nullptr;
	Evas_Object* m_star = nullptr;
};

#endif
