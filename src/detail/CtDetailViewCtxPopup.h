#ifndef _CT_DETAIL_VIEW_CTX_POPUP_H_
#define _CT_DETAIL_VIEW_CTX_POPUP_H_

#include "WPopup.h"

#include <Elementary.h>

#include <memory>
#include <string>

class CtDetailViewGenlistItem;

// The long-press popup of a detail row with one entry, "Copy", that puts the
// row's value on the clipboard as text (the picture row's picture as an image).
class CtDetailViewCtxPopup : public app_assist::WPopup {
public:
	// Where the popup points: above the value, or at a fixed height when the
	// value is too close to the top of the screen.
	struct Position {
		Evas_Coord x;
		Evas_Coord y;
	};

	// `window` receives the clipboard content; `item` is the long-pressed row.
	CtDetailViewCtxPopup(Evas_Object* window, Elm_Object_Item* item);

	// The long-press handling of a detail list: unless the row has nothing to
	// copy, highlights it, blocks vertical scrolling of `genlist` and attaches
	// a new popup to `owner`. Returns the popup, or an empty pointer.
	static std::weak_ptr<app_assist::WControl> open(app_assist::WControl* owner, Evas_Object* window,
			Elm_Object_Item* item);
	// The placement rule for an anchor at (x, y, w, h) and the scale `scale`.
	static Position computePosition(Evas_Coord x, Evas_Coord y, Evas_Coord w, Evas_Coord h, bool isPicture,
			double scale);

	Position getPosition() const { return m_position; }
	// Copies the row's value and closes the popup.
	void copy();

protected:
	~CtDetailViewCtxPopup() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onDestroy() override;

private:
	CtDetailViewGenlistItem* __getRow() const;
	bool __isPictureRow() const;
	void __place(Evas_Object* ctxpopup);
	void __copyPicture(const std::string& path);
	static void __copySelectedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __dismissedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __backCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __genlistDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);

	Evas_Object* m_window;
	Elm_Object_Item* m_item;
	Evas_Object* m_genlist;
	Position m_position = {0, 0};
};

#endif
