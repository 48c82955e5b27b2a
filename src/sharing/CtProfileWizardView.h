#ifndef _CT_PROFILE_WIZARD_VIEW_H_
#define _CT_PROFILE_WIZARD_VIEW_H_

#include "WView.h"

#include <Elementary.h>
#include <app_control.h>

// The first-time set-up of profile sharing in three steps: the feature (and
// the sign-up when not done), the profile type (personal or business), then
// the fields to share, all four turned on. Next on the last step opens the
// profile editor; saving there closes the wizard too. Back goes one step
// back; on the first step it leaves.
class CtProfileWizardView : public app_assist::WView {
public:
	CtProfileWizardView();

	int getStep() const { return m_step; }
	Evas_Object* getNextButton() const { return m_nextButton; }
	// The list of the step (null on step 1).
	Evas_Object* getGenlist() const { return m_genlist; }
	// The text of the step's title area (empty while it is hidden).
	const char* getTitleAreaText() const;

public: // app_assist::WView
	const char* getClassName() override { return "CtProfileWizardView"; }

protected:
	~CtProfileWizardView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onCreated() override;
	void onPushed(Elm_Object_Item* naviItem) override;
	bool onPop() override;
	void onDestroy() override;

private:
	void __showStep(int step);
	void __updateNaviTitle();
	void __updateTopLayout();
	void __updateTitleLayout();
	void __updateContentsLayout();
	void __updateGenlist();
	Evas_Object* __updateArea(Evas_Object* area, bool visible, const char* group, const char* part);
	void __appendProfileItems();
	void __profileTypeItemClicked(int type);
	void __next();
	void __openEditor();
	static void __nextButtonClickCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __signUpResultCb(app_control_h request, app_control_h reply, app_control_result_e result, void* data);
	static void __wizardExitCb(void* data);

	int m_step = 1;
	Evas_Object* m_baseLayout = nullptr;
	Evas_Object* m_topLayout = nullptr;
	Evas_Object* m_titleLayout = nullptr;
	Evas_Object* m_contentsLayout = nullptr;
	Evas_Object* m_genlist = nullptr;
	Evas_Object* m_radioGroup = nullptr;
	Evas_Object* m_nextButton = nullptr;
	bool m_topVisible = false;
	bool m_titleVisible = false;
	bool m_contentsVisible = false;
	bool m_listVisible = false;
};

#endif
