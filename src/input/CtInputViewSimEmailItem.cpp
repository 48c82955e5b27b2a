#include "CtInputViewSimEmailItem.h"

CtInputViewSimEmailItem::CtInputViewSimEmailItem(std::shared_ptr<CtData> data, contacts_record_h record,
		std::function<void()> changed, const char* initialText)
	: CtInputViewSimFieldItem(std::move(data), CONTACTS_SIM_FIELD_EMAIL, std::move(changed), initialText),
	  m_record(record)
{
}

std::string CtInputViewSimEmailItem::readText()
{
	const char* text = m_data && m_record ? m_data->getEmailEmail(m_record) : nullptr;
	return text ? text : "";
}

void CtInputViewSimEmailItem::writeText(const char* text)
{
	if (m_data && m_record)
		m_data->setEmailEmail(m_record, text);
}
