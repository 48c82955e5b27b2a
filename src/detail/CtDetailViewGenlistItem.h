#ifndef _CT_DETAIL_VIEW_GENLIST_ITEM_H_
#define _CT_DETAIL_VIEW_GENLIST_ITEM_H_

#include "CtDetailDataBase.h"
#include "WGenlistItem.h"

#include <string>

// Row kinds of the detail lists, as getItemType() answers them.
enum CtDetailItemType {
	DETAIL_ITEM_NONE = -1,
	DETAIL_ITEM_MULTI_IMAGE = 1,
	DETAIL_ITEM_PROFILE_MULTI_IMAGE = 2,
	DETAIL_ITEM_STATUS = 3,
	DETAIL_ITEM_BASIC_INFO = 4,
	DETAIL_ITEM_PROFILE_SHARING = 6,
	DETAIL_ITEM_NUMBER = 7,
	DETAIL_ITEM_VIDEO_CALL = 8,
	DETAIL_ITEM_EMAIL = 9,
	DETAIL_ITEM_FACEBOOK = 10,
	DETAIL_ITEM_ADDRESS = 11,
	DETAIL_ITEM_MESSENGER = 12,
	DETAIL_ITEM_WEBSITE = 13,
	DETAIL_ITEM_RELATION = 14,
	DETAIL_ITEM_EVENT = 15,
	DETAIL_ITEM_NOTE = 16,
	DETAIL_ITEM_RINGTONE = 17,
	DETAIL_ITEM_GROUPS = 18,
	DETAIL_ITEM_LINK = 19,
};

// Base of every row of the contact detail list: the item class built from
// the row's style, text and content, the copy text for the long-press popup
// and the highlight while that popup is open.
class CtDetailViewGenlistItem : public app_assist::WGenlistItem {
public:
	// `data` is not owned and must outlive the row.
	explicit CtDetailViewGenlistItem(CtDetailDataBase* data);
	~CtDetailViewGenlistItem() override;

	// The text the copy popup copies; empty when the row has nothing to copy.
	virtual std::string getCopyText();
	virtual int getItemType();
	// Power saving turns off the actions of the video-call, e-mail and
	// address rows; the caller updates the item.
	void setPowerSaving(bool on)
	{
		m_powerSaving = on;
		invalidateContent();
	}
	bool isPowerSaving() const { return m_powerSaving; }

	// Contents made so far are not reused when the item is realized or its
	// parts updated again; call it when what the contents show has changed.
	void invalidateContent();

	void setHighlighted(bool on) { highlighted = on; }
	bool isHighlighted() const { return highlighted; }
	CtDetailDataBase* getData() const { return m_data; }

	// The colour code of action icons: the SIM colour when one SIM is in use, else "A03O004".
	static std::string getIconColorCode();
	// getIconColorCode() as read when the current contents were made.
	const std::string& iconColorCode();

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassNew() override;

protected:
	virtual const char* getItemStyle() = 0;
	// Text of `part`, markup; empty for none.
	virtual std::string getText(const char* part);
	virtual Evas_Object* getContent(Evas_Object* genlist, const char* part);
	// An action icon of the row ("touch.call", "touch.message" or "touch.icon") was tapped.
	virtual void onIconClicked(const char* touchPart);

	// `markup` wrapped in the highlight backing while the copy popup is open.
	std::string highlightMain(const std::string& markup) const;
	static std::string toMarkup(const char* text);
	static std::string translate(const char* textId);
	// A type label of the common library (a translation id or a custom label) as markup.
	static std::string typeLabel(const char* label);
	// A transparent rectangle as large as the row's `textPart` (a literal)
	// draws its text, at most 656 x 54 (scaled); sized when the row is realized.
	static Evas_Object* createCopyArea(Evas_Object* genlist, const char* textPart);
	// The icon layout `group` of "contacts/detail_layout.edj" with the
	// buttons added by addIconButton.
	static Evas_Object* createIconLayout(Evas_Object* parent, const char* group);
	// Puts a "btn_with_swallow" button showing `image` into `part` of the
	// icon layout; taps on `touchPart` run onIconClicked.
	void addIconButton(Evas_Object* layout, const char* part, const char* image, const char* touchPart, bool disabled);
	// A usage-log record of `feature` (and `extra` when not null); the result is ignored.
	static void insertUsageLog(const char* feature, const char* extra);

	bool highlighted = false;
	bool m_powerSaving = false;

private:
	static char* __textGetCb(void* data, Evas_Object* obj, const char* part);
	static Evas_Object* __contentGetCb(void* data, Evas_Object* obj, const char* part);
	static Evas_Object* __reusableContentGetCb(void* data, Evas_Object* obj, const char* part, Evas_Object* old);
	static void __rowRealizedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __iconClickedCb(void* data, Evas_Object* obj, const char* emission, const char* source);
	static void __iconPressedCb(void* data, Evas_Object* obj, const char* emission, const char* source);
	static void __iconReleasedCb(void* data, Evas_Object* obj, const char* emission, const char* source);

	CtDetailDataBase* m_data;
	// Unique over all rows: the list keeps contents of deleted rows for reuse,
	// and a new row may be given the address of a deleted one.
	unsigned m_contentGeneration;
	std::string m_iconColor;
	unsigned m_iconColorGeneration = 0;
};

#endif
