// The ringtone picker: "Default" (when the request's "default" extra is
// "default show") and the sound files of the folder in "path" (when that
// folder has none, the host's own ringtones); the row of "marked_mode" is
// marked. Tapping a row replies "result" (the file's path, or "default") and
// "position" ("0": play from the start).
#pragma once

#include "StandInView.h"

namespace ct::demo {

class StandInRingtonePickerView : public StandInView {
public:
	StandInRingtonePickerView(app_control_h request, ct::appcontrol::Reply reply, std::string fallbackFolder);

	const char* getClassName() override { return "StandInRingtonePickerView"; }

protected:
	Evas_Object* createContent(Evas_Object* parent) override;

private:
	void __choose(const std::string& result);
	static void __cancelClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	std::string m_fallbackFolder;
};

} // namespace ct::demo
