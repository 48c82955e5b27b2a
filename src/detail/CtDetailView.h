#ifndef _CT_DETAIL_VIEW_H_
#define _CT_DETAIL_VIEW_H_

#include "CtDetailViewItemOwner.h"
#include "CtGalSearchData.h"
#include "CtLaunchRequest.h"
#include "CtSimListener.h"
#include "CtView.h"
#include "ICtChangeListener.h"
#include "WNextFrame.h"
#include "WUiTimer.h"
#include "WView.h"

#include <phone_misc.h>
#include <vconf.h>

#include <memory>

class CtDetailData;
class CtDetailViewGenlistItem;

// The detail screen of one person: the name in the title, a favourite star,
// and a list of the person's data built a few rows per animation frame. It
// rebuilds when the person changes, closes when the person is deleted, and
// follows SIM, call-block, power-saving and language changes. The same class
// shows a global address list search result, without watching the store.
class CtDetailView : public app_assist::WView, public CtView, public ICtChangeListener, public CtSimListener,
		public CtDetailViewItemOwner {
public:
	// The person id comes from the request's extra data; see personIdFromRequest.
	explicit CtDetailView(CtLaunchRequest* request);
	// `request` may be null; it is kept, not read, and must outlive the view.
	CtDetailView(int personId, CtLaunchRequest* request);
	// `galData` is owned by the caller and must outlive the view.
	explicit CtDetailView(const CtGalSearchData* galData);

	// The person id a request asks for: "person_id" (replaced by
	// "ct_person_id" when present) without an operation, the id data of a
	// view request; 0 for anything else, logged.
	static int personIdFromRequest(CtLaunchRequest* request);

	int getPersoinId();
	CtDetailData* getDetailData() const { return m_detailData.get(); }
	Evas_Object* getGenlist() const { return m_genlist; }
	bool isSimContactView() const { return m_isSimContact; }
	bool isCompactLayout() const { return m_isCompactLayout; }
	bool isPowerSaving() const { return m_isPowerSaving; }
	// Rows are still being added over animation frames.
	bool isBuildingRows() const;
	// How many times the list was rebuilt after a change of the person.
	int getRebuildCount() const { return m_rebuildCount; }

public: // app_assist::WView
	const char* getClassName() override;

public: // ICtChangeListener
	void onDbChanged(const char* viewUri) override;
	void onCompleteGetContacts() override;
	void onConditionChagned() override;

public: // CtSimListener
	void onSimChanged() override;

public: // CtView
	void onLanguageChanged() override;

public: // CtDetailViewItemOwner
	void onVideoCallSelected() override;
	void onAddressSelected(contacts_record_h address) override;
	void onImageSelected(int page) override;

protected:
	~CtDetailView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onDestroy() override;
	void onPushed(Elm_Object_Item* naviItem) override;
	bool onPop() override;

private:
	void __initialize(CtLaunchRequest* request);
	void __listenToPowerSaving();
	void __createData(int personId);
	void __connectCallBlock();
	void __disconnectCallBlock();
	void __addAllItems();
	void __waitForDrawnRows();
	bool __onRowTick();
	void __stopAddingRows();
	bool __addItemsForFrame();
	bool __addItemOfKind(int& budget);
	bool __addNextListItem(int& budget);
	CtDetailViewGenlistItem* __makeSingleItem(int kind);
	bool __addListItem(Eina_List* list, int& index, int& budget, CtDetailViewGenlistItem* (CtDetailView::*make)(contacts_record_h));
	Elm_Object_Item* __appendItem(CtDetailViewGenlistItem* row);
	CtDetailViewGenlistItem* __makeNumberItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeEmailItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeAddressItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeMessengerItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeWebsiteItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeRelationItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeEventItem(contacts_record_h record);
	CtDetailViewGenlistItem* __makeNoteItem(contacts_record_h record);
	bool __getNumberCallBlockStatus(contacts_record_h number);
	void __updateTitle();
	void __updateFavoriteBtn();
	void __showBackButton();
	void __updateGenlist();
	void __applyCompactLayout();
	void __closeWithScreensAbove();
	void __startChangeTimer();
	void __startFavoriteSettleTimer();
	void __onBlockListChanged();
	void __onPowerSavingChanged(bool on);
	void __launchVideoCall(const char* number);
	void __showVideoCallPopup();
	void __closePopup();
	void __openMoreMenu();
	void __onEditCb();
	void __onDeleteCb();
	void __onHideCb();
	void __onShareCb();
	void __showSelectShareTypePopup(int personId);
	void __onMarkAsDefaultCb();
	void __onLinkCb();
	void __onManageLinkedContactsCb();
	void __showDeletePopup(const char* titleId, const char* textId, const char* buttonId);
	bool __deletePerson();
	void __pushView(app_assist::WView* view);
	// Redraws the shown rows with fresh contents (SIM colours, texts).
	void __refreshRows();

	static void __powerSavingModeChangedCb(keynode_t* node, void* data);
	static void __blockListChangedCb(void* data);
	static void __favoriteCheckClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __backButtonClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __naviTransitionFinishedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __genlistLongpressedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __genlistPressedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __genlistReleasedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __moreButtonCb(void* data, Evas_Object* obj, void* eventInfo);

	CtLaunchRequest* m_request = nullptr;
	std::unique_ptr<CtDetailData> m_detailData;
	Evas_Object* m_genlist = nullptr;
	Elm_Object_Item* m_firstNumberItem = nullptr;
	Elm_Object_Item* m_lastNumberItem = nullptr;
	phone_misc_h m_callBlock = nullptr;
	app_assist::WUiTimerHandle m_changeTimer;
	int m_pendingChangeCount = 0;
	bool m_isCompactLayout = false;
	bool m_isSimContact = false;
	bool m_isClosing = false;
	bool m_isPowerSaving = false;
	int m_currentKind = 0;
	int m_numberIndex = 0;
	int m_emailIndex = 0;
	int m_noteIndex = 0;
	int m_addressIndex = 0;
	int m_eventIndex = 0;
	int m_relationshipIndex = 0;
	int m_websiteIndex = 0;
	int m_messengerIndex = 0;
	const CtGalSearchData* m_galData = nullptr;
	app_assist::WUiTimerHandle m_favoriteSettleTimer;
	std::weak_ptr<app_assist::WControl> m_popup;
	bool m_rebuiltWhileShown = false;

	std::unique_ptr<app_assist::WNextFrame> m_drawnRows;
	app_assist::WUiTimerHandle m_rowAnimator;
	Evas_Object* m_naviframeObj = nullptr;
	int m_rebuildCount = 0;
	bool m_isDeleting = false;
};

#endif
