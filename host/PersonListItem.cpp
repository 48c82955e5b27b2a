#include "PersonListItem.h"

#include "ContactsCommon.h"

#include <algorithm>
#include <cstring>
#include <string>

namespace ct::demo {

namespace {

constexpr int kPictureSize = 40;
constexpr int kStarSize = 24;

} // namespace

PersonListItem::PersonListItem(PersonSummary person, SelectHandler onSelect)
	: m_person(std::move(person))
	, m_onSelect(std::move(onSelect))
{
}

Elm_Genlist_Item_Class* PersonListItem::getItemClassStatic()
{
	static Elm_Genlist_Item_Class itc = [] {
		Elm_Genlist_Item_Class c = {};
		c.version = ELM_GENLIST_ITEM_CLASS_VERSION;
		c.item_style = "1line";
		c.func.text_get = __getTextCb;
		c.func.content_get = __getContentCb;
		return c;
	}();
	return &itc;
}

void PersonListItem::onSelect(Elm_Object_Item* item)
{
	elm_genlist_item_selected_set(item, EINA_FALSE);
	if (m_onSelect)
		m_onSelect(m_person.id);
}

char* PersonListItem::__getTextCb(void* data, Evas_Object*, const char* part)
{
	auto* self = static_cast<PersonListItem*>(data);
	if (strcmp(part, "elm.text") != 0)
		return nullptr;
	// A stored name is text on one line, never markup for the row to interpret.
	std::string line = self->m_person.name;
	std::replace_if(line.begin(), line.end(), [](char c) { return c >= 0 && c < ' '; }, ' ');
	return elm_entry_utf8_to_markup(line.c_str());
}

Evas_Object* PersonListItem::__getContentCb(void* data, Evas_Object* obj, const char* part)
{
	auto* self = static_cast<PersonListItem*>(data);
	if (strcmp(part, "elm.swallow.icon") == 0) {
		const std::string& own = self->m_person.picturePath;
		return self->__makeIcon(obj, own.empty() ? ContactsCommon::getAppImagePath("contacts_caller_id_default_02.png") : own,
				kPictureSize);
	}
	if (strcmp(part, "elm.swallow.end") == 0 && self->m_person.favourite)
		return self->__makeIcon(obj, ContactsCommon::getAppImagePath("contacts_icon_favorite.png"), kStarSize);
	return nullptr;
}

Evas_Object* PersonListItem::__makeIcon(Evas_Object* parent, const std::string& path, int size) const
{
	if (path.empty())
		return nullptr;
	Evas_Object* image = elm_image_add(parent);
	if (!elm_image_file_set(image, path.c_str(), nullptr)) {
		evas_object_del(image);
		return nullptr;
	}
	elm_image_aspect_fixed_set(image, EINA_TRUE);
	evas_object_size_hint_min_set(image, ELM_SCALE_SIZE(size), ELM_SCALE_SIZE(size));
	evas_object_size_hint_max_set(image, ELM_SCALE_SIZE(size), ELM_SCALE_SIZE(size));
	return image;
}

} // namespace ct::demo
