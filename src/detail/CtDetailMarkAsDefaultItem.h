#ifndef _CT_DETAIL_MARK_AS_DEFAULT_ITEM_H_
#define _CT_DETAIL_MARK_AS_DEFAULT_ITEM_H_

#include "WGenlistItem.h"

#include <functional>
#include <string>

// A row of the mark-as-default list: a group title, or one choice of a
// picture or of a name with its radio. Texts are translation ids or plain
// texts; the radio joins the group's radio, which the view owns.
class CtDetailMarkAsDefaultItem : public app_assist::WGenlistItem {
public:
	enum class Kind { Picture, Name, GroupIndex };

	struct Entry {
		Kind kind = Kind::Name;
		int index = -1;       // position within its group
		int id = 0;           // picture id or contact id
		std::string text1;    // group title, account or display name
		std::string text2;    // account text
		std::string path;     // picture path
	};

	// `onSelected` runs when the row or its radio is chosen (not for group titles).
	CtDetailMarkAsDefaultItem(const Entry& entry, Evas_Object* groupRadio,
		std::function<void(CtDetailMarkAsDefaultItem*)> onSelected);

	const Entry& getEntry() const { return m_entry; }
	const char* getItemStyle() const;
	// The text a person sees in `part` (translated); empty for none.
	std::string getText(const char* part) const;

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassNew() override;
	void onSelect(Elm_Object_Item* item) override;

private:
	Evas_Object* __getContent(Evas_Object* genlist, const char* part);
	Evas_Object* __createThumbnail(Evas_Object* parent);
	Evas_Object* __createRadio(Evas_Object* parent);
	static char* __textGetCb(void* data, Evas_Object* obj, const char* part);
	static Evas_Object* __contentGetCb(void* data, Evas_Object* obj, const char* part);
	static void __radioChangedCb(void* data, Evas_Object* obj, void* eventInfo);

	Entry m_entry;
	Evas_Object* m_groupRadio;
	std::function<void(CtDetailMarkAsDefaultItem*)> m_onSelected;
};

#endif
