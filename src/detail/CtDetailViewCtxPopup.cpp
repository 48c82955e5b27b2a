#include "CtDetailViewCtxPopup.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonWidgetUtil.h"
#include "CtDetailViewGenlistItem.h"

#include <efl_assist.h>

namespace {

const int kGap = 14;
const int kBand = 72;
const int kLimit = 150;
const int kMargin = 20;

bool isPictureKind(int kind)
{
	return kind == DETAIL_ITEM_MULTI_IMAGE || kind == DETAIL_ITEM_PROFILE_MULTI_IMAGE;
}

// Whether `item` is still one of `genlist`'s items (rows can be rebuilt
// while the popup is open).
bool isListed(Evas_Object* genlist, Elm_Object_Item* item)
{
	if (!genlist)
		return false;
	for (Elm_Object_Item* it = elm_genlist_first_item_get(genlist); it; it = elm_genlist_item_next_get(it))
		if (it == item)
			return true;
	return false;
}

} // namespace

CtDetailViewCtxPopup::CtDetailViewCtxPopup(Evas_Object* window, Elm_Object_Item* item)
	: m_window(window), m_item(item), m_genlist(item ? elm_object_item_widget_get(item) : nullptr)
{
	if (m_genlist)
		evas_object_event_callback_add(m_genlist, EVAS_CALLBACK_DEL, __genlistDelCb, this);
}

CtDetailViewCtxPopup::~CtDetailViewCtxPopup()
{
	if (m_genlist)
		evas_object_event_callback_del_full(m_genlist, EVAS_CALLBACK_DEL, __genlistDelCb, this);
}

std::weak_ptr<app_assist::WControl> CtDetailViewCtxPopup::open(app_assist::WControl* owner, Evas_Object* window,
		Elm_Object_Item* item)
{
	WPRET_VM(!owner || !item, std::weak_ptr<app_assist::WControl>(), "Invalid param : owner or item");
	elm_genlist_item_selected_set(item, EINA_FALSE);
	auto* row = static_cast<CtDetailViewGenlistItem*>(elm_object_item_data_get(item));
	WPRET_VM(!row, std::weak_ptr<app_assist::WControl>(), "row is nullptr");
	if (row->getCopyText().empty()) {
		WERROR("no copy text");
		return std::weak_ptr<app_assist::WControl>();
	}
	if (!isPictureKind(row->getItemType())) {
		row->setHighlighted(true);
		elm_genlist_item_update(item);
	}
	elm_scroller_movement_block_set(elm_object_item_widget_get(item), ELM_SCROLLER_MOVEMENT_BLOCK_VERTICAL);
	auto* popup = new CtDetailViewCtxPopup(window, item);
	owner->attachPopup(popup);
	return owner->getPopup() == popup ? popup->getWeakPtr() : std::weak_ptr<app_assist::WControl>();
}

CtDetailViewCtxPopup::Position CtDetailViewCtxPopup::computePosition(Evas_Coord x, Evas_Coord y, Evas_Coord w,
		Evas_Coord h, bool isPicture, double scale)
{
	int gap = (int)(kGap * scale);
	int band = (int)(kBand * scale);
	int limit = (int)(kLimit * scale);
	int margin = (int)(kMargin * scale);
	Evas_Coord wanted = isPicture ? y + h / 2 + band / 2 - gap : y - gap;
	if (wanted - band > limit)
		return {x + w / 2, wanted};
	return {x + w / 2, limit + band + margin};
}

Evas_Object* CtDetailViewCtxPopup::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	Evas_Object* top = elm_object_top_widget_get(parent);
	Evas_Object* ctxpopup = elm_ctxpopup_add(top ? top : parent);
	WPRET_VM(!ctxpopup, nullptr, "elm_ctxpopup_add() is fail");
	elm_ctxpopup_horizontal_set(ctxpopup, EINA_TRUE);
	ea_object_event_callback_add(ctxpopup, EA_CALLBACK_BACK, __backCb, this);
	evas_object_smart_callback_add(ctxpopup, "dismissed", __dismissedCb, this);
	elm_ctxpopup_item_append(ctxpopup, ContactsCommon::translate("IDS_PB_OPT_VIEW_COPY"), nullptr,
			__copySelectedCb, this);
	__place(ctxpopup);
	evas_object_show(ctxpopup);
	return ctxpopup;
}

void CtDetailViewCtxPopup::onDestroy()
{
	WENTER();
	if (CtDetailViewGenlistItem* row = __getRow()) {
		row->setHighlighted(false);
		elm_genlist_item_update(m_item);
	}
	if (Evas_Object* obj = getEvasObj())
		ea_object_event_callback_del(obj, EA_CALLBACK_BACK, __backCb);
}

CtDetailViewGenlistItem* CtDetailViewCtxPopup::__getRow() const
{
	if (!isListed(m_genlist, m_item))
		return nullptr;
	return static_cast<CtDetailViewGenlistItem*>(elm_object_item_data_get(m_item));
}

bool CtDetailViewCtxPopup::__isPictureRow() const
{
	CtDetailViewGenlistItem* row = __getRow();
	return row && isPictureKind(row->getItemType());
}

void CtDetailViewCtxPopup::__place(Evas_Object* ctxpopup)
{
	bool picture = __isPictureRow();
	Evas_Object* anchor = __getRow()
		? elm_object_item_part_content_get(m_item, picture ? "elm.icon" : "copy.text.area")
		: nullptr;
	Evas_Coord x = 0, y = 0, w = 0, h = 0;
	if (anchor)
		evas_object_geometry_get(anchor, &x, &y, &w, &h);
	else
		WERROR("no anchor");
	m_position = computePosition(x, y, w, h, picture, ctCommonGetScale());
	evas_object_move(ctxpopup, m_position.x, m_position.y);
}

void CtDetailViewCtxPopup::copy()
{
	WENTER();
	CtDetailViewGenlistItem* row = __getRow();
	if (row) {
		std::string text = row->getCopyText();
		if (__isPictureRow()) {
			__copyPicture(text);
		} else {
			elm_cnp_selection_set(m_window, ELM_SEL_TYPE_CLIPBOARD, ELM_SEL_FORMAT_TEXT, text.c_str(), text.size());
		}
	} else {
		WERROR("row is gone");
	}
	destroy();
}

// The toolkit's image clipboard takes the picture's bytes (it reads the
// format from them); a "file://" text handed over as an image crashes it.
void CtDetailViewCtxPopup::__copyPicture(const std::string& path)
{
	if (path.rfind("file://", 0) == 0)
		return __copyPicture(path.substr(7));
	Eina_File* file = eina_file_open(path.c_str(), EINA_FALSE);
	WPRET_M(!file, "cannot open %s", path.c_str());
	size_t size = eina_file_size_get(file);
	void* bytes = size ? eina_file_map_all(file, EINA_FILE_SEQUENTIAL) : nullptr;
	if (bytes) {
		if (!elm_cnp_selection_set(m_window, ELM_SEL_TYPE_CLIPBOARD, ELM_SEL_FORMAT_IMAGE, bytes, size))
			WERROR("elm_cnp_selection_set() is fail");
		eina_file_map_free(file, bytes);
	} else {
		WERROR("cannot read %s", path.c_str());
	}
	eina_file_close(file);
}

void CtDetailViewCtxPopup::__copySelectedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtDetailViewCtxPopup*>(data)->copy();
}

void CtDetailViewCtxPopup::__dismissedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtDetailViewCtxPopup*>(data)->destroy();
}

void CtDetailViewCtxPopup::__backCb(void*, Evas_Object* obj, void*)
{
	WHIT();
	elm_ctxpopup_dismiss(obj);
}

void CtDetailViewCtxPopup::__genlistDelCb(void* data, Evas*, Evas_Object*, void*)
{
	static_cast<CtDetailViewCtxPopup*>(data)->m_genlist = nullptr;
}
