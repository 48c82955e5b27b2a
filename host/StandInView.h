// The screen of one stand-in application: it answers the request it was
// launched with exactly once. A choice replies APP_CONTROL_RESULT_SUCCEEDED
// with the answer and closes the screen; a screen closed without a choice
// (back key, terminate, exit) replies APP_CONTROL_RESULT_CANCELED with no data.
// Below a caption naming what was asked, subclasses put their content and
// buttons.
#pragma once

#include "AppControlRouter.h"
#include "StandInListItem.h"
#include "WView.h"

#include <Elementary.h>

#include <string>
#include <vector>

namespace ct::demo {

class StandInView : public app_assist::WView {
public:
	// Keeps a copy of `request`; `caption` says what the application does.
	StandInView(app_control_h request, ct::appcontrol::Reply reply, const char* title, std::string caption);

	bool hasAnswered() const { return m_answered; }
	// The buttons at the bottom, in order (for tests and the host's tour).
	const std::vector<Evas_Object*>& getButtons() const { return m_buttons; }
	// The list made by createList (null when the screen has none).
	Evas_Object* getList() const { return m_list; }

protected:
	~StandInView() override;

	// The middle of the screen.
	virtual Evas_Object* createContent(Evas_Object* parent) = 0;

	// The received request's extra `key` ("" when absent or an array).
	std::string getExtra(const char* key) const;
	std::string getUri() const;
	bool isReplyRequested() const;

	// Replies `answer` (null: succeeded without data) and closes the screen.
	void answer(app_control_h answer);
	void answerText(const char* key, const std::string& value);
	void answerSelected(const std::string& path);

	// A button at the bottom (call from createContent); `onClick` gets this view as data.
	// The main action is drawn filled.
	Evas_Object* addButton(const char* label, Evas_Smart_Cb onClick, bool main = false);
	void setCaption(const std::string& caption);
	// A text entry in the screen's type size (editable or read-only).
	static Evas_Object* createEntry(Evas_Object* parent, bool editable);
	// A list filling the middle of the screen, and its rows (owned by it).
	Evas_Object* createList(Evas_Object* parent);
	StandInListItem* appendRow(StandInListItem* row);
	Evas_Object* getBox() const { return m_box; }

	// app_assist::WView
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;
	void onPushed(Elm_Object_Item* naviItem) override;
	void onDestroy() override;

private:
	void __cancel();

	app_control_h m_request = nullptr;
	ct::appcontrol::Reply m_reply;
	std::string m_caption;
	Evas_Object* m_box = nullptr;
	Evas_Object* m_captionLabel = nullptr;
	Evas_Object* m_buttonRow = nullptr;
	Evas_Object* m_list = nullptr;
	std::vector<Evas_Object*> m_buttons;
	bool m_answered = false;
};

} // namespace ct::demo
