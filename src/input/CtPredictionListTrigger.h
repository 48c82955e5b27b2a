#ifndef _CT_PREDICTION_LIST_TRIGGER_H_
#define _CT_PREDICTION_LIST_TRIGGER_H_

#include "CtPredictionListControl.h"
#include "WUiTimer.h"

#include <Elementary.h>

#include <memory>
#include <string>

// The edit form's side of the prediction list: the name row reports each
// change of a name entry, and a list of matching contacts appears under the
// field after a typing pause of kTypingPause seconds, is updated in place on
// later changes and closes on a tap in the form. At most one list exists.
class CtPredictionListTrigger {
public:
	static constexpr double kTypingPause = 1.0;
	static constexpr double kResizeDelay = 0.3;

	// The list is made on `listParent` (the form's object); a mouse-down on
	// `inputList` (may be null) closes it. Only a new contact gets predictions.
	CtPredictionListTrigger(Evas_Object* listParent, Evas_Object* inputList, bool isNewContact,
		CtPredictionListControl::SelectedCallback onSelected);
	~CtPredictionListTrigger();
	CtPredictionListTrigger(const CtPredictionListTrigger&) = delete;
	CtPredictionListTrigger& operator=(const CtPredictionListTrigger&) = delete;

	// A name entry changed; `fullName` is the whole name it now makes.
	void onNameChanged(Evas_Object* entry, Elm_Object_Item* basicInfoRow, const std::string& fullName);
	// Places the list again, at once or after kResizeDelay (on scroll or resize).
	void resizePredictionList(bool delayed);
	void destroyPredictionList();
	// The shown list, null when none.
	CtPredictionListControl* getPredictionList() const;
	// How many times the contacts were searched (the pause folds fast typing into one).
	int getLoadCount() const { return m_loadCount; }

private:
	bool __onTypingPaused();
	void __showPredictionList(Evas_Object* entry, Elm_Object_Item* basicInfoRow, const std::string& text);
	static void __inputListMouseDownCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __watchedObjDelCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	void __watchPendingEntry(Evas_Object* entry);

	Evas_Object* m_listParent;
	Evas_Object* m_inputList;
	bool m_isNewContact;
	CtPredictionListControl::SelectedCallback m_onSelected;
	std::weak_ptr<app_assist::WControl> m_list;
	app_assist::WUiTimerHandle m_typingTimer;
	app_assist::WUiTimerHandle m_resizeTimer;
	Evas_Object* m_pendingEntry = nullptr;
	Elm_Object_Item* m_pendingRow = nullptr;
	std::string m_pendingText;
	int m_loadCount = 0;
};

#endif
