#include "CtInputViewMessengerItem.h"

#include "CtCommonRecordUtil.h"

CtInputViewMessengerItem::CtInputViewMessengerItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
		CtInputViewItemCallbacks callbacks, const char* initialText)
	: CtInputViewFieldItem(std::move(data), record, addKind, std::move(callbacks), initialText)
{
}

Elm_Genlist_Item_Class* CtInputViewMessengerItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("input.3icon");
	return itc;
}

std::string CtInputViewMessengerItem::readText()
{
	const char* text = m_data->getMessengerMessenger(m_record);
	return text ? text : "";
}

void CtInputViewMessengerItem::writeText(const char* text)
{
	m_data->setMessengerMessenger(m_record, text);
}

std::vector<CtInputViewTypeSelector::Choice> CtInputViewMessengerItem::getTypeChoices()
{
	std::vector<CtInputViewTypeSelector::Choice> choices;
	addCurrentCustomChoice(choices, _contacts_messenger.type, _contacts_messenger.label, CONTACTS_MESSENGER_TYPE_CUSTOM);
	const std::pair<const char*, int> menu[] = {{"IDS_PB_OPT_AIM", CONTACTS_MESSENGER_TYPE_AIM}, {"IDS_PB_OPT_YAHOO_E", CONTACTS_MESSENGER_TYPE_YAHOO}, {"IDS_PB_BODY_SKYPE", CONTACTS_MESSENGER_TYPE_SKYPE}, {"IDS_PB_OPT_QQ", CONTACTS_MESSENGER_TYPE_QQ}, {"IDS_PB_OPT_HANGOUTS", CONTACTS_MESSENGER_TYPE_GOOGLE}, {"IDS_PB_OPT_ICQ", CONTACTS_MESSENGER_TYPE_ICQ}, {"IDS_PB_OPT_JABBER", CONTACTS_MESSENGER_TYPE_JABBER}, {"IDS_PB_OPT_CUSTOM", CONTACTS_MESSENGER_TYPE_CUSTOM}};
	for (const auto& [textId, type] : menu)
		choices.push_back(choice(textId, type));
	return choices;
}

std::string CtInputViewMessengerItem::getTypeLabel()
{
	const char* label = CtCommonGetMessengerTypeStr(m_record, m_data->getDataType(m_record, _contacts_messenger.type));
	return label ? label : "";
}

int CtInputViewMessengerItem::getCustomType() const
{
	return CONTACTS_MESSENGER_TYPE_CUSTOM;
}

void CtInputViewMessengerItem::writeType(int type, const char* label)
{
	m_data->setMessengerType(m_record, type, label);
}
