// A modal popup: title, text or built content, up to three buttons in call
// order. A button closes the popup after its onClick unless the callback
// clears *destroyPopup; the back key and a tap outside run the back handler
// (default: close). Callbacks may destroy the popup or its owner view.
#pragma once

#include "WControl.h"

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace app_assist {

class WPopup : public WControl {
public:
	using ButtonCallback = std::function<void(bool* destroyPopup)>;
	using PropertiesCallback = std::function<void(Evas_Object* obj)>;
	using ContentBuilder = std::function<Evas_Object*(Evas_Object* parent)>;

	WPopup();
	WPopup(const char* title, const char* text);

	const char* getClassName() override;

	void setTitle(const char* title);
	// Title, text and button labels are translation ids of `domain`.
	void setTextTranslatable(const char* domain);
	void setContent(const char* text);
	void setContent(ContentBuilder builder);
	void addButton(const char* label, ButtonCallback onClick, PropertiesCallback onAddProperties = nullptr);
	// Runs on the popup object right before it is shown.
	void setOnAddProperties(PropertiesCallback onAddProperties);
	void setOnBack(ButtonCallback onBack);
	// Attaches this popup to `owner` (created there when needed).
	void attachToView(WControl* owner);

	static constexpr int kMaxButtons = 3;

protected:
	~WPopup() override;
	Evas_Object* onCreate(Evas_Object* parent, void* param) override;

	const char* getTextDomain() const { return m_domain.empty() ? nullptr : m_domain.c_str(); }
	// Sets `part` of `obj` (null: the main text) from a text or translation id.
	void setPartText(Evas_Object* obj, const char* part, const std::string& text) const;
	// Runs `callback` the way buttons do: closes unless told not to.
	void runClosingCallback(const ButtonCallback& callback);
	static void backCb(void* data, Evas_Object* obj, void* eventInfo);

private:
	struct Button {
		WPopup* owner;
		std::string label;
		ButtonCallback onClick;
		PropertiesCallback onAddProperties;
	};
	static void __buttonClickedCb(void* data, Evas_Object* obj, void* eventInfo);
	void __addButtons(Evas_Object* popup);

	std::string m_title;
	std::string m_text;
	std::string m_domain;
	ContentBuilder m_contentBuilder;
	std::vector<std::unique_ptr<Button>> m_buttons;
	PropertiesCallback m_onAddProperties;
	ButtonCallback m_onBack;
};

} // namespace app_assist
