#include "DemoDatabase.h"

#include "ContactsDebug.h"
#include "DemoPeople.h"
#include "DemoProfile.h"
#include "DemoPictures.h"

#include <contacts.h>
#include <phone_misc.h>

namespace ct::demo {

namespace {

// Blocking is idempotent: a number that is already blocked counts as done.
int blockDemoNumbers()
{
	phone_misc_h handle = nullptr;
	int err = phone_misc_connect(&handle);
	WPRET_VM(err != PHONE_MISC_ERROR_NONE, err, "phone_misc_connect() Failed(%d)", err);
	for (const std::string& number : DemoPeople::blockedNumbers()) {
		int rc = phone_misc_block_add(handle, PHONE_MISC_BLOCK_TYPE_CALL, number.c_str());
		if (rc != PHONE_MISC_ERROR_NONE && rc != PHONE_MISC_ERROR_ALREADY_EXISTS) {
			WFAILED("phone_misc_block_add", rc);
			err = rc;
		}
	}
	phone_misc_disconnect(handle);
	return err;
}

} // namespace

DemoDatabase::DemoDatabase() = default;

DemoDatabase::~DemoDatabase()
{
	if (m_connected)
		contacts_disconnect();
}

int DemoDatabase::open()
{
	WENTER();
	if (!m_connected) {
		int err = contacts_connect();
		WPRET_VM(err != CONTACTS_ERROR_NONE, err, "contacts_connect() Failed(%d)", err);
		m_connected = true;
	}
	int count = personCount();
	if (count < 0)
		return count;
	if (count > 0)
		return CONTACTS_ERROR_NONE;
	return __fill();
}

int DemoDatabase::__fill()
{
	WINFO("creating the demo persons");
	std::vector<std::string> pictures = DemoPictures::ensure();
	int err = DemoPeople::fill(pictures);
	int profileErr = DemoProfile::ensure(pictures);
	if (err == CONTACTS_ERROR_NONE)
		err = profileErr;
	m_created = true;
	int blockErr = blockDemoNumbers();
	return err != CONTACTS_ERROR_NONE ? err : blockErr;
}

int DemoDatabase::personCount()
{
	int count = 0;
	int err = contacts_db_get_count(_contacts_person._uri, &count);
	WPRET_VM(err != CONTACTS_ERROR_NONE, err, "contacts_db_get_count() Failed(%d)", err);
	return count;
}

} // namespace ct::demo
