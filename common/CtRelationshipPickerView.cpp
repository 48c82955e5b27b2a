#include "CtRelationshipPickerView.h"

#include "ContactsDebug.h"
#include "CtRegistryMgr.h"

CtRelationshipPickerView::CtRelationshipPickerView()
	: CtPersonPickerView("IDS_PB_OPT_RELATIONSHIP_ABB2")
{
}

std::vector<CtPersonPickerView::Entry> CtRelationshipPickerView::loadEntries()
{
	return loadPersons(0);
}

void CtRelationshipPickerView::onChosen(const Entry& entry)
{
	WDEBUG("relationship person %d", entry.id);
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_RELATIONSHIP_PERSON, entry.id);
	popOut();
}
