#include "CtView.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "CtRegistryMgr.h"
#include "CtThemeMgr.h"

#include <vconf.h>

#include <algorithm>
#include <clocale>
#include <cstdlib>
#include <memory>
#include <vector>

namespace {

constexpr const char* kBaseEdj = "contacts/contacts.edj";

std::vector<CtView*>& openViews()
{
	static std::vector<CtView*> views;
	return views;
}

void applyLocale(const char* locale)
{
	setenv("LANGUAGE", locale, 1);
	if (!setlocale(LC_ALL, locale))
		setlocale(LC_MESSAGES, locale);
	elm_language_set(locale);
}

void notifyOpenViews()
{
	// A screen may close another one while it re-translates.
	std::vector<CtView*> snapshot = openViews();
	for (CtView* view : snapshot) {
		auto& live = openViews();
		if (std::find(live.begin(), live.end(), view) != live.end())
			view->onLanguageChanged();
	}
}

void onLanguageSettingChanged(keynode_t* node, void*)
{
	WHIT();
	const char* locale = vconf_keynode_get_str(node);
	if (locale && *locale) {
		applyLocale(locale);
		notifyOpenViews();
	}
}

} // namespace

CtView::CtView()
{
	ContactsCommon::bindTextDomain();
	if (openViews().empty())
		CtRegistryMgr::getInstance()->registerVconfChangedCb(VCONFKEY_LANGSET, onLanguageSettingChanged, nullptr);
	openViews().push_back(this);
}

CtView::~CtView()
{
	auto& views = openViews();
	views.erase(std::remove(views.begin(), views.end(), this), views.end());
	if (views.empty())
		CtRegistryMgr::getInstance()->unRegisterVconfChangedCb(VCONFKEY_LANGSET, onLanguageSettingChanged, nullptr);
}

Evas_Object* CtView::createBaseLayout(Evas_Object* parent, const char* edjName, const char* group)
{
	WPRET_VM(!parent, nullptr, "Invalid param : parent");
	std::string edjPath;
	if (!ContactsCommon::getAppEdjePath(edjName ? edjName : kBaseEdj, edjPath)) {
		WERROR("ctCommonCreateLayout() is fail");
		return nullptr;
	}
	Evas_Object* layout = elm_layout_add(parent);
	bool loaded;
	if (group) {
		loaded = elm_layout_file_set(layout, edjPath.c_str(), group);
	} else {
		CtThemeMgr::getInstance()->addExtensionTheme(edjPath.c_str());
		loaded = elm_layout_theme_set(layout, "layout", "application", "default");
	}
	if (!loaded) {
		WERROR("ctCommonCreateLayout() is fail");
		evas_object_del(layout);
		return nullptr;
	}
	evas_object_size_hint_weight_set(layout, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(layout, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_show(layout);
	return layout;
}

void CtView::changeLanguage(const char* locale)
{
	WPRET_M(!locale || !*locale, "Invalid param : locale");
	applyLocale(locale);
	notifyOpenViews();
}

int CtView::getOpenViewCount()
{
	return (int)openViews().size();
}
