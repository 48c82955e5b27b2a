#include "ShotRows.h"

#include "ResourcePaths.h"

#include <cstring>

namespace ct::test::res {

namespace {

char* textGet(void* data, Evas_Object*, const char* part)
{
	auto* row = static_cast<ShotRow*>(data);
	auto found = row->texts.find(part);
	return found == row->texts.end() ? nullptr : strdup(found->second.c_str());
}

Evas_Object* contentGet(void* data, Evas_Object* obj, const char* part)
{
	auto* row = static_cast<ShotRow*>(data);
	auto found = row->contents.find(part);
	return found == row->contents.end() ? nullptr : found->second(obj);
}

} // namespace

std::vector<Elm_Object_Item*> appendShotRows(Evas_Object* genlist, std::vector<ShotRow>& rows)
{
	std::vector<Elm_Object_Item*> items;
	for (ShotRow& row : rows) {
		Elm_Genlist_Item_Class* itc = elm_genlist_item_class_new();
		itc->item_style = row.style.c_str();
		itc->func.text_get = textGet;
		itc->func.content_get = contentGet;
		Elm_Object_Item* item = elm_genlist_item_append(genlist, itc, &row, nullptr,
			ELM_GENLIST_ITEM_NONE, nullptr, nullptr);
		elm_genlist_item_class_free(itc);
		elm_object_item_disabled_set(item, row.disabled);
		if (row.selected)
			elm_genlist_item_selected_set(item, EINA_TRUE);
		items.push_back(item);
	}
	return items;
}

ContentMaker icon(const std::string& imageName, int size)
{
	return [imageName, size](Evas_Object* parent) {
		Evas_Object* image = elm_image_add(parent);
		elm_image_file_set(image, edjePath("image_layout.edj").c_str(), imageName.c_str());
		evas_object_size_hint_min_set(image, size, size);
		return image;
	};
}

ContentMaker entry(const std::string& text, const std::string& guide)
{
	return [text, guide](Evas_Object* parent) {
		Evas_Object* field = elm_entry_add(parent);
		elm_entry_single_line_set(field, EINA_TRUE);
		elm_entry_scrollable_set(field, EINA_TRUE);
		elm_object_text_set(field, text.c_str());
		elm_object_part_text_set(field, "elm.guide", guide.c_str());
		evas_object_size_hint_weight_set(field, EVAS_HINT_EXPAND, 0);
		evas_object_size_hint_align_set(field, EVAS_HINT_FILL, 0.5);
		return field;
	};
}

ContentMaker typeSelector(const std::string& label)
{
	return [label](Evas_Object* parent) {
		return layout("detail_layout.edj", "input/number/type",
			{{"elm.swallow.content", button(label)}})(parent);
	};
}

ContentMaker button(const std::string& label)
{
	return [label](Evas_Object* parent) {
		Evas_Object* b = elm_button_add(parent);
		elm_object_text_set(b, label.c_str());
		return b;
	};
}

ContentMaker radio(bool on)
{
	return [on](Evas_Object* parent) {
		Evas_Object* r = elm_radio_add(parent);
		elm_radio_state_value_set(r, 1);
		elm_radio_value_set(r, on ? 1 : 0);
		return r;
	};
}

ContentMaker check(bool on, const char* style)
{
	return [on, style](Evas_Object* parent) {
		Evas_Object* c = elm_check_add(parent);
		if (style)
			elm_object_style_set(c, style);
		elm_check_state_set(c, on);
		return c;
	};
}

ContentMaker layout(const std::string& edj, const std::string& group,
	std::map<std::string, ContentMaker> parts)
{
	return [edj, group, parts](Evas_Object* parent) {
		Evas_Object* l = elm_layout_add(parent);
		elm_layout_file_set(l, edjePath(edj).c_str(), group.c_str());
		for (const auto& [part, make] : parts)
			elm_object_part_content_set(l, part.c_str(), make(l));
		return l;
	};
}

} // namespace ct::test::res
