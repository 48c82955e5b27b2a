#include "phone_misc.h"

#include "CallBlockList.h"
#include "ContactsDebug.h"

#include <Ecore.h>

#include <cstring>
#include <new>

struct phone_misc_s {
	ct::callblock::CallBlockList list;
	// Set when the handle was released during one of its own callbacks.
	bool released = false;
};

namespace {

bool isValidType(int type)
{
	return type == PHONE_MISC_BLOCK_TYPE_CALL || type == PHONE_MISC_BLOCK_TYPE_MESSAGE;
}

// 0 when the handle and number can be used; logs why not.
int checkArguments(phone_misc_h handle, int type, const char* number)
{
	WPRET_VM(!handle || handle->released, PHONE_MISC_ERROR_INVALID_PARAMETER, "handle is null");
	WPRET_VM(!isValidType(type), PHONE_MISC_ERROR_INVALID_PARAMETER, "unknown block type %d", type);
	WPRET_VM(!number || strlen(number) > ct::callblock::CallBlockList::kMaxNumberBytes,
		PHONE_MISC_ERROR_INVALID_PARAMETER, "number is null or too long");
	WPRET_VM(ct::callblock::CallBlockList::cleanNumber(number).empty(),
		PHONE_MISC_ERROR_INVALID_PARAMETER, "number has no digit");
	return PHONE_MISC_ERROR_NONE;
}

void deleteHandleCb(void* data)
{
	delete static_cast<phone_misc_h>(data);
}

} // namespace

extern "C" {

int phone_misc_connect(phone_misc_h* handle)
{
	WPRET_VM(!handle, PHONE_MISC_ERROR_INVALID_PARAMETER, "handle is null");
	*handle = nullptr;
	auto* created = new (std::nothrow) phone_misc_s;
	if (!created)
		return PHONE_MISC_ERROR_OUT_OF_MEMORY;
	int rc = created->list.open();
	if (rc != 0) {
		delete created;
		return rc;
	}
	*handle = created;
	return PHONE_MISC_ERROR_NONE;
}

int phone_misc_disconnect(phone_misc_h handle)
{
	WPRET_VM(!handle || handle->released, PHONE_MISC_ERROR_INVALID_PARAMETER, "handle is null");
	if (handle->list.isDelivering()) {
		// The list is still calling its observers: free it once they returned.
		handle->released = true;
		handle->list.removeAllObservers();
		ecore_job_add(deleteHandleCb, handle);
		return PHONE_MISC_ERROR_NONE;
	}
	delete handle;
	return PHONE_MISC_ERROR_NONE;
}

int phone_misc_block_find(phone_misc_h handle, int type, const char* number, int* out_is_blocked)
{
	if (out_is_blocked)
		*out_is_blocked = 0;
	int rc = checkArguments(handle, type, number);
	if (rc != PHONE_MISC_ERROR_NONE)
		return rc;
	rc = handle->list.find(type, number);
	if (rc > 0 && out_is_blocked)
		*out_is_blocked = 1;
	return rc;
}

int phone_misc_block_add(phone_misc_h handle, int type, const char* number)
{
	int rc = checkArguments(handle, type, number);
	return rc == PHONE_MISC_ERROR_NONE ? handle->list.add(type, number) : rc;
}

int phone_misc_block_remove(phone_misc_h handle, int type, const char* number)
{
	int rc = checkArguments(handle, type, number);
	return rc == PHONE_MISC_ERROR_NONE ? handle->list.remove(type, number) : rc;
}

int phone_misc_block_foreach(phone_misc_h handle, int type, phone_misc_block_foreach_cb cb, void* user_data)
{
	WPRET_VM(!handle || handle->released || !cb || !isValidType(type), PHONE_MISC_ERROR_INVALID_PARAMETER,
		"invalid argument");
	for (const auto& number : handle->list.numbers(type))
		cb(number.c_str(), user_data);
	return PHONE_MISC_ERROR_NONE;
}

int phone_misc_add_block_db_change_cb(phone_misc_h handle, phone_misc_block_db_change_cb cb, void* user_data)
{
	WPRET_VM(!handle || handle->released || !cb, PHONE_MISC_ERROR_INVALID_PARAMETER, "invalid argument");
	handle->list.addObserver(reinterpret_cast<const void*>(cb), [cb, user_data] { cb(user_data); });
	return PHONE_MISC_ERROR_NONE;
}

int phone_misc_remove_block_db_change_cb(phone_misc_h handle, phone_misc_block_db_change_cb cb)
{
	WPRET_VM(!handle || handle->released || !cb, PHONE_MISC_ERROR_INVALID_PARAMETER, "invalid argument");
	if (!handle->list.removeObserver(reinterpret_cast<const void*>(cb)))
		return PHONE_MISC_ERROR_NO_DATA;
	return PHONE_MISC_ERROR_NONE;
}

} // extern "C"
