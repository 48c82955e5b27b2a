#ifndef _CT_PROFILE_CHANGE_ORDER_VIEW_H_
#define _CT_PROFILE_CHANGE_ORDER_VIEW_H_

#include "WView.h"

#include <Elementary.h>
#include <contacts.h>

#include <functional>
#include <memory>
#include <vector>

class CtData;

// Reorders the pictures of the profile being edited: the pictures in a grid,
// dragged into place. Done (enabled once a picture moved) numbers them 1, 2,
// 3, ... in grid order in the edited record; nothing is stored here.
class CtProfileChangeOrderView : public app_assist::WView {
public:
	// `pictureRow` (may be null) is the caller's row showing the pictures,
	// updated after Done; it may die before Done. `onDone` may be empty.
	CtProfileChangeOrderView(std::shared_ptr<CtData> data, Elm_Object_Item* pictureRow, std::function<void()> onDone);

	Evas_Object* getGengrid() const { return m_gengrid; }
	Evas_Object* getDoneButton() const { return m_doneButton; }
	// The image record of each cell, in grid order.
	std::vector<contacts_record_h> getCellImages() const;

public: // app_assist::WView
	const char* getClassName() override { return "CtProfileChangeOrderView"; }

protected:
	~CtProfileChangeOrderView() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onCreated() override;
	void onPushed(Elm_Object_Item* naviItem) override;
	void onDestroy() override;

private:
	Evas_Object* __createGengrid(Evas_Object* parent);
	void __addTitleButtons(Elm_Object_Item* naviItem);
	void __appendCells();
	void __trackPictureRow(Elm_Object_Item* pictureRow);
	void __save();
	static void __gengridMovedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __gengridSelectedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __saveCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __cancelCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __pictureRowDeletedCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);

	std::shared_ptr<CtData> m_data;
	Evas_Object* m_gengrid = nullptr;
	Elm_Object_Item* m_pictureRow = nullptr;
	Evas_Object* m_pictureRowTracker = nullptr;
	Evas_Object* m_doneButton = nullptr;
	std::function<void()> m_onDone;
};

#endif
