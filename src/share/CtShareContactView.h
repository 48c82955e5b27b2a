#ifndef _CT_SHARE_CONTACT_VIEW_H_
#define _CT_SHARE_CONTACT_VIEW_H_

#include "CtLaunchRequest.h"
#include "CtView.h"
#include "ICtChangeListener.h"
#include "WView.h"

#include <memory>
#include <set>
#include <string>

class CtDetailData;
class CtDetailViewBasicInfoItem;
class CtShareContactViewItem;

// Lets the user mark fields of one person and returns the person's name and
// the marked fields to the caller as plain text ("person_info" of the UI
// gadget's result). A preview under the list shows exactly that text while
// the user marks. The list follows changes of the person, keeping the marks
// of the fields that are still there, and the screen closes when the person
// is deleted.
class CtShareContactView : public app_assist::WView, public CtView, public ICtChangeListener {
public:
	// `request` may be null (nobody to reply to); it is kept, not copied, and
	// must outlive the view. Its gadget receives the result and is asked to
	// close when the screen goes.
	CtShareContactView(int personId, CtLaunchRequest* request);

	int getPersoinId();
	CtDetailData* getDetailData() const { return m_detailData.get(); }
	Evas_Object* getGenlist() const { return m_genlist; }
	int getSelectedCount() const { return m_selectedCount; }
	// The text Done returns for the marks as they are now.
	std::string composeText();
	// The text the preview shows, as plain text.
	std::string getPreviewText() const;
	// How many times the list was rebuilt after a change of the person.
	int getRebuildCount() const { return m_rebuildCount; }

public: // app_assist::WView
	const char* getClassName() override;

public: // ICtChangeListener
	void onDbChanged(const char* viewUri) override;
	void onCompleteGetContacts() override;
	void onConditionChagned() override;

public: // CtView
	void onLanguageChanged() override;

protected:
	~CtShareContactView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onDestroy() override;
	void onPushed(Elm_Object_Item* naviItem) override;

private:
	void __initialize(CtLaunchRequest* request);
	void __addExtensionThemes();
	Evas_Object* __createPreview(Evas_Object* parent);
	void __setPreviewTitle();
	void __addAllItems(const std::set<std::string>& keptMarks);
	void __addNameItem();
	void __addFieldItems(Eina_List* records, const char* kind, const std::set<std::string>& keptMarks);
	void __createTitleButtons(Elm_Object_Item* naviItem);
	void __onMarksChanged();
	void __countMarks();
	void __updateTitle();
	void __updatePreview();
	void __updateGenlist();
	std::set<std::string> __markedFieldKeys();
	void __save();
	void __closeGadget();

	static void __onItemSelectedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __saveCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __cancelCb(void* data, Evas_Object* obj, void* eventInfo);

	CtLaunchRequest* m_request = nullptr;
	int m_personId = 0;
	std::unique_ptr<CtDetailData> m_detailData;
	Evas_Object* m_genlist = nullptr;
	Evas_Object* m_previewTitle = nullptr;
	Evas_Object* m_preview = nullptr;
	CtDetailViewBasicInfoItem* m_nameItem = nullptr;
	Evas_Object* m_doneButton = nullptr;
	Evas_Object* m_cancelButton = nullptr;
	int m_selectedCount = 0;
	bool m_isClosing = false;
	bool m_isGadgetClosed = false;
	int m_rebuildCount = 0;
};

#endif
