#include "CtDbChangeSubscription.h"

#include "ContactsDebug.h"

CtDbChangeSubscription::CtDbChangeSubscription(const char* viewUri, contacts_db_changed_cb callback, void* data)
	: m_viewUri(viewUri ? viewUri : ""), m_callback(callback), m_data(data)
{
	int err = contacts_db_add_changed_cb(m_viewUri.c_str(), m_callback, m_data);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_db_add_changed_cb", err);
	m_active = err == CONTACTS_ERROR_NONE;
}

CtDbChangeSubscription::~CtDbChangeSubscription()
{
	if (!m_active)
		return;
	int err = contacts_db_remove_changed_cb(m_viewUri.c_str(), m_callback, m_data);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_db_remove_changed_cb", err);
}
