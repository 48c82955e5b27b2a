#include "CtProfileSharingPreviewItem.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"
#include "CtContactsAgentMgr.h"
#include "CtMyProfileDetailData.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace {

constexpr int kBirthdayType = 2;
constexpr int kPictureSize = 48;
// Fields of the profile card, in the order a contact sees them.
constexpr CtProfileProperty kFieldOrder[] = {CT_PROFILE_PROPERTY_ORGANIZATION, CT_PROFILE_PROPERTY_EMAIL,
	CT_PROFILE_PROPERTY_ADDRESS, CT_PROFILE_PROPERTY_BIRTHDAY};

template <typename Fn>
void forEachRecord(Eina_List* list, Fn fn)
{
	Eina_List* l = nullptr;
	void* data = nullptr;
	EINA_LIST_FOREACH(list, l, data)
		fn(static_cast<contacts_record_h>(data));
}

std::string orEmpty(const char* text)
{
	return text ? text : "";
}

// YYYYMMDD as "YYYY-MM-DD", or "--MM-DD" without a year.
std::string dateText(int date)
{
	char buf[16] = {};
	if (date / 10000 > 0)
		snprintf(buf, sizeof(buf), "%04d-%02d-%02d", date / 10000, date / 100 % 100, date % 100);
	else
		snprintf(buf, sizeof(buf), "--%02d-%02d", date / 100 % 100, date % 100);
	return buf;
}

} // namespace

CtProfileSharingPreviewItem::CtProfileSharingPreviewItem()
	: CtProfileSharingRow("multiline_sub.main.1icon"), m_data(std::make_unique<CtMyProfileDetailData>())
{
	setText("elm.text.main", [this] { return getName(); });
	setText("elm.text.multiline", [this] {
		std::string text;
		for (const std::string& line : getLines())
			text += (text.empty() ? "" : "\n") + line;
		return text;
	});
	setContent("elm.icon", [this](Evas_Object* parent) { return __createPicture(parent); });
	m_data->attachListener(this);
}

CtProfileSharingPreviewItem::~CtProfileSharingPreviewItem()
{
	m_data->detachListener();
}

void CtProfileSharingPreviewItem::onDbChanged(const char*)
{
	WHIT();
	if (Elm_Object_Item* item = getElmObjectItem())
		elm_genlist_item_update(item);
}

std::string CtProfileSharingPreviewItem::getName() const
{
	std::string name = orEmpty(m_data->getDisplayName());
	return name.empty() ? "IDS_LOGS_MBODY_UNKNOWN" : name;
}

std::vector<std::string> CtProfileSharingPreviewItem::getLines() const
{
	std::vector<std::string> lines;
	std::string status = orEmpty(m_data->getStatus());
	if (!status.empty())
		lines.push_back(status);
	CtContactsAgentMgr* agent = CtContactsAgentMgr::getInstance();
	for (CtProfileProperty property : kFieldOrder) {
		if (!agent->getProfileProperty(property))
			continue;
		std::string text = __fieldText(property);
		if (!text.empty())
			lines.push_back(text);
	}
	return lines;
}

std::string CtProfileSharingPreviewItem::__fieldText(int property) const
{
	switch (property) {
	case CT_PROFILE_PROPERTY_EMAIL: {
		contacts_record_h first = static_cast<contacts_record_h>(eina_list_data_get(m_data->getEmailList()));
		return first ? orEmpty(m_data->getEmail(first)) : "";
	}
	case CT_PROFILE_PROPERTY_ORGANIZATION:
		return orEmpty(m_data->getCompany());
	case CT_PROFILE_PROPERTY_ADDRESS: {
		contacts_record_h first = static_cast<contacts_record_h>(eina_list_data_get(m_data->getAddressList()));
		char buf[1024] = {};
		if (first)
			m_data->getAddress(first, buf, sizeof(buf));
		std::string address = buf;
		for (char& c : address)
			c = c == '\n' ? ' ' : c;
		return address;
	}
	case CT_PROFILE_PROPERTY_BIRTHDAY:
		return __birthday();
	default:
		return "";
	}
}

std::string CtProfileSharingPreviewItem::__birthday() const
{
	std::string text;
	forEachRecord(m_data->getEventList(), [this, &text](contacts_record_h event) {
		int type = 0;
		contacts_record_get_int(event, _contacts_event.type, &type);
		if (text.empty() && type == kBirthdayType)
			text = dateText(m_data->getEvent(event));
	});
	return text;
}

Evas_Object* CtProfileSharingPreviewItem::__createPicture(Evas_Object* parent) const
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/detail_layout.edj", "list/A/contact/thumbnail");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	const char* path = m_data->getImageThumbnailPath();
	Evas_Object* image = path && *path ? ctCommonCreateMaskImageForCallerId(layout, path, kPictureSize) : nullptr;
	if (!image)
		image = ctCommonCreateImage(layout, "contacts/image_layout.edj", "contacts_caller_id_default_02.png");
	if (image)
		elm_object_part_content_set(layout, "elm.swallow.content", image);
	return layout;
}
