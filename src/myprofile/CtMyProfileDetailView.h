#ifndef _CT_MY_PROFILE_DETAIL_VIEW_H_
#define _CT_MY_PROFILE_DETAIL_VIEW_H_

#include "CtDetailViewItemOwner.h"
#include "CtView.h"
#include "ICtChangeListener.h"
#include "WUiTimer.h"
#include "WView.h"

#include <app_control.h>
#include <vconf.h>

#include <memory>

class CtDbChangeSubscription;
class CtDetailViewGenlistItem;
class CtMyProfileDetailData;

// The user's own profile, read only: the pictures, the profile-sharing state
// and status, then numbers, e-mails, notes, addresses, events, relationships,
// web sites and messengers. A bottom button shares the profile; the more menu
// leads to its edit form and to the profile-sharing settings. The list
// follows changes of the profile (coalesced, as the person detail screen
// does), of power saving and of the sharing state; the screen closes when
// the profile is deleted.
class CtMyProfileDetailView : public app_assist::WView, public CtView, public ICtChangeListener,
		public CtDetailViewItemOwner {
public:
	// `mode` is kept for the caller; the screen looks the same either way.
	explicit CtMyProfileDetailView(bool mode);

	int getPersoinId();
	CtMyProfileDetailData* getDetailData() const { return m_detailData.get(); }
	Evas_Object* getGenlist() const { return m_genlist; }
	Elm_Object_Item* getProfileSharingItem() const { return m_profileSharingItem; }
	Elm_Object_Item* getStatusItem() const { return m_statusItem; }
	Evas_Object* getShareButton() const { return m_shareButton; }
	bool isPowerSaving() const { return m_isPowerSaving; }
	// How many times the list was rebuilt after the profile or its sharing changed.
	int getRebuildCount() const { return m_rebuildCount; }

public: // app_assist::WView
	const char* getClassName() override { return "CtMyProfileDetailView"; }

public: // ICtChangeListener
	void onDbChanged(const char* viewUri) override;
	void onCompleteGetContacts() override;
	void onConditionChagned() override;

public: // CtView
	void onLanguageChanged() override;

public: // CtDetailViewItemOwner
	void onVideoCallSelected() override;
	void onAddressSelected(contacts_record_h address) override;
	void onImageSelected(int page) override;

protected:
	~CtMyProfileDetailView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onCreated() override;
	void onDestroy() override;
	void onPushed(Elm_Object_Item* naviItem) override;

private:
	Evas_Object* __getWindow();
	void __createGenlist(Evas_Object* layout);
	void __updateBottomButton();
	void __updateTitle();
	void __addAllItems();
	void __addItem(int index);
	void __addListItems(Eina_List* list, CtDetailViewGenlistItem* (CtMyProfileDetailView::*make)(contacts_record_h));
	Elm_Object_Item* __appendItem(CtDetailViewGenlistItem* row);
	CtDetailViewGenlistItem* __makeNumberItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeEmailItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeNoteItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeAddressItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeEventItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeRelationItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeWebsiteItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeMessengerItem(contacts_record_h record);
	void __updateGenlist();
	void __applyHomogeneity();
	void __startChangeTimer();
	void __onChangeTimer();
	void __onRegistryChanged(int key, int value);
	void __onPowerSavingChanged(bool on);
	void __showMoreMenu();
	void __pushEditView();
	void __openProfileSharing();
	void __onSignUpSucceeded();
	void __pushProfileSharingView();
	void __share();

	static void __onPowerSavingModeChangedCb(keynode_t* node, void* data);
	static void __moreButtonCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __onShareCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __signUpResultCb(app_control_h request, app_control_h reply, app_control_result_e result, void* data);
	static void __profileChangedCb(const char* viewUri, void* data);

	std::unique_ptr<CtMyProfileDetailData> m_detailData;
	Evas_Object* m_genlist = nullptr;
	Elm_Object_Item* m_profileSharingItem = nullptr;
	Elm_Object_Item* m_statusItem = nullptr;
	bool m_mode = false;
	bool m_isPowerSaving = false;
	int m_registryListenerId = 0;

	Evas_Object* m_shareButton = nullptr;
	std::weak_ptr<app_assist::WControl> m_menu;
	// While the change timer runs the data is left as the rows show it, and
	// changes of the profile are only counted.
	app_assist::WUiTimerHandle m_changeTimer;
	std::unique_ptr<CtDbChangeSubscription> m_changeCounter;
	int m_pendingChangeCount = 0;
	// The profile the rows show; 0 while none is stored.
	int m_shownProfileId = 0;
	bool m_isClosing = false;
	int m_rebuildCount = 0;
};

#endif
