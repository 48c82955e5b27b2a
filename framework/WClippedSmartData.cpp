#include "WClippedSmartData.h"

#include <malloc.h>

#include <cstring>

// The class of every object that has members (not wrapped for C++ by the
// toolkit's headers).
extern "C" const Efl_Class* efl_canvas_group_class_get(void);

namespace app_assist {
namespace {

constexpr const char* kRecordKey = "WClippedSmartData.record";
// The clipper record: the clipper rectangle and the canvas, 16 bytes.
struct ClipperRecord {
	Evas_Object* clipper;
	Evas* canvas;
};
constexpr size_t kMostRecordBlock = 24;

// Only the toolkit's own record of an edje object (other smart objects may
// keep data of their own there): a 16-byte block naming this object's canvas
// and, when there is one, a clipper rectangle that is this object's member.
bool isClipperRecord(Evas_Object* obj, void* data)
{
	const char* type = evas_object_type_get(obj);
	if (!data || !type || strcmp(type, "edje") != 0)
		return false;
	auto* record = static_cast<ClipperRecord*>(data);
	if (record->canvas != evas_object_evas_get(obj))
		return false;
	if (record->clipper && evas_object_smart_parent_get(record->clipper) != obj)
		return false;
	return malloc_usable_size(data) <= kMostRecordBlock;
}

// Right before the toolkit drops it: the record is remembered on the object.
void objectDelCb(void*, Evas*, Evas_Object* obj, void*)
{
	void* data = evas_object_smart_data_get(obj);
	if (isClipperRecord(obj, data))
		evas_object_data_set(obj, kRecordKey, data);
}

// The toolkit has finished with the object; a record it no longer points to
// is ours to free, one it still holds it frees itself.
void objectFreeCb(void*, Evas*, Evas_Object* obj, void*)
{
	void* record = evas_object_data_del(obj, kRecordKey);
	if (record && !evas_object_smart_data_get(obj))
		free(record);
}

void watch(Evas_Object* obj)
{
	if (!evas_object_smart_data_get(obj))
		return;
	evas_object_event_callback_del(obj, EVAS_CALLBACK_DEL, objectDelCb);
	evas_object_event_callback_del(obj, EVAS_CALLBACK_FREE, objectFreeCb);
	evas_object_event_callback_add(obj, EVAS_CALLBACK_DEL, objectDelCb, nullptr);
	evas_object_event_callback_add(obj, EVAS_CALLBACK_FREE, objectFreeCb, nullptr);
}

void watchTree(Evas_Object* obj)
{
	if (!efl_isa(obj, efl_canvas_group_class_get()))
		return;
	watch(obj);
	Eina_List* members = evas_object_smart_members_get(obj);
	void* member;
	EINA_LIST_FREE(members, member)
	watchTree(static_cast<Evas_Object*>(member));
}

void rootDelCb(void*, Evas*, Evas_Object* root, void*)
{
	watchTree(root);
}

} // namespace

bool WClippedSmartData::isNeeded()
{
	return eina_version && eina_version->major == 1 && eina_version->minor == 26;
}

void WClippedSmartData::reclaimOnDelete(Evas_Object* root)
{
	if (root && isNeeded())
		watchTree(root);
}

void WClippedSmartData::reclaimWhenDeleted(Evas_Object* root)
{
	if (!root || !isNeeded())
		return;
	evas_object_event_callback_del(root, EVAS_CALLBACK_DEL, rootDelCb);
	evas_object_event_callback_add(root, EVAS_CALLBACK_DEL, rootDelCb, nullptr);
}

} // namespace app_assist
