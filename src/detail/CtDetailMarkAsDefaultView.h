#ifndef _CT_DETAIL_MARK_AS_DEFAULT_VIEW_H_
#define _CT_DETAIL_MARK_AS_DEFAULT_VIEW_H_

#include "CtDetailMarkAsDefaultItem.h"
#include "CtView.h"
#include "WView.h"

#include <vector>

class CtDetailDataBase;

// Chooses which linked contact gives a person its name and which picture the
// person shows: a group of pictures (one per linked contact) and a group of
// names, each with radios. Done is enabled only while a choice differs from
// the person's current one, and writes only the choices that differ.
class CtDetailMarkAsDefaultView : public app_assist::WView, public CtView {
public:
	// Everything shown is read here: `data` is not kept, so the screen below
	// may replace its data while this one is shown.
	explicit CtDetailMarkAsDefaultView(CtDetailDataBase* data);

	// True when the person offers a choice of pictures or of names.
	static bool hasChoice(CtDetailDataBase* data);

	Evas_Object* getGenlist() const { return m_genlist; }
	Evas_Object* getDoneButton() const { return m_doneButton; }
	int getSelectedPictureIndex() const { return m_selectedPicture; }
	int getSelectedNameIndex() const { return m_selectedName; }

public: // app_assist::WView
	const char* getClassName() override { return "CtDetailMarkAsDefaultView"; }

public: // CtView
	void onLanguageChanged() override;

protected:
	~CtDetailMarkAsDefaultView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onPushed(Elm_Object_Item* naviItem) override;

private:
	using Entry = CtDetailMarkAsDefaultItem::Entry;

	void __collectPictures(CtDetailDataBase* data);
	void __collectNames(CtDetailDataBase* data);
	void __addTitleButtons(Elm_Object_Item* naviItem);
	void __addGroup(const char* titleId, const std::vector<Entry>& entries, Evas_Object** radio, int selected);
	void __appendRow(const Entry& entry, Evas_Object* radio);
	void __onRowSelected(CtDetailMarkAsDefaultItem* row);
	void __updateDoneButton();
	void __doSetDefault();
	static void __cancelClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __doneClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	int m_personId = 0;
	std::vector<Entry> m_pictures;
	std::vector<Entry> m_names;
	Evas_Object* m_doneButton = nullptr;
	Evas_Object* m_genlist = nullptr;
	Evas_Object* m_pictureRadio = nullptr;
	Evas_Object* m_nameRadio = nullptr;
	int m_selectedPicture = -1;
	int m_selectedName = -1;
	int m_initialPicture = -1;
	int m_initialName = -1;
};

#endif
