#ifndef _CT_PROFILE_SHARING_ROW_H_
#define _CT_PROFILE_SHARING_ROW_H_

#include "WGenlistItem.h"

#include <functional>
#include <map>
#include <string>

// A row of the profile-sharing lists: an item style, texts by part (each
// asked for when drawn, so a row shows the current setting) and contents by
// part. A row without a selection handler is display only.
class CtProfileSharingRow : public app_assist::WGenlistItem {
public:
	// Returns a translation id or a plain text; empty for nothing.
	using TextSource = std::function<std::string()>;
	using ContentSource = std::function<Evas_Object*(Evas_Object* parent)>;
	using SelectHandler = std::function<void(CtProfileSharingRow* row)>;

	explicit CtProfileSharingRow(const char* style);

	void setText(const char* part, TextSource source);
	// A fixed translation id.
	void setTextId(const char* part, const char* textId);
	void setContent(const char* part, ContentSource source);
	void setSelectHandler(SelectHandler handler);

	// Appends the row to `genlist`; the genlist owns it then. Null (and the row
	// deleted) when appending failed.
	static CtProfileSharingRow* append(Evas_Object* genlist, CtProfileSharingRow* row);

	// An "on&off" check in a "list/C/type.3" holder, letting events pass to
	// the row, calling `changedCb(data)` when toggled.
	static Evas_Object* createSwitch(Evas_Object* parent, bool on, Evas_Smart_Cb changedCb, void* data);
	// A radio of `state` joined to `group`, in a "list/B/type.4" holder.
	static Evas_Object* createRadio(Evas_Object* parent, Evas_Object* group, int state);

	const std::string& getStyle() const { return m_style; }
	// The text a person sees in `part` (translated); empty for none.
	std::string getText(const char* part) const;
	// The control swallowed by the holder layout in `part`; null while the
	// row is not realized.
	Evas_Object* getHeldContent(const char* part) const;
	bool isDisplayOnly() const { return !m_onSelect; }

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassNew() override;
	void onSelect(Elm_Object_Item* item) override;

private:
	static char* __textGetCb(void* data, Evas_Object* obj, const char* part);
	static Evas_Object* __contentGetCb(void* data, Evas_Object* obj, const char* part);

	std::string m_style;
	std::map<std::string, TextSource> m_texts;
	std::map<std::string, ContentSource> m_contents;
	SelectHandler m_onSelect;
};

#endif
