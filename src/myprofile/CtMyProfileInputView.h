#ifndef _CT_MY_PROFILE_INPUT_VIEW_H_
#define _CT_MY_PROFILE_INPUT_VIEW_H_

#include "CtLaunchRequest.h"
#include "CtView.h"
#include "ICtChangeListener.h"
#include "WView.h"

#include <Elementary.h>
#include <contacts.h>

#include <functional>
#include <memory>

class CtData;
class CtMyProfileInputData;

// The create/edit form of the user's own profile: up to five pictures, the
// name fields, the status, the phone's own number and the other fields of
// the profile. Done writes the profile and closes the form; Cancel or back
// asks before changes are discarded. In the profile wizard the form makes
// sure the fields chosen for sharing have rows.
class CtMyProfileInputView : public app_assist::WView, public CtView, public ICtChangeListener {
public:
	using WizardCallback = std::function<void(void* wizardView)>;

	// The stored profile; when none is stored, `record` (may be null; taken
	// over) seeds the new one. `request` (may be null) is the host's request,
	// kept for the life of the view.
	CtMyProfileInputView(contacts_record_h record, CtLaunchRequest* request);
	// The form opened by the profile wizard `wizardView`: `wizardCallback`
	// runs once with `wizardView` when a save starts or the form is left
	// discarding its changes.
	CtMyProfileInputView(WizardCallback wizardCallback, void* wizardView);

	Evas_Object* getGenlist() const { return m_genlist; }
	Evas_Object* getDoneButton() const { return m_doneButton; }
	std::shared_ptr<CtData> getInputData() const;
	bool isNewProfile() const { return m_isNew; }
	bool isWizardMode() const { return m_wizardMode; }
	bool isSaved() const { return m_saved; }

public: // app_assist::WView
	const char* getClassName() override { return "CtMyProfileInputView"; }

public: // CtView
	void onLanguageChanged() override;

public: // ICtChangeListener
	void onDbChanged(const char* viewUri) override;
	void onCompleteGetContacts() override {}
	void onConditionChagned() override {}

protected:
	~CtMyProfileInputView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onPushed(Elm_Object_Item* naviItem) override;
	bool onPop() override;
	void onDestroy() override;

private:
	void __init();
	void __addTitleButtons(Elm_Object_Item* naviItem);
	void __addAllItems();
	void __save();
	static void __saveCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __cancelCb(void* data, Evas_Object* obj, void* eventInfo);

	CtLaunchRequest* m_request = nullptr;
	std::shared_ptr<CtMyProfileInputData> m_inputData;
	Evas_Object* m_genlist = nullptr;
	Evas_Object* m_doneButton = nullptr;
	Evas_Object* m_cancelButton = nullptr;
	bool m_saved = false;
	bool m_isNew = false;
	bool m_wizardMode = false;
	void* m_wizardView = nullptr;
	WizardCallback m_wizardCallback;
	bool m_popRequested = false;
};

#endif
