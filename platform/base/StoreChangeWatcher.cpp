#include "StoreChangeWatcher.h"

namespace ct::db {

StoreChangeWatcher::StoreChangeWatcher(Database& db, std::function<void()> onChange, double pollSeconds)
	: m_db(db)
	, m_onChange(std::move(onChange))
	, m_lastVersion(db.dataVersion())
{
	ecore_init();
	m_timer = ecore_timer_add(pollSeconds, __pollCb, this);
}

StoreChangeWatcher::~StoreChangeWatcher()
{
	if (m_timer)
		ecore_timer_del(m_timer);
	if (m_job)
		ecore_job_del(m_job);
	ecore_shutdown();
}

void StoreChangeWatcher::notifyLocalChange()
{
	if (!m_job)
		m_job = ecore_job_add(__jobCb, this);
}

Eina_Bool StoreChangeWatcher::__pollCb(void* data)
{
	auto* self = static_cast<StoreChangeWatcher*>(data);
	int64_t version = self->m_db.dataVersion();
	if (version != self->m_lastVersion) {
		self->m_lastVersion = version;
		self->__deliver();
	}
	return ECORE_CALLBACK_RENEW;
}

void StoreChangeWatcher::__jobCb(void* data)
{
	auto* self = static_cast<StoreChangeWatcher*>(data);
	self->m_job = nullptr;
	self->__deliver();
}

void StoreChangeWatcher::__deliver()
{
	if (m_onChange)
		m_onChange();
}

} // namespace ct::db
