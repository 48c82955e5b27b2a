#ifndef _CT_PROFILE_SHARING_VIEW_H_
#define _CT_PROFILE_SHARING_VIEW_H_

#include "CtView.h"
#include "WView.h"

#include <vconf.h>

#include <vector>

class CtProfileSharingRow;
class CtProfileSharingPreviewItem;

// The settings of profile sharing: the on/off switch (refused without a SIM
// or network, confirmed by the agent while a processing popup shows), the
// shared profile (personal or business), the way to who may see the personal
// one, the optional fields and a preview of what a contact receives. While
// sharing is off every row but the switch is disabled.
class CtProfileSharingView : public app_assist::WView, public CtView {
public:
	CtProfileSharingView();

	Evas_Object* getGenlist() const { return m_genlist; }
	CtProfileSharingRow* getModeRow() const { return m_modeRow; }
	CtProfileSharingPreviewItem* getPreviewRow() const { return m_previewRow; }
	// The switch as the user sees it (null while its row is not realized).
	Evas_Object* getModeCheck() const;
	// Applies the sharing state to the rows: the switch shows `on`, the other
	// rows are enabled only while on.
	void profileSharingModeChangedCb(bool on);

public: // app_assist::WView
	const char* getClassName() override { return "CtProfileSharingView"; }

public: // CtView
	void onLanguageChanged() override;

protected:
	~CtProfileSharingView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onCreated() override;
	void onPushed(Elm_Object_Item* naviItem) override;
	void onDestroy() override;

private:
	void __appendModeRow();
	void __appendProfileTypeRows();
	void __appendPreviewRows();
	CtProfileSharingRow* __append(CtProfileSharingRow* row);
	Evas_Object* __createShareWithArea(Evas_Object* parent);
	void __onSwitchTouched();
	void __switchSharing();
	void __onProfileTypeChosen(int type);
	void __updateProfileTypeRows();
	void __refreshPreview();
	void __onRegistryChanged(int key, int value);
	void __pushShareWith();
	void __stopListening();
	static void __checkButtonChangedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __profileShareWithButtonClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __networkChangedCb(keynode_t* node, void* data);

	Evas_Object* m_genlist = nullptr;
	Evas_Object* m_radioGroup = nullptr;
	CtProfileSharingRow* m_modeRow = nullptr;
	CtProfileSharingRow* m_myProfileRow = nullptr;
	CtProfileSharingRow* m_bizProfileRow = nullptr;
	CtProfileSharingPreviewItem* m_previewRow = nullptr;
	bool m_sharingOn = false;
	int m_registryListenerId = 0;
	bool m_networkListening = false;
};

#endif
