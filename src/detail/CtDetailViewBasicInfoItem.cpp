#include "CtDetailViewBasicInfoItem.h"

#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"
#include "CtRegistryMgr.h"

#include <cstring>
#include <vector>

namespace {

const char* const kImageEdj = "contacts/image_layout.edj";
const int kThumbnailSize = 56;

} // namespace

CtDetailViewBasicInfoItem::CtDetailViewBasicInfoItem(CtDetailDataBase* data, int mode)
	: CtDetailViewGenlistItem(data), m_mode(mode), m_isFavorite(data && data->isFavorite())
{
}

CtDetailViewBasicInfoItem::~CtDetailViewBasicInfoItem()
{
	__forgetStar();
}

std::string CtDetailViewBasicInfoItem::getText(const char* part)
{
	if (strcmp(part, "main.name") == 0) {
		const char* name = getData()->getDisplayName();
		return name && *name ? toMarkup(name) : translate("IDS_LOGS_MBODY_UNKNOWN");
	}
	if (m_mode && strncmp(part, "sub.name", 8) == 0)
		return __getSubName(atoi(part + 8));
	return std::string();
}

// Line `line` (1 to 3) of the non-empty ones of phonetic name, nickname, company.
std::string CtDetailViewBasicInfoItem::__getSubName(int line)
{
	std::vector<const char*> lines;
	for (const char* text : {getData()->getExtraName1Second(), getData()->getExtraName1First(), getData()->getCompany()})
		if (text && *text)
			lines.push_back(text);
	if (line < 1 || line > (int)lines.size())
		return std::string();
	return toMarkup(lines[line - 1]);
}

Evas_Object* CtDetailViewBasicInfoItem::getContent(Evas_Object* genlist, const char* part)
{
	if (strcmp(part, "elm.icon.2") != 0)
		return nullptr;
	return __createThumbnail(genlist);
}

Evas_Object* CtDetailViewBasicInfoItem::__createThumbnail(Evas_Object* parent)
{
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/detail_layout.edj", "list/B/type.2");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is fail");
	const char* thumbnail = getData()->getImageThumbnailPath();
	Evas_Object* image = thumbnail && *thumbnail
		? ctCommonCreateMaskImageForCallerId(layout, thumbnail, kThumbnailSize)
		: ctCommonCreateImage(layout, kImageEdj, "contacts_caller_id_default_02.png");
	elm_object_part_content_set(layout, "image.thumbnail", image);

	__forgetStar();
	const char* starImage = m_isFavorite ? "contacts_icon_favorite.png" : "contacts_icon_favorite_off.png";
	m_star = ctCommonCreateImage(layout, kImageEdj, starImage);
	elm_object_part_content_set(layout, "favor.icon", m_star);
	m_thumbnailLayout = layout;
	if (m_star)
		evas_object_event_callback_add(m_star, EVAS_CALLBACK_DEL, __starDelCb, this);
	evas_object_event_callback_add(layout, EVAS_CALLBACK_MOUSE_UP, __mouseUpCb, this);
	return layout;
}

void CtDetailViewBasicInfoItem::__forgetStar()
{
	if (m_star)
		evas_object_event_callback_del_full(m_star, EVAS_CALLBACK_DEL, __starDelCb, this);
	if (m_thumbnailLayout)
		evas_object_event_callback_del_full(m_thumbnailLayout, EVAS_CALLBACK_MOUSE_UP, __mouseUpCb, this);
	m_star = nullptr;
	m_thumbnailLayout = nullptr;
}

void CtDetailViewBasicInfoItem::__starDelCb(void* data, Evas*, Evas_Object* obj, void*)
{
	auto* row = static_cast<CtDetailViewBasicInfoItem*>(data);
	if (row->m_star == obj)
		row->__forgetStar();
}

void CtDetailViewBasicInfoItem::__mouseUpCb(void* data, Evas*, Evas_Object*, void* eventInfo)
{
	auto* row = static_cast<CtDetailViewBasicInfoItem*>(data);
	auto* ev = static_cast<Evas_Event_Mouse_Up*>(eventInfo);
	if (!ev || !row->m_star || (ev->event_flags & EVAS_EVENT_FLAG_ON_HOLD))
		return;
	Evas_Coord x = 0, w = 0;
	evas_object_geometry_get(row->m_star, &x, nullptr, &w, nullptr);
	if (ev->canvas.x < x || ev->canvas.x > x + w)
		return;
	WHIT();
	row->__toggleFavorite();
}

void CtDetailViewBasicInfoItem::__toggleFavorite()
{
	m_skipOnce = true;
	m_isFavorite = !m_isFavorite;
	getData()->setFavorite(m_isFavorite);
	CtRegistryMgr::getInstance()->raiseChangeSignal(CT_REGISTRY_KEY_FAVORITE_CHANGED, 0);
}
