#include "CtInputViewEmailItem.h"

#include "CtCommonRecordUtil.h"

CtInputViewEmailItem::CtInputViewEmailItem(std::shared_ptr<CtData> data, contacts_record_h record, int addKind,
		CtInputViewItemCallbacks callbacks, const char* initialText)
	: CtInputViewFieldItem(std::move(data), record, addKind, std::move(callbacks), initialText)
{
}

Elm_Genlist_Item_Class* CtInputViewEmailItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class* itc = createItemClass("input.3icon");
	return itc;
}

std::string CtInputViewEmailItem::readText()
{
	const char* text = m_data->getEmailEmail(m_record);
	return text ? text : "";
}

void CtInputViewEmailItem::writeText(const char* text)
{
	m_data->setEmailEmail(m_record, text);
}

std::vector<CtInputViewTypeSelector::Choice> CtInputViewEmailItem::getTypeChoices()
{
	std::vector<CtInputViewTypeSelector::Choice> choices;
	addCurrentCustomChoice(choices, _contacts_email.type, _contacts_email.label, CONTACTS_EMAIL_TYPE_CUSTOM);
	const std::pair<const char*, int> menu[] = {{"IDS_PB_OPT_HOME_M_PERSONAL_ABB", CONTACTS_EMAIL_TYPE_HOME}, {"IDS_PB_OPT_WORK", CONTACTS_EMAIL_TYPE_WORK}, {"IDS_PB_OPT_OTHER", CONTACTS_EMAIL_TYPE_OTHER}, {"IDS_PB_OPT_CUSTOM", CONTACTS_EMAIL_TYPE_CUSTOM}};
	for (const auto& [textId, type] : menu)
		choices.push_back(choice(textId, type));
	return choices;
}

std::string CtInputViewEmailItem::getTypeLabel()
{
	const char* label = CtCommonGetEmailTypeStr(m_record, m_data->getDataType(m_record, _contacts_email.type));
	return label ? label : "";
}

int CtInputViewEmailItem::getCustomType() const
{
	return CONTACTS_EMAIL_TYPE_CUSTOM;
}

void CtInputViewEmailItem::writeType(int type, const char* label)
{
	m_data->setEmailType(m_record, type, label);
}

void CtInputViewEmailItem::onTextChanged(Evas_Object* entry)
{
	CtInputViewFieldItem::onTextChanged(entry);
	showGuideWhenEmpty(entry);
}
