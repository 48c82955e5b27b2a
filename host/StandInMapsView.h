// Maps: shows the place asked for ("searchByName", or the q="..." of a
// geo: URI) in an entry the person can change; "Done" replies the typed
// address in APP_CONTROL_DATA_SELECTED (a text), or a reply without it when
// the entry is empty.
#pragma once

#include "StandInView.h"

namespace ct::demo {

class StandInMapsView : public StandInView {
public:
	StandInMapsView(app_control_h request, ct::appcontrol::Reply reply);

	const char* getClassName() override { return "StandInMapsView"; }
	Evas_Object* getEntry() const { return m_entry; }
	// The place a geo: URI asks for: its q= value, percent-decoded and unquoted.
	static std::string placeOfGeoUri(const std::string& uri);

protected:
	Evas_Object* createContent(Evas_Object* parent) override;

private:
	static void __doneClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	static void __cancelClickedCb(void* data, Evas_Object* obj, void* eventInfo);

	Evas_Object* m_entry = nullptr;
};

} // namespace ct::demo
