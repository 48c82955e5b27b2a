// A row of a stand-in application's list: a text, an optional second line,
// an optional picture in front and an optional mark at the end (a radio for
// the current choice, a check for multi-select). Selecting the row runs its
// handler; a check row flips its check first.
#pragma once

#include "WGenlistItem.h"

#include <functional>
#include <string>

namespace ct::demo {

class StandInListItem : public app_assist::WGenlistItem {
public:
	enum class Mark { None, Radio, Check };
	using SelectHandler = std::function<void(StandInListItem& row)>;

	StandInListItem(std::string text, std::string subText, std::string picturePath, SelectHandler onSelect);

	void setMark(Mark mark, bool marked);
	bool isMarked() const { return m_marked; }
	const std::string& getText() const { return m_text; }
	// A number the list keeps for the row (a group id, ...).
	void setTag(int tag) { m_tag = tag; }
	int getTag() const { return m_tag; }

	// WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;
	void onSelect(Elm_Object_Item* item) override;

private:
	static char* __getTextCb(void* data, Evas_Object* obj, const char* part);
	static Evas_Object* __getContentCb(void* data, Evas_Object* obj, const char* part);
	Evas_Object* __makeMark(Evas_Object* parent) const;
	Evas_Object* __makePicture(Evas_Object* parent) const;

	std::string m_text;
	std::string m_subText;
	std::string m_picturePath;
	SelectHandler m_onSelect;
	Mark m_mark = Mark::None;
	bool m_marked = false;
	int m_tag = 0;
};

} // namespace ct::demo
