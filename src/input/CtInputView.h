#ifndef _CT_INPUT_VIEW_H_
#define _CT_INPUT_VIEW_H_

#include "CtLaunchRequest.h"
#include "CtSimListener.h"
#include "CtView.h"
#include "ICtChangeListener.h"
#include "IContactsTabPageView.h"
#include "WUiTimer.h"

#include <contacts.h>
#include <vconf.h>

#include <memory>
#include <string>

namespace app_assist {
class WPopup;
}

class CtData;
class CtEditTabView;
class CtInputViewControl;
class CtInputViewSimControl;
class CtThread;

// The create/edit form of a contact on the phone, an account or a SIM card:
// a title with Done and Cancel, the list control of the storage, and the
// save with its checks, its reply to the caller and what is shown next. It
// asks where new contacts go, asks before typed text is thrown away, and
// closes when its contact is deleted elsewhere or its SIM is switched off.
// The same class is a page of the edit tab view of a linked person.
class CtInputView : public CtView, public IContactsTabPageView, public ICtChangeListener, public CtSimListener {
public:
	// Edits `record` (taken over; null: a new contact).
	explicit CtInputView(contacts_record_h record);
	// A page of the edit tab view `host`, which outlives the page.
	CtInputView(contacts_record_h record, CtEditTabView* host);
	// With a request, the contact also takes the request's operation and
	// extras; the request is the host's and must outlive the view.
	CtInputView(contacts_record_h record, CtLaunchRequest* request);
	// A contact built from the request alone.
	explicit CtInputView(CtLaunchRequest* request);

	// Replaces the list: the ordinary control, or the SIM control when `sim`.
	void createInputViewControl(Evas_Object* layout, bool sim);
	// Done (or the edit tab view's Save) disabled exactly when nothing is entered.
	void updateSaveBtn(bool disabled);
	void focusOnSaveBtn();
	void setSipStatus(bool shown);
	void setNeedDiscardPopup(bool need);
	void showDiscardPopup();

	// Tab-page mode: the content is built on first use.
	void createEditSubViewContent();
	// Left untouched without a list control.
	void getChangedForEditTabSubView(bool* changed);
	void getEmptyForEditTabSubView(bool* empty);
	void saveContactForEditTabSubView();
	// False (with the notice) when the contact is in the emergency group
	// without a number; the edit tab view checks every page before saving.
	bool checkEmergencyForEditTabSubView();

	// The request's "type" extra; -1 without a request or a readable one.
	int getInputType() const { return m_inputType; }

	// What the controls and the tests read.
	std::shared_ptr<CtData> getData() const { return m_data; }
	Evas_Object* getLayout() const { return m_layout; }
	Evas_Object* getDoneButton() const { return m_doneButton; }
	Evas_Object* getCancelButton() const { return m_cancelButton; }
	// The list control now in the layout (null when none).
	app_assist::WControl* getInputControl() const;
	bool isCreateMode() const { return m_isCreateMode; }
	bool isSipShown() const { return m_isSipShown; }
	bool isDiscardPending() const { return m_needDiscardPopup; }
	// The view leaves once the keypad has gone down.
	bool isClosingAfterKeypad() const { return m_closeAfterKeypad; }
	bool isClosing() const { return m_isClosing; }
	bool isSaved() const { return m_isSaved; }
	int getStorageId() const { return m_storageId; }

	// app_assist::WControl
	const char* getClassName() override;

	// CtView
	void onLanguageChanged() override;

	// IContactsTabPageView
	void onTabSelect(Elm_Object_Item* naviItem) override;
	void onTabUnselect(Elm_Object_Item* naviItem) override;
	void onTabPop() override;
	void onTabScrollStart() override {}
	void onTabScrollStop() override {}

	// ICtChangeListener
	void onDbChanged(const char* viewUri) override;
	void onCompleteGetContacts() override {}
	void onConditionChagned() override {}

	// CtSimListener
	void onSimChanged() override;

protected:
	~CtInputView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onDestroy() override;
	void onPushed(Elm_Object_Item* naviItem) override;
	bool onPop() override;

private:
	void __initialize(CtLaunchRequest* request);
	void __readRequest();
	void __trimSimEmail();
	void __addExtensionThemes();
	void __setTitleText();
	void __createTitleButtons(Elm_Object_Item* naviItem);
	void __startStorageTimer();
	void __attachToSimInThread();
	void __detachFromSim();
	void __showNumberChangingAlert();
	bool __onStorageTimer();
	void __showDeviceOnlyPopup();
	void __showStorageListPopup();
	void __applyStorage(int storageId);
	void __addStorageButtons(app_assist::WPopup* popup, std::shared_ptr<int> chosen);

	void __save();
	void __saveInEditMode(const std::string& storageName);
	void __saveInCreateMode(const std::string& storageName);
	bool __isNameInUse();
	bool __passEmergencyCheck();
	void __addPrimaryContact(int contactId);
	void __replyEdit(bool success);
	void __replyCreate(bool success, int personId);
	void __closeAfterEdit();
	void __closeAfterCreate(int personId);
	void __pushDetailView(int personId);
	void __launchDetailsApp(int personId);
	void __launchImageCrop();
	void __onImageCropReply(app_control_h reply);
	void __closeTypeSelectors();
	void __popOutOrWaitForKeypad();
	void __onKeypadDown();
	bool __isAboveDetailView();

	void __showNameInUsePopup();
	void __editExistContact(contacts_record_h record);
	void __updateWithExistContact(contacts_record_h picked);
	void __pushRelationshipPicker();
	void __readEmptyAndChanged(bool* empty, bool* changed);
	void __onSimPowerChanged(const char* key);

	CtInputViewControl* __control() const;
	CtInputViewSimControl* __simControl() const;
	void __createControl(Evas_Object* layout, bool sim);
	bool __controlIsEmpty();
	bool __controlIsChanged();
	bool __controlCheckEmergencyGroup();
	void __controlUpdateNameRecordForSim();
	void __controlHideInputPanel();
	void __controlShowCreateKeypad();
	void __controlFocusForRename();
	void __controlCloseHoversel();
	void __controlUpdateStorageRow();
	void __controlUpdateRealizedItems();

	void __sendUgResult(const char* key, const char* value, const char* key2 = nullptr, const char* value2 = nullptr);
	void __sendAppControlReply(const char* key, const char* value, app_control_result_e result);

	static void __saveCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __cancelCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __simPowerChangedCb(keynode_t* node, void* data);

	std::weak_ptr<app_assist::WControl> m_control;
	std::weak_ptr<app_assist::WControl> m_simControl;
	CtLaunchRequest* m_request = nullptr;
	CtEditTabView* m_tabHost = nullptr;
	std::shared_ptr<CtData> m_data;
	app_assist::WUiTimerHandle m_storageTimer;
	int m_storageId = 0;
	bool m_isCreateMode = false;
	bool m_isSaved = false;
	bool m_leaveWithoutAsking = false;
	bool m_isContentMade = false;
	bool m_isSipShown = false;
	bool m_needDiscardPopup = false;
	bool m_nameCheckPassed = false;
	Evas_Object* m_doneButton = nullptr;
	Evas_Object* m_cancelButton = nullptr;
	Evas_Object* m_layout = nullptr;
	int m_inputType = -1;
	int m_savedPersonId = 0;
	app_assist::WUiTimerHandle m_detailTimer;
	app_assist::WUiTimerHandle m_storageIdler;
	struct SimAttachment;
	std::shared_ptr<SimAttachment> m_simAttachment;
	std::unique_ptr<CtThread> m_simThread;
	std::string m_tempFile;
	bool m_numberAlert = false;
	bool m_isClosing = false;
	bool m_closeAfterKeypad = false;
	bool m_listensToSimPower = false;
	Evas_Object* m_naviframeObj = nullptr;
	std::shared_ptr<bool> m_alive;
};

#endif
