#include "CtInputViewControl.h"

#include "ContactsDebug.h"
#include "CtPredictionListTrigger.h"

CtInputViewControl::CtInputViewControl(std::shared_ptr<CtData> inputData, CtInputView* view,
		ExistingContactCallback onExistingContact, std::function<void()> onSelectRelationContact,
		std::function<void()> onKeypadDown)
	: m_inputData(std::move(inputData)), m_view(view), m_onExistingContact(std::move(onExistingContact)),
	  m_onSelectRelationContact(std::move(onSelectRelationContact)), m_onKeypadDown(std::move(onKeypadDown)),
	  m_hasBirthday(std::make_shared<bool>(false)), m_alive(std::make_shared<bool>(true))
{
}

CtInputViewControl::~CtInputViewControl()
{
	*m_alive = false;
}

const char* CtInputViewControl::getClassName()
{
	return "CtInputViewControl";
}

Evas_Object* CtInputViewControl::onCreate(Evas_Object* parent, void*)
{
	m_genlist = elm_genlist_add(parent);
	evas_object_size_hint_weight_set(m_genlist, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_genlist, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_show(m_genlist);
	return m_genlist;
}

void CtInputViewControl::onDestroy()
{
	m_genlist = nullptr;
}

bool CtInputViewControl::__checkIsEmpty() { return true; }
bool CtInputViewControl::__checkIsInsert() { return false; }
bool CtInputViewControl::getIsChanged() { return false; }
void CtInputViewControl::hideInputPanel() {}
void CtInputViewControl::basicInfoItemShowCreateKeypad() {}
void CtInputViewControl::focusForRename() {}
bool CtInputViewControl::checkEmergencyGroup() { return true; }
void CtInputViewControl::closeHoversel() {}
void CtInputViewControl::updateAddrbookItem() {}
void CtInputViewControl::updateRealizedItems() {}

Elm_Object_Item* CtInputViewControl::getLastItem(InputItemKind kind) const
{
	return kind >= 0 && kind < kItemKindCount ? m_genlistItems[kind] : nullptr;
}
