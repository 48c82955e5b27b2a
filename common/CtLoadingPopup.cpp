#include "CtLoadingPopup.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"

namespace {

const char* const kTextDomain = "contacts";

} // namespace

CtLoadingPopup::CtLoadingPopup(const char* textId)
	: m_textId(textId ? textId : "")
{
	setTextTranslatable(kTextDomain);
	setContent([this](Evas_Object* parent) { return __createContent(parent); });
	setOnBack([](bool* destroyPopup) {
		WHIT();
		*destroyPopup = false;
	});
}

CtLoadingPopup::~CtLoadingPopup() = default;

const char* CtLoadingPopup::getClassName()
{
	return "CtLoadingPopup";
}

Evas_Object* CtLoadingPopup::__createContent(Evas_Object* parent)
{
	Evas_Object* box = elm_box_add(parent);
	WPRET_VM(!box, nullptr, "* Critical * elm_box_add() is fail");
	elm_box_horizontal_set(box, EINA_TRUE);
	elm_box_padding_set(box, ELM_SCALE_SIZE(24), 0);

	Evas_Object* wheel = elm_progressbar_add(box);
	elm_object_style_set(wheel, "wheel");
	elm_progressbar_pulse_set(wheel, EINA_TRUE);
	elm_progressbar_pulse(wheel, EINA_TRUE);
	evas_object_show(wheel);
	elm_box_pack_end(box, wheel);

	Evas_Object* label = elm_label_add(box);
	elm_object_domain_translatable_text_set(label, kTextDomain, m_textId.c_str());
	evas_object_show(label);
	elm_box_pack_end(box, label);
	evas_object_show(box);
	return box;
}
