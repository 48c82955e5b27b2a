#include "CtDetailViewRingtoneItem.h"

#include <cstring>

namespace {

const size_t kMaxNameBytes = 1024;

// "/x/Over the Horizon.ogg" -> "Over the Horizon".
std::string displayFileName(const char* path)
{
	if (!path || !*path)
		return std::string();
	std::string name(path);
	size_t slash = name.find_last_of('/');
	if (slash != std::string::npos)
		name.erase(0, slash + 1);
	size_t dot = name.find_last_of('.');
	if (dot != std::string::npos && dot > 0)
		name.erase(dot);
	if (name.size() >= kMaxNameBytes) {
		size_t end = kMaxNameBytes - 1;
		while (end > 0 && ((unsigned char)name[end] & 0xC0) == 0x80)
			--end;
		name.erase(end);
	}
	return name;
}

} // namespace

CtDetailViewRingtoneItem::CtDetailViewRingtoneItem(CtDetailDataBase* data) : CtDetailViewGenlistItem(data)
{
}

void CtDetailViewRingtoneItem::onSetElmObjectItem(Elm_Object_Item* item)
{
	elm_genlist_item_select_mode_set(item, ELM_OBJECT_SELECT_MODE_NONE);
}

std::string CtDetailViewRingtoneItem::getText(const char* part)
{
	if (strcmp(part, "elm.text.sub.left.top") == 0)
		return translate("IDS_PB_OPT_RINGTONE");
	if (strcmp(part, "elm.text.main.left.bottom") == 0) {
		std::string name = displayFileName(getData()->getRingtonePath());
		return name.empty() ? translate("IDS_PB_BODY_DEFAULT") : toMarkup(name.c_str());
	}
	return std::string();
}
