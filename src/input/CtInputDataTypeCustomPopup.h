#ifndef _CT_INPUT_DATA_TYPE_CUSTOM_POPUP_H_
#define _CT_INPUT_DATA_TYPE_CUSTOM_POPUP_H_

#include "WPopup.h"
#include "WUiTimer.h"

#include <functional>
#include <string>

// Asks for a custom type label. Create enables once something is typed;
// the result callback gets the label without its surrounding blanks and
// runs at most once (never for a label of blanks only).
class CtInputDataTypeCustomPopup : public app_assist::WPopup {
public:
	using ResultCallback = std::function<void(const char* label)>;

	CtInputDataTypeCustomPopup();
	void setResultCallback(ResultCallback callback) { m_resultCallback = std::move(callback); }

	static constexpr int kMaxChars = 1000;

	// `text` without leading and trailing blanks; empty when only blanks.
	static std::string trimLabel(const char* text);

protected:
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;

private:
	Evas_Object* __createContent(Evas_Object* parent);
	void __saveCustomDataType();
	void __updateCreateButton();
	static void __dataTypeCustomEntryChangedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __entryActivatedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __entryShowCb(void* data, Evas* e, Evas_Object* obj, void* eventInfo);
	static void __maxLengthReachedCb(void* data, Evas_Object* obj, void* eventInfo);

	Evas_Object* m_entry = nullptr;
	Evas_Object* m_popup = nullptr;
	ResultCallback m_resultCallback;
	bool m_resultSent = false;
	app_assist::WUiTimerHandle m_noticeTimer;
};

#endif
