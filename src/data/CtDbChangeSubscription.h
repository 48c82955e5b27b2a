#ifndef _CT_DB_CHANGE_SUBSCRIPTION_H_
#define _CT_DB_CHANGE_SUBSCRIPTION_H_

#include <contacts.h>

#include <string>

// A contacts-service change callback on one view, removed with the object.
class CtDbChangeSubscription {
public:
	CtDbChangeSubscription(const char* viewUri, contacts_db_changed_cb callback, void* data);
	~CtDbChangeSubscription();
	CtDbChangeSubscription(const CtDbChangeSubscription&) = delete;
	CtDbChangeSubscription& operator=(const CtDbChangeSubscription&) = delete;

	bool isActive() const { return m_active; }

private:
	std::string m_viewUri;
	contacts_db_changed_cb m_callback;
	void* m_data;
	bool m_active = false;
};

#endif
