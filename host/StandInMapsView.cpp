#include "StandInMapsView.h"

#include "ContactsCommon.h"

#include <cstdlib>

namespace ct::demo {

namespace {

constexpr size_t kMaxAddressBytes = 1024;
constexpr int kPinSize = 96;

int hexValue(char c)
{
	if (c >= '0' && c <= '9')
		return c - '0';
	if (c >= 'a' && c <= 'f')
		return c - 'a' + 10;
	if (c >= 'A' && c <= 'F')
		return c - 'A' + 10;
	return -1;
}

std::string percentDecoded(const std::string& text)
{
	std::string out;
	for (size_t i = 0; i < text.size(); ++i) {
		int high = i + 2 < text.size() && text[i] == '%' ? hexValue(text[i + 1]) : -1;
		int low = high >= 0 ? hexValue(text[i + 2]) : -1;
		if (low >= 0) {
			out += static_cast<char>(high * 16 + low);
			i += 2;
		} else {
			out += text[i] == '+' ? ' ' : text[i];
		}
	}
	return out;
}

std::string fromMarkup(const char* markup)
{
	char* text = elm_entry_markup_to_utf8(markup ? markup : "");
	std::string out = text ? text : "";
	free(text);
	return out;
}

} // namespace

StandInMapsView::StandInMapsView(app_control_h request, ct::appcontrol::Reply reply)
	: StandInView(request, std::move(reply), "Maps", "")
{
	setCaption(isReplyRequested() ? "Type or correct the address, then Done." : "The map would show this place.");
}

std::string StandInMapsView::placeOfGeoUri(const std::string& uri)
{
	size_t q = uri.find("q=");
	if (uri.compare(0, 4, "geo:") != 0 || q == std::string::npos)
		return "";
	std::string place = percentDecoded(uri.substr(q + 2));
	if (place.size() >= 2 && place.front() == '"' && place.back() == '"')
		place = place.substr(1, place.size() - 2);
	return place;
}

Evas_Object* StandInMapsView::createContent(Evas_Object* parent)
{
	std::string searched = getExtra("searchByName");
	std::string place = searched.empty() ? placeOfGeoUri(getUri()) : fromMarkup(searched.c_str());
	if (place.size() > kMaxAddressBytes) {
		size_t cut = kMaxAddressBytes;
		while (cut > 0 && (static_cast<unsigned char>(place[cut]) & 0xC0) == 0x80)
			--cut;
		place.resize(cut);
	}
	Evas_Object* box = elm_box_add(parent);
	evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(box, EVAS_HINT_FILL, EVAS_HINT_FILL);
	m_entry = createEntry(box, true);
	char* markup = elm_entry_utf8_to_markup(place.c_str());
	elm_object_text_set(m_entry, markup);
	free(markup);
	elm_object_part_text_set(m_entry, "elm.guide", "Address");
	// Not scrolling: the entry grows with the address it holds.
	elm_entry_scrollable_set(m_entry, EINA_FALSE);
	evas_object_size_hint_weight_set(m_entry, EVAS_HINT_EXPAND, 0.0);
	evas_object_size_hint_align_set(m_entry, EVAS_HINT_FILL, 0.0);
	evas_object_show(m_entry);
	elm_box_pack_end(box, m_entry);
	// Where the map would be.
	Evas_Object* pin = elm_image_add(box);
	elm_image_file_set(pin, ContactsCommon::getAppImagePath("contacts_btn_ic_map.png").c_str(), nullptr);
	elm_image_resizable_set(pin, EINA_FALSE, EINA_FALSE);
	evas_object_size_hint_weight_set(pin, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_min_set(pin, ELM_SCALE_SIZE(kPinSize), ELM_SCALE_SIZE(kPinSize));
	evas_object_show(pin);
	elm_box_pack_end(box, pin);
	addButton("Cancel", __cancelClickedCb);
	addButton("Done", __doneClickedCb, true);
	return box;
}

void StandInMapsView::__doneClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<StandInMapsView*>(data);
	std::string typed = fromMarkup(elm_object_text_get(self->m_entry));
	if (typed.empty())
		self->answer(nullptr);
	else
		self->answerText(APP_CONTROL_DATA_SELECTED, typed);
}

void StandInMapsView::__cancelClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<StandInMapsView*>(data)->popOut();
}

} // namespace ct::demo
