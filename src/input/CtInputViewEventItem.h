#ifndef _CT_INPUT_VIEW_EVENT_ITEM_H_
#define _CT_INPUT_VIEW_EVENT_ITEM_H_

#include "CtData.h"
#include "CtInputViewGenlistItem.h"
#include "CtInputViewItemCallbacks.h"
#include "CtInputViewTypeSelector.h"
#include "WControl.h"

#include <ctime>
#include <functional>
#include <memory>

class CtDatePicker;

// A dated event (birthday, anniversary, other or a custom label): a date
// button opening a date popup (solar, or lunar where the country uses it),
// the type selector and a delete button. Birthday is offered only while no
// other event of the contact is one: the rows share that flag.
class CtInputViewEventItem : public CtInputViewGenlistItem {
public:
	// `record` belongs to `data`'s contact; `hasBirthday` is shared by all
	// event rows of the list. `typesChanged` runs (from the main loop) after
	// the type changed so that the owner refreshes every event row.
	CtInputViewEventItem(std::shared_ptr<CtData> data, contacts_record_h record, const char* initialText,
			std::shared_ptr<bool> hasBirthday, CtInputViewItemCallbacks callbacks, std::function<void()> typesChanged);
	~CtInputViewEventItem() override;

	contacts_record_h getRecord() const { return m_record; }
	Evas_Object* getDateButton() const { return m_dateButton; }
	// The date button's text for the stored date (with or without year).
	std::string getDateText();
	// Shows the stored date again (after the owner changed it).
	void updateDateText();
	void selectType(int type);
	void setCustomType(const char* label);
	void deleteRow();
	void openDatePopup();
	// Whether the country uses the lunar calendar ("CN", "KR").
	static bool isLunarSupported();
	// The date the popup opens on for a stored YYYYMMDD: a year before 1902
	// (or none) shows as 1902, month and day are brought into range.
	static struct tm popupStartDate(int date);

public: // WGenlistItem
	Elm_Genlist_Item_Class* getItemClassStatic() override;

public: // CtInputViewGenlistItem
	Evas_Object* getHoverselObj() override { return m_hoversel; }

protected:
	Evas_Object* getContent(Evas_Object* genlist, const char* part) override;

private:
	std::vector<CtInputViewTypeSelector::Choice> __getTypeChoices();
	std::string __getTypeLabel();
	int __getType();
	bool __isProfileSharingStorage();
	Evas_Object* __createDateButton(Evas_Object* genlist);
	Evas_Object* __createSelector(Evas_Object* genlist);
	Evas_Object* __createDatePopupContent(Evas_Object* parent);
	void __setDate();
	void __toggleCalendar();
	void __notifyTypesChanged();
	void __updateCalendarButton();
	void __onPickerChanged();
	CtDatePicker* __datePicker() const;
	static void __dateClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __calendarClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __deleteClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::shared_ptr<CtData> m_data;
	contacts_record_h m_record;
	std::shared_ptr<bool> m_hasBirthday;
	CtInputViewItemCallbacks m_callbacks;
	std::function<void()> m_typesChanged;
	Evas_Object* m_dateButton = nullptr;
	Evas_Object* m_hoversel = nullptr;
	std::weak_ptr<app_assist::WControl> m_datePicker;
	Evas_Object* m_calendarButton = nullptr;
	std::weak_ptr<app_assist::WControl> m_datePopup;
	std::weak_ptr<app_assist::WControl> m_customPopup;
	bool m_isSolar = true;
	bool m_isLeapMonth = false;
};

#endif
