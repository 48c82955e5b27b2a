#ifndef _CT_MY_PROFILE_INPUT_VIEW_H_
#define _CT_MY_PROFILE_INPUT_VIEW_H_

#include "CtLaunchRequest.h"
#include "CtView.h"
#include "ICtChangeListener.h"
#include "WView.h"

#include <Elementary.h>
#include <app_control.h>
#include <contacts.h>
#include <vconf.h>

#include <array>
#include <functional>
#include <memory>
#include <string>

class CtData;
class CtMyProfileInputData;
class CtInputViewBasicInfoItem;
class CtInputViewGenlistItem;
class CtInputViewImportantFieldsItem;
struct CtInputViewItemCallbacks;

// The create/edit form of the user's own profile: up to five pictures, the
// name fields, the status, the phone's own number and the other fields of
// the profile. Done writes the profile and closes the form (a failed write
// keeps it open with a notice); Cancel or back asks before changes are
// discarded. In the profile wizard the form makes sure the fields chosen for
// sharing have rows.
class CtMyProfileInputView : public app_assist::WView, public CtView, public ICtChangeListener {
public:
	using WizardCallback = std::function<void(void* wizardView)>;

	// Row kinds, in list order.
	enum RowKind {
		MYPROFILE_INPUT_IMAGE, MYPROFILE_INPUT_BASIC_INFO, MYPROFILE_INPUT_STATUS, MYPROFILE_INPUT_MSISDN,
		MYPROFILE_INPUT_NUMBER, MYPROFILE_INPUT_EMAIL, MYPROFILE_INPUT_NOTE, MYPROFILE_INPUT_ADDRESS,
		MYPROFILE_INPUT_EVENT, MYPROFILE_INPUT_WEBSITE, MYPROFILE_INPUT_MESSENGER, MYPROFILE_INPUT_ADD_FIELD,
		MYPROFILE_INPUT_MAX
	};

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
	bool isLunarAllowed() const { return m_lunarAllowed; }
	// The first list item of `kind` (null when the list has none).
	Elm_Object_Item* getFirstItem(RowKind kind) const;

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
	void __addItem(int index, bool hasInfo);
	void __addBasicInfoItem();
	void __addFieldItems(RowKind kind, Eina_List* records);
	void __addEventItems();
	Elm_Object_Item* __insertRow(RowKind kind, CtInputViewGenlistItem* row);
	CtInputViewGenlistItem* __createFieldRow(RowKind kind, contacts_record_h record, bool addedByUser);
	CtInputViewItemCallbacks __fieldCallbacks(RowKind kind);
	Elm_Object_Item* __addFieldRow(RowKind kind, contacts_record_h record, bool addedByUser);
	void __appendEventItem(int date, int calendarType, int isLeapMonth, bool addedByUser);
	void __updateEventItems();
	void __itemDeleted(RowKind kind, bool heldText, contacts_record_h record);
	void __basicInfoItemDeleted(int group);
	void __updateSaveBtn();
	bool __isAllEmpty();
	bool __isChanged();
	void __focusNextEntry(Elm_Object_Item* item);

	void __addNumberClickedCb();
	void __addEmailClickedCb();
	void __addNoteClickedCb();
	void __addMoreClickedCb();
	void __showMorePopup();
	void __importantSubitemSelected(int entry);
	void __showBasicInfoGroup(int group);
	void __createEventDataPopup();

	void __onPictureClicked(int order);
	void __showPicturePopup();
	void __pictureActionSelected(int action);
	void __launchGallery();
	void __launchCamera();
	void __launchDecorateContactImage();
	void __launch(app_control_h request);
	void __updateImageRecord(const char* path);
	void __removeImage();
	void __updateImageItem();
	void __pushChangeOrder();
	void __readKnownImagePaths();
	void __launchMapsApp(contacts_record_h address);

	void __save();
	void __removeEmptyItems();
	bool __writeProfile();
	void __writeUsageLogs();
	void __requestPop();
	void __showDiscardPopup();
	void __closeHoversel();
	void __onSipUp();
	void __onSipDown();

	static void __saveCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __cancelCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __onSipUpCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __onSipDownCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __onNotifyUPSModeChangedCb(keynode_t* node, void* data);
	static void __pictureReplyCb(app_control_h request, app_control_h reply, app_control_result_e result, void* data);
	static void __moreItemSelectedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __pictureItemSelectedCb(void* data, Evas_Object* obj, void* eventInfo);

	CtLaunchRequest* m_request = nullptr;
	std::shared_ptr<CtMyProfileInputData> m_inputData;
	Evas_Object* m_genlist = nullptr;
	bool m_saved = false;
	bool m_isNew = false;
	Evas_Object* m_doneButton = nullptr;
	Evas_Object* m_cancelButton = nullptr;
	Evas_Object* m_windowObj = nullptr;
	bool m_morePending = false;
	bool m_keypadUp = false;
	bool m_lunarAllowed = false;
	std::array<std::string, 5> m_knownImagePaths;
	bool m_wizardMode = false;
	void* m_wizardView = nullptr;
	WizardCallback m_wizardCallback;
	bool m_popPending = false;
	bool m_popRequested = false;
	bool m_discardConfirmed = false;
	bool m_rowsAddedOrDeleted = false;
	bool m_pictureChanged = false;
	bool m_psmodeListening = false;
	int m_pictureSlot = 1;
	std::string m_initialStatus;
	std::shared_ptr<bool> m_hasBirthday;
	CtInputViewBasicInfoItem* m_basicInfoRow = nullptr;
	CtInputViewImportantFieldsItem* m_addFieldRow = nullptr;
};

#endif
