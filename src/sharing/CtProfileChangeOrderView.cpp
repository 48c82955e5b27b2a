#include "CtProfileChangeOrderView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtCommonUsageLog.h"
#include "CtCommonWidgetUtil.h"
#include "CtData.h"
#include "CtProfileOrderImageItem.h"
#include "WNaviframe.h"

#include <algorithm>

namespace {

const char* const kTitleId = "IDS_PB_OPT_REORDER";
constexpr int kCellSize = 110;

struct OrderedImage {
	int order;
	contacts_record_h image;
};

// The edited pictures in picture order; pictures without an order go last.
std::vector<OrderedImage> picturesInOrder(CtData& data)
{
	std::vector<OrderedImage> pictures;
	int count = data.getImageCount();
	for (int index = 0; index < count; ++index) {
		int order = data.getImageOrder(index);
		// Only an existing order: asking for a missing one would add a picture.
		if (data.getImageIndex(order) != index)
			continue;
		if (contacts_record_h image = data.getImageRecord(order))
			pictures.push_back({order, image});
	}
	std::stable_sort(pictures.begin(), pictures.end(),
		[](const OrderedImage& a, const OrderedImage& b) { return a.order < b.order; });
	return pictures;
}

const char* pathOf(contacts_record_h image)
{
	char* path = nullptr;
	contacts_record_get_str_p(image, _contacts_image.path, &path);
	return path;
}

// The child index of `image` in the edited record, -1 when it is gone.
int indexOf(CtData& data, contacts_record_h image)
{
	int count = data.getImageCount();
	for (int index = 0; index < count; ++index) {
		int order = data.getImageOrder(index);
		if (data.getImageIndex(order) == index && data.getImageRecord(order) == image)
			return index;
	}
	return -1;
}

} // namespace

CtProfileChangeOrderView::CtProfileChangeOrderView(std::shared_ptr<CtData> data, Elm_Object_Item* pictureRow,
		std::function<void()> onDone)
	: m_data(std::move(data)), m_onDone(std::move(onDone))
{
	WENTER();
	__trackPictureRow(pictureRow);
}

CtProfileChangeOrderView::~CtProfileChangeOrderView()
{
	WENTER();
	if (m_pictureRowTracker) {
		evas_object_event_callback_del_full(m_pictureRowTracker, EVAS_CALLBACK_DEL, __pictureRowDeletedCb, this);
		elm_object_item_untrack(m_pictureRow);
	}
}

// The caller's row may be deleted while this screen is shown.
void CtProfileChangeOrderView::__trackPictureRow(Elm_Object_Item* pictureRow)
{
	if (!pictureRow)
		return;
	m_pictureRowTracker = elm_object_item_track(pictureRow);
	if (!m_pictureRowTracker)
		return;
	m_pictureRow = pictureRow;
	evas_object_event_callback_add(m_pictureRowTracker, EVAS_CALLBACK_DEL, __pictureRowDeletedCb, this);
}

void CtProfileChangeOrderView::__pictureRowDeletedCb(void* data, Evas*, Evas_Object*, void*)
{
	auto* view = static_cast<CtProfileChangeOrderView*>(data);
	view->m_pictureRow = nullptr;
	view->m_pictureRowTracker = nullptr;
}

Evas_Object* CtProfileChangeOrderView::onCreate(Evas_Object* parent, void*)
{
	WENTER();
	Evas_Object* layout = ctCommonCreateLayout(parent, "contacts/detail_layout.edj", "layout/reorder");
	WPRET_VM(!layout, nullptr, "ctCommonCreateLayout() is failed");
	m_gengrid = __createGengrid(layout);
	if (!m_gengrid)
		WERROR("__createGengrid() is failed");
	return layout;
}

Evas_Object* CtProfileChangeOrderView::__createGengrid(Evas_Object* parent)
{
	WPRET_VM(!parent, nullptr, "parent is NULL");
	Evas_Object* grid = elm_gengrid_add(parent);
	WPRET_VM(!grid, nullptr, "elm_gengrid_add() is fail");
	elm_gengrid_reorder_mode_set(grid, EINA_TRUE);
	elm_gengrid_item_size_set(grid, ELM_SCALE_SIZE(kCellSize), ELM_SCALE_SIZE(kCellSize));
	elm_gengrid_align_set(grid, 0.5, 0.0);
	evas_object_size_hint_weight_set(grid, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(grid, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_smart_callback_add(grid, "moved", __gengridMovedCb, this);
	evas_object_smart_callback_add(grid, "selected", __gengridSelectedCb, this);
	elm_object_part_content_set(parent, "elm.swallow.content", grid);
	return grid;
}

void CtProfileChangeOrderView::onCreated()
{
	WENTER();
}

void CtProfileChangeOrderView::onPushed(Elm_Object_Item* naviItem)
{
	WENTER();
	elm_object_item_part_text_set(naviItem, "elm.text.title", ContactsCommon::translate(kTitleId));
	__addTitleButtons(naviItem);
	__appendCells();
}

void CtProfileChangeOrderView::onDestroy()
{
	WENTER();
}

void CtProfileChangeOrderView::__addTitleButtons(Elm_Object_Item* naviItem)
{
	app_assist::WNaviframe* naviframe = getNaviframe();
	WPRET_M(!naviframe, "naviframe is nullptr");
	Evas_Object* parent = naviframe->getEvasObj();
	Evas_Object* cancel = ctCommonCreateButton(parent, "naviframe/title_left", "IDS_TPLATFORM_ACBUTTON_CANCEL_ABB",
		__cancelCb, this);
	if (Evas_Object* back = elm_object_item_part_content_unset(naviItem, "elm.swallow.prev_btn"))
		evas_object_del(back);
	elm_object_item_part_content_set(naviItem, "title_left_btn", cancel);
	if (elm_object_item_part_content_get(naviItem, "title_left_btn") != cancel)
		elm_object_item_part_content_set(naviItem, "elm.swallow.prev_btn", cancel);
	m_doneButton = ctCommonCreateButton(parent, "naviframe/title_right", "IDS_TPLATFORM_ACBUTTON_DONE_ABB",
		__saveCb, this);
	elm_object_disabled_set(m_doneButton, EINA_TRUE);
	elm_object_item_part_content_set(naviItem, "title_right_btn", m_doneButton);
}

void CtProfileChangeOrderView::__appendCells()
{
	WPRET_M(!m_data || !m_gengrid, "Invalid param : data");
	for (const OrderedImage& picture : picturesInOrder(*m_data)) {
		auto* cell = new CtProfileOrderImageItem(picture.image, pathOf(picture.image));
		Elm_Object_Item* item = elm_gengrid_item_append(m_gengrid, cell->getItemClass(), cell,
			nullptr, nullptr);
		if (!item) {
			WERROR("elm_gengrid_item_append() is fail");
			delete cell;
			continue;
		}
		cell->setElmObjectItem(item);
		cell->attachToView(this);
	}
}

std::vector<contacts_record_h> CtProfileChangeOrderView::getCellImages() const
{
	std::vector<contacts_record_h> images;
	for (Elm_Object_Item* item = m_gengrid ? elm_gengrid_first_item_get(m_gengrid) : nullptr; item;
			item = elm_gengrid_item_next_get(item)) {
		auto* cell = dynamic_cast<CtProfileOrderImageItem*>(
			static_cast<app_assist::WGengridItem*>(elm_object_item_data_get(item)));
		if (cell)
			images.push_back(cell->getImage());
	}
	return images;
}

void CtProfileChangeOrderView::__save()
{
	WENTER();
	// All positions first: the lookups go by order, which is being rewritten.
	std::vector<int> indices;
	for (contacts_record_h image : getCellImages()) {
		int index = indexOf(*m_data, image);
		if (index < 0)
			WERROR("picture removed while reordering");
		else
			indices.push_back(index);
	}
	int order = 1;
	for (int index : indices)
		m_data->setImageOrder(index, order++);
	if (m_pictureRow)
		elm_genlist_item_update(m_pictureRow);
	if (m_onDone)
		m_onDone();
	ctCommonInsertUsageLog("CT15", nullptr);
}

void CtProfileChangeOrderView::__gengridMovedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	auto* view = static_cast<CtProfileChangeOrderView*>(data);
	if (view->m_doneButton)
		elm_object_disabled_set(view->m_doneButton, EINA_FALSE);
}

void CtProfileChangeOrderView::__gengridSelectedCb(void*, Evas_Object*, void* eventInfo)
{
	WHIT();
	WPRET_M(!eventInfo, "event_info is NULL");
	elm_gengrid_item_selected_set(static_cast<Elm_Object_Item*>(eventInfo), EINA_FALSE);
}

void CtProfileChangeOrderView::__saveCb(void* data, Evas_Object*, void*)
{
	WHIT();
	auto* view = static_cast<CtProfileChangeOrderView*>(data);
	view->__save();
	view->popOut();
}

void CtProfileChangeOrderView::__cancelCb(void* data, Evas_Object*, void*)
{
	WHIT();
	static_cast<CtProfileChangeOrderView*>(data)->popOut();
}
