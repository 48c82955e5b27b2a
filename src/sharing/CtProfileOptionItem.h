#ifndef _CT_PROFILE_OPTION_ITEM_H_
#define _CT_PROFILE_OPTION_ITEM_H_

#include "CtContactsAgentMgr.h"
#include "CtProfileSharingRow.h"

#include <functional>

// One shareable profile field with its on/off switch. The switch follows the
// stored choice: without network a toggle is refused and the switch goes
// back.
class CtProfileOptionItem : public CtProfileSharingRow {
public:
	// `onChanged` (may be empty) runs after each toggle, refused or not.
	CtProfileOptionItem(CtProfileProperty property, std::function<void()> onChanged);

	CtProfileProperty getProperty() const { return m_property; }
	bool isShared() const { return m_shared; }
	Evas_Object* getCheck() const { return getHeldContent("elm.icon.2"); }

	// The row's texts: translation id and usage-log name of a property.
	static const char* textIdOf(CtProfileProperty property);
	static const char* logNameOf(CtProfileProperty property);

public: // WGenlistItem
	void onSelect(Elm_Object_Item* item) override;

private:
	void __toggle();
	static void __checkButtonChangedCb(void* data, Evas_Object* obj, void* eventInfo);

	CtProfileProperty m_property;
	bool m_shared;
	std::function<void()> m_onChanged;
};

#endif
