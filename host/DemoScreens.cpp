#include "DemoScreens.h"

#include "ContactsCommon.h"
#include "ContactsDebug.h"
#include "ShareFieldsRequest.h"

#include <Ecore.h>
#include <Elementary.h>
#include <contacts.h>

#include <cstring>

namespace ct::demo {

namespace {

// A copy of a person's first contact, for the edit form (which takes it over).
contacts_record_h firstContactOf(int personId)
{
	contacts_query_h query = nullptr;
	contacts_filter_h filter = nullptr;
	contacts_list_h list = nullptr;
	contacts_record_h contact = nullptr;
	contacts_query_create(_contacts_contact._uri, &query);
	contacts_filter_create(_contacts_contact._uri, &filter);
	contacts_filter_add_int(filter, _contacts_contact.person_id, CONTACTS_MATCH_EQUAL, personId);
	contacts_query_set_filter(query, filter);
	if (contacts_db_get_records_with_query(query, 0, 1, &list) == CONTACTS_ERROR_NONE) {
		// A listed record holds no child records: the contact is read whole.
		contacts_record_h first = nullptr;
		int contactId = 0;
		if (contacts_list_get_current_record_p(list, &first) == CONTACTS_ERROR_NONE && first)
			contacts_record_get_int(first, _contacts_contact.id, &contactId);
		contacts_list_destroy(list, true);
		if (contactId > 0 && contacts_db_get_record(_contacts_contact._uri, contactId, &contact) != CONTACTS_ERROR_NONE)
			contact = nullptr;
	}
	contacts_filter_destroy(filter);
	contacts_query_destroy(query);
	return contact;
}

// A finger tap at (x, y) of the window, as the device would feed it.
void tapAt(Evas_Object* win, int x, int y)
{
	Evas* canvas = evas_object_evas_get(win);
	unsigned int stamp = static_cast<unsigned int>(ecore_time_get() * 1000);
	evas_event_feed_mouse_move(canvas, x, y, stamp, nullptr);
	evas_event_feed_mouse_down(canvas, 1, EVAS_BUTTON_NONE, stamp + 1, nullptr);
	evas_event_feed_mouse_up(canvas, 1, EVAS_BUTTON_NONE, stamp + 2, nullptr);
}

void pressKey(Evas_Object* win, const char* key)
{
	Evas* canvas = evas_object_evas_get(win);
	unsigned int stamp = static_cast<unsigned int>(ecore_time_get() * 1000);
	evas_event_feed_key_down(canvas, key, key, nullptr, nullptr, stamp, nullptr);
	evas_event_feed_key_up(canvas, key, key, nullptr, nullptr, stamp + 1, nullptr);
}

Evas_Object* findCtxpopup(Evas_Object* obj)
{
	if (!strcmp(evas_object_type_get(obj), "elm_ctxpopup") && evas_object_visible_get(obj))
		return obj;
	Eina_List* members = evas_object_smart_members_get(obj);
	Evas_Object* found = nullptr;
	void* member = nullptr;
	EINA_LIST_FREE(members, member) {
		if (!found)
			found = findCtxpopup(static_cast<Evas_Object*>(member));
	}
	return found;
}

// Opens the more menu with the more key and chooses the entry `textId`.
void chooseMenuEntry(Evas_Object* win, const char* textId)
{
	pressKey(win, "Menu");
	for (int i = 0; i < 10; ++i)
		ecore_main_loop_iterate();
	Evas_Object* menu = nullptr;
	Evas* canvas = evas_object_evas_get(win);
	for (Evas_Object* obj = evas_object_top_get(canvas); obj && !menu; obj = evas_object_below_get(obj))
		menu = findCtxpopup(obj);
	const char* wanted = ContactsCommon::translate(textId);
	for (Elm_Object_Item* it = menu ? elm_ctxpopup_first_item_get(menu) : nullptr; it; it = elm_ctxpopup_item_next_get(it)) {
		const char* label = elm_object_item_text_get(it);
		if (label && !strcmp(label, wanted)) {
			elm_ctxpopup_item_selected_set(it, EINA_TRUE);
			return;
		}
	}
	WERROR("no menu entry %s", textId);
}

template <typename Fn, typename... Args>
app_assist::WView* make(const DetailsLibrary& library, const char* exportName, Args... args)
{
	Fn factory = library.factory<Fn>(exportName);
	return factory ? factory(args...) : nullptr;
}

} // namespace

const std::vector<DemoScreen>& demoScreens()
{
	static const std::vector<DemoScreen> screens = {
		{"detail", true, "a person's detail screen",
			[](DemoScreenContext& c) { return make<CreateDetailViewFn>(c.library, "createCtDetailView", c.personId, nullptr); }},
		{"create", false, "the form of a new contact",
			[](DemoScreenContext& c) {
				return make<CreateInputViewFn>(c.library, "createCtInputView", contacts_record_h(nullptr), nullptr);
			}},
		{"edit", true, "the edit form of a person's first contact",
			[](DemoScreenContext& c) -> app_assist::WView* {
				auto factory = c.library.factory<CreateInputViewFn>("createCtInputView");
				contacts_record_h contact = factory ? firstContactOf(c.personId) : nullptr;
				return contact ? factory(contact, nullptr) : nullptr;
			}},
		{"my-profile", false, "the user's own profile",
			[](DemoScreenContext& c) { return make<CreateMyProfileDetailViewFn>(c.library, "createCtMyProfileDetailView"); }},
		{"profile-sharing", false, "the profile sharing settings (the profile screen's more menu)",
			[](DemoScreenContext& c) { return make<CreateMyProfileDetailViewFn>(c.library, "createCtMyProfileDetailView"); },
			[](Evas_Object* win) {
				chooseMenuEntry(win, "IDS_PB_OPT_PROFILE_SHARING_ABB");
				// The first time, the sign-up step answers on the main loop before the screen comes.
				for (int i = 0; i < 10; ++i)
					ecore_main_loop_iterate();
			}},
		{"my-profile-edit", false, "the edit form of the user's own profile",
			[](DemoScreenContext& c) {
				return make<CreateMyProfileInputViewFn>(c.library, "createCtMyProfileInputView", contacts_record_h(nullptr), nullptr);
			}},
		{"pictures", true, "a person's pictures full screen (the detail screen's picture tapped)",
			[](DemoScreenContext& c) { return make<CreateDetailViewFn>(c.library, "createCtDetailView", c.personId, nullptr); },
			[](Evas_Object* win) {
				Evas_Coord w = 0;
				evas_object_geometry_get(win, nullptr, nullptr, &w, nullptr);
				tapAt(win, w / 2, 160);
			}},
		{"mark-as-default", true, "the choice of a linked person's name and picture (the detail screen's more menu)",
			[](DemoScreenContext& c) { return make<CreateDetailViewFn>(c.library, "createCtDetailView", c.personId, nullptr); },
			[](Evas_Object* win) { chooseMenuEntry(win, "IDS_PB_OPT_SET_DEFAULT_CONTACT_INFO_ABB"); }},
		{"more-menu", true, "the detail screen's more menu",
			[](DemoScreenContext& c) { return make<CreateDetailViewFn>(c.library, "createCtDetailView", c.personId, nullptr); },
			[](Evas_Object* win) { pressKey(win, "Menu"); }},
		{"wizard", false, "the profile set-up wizard",
			[](DemoScreenContext& c) { return make<CreateProfileWizardViewFn>(c.library, "createCtProfileWizardView"); }},
		{"share-fields", true, "chosen fields of a person, returned as text the host prints",
			[](DemoScreenContext& c) {
				auto request = std::make_shared<ShareFieldsRequest>();
				c.keepAlive.push_back(request);
				return make<CreateShareContactViewFn>(c.library, "createCtShareContactView", c.personId, request->get());
			}},
	};
	return screens;
}

const DemoScreen* findDemoScreen(const std::string& name)
{
	for (const DemoScreen& screen : demoScreens()) {
		if (name == screen.name)
			return &screen;
	}
	return nullptr;
}

} // namespace ct::demo
