#ifndef _CT_INPUT_VIEW_CONTROL_H_
#define _CT_INPUT_VIEW_CONTROL_H_

#include "CtData.h"
#include "WControl.h"
#include "WUiTimer.h"

#include <app_control.h>
#include <contacts.h>
#include <vconf.h>

#include <array>
#include <functional>
#include <memory>
#include <string>
#include <utility>
#include <vector>

class CtDatePicker;
class CtInputView;
class CtInputViewGenlistItem;
class CtInputViewRelationItem;
class CtPredictionListTrigger;

// The list of the contact create/edit form (phone and account storages):
// the rows of the edited contact in a fixed order of kinds, the add buttons
// and the add-field popup, the Save button kept enabled only while something
// is entered, the keypad's return keys and focus moves, the storage switch,
// and the pickers it starts (picture, ringtone, groups, event date,
// relationship contact, address on a map).
class CtInputViewControl : public app_assist::WControl {
public:
	// Row kinds, in list order; also the index of the last row of each kind.
	enum InputItemKind {
		INPUT_BASIC_INFO = 0,
		INPUT_STATUS = 1,
		INPUT_NUMBER = 2,
		INPUT_EMAIL = 3,
		INPUT_NOTE = 4,
		INPUT_ADDRESS = 5,
		INPUT_EVENT = 6,
		INPUT_RELATIONSHIP = 7,
		INPUT_WEBSITE = 8,
		INPUT_MESSENGER = 9,
		INPUT_RINGTONE = 10,
		INPUT_GROUPS = 11,
		INPUT_ADDRESSBOOK = 12,
		INPUT_IMPORTANT_FIELDS = 13,
		INPUT_FINISH = 15,
	};
	static constexpr int kItemKindCount = 14;
	// A stored contact with more field records than this is listed one row per frame.
	static constexpr int kDeferredAppendThreshold = 10;

	using ExistingContactCallback = std::function<void(contacts_record_h record)>;

	// `view` owns the control and outlives it. `onExistingContact` gets the
	// contact picked in the name prediction list, `onSelectRelationContact`
	// runs when a relationship row asks for a contact, `onKeypadDown` each
	// time the keypad went down.
	CtInputViewControl(std::shared_ptr<CtData> inputData, CtInputView* view, ExistingContactCallback onExistingContact,
			std::function<void()> onSelectRelationContact, std::function<void()> onKeypadDown);

	// True when every row is empty (nothing to save); a contact of the
	// profile-sharing storage is never empty.
	bool __checkIsEmpty();
	// True when the person entered anything, or the list holds rows that
	// count as input by themselves (events, ringtone, groups, picture).
	bool __checkIsInsert();
	// True when the contact differs from what was loaded.
	bool getIsChanged();
	void hideInputPanel();
	// Raises the keypad on the name entry of a new contact.
	void basicInfoItemShowCreateKeypad();
	void focusForRename();
	// False only when the contact is in the emergency group without a number.
	bool checkEmergencyGroup();
	// Closes the prediction list and every open type selector.
	void closeHoversel();
	// Shows the storage row again (after the storage or a SIM changed).
	void updateAddrbookItem();
	// Rebuilds the shown rows' texts (after a language change).
	void updateRealizedItems();

	Evas_Object* getGenlist() const { return m_genlist; }
	// The last row of `kind`, null when none.
	Elm_Object_Item* getLastItem(InputItemKind kind) const;
	// Whether the rows are still being appended frame by frame.
	bool isAppending() const { return m_isDeferredAppend && m_appendAnimator.lock() != nullptr; }
	// The picture copied from the last pick of this session (empty when none).
	const std::string& getCopiedImagePath() const { return m_copiedImagePath; }

	// WControl
	const char* getClassName() override;

protected:
	~CtInputViewControl() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onDestroy() override;

private:
	using RemainingItem = std::pair<int, contacts_record_h>;

	// List building.
	void __addAllItems(Evas_Object* genlist);
	void __appendRemainingItems();
	bool __appendRemainingItemsCb();
	bool __appendItem(int kind, contacts_record_h record, bool deferred);
	Elm_Object_Item* __appendRow(CtInputViewGenlistItem* row);
	Elm_Object_Item* __insertRow(CtInputViewGenlistItem* row, int kind, bool showTop);
	Elm_Object_Item* __findInsertAfter(int kind) const;
	CtInputViewGenlistItem* __makeFieldRow(int kind, contacts_record_h record, int addKind);
	CtInputViewGenlistItem* __makeEventRow(contacts_record_h record, const char* initialText);
	void __finishList(bool deferred);
	CtInputViewGenlistItem* __rowOf(Elm_Object_Item* item) const;
	CtInputViewGenlistItem* __rowOf(int kind) const { return __rowOf(m_genlistItems[kind]); }
	// Rows from the first (or the basic info row) up to the storage or add-buttons row.
	std::vector<Elm_Object_Item*> __fieldItems(bool fromBasicInfo) const;
	bool __isEasySignUpStorage();
	bool __isProfileSharingStorage();
	bool __isPowerSaving() const;

	// Row callbacks.
	void __updateSaveBtn();
	void __activateNextEntry(Evas_Object* entry, Elm_Object_Item* item);
	void __updateEntryReturnKeyType(Elm_Object_Item* except);
	void __updateEntryReturnTypeByFocusedState(bool focused);
	void __itemDeleted(int kind, Elm_Object_Item* item, bool heldText, contacts_record_h record);
	void __ringtoneItemDeleted(bool heldText);
	void __basicInfoItemDeleted(int group);
	void __updateEventItems();
	void __updateBasicInfoItem();

	// Add buttons and the add-field popup.
	void __addFieldRow(int kind);
	void __addNumberClickedCb();
	void __addEmailClickedCb();
	void __addNoteClickedCb();
	void __addMoreClickedCb();
	void __showMorePopup();
	Evas_Object* __createMorePopupContent(Evas_Object* parent);
	void __importantSubitemSelectedCb(int entry, Elm_Object_Item* item);
	void __showBasicInfoGroup(int group);

	// Storage.
	void __onAddrbookItemSelectedCb();
	void __onAddrbookPicked(int addressbookId);
	void __switchAddressbook(int addressbookId);
	void __createChangeLocationPopup(int newId, int oldId);

	// Keypad.
	void __onSipUpCb();
	void __onSipDownCb();
	bool __isKeypadShown() const;

	// Prediction list.
	void __createPredictionList(Evas_Object* entry);

	// Picture.
	void __basicInfoItemImageClicked();
	void __onPictureChoice(int index);
	void __launchGallery();
	void __launchCamera();
	void __launchDecorateContactImage();
	bool __sendRequest(app_control_h request, app_control_reply_cb replyCb);
	void __onPictureReply(app_control_result_e result, app_control_h reply, const char* key, bool isArray);
	void __updateImageData(const char* path);
	void __onRemoveSelCb();
	void __refreshPicture();
	void __setPictureFocus(bool allowed);

	// Ringtone.
	void __onRingtoneSelectedCb();
	void __onRingtoneReply(app_control_h reply);
	void __addRingtonItem();

	// Groups.
	void __launchGroupsUG();
	void __onGroupsReply(app_control_h reply);
	int __createGroup(const std::string& name, int addressbookId);
	void __addGroupsItem();

	// Event date popup.
	void __createEventDataPopup();
	Evas_Object* __createEventDatePopupContent(Evas_Object* parent);
	CtDatePicker* __datePicker() const;
	void __calendarBtnClickedCb();
	void __datetimeValueChangedCb();
	void __onEventDateSet();
	void __appendEventItem(int year, int month, int day);

	// Relationship and maps.
	void __relationSelectContactClicked(CtInputViewRelationItem* row);
	void __onRelationshipPersonPicked(int personId);
	void __launchMapsApp(Elm_Object_Item* item, contacts_record_h record);
	void __onMapsReply(app_control_h reply);

	// Settings.
	void __onPowerSavingChanged();

	static void __genlistRealizedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __genlistPressedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __genlistScrollCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __genlistResizeCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __genlistMouseDownCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __sipUpCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __sipDownCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __regionFormatChangedCb(keynode_t* node, void* data);
	static void __powerSavingChangedCb(keynode_t* node, void* data);
	static void __moreSubitemSelectedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __galleryReplyCb(app_control_h request, app_control_h reply, app_control_result_e result, void* data);
	static void __cameraReplyCb(app_control_h request, app_control_h reply, app_control_result_e result, void* data);
	static void __decorateReplyCb(app_control_h request, app_control_h reply, app_control_result_e result, void* data);
	static void __ringtoneReplyCb(app_control_h request, app_control_h reply, app_control_result_e result, void* data);
	static void __groupsReplyCb(app_control_h request, app_control_h reply, app_control_result_e result, void* data);
	static void __mapsReplyCb(app_control_h request, app_control_h reply, app_control_result_e result, void* data);
	static CtInputViewControl* __fromReply(void* data);
	static bool __isSuccess(app_control_result_e result);

	std::shared_ptr<CtData> m_inputData;
	CtInputView* m_view;
	// Expires with the view (which may be gone before this control's onDestroy).
	std::weak_ptr<app_assist::WControl> m_viewRef;
	ExistingContactCallback m_onExistingContact;
	std::function<void()> m_onSelectRelationContact;
	std::function<void()> m_onKeypadDown;

	Evas_Object* m_genlist = nullptr;
	Evas_Object* m_conformant = nullptr;
	Evas_Object* m_nameEntry = nullptr;
	std::array<Elm_Object_Item*, kItemKindCount> m_genlistItems = {};
	std::shared_ptr<bool> m_hasBirthday;
	bool m_isItemDeleted = false;
	bool m_isMorePopupPending = false;
	bool m_isSipShown = false;
	bool m_isPictureLaunched = false;
	bool m_isPicturePopupShown = false;
	bool m_isAdding = false;
	int m_addedKind = 0;
	bool m_isRingtonePickerLaunched = false;
	bool m_isLunarSupported = false;
	bool m_isPowerSaving = false;

	std::vector<RemainingItem> m_remainingItems;
	size_t m_remainingIndex = 0;
	bool m_isDeferredAppend = false;
	app_assist::WUiTimerHandle m_appendAnimator;
	app_assist::WUiTimerHandle m_ringtonePopupTimer;
	app_assist::WUiTimerHandle m_nameKeypadTimer;
	app_assist::WUiTimerHandle m_autoScrollIdler;

	// Event date popup.
	std::weak_ptr<app_assist::WControl> m_datePicker;
	Evas_Object* m_calendarButton = nullptr;
	bool m_isSolar = true;
	bool m_isLeapMonth = false;

	Elm_Object_Item* m_relationItem = nullptr;
	contacts_record_h m_relationRecord = nullptr;
	Elm_Object_Item* m_addressItem = nullptr;
	contacts_record_h m_addressRecord = nullptr;
	std::string m_copiedImagePath;
	bool m_isImageChanged = false;

	std::unique_ptr<CtPredictionListTrigger> m_prediction;
	std::weak_ptr<app_assist::WControl> m_morePopup;
	std::weak_ptr<app_assist::WControl> m_picturePopup;
	std::weak_ptr<app_assist::WControl> m_changeLocationPopup;
	std::weak_ptr<app_assist::WControl> m_storagePopup;
	std::weak_ptr<app_assist::WControl> m_datePopup;
	int m_registryListenerId = 0;
	// Handed to late callbacks: false once the control is gone.
	std::shared_ptr<bool> m_alive;
};

#endif
