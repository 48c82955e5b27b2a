#include "WPopup.h"

#include "ContactsDebug.h"
#include "efl_extension.h"

namespace app_assist {

namespace {

const char* const kButtonParts[WPopup::kMaxButtons] = { "button1", "button2", "button3" };

Evas_Object* topWidgetOf(Evas_Object* obj)
{
	Evas_Object* top = elm_object_top_widget_get(obj);
	return top ? top : obj;
}

} // namespace

WPopup::WPopup() = default;

WPopup::WPopup(const char* title, const char* text)
{
	setTitle(title);
	setContent(text);
}

WPopup::~WPopup() = default;

const char* WPopup::getClassName()
{
	return "WPopup";
}

void WPopup::setTitle(const char* title)
{
	m_title = title ? title : "";
	if (getEvasObj())
		setPartText(getEvasObj(), "title,text", m_title);
}

void WPopup::setTextTranslatable(const char* domain)
{
	m_domain = domain ? domain : "";
}

void WPopup::setContent(const char* text)
{
	m_text = text ? text : "";
	m_contentBuilder = nullptr;
	if (getEvasObj())
		setPartText(getEvasObj(), nullptr, m_text);
}

void WPopup::setContent(ContentBuilder builder)
{
	m_contentBuilder = std::move(builder);
	m_text.clear();
}

void WPopup::addButton(const char* label, ButtonCallback onClick, PropertiesCallback onAddProperties)
{
	WPRET_M(isCreated(), "buttons are added before the popup is shown");
	WPRET_M(m_buttons.size() >= static_cast<size_t>(kMaxButtons), "a popup has at most %d buttons", kMaxButtons);
	m_buttons.push_back(std::make_unique<Button>(
		Button { this, label ? label : "", std::move(onClick), std::move(onAddProperties) }));
}

void WPopup::setOnAddProperties(PropertiesCallback onAddProperties)
{
	m_onAddProperties = std::move(onAddProperties);
}

void WPopup::setOnBack(ButtonCallback onBack)
{
	m_onBack = std::move(onBack);
}

void WPopup::attachToView(WControl* owner)
{
	WPRET_M(!owner, "Invalid param : owner");
	owner->attachPopup(this);
}

Evas_Object* WPopup::onCreate(Evas_Object* parent, void*)
{
	Evas_Object* popup = elm_popup_add(topWidgetOf(parent));
	WPRET_VM(!popup, nullptr, "elm_popup_add() failed");
	elm_popup_align_set(popup, ELM_NOTIFY_ALIGN_FILL, 1.0);
	evas_object_size_hint_weight_set(popup, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	if (!m_title.empty())
		setPartText(popup, "title,text", m_title);
	if (m_contentBuilder) {
		Evas_Object* content = m_contentBuilder(popup);
		if (content)
			elm_object_content_set(popup, content);
	} else if (!m_text.empty()) {
		setPartText(popup, nullptr, m_text);
	}
	__addButtons(popup);
	eext_object_event_callback_add(popup, EEXT_CALLBACK_BACK, backCb, this);
	evas_object_smart_callback_add(popup, "block,clicked", backCb, this);
	if (m_onAddProperties)
		m_onAddProperties(popup);
	evas_object_show(popup);
	return popup;
}

void WPopup::setPartText(Evas_Object* obj, const char* part, const std::string& text) const
{
	if (getTextDomain())
		elm_object_domain_translatable_part_text_set(obj, part, getTextDomain(), text.c_str());
	else
		elm_object_part_text_set(obj, part, text.c_str());
}

void WPopup::runClosingCallback(const ButtonCallback& callback)
{
	// Copies keep the callback's captures alive if it destroys this popup.
	ButtonCallback run = callback;
	std::weak_ptr<WControl> alive = getWeakPtr();
	bool destroyPopup = true;
	if (run)
		run(&destroyPopup);
	if (alive.expired())
		return;
	if (destroyPopup)
		destroy();
}

void WPopup::backCb(void* data, Evas_Object*, void*)
{
	WHIT();
	auto* self = static_cast<WPopup*>(data);
	self->runClosingCallback(self->m_onBack);
}

void WPopup::__addButtons(Evas_Object* popup)
{
	for (size_t i = 0; i < m_buttons.size(); ++i) {
		Button* button = m_buttons[i].get();
		Evas_Object* obj = elm_button_add(popup);
		elm_object_style_set(obj, "popup");
		setPartText(obj, nullptr, button->label);
		evas_object_smart_callback_add(obj, "clicked", __buttonClickedCb, button);
		elm_object_part_content_set(popup, kButtonParts[i], obj);
		if (button->onAddProperties)
			button->onAddProperties(obj);
	}
}

void WPopup::__buttonClickedCb(void* data, Evas_Object*, void*)
{
	WHIT();
	auto* button = static_cast<Button*>(data);
	if (button->owner->isDestroying())
		return;
	button->owner->runClosingCallback(button->onClick);
}

} // namespace app_assist
