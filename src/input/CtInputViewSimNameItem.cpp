#include "CtInputViewSimNameItem.h"

CtInputViewSimNameItem::CtInputViewSimNameItem(std::shared_ptr<CtData> data, std::function<void()> changed,
		const char* initialText)
	: CtInputViewSimFieldItem(std::move(data), CONTACTS_SIM_FIELD_NAME, std::move(changed), initialText)
{
}

std::string CtInputViewSimNameItem::readText()
{
	return m_data ? m_data->getFullName() : std::string();
}

void CtInputViewSimNameItem::writeText(const char* text)
{
	if (m_data)
		m_data->setFullName(text);
}

void CtInputViewSimNameItem::onTextChanged(Evas_Object* entry)
{
	CtInputViewSimFieldItem::onTextChanged(entry);
	if (m_acceptedText.empty())
		elm_entry_autocapital_type_set(entry, ELM_AUTOCAPITAL_TYPE_WORD);
}
