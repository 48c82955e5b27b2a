#ifndef _CT_PROFILE_SHARE_WITH_VIEW_H_
#define _CT_PROFILE_SHARE_WITH_VIEW_H_

#include "CtView.h"
#include "WView.h"

class CtProfileSharingRow;

// Who may see the personal profile: all contacts, favourites or selected
// contacts (chosen in the contacts picker). Every row reads the stored level
// when drawn; nothing is cached.
class CtProfileShareWithView : public app_assist::WView, public CtView {
public:
	CtProfileShareWithView();

	Evas_Object* getGenlist() const { return m_genlist; }
	// The row text of a privacy level; empty for an unknown level.
	static const char* textIdOf(int level);

public: // app_assist::WView
	const char* getClassName() override { return "CtProfileShareWithView"; }

public: // CtView
	void onLanguageChanged() override;

protected:
	~CtProfileShareWithView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onCreated() override;
	void onPushed(Elm_Object_Item* naviItem) override;
	void onDestroy() override;

private:
	void __appendLevelRow(int level);
	Evas_Object* __createSettingArea(Evas_Object* parent);
	void __onLevelChosen(int level);
	void __refreshRows();
	static void __launchContactsPicker();
	static void __selectedContactsButtonClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	Evas_Object* m_genlist = nullptr;
	Evas_Object* m_radioGroup = nullptr;
};

#endif
