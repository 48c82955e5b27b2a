// Stored fields no screen expects (invalid UTF-8, a megabyte of text, markup,
// control characters) shown on every screen: nothing crashes, the screen
// opens and closes, and what it shows is valid UTF-8. Also: every factory
// the library exports has its line in the screen table.
#include "../../data/myprofile/MyProfileTestStore.h"
#include "../SoakScreens.h"
#include "../WriterProcess.h"
#include "ScreenHarness.h"

#include <dlfcn.h>
#include <glib.h>
#include <vconf.h>

#include <algorithm>
#include <fstream>
#include <set>

namespace ct::test {
namespace {

// A megabyte in the long mode; the suite's run keeps to 64 kB, which already
// passes every fixed buffer a screen or the toolkit might have.
const std::string kHugeText(static_cast<size_t>(rounds(64, 1024)) * 1024, 'M');

struct HostileText {
	const char* what;
	std::string text;
};

const std::vector<HostileText>& hostileTexts()
{
	static const std::vector<HostileText> texts = {
		{ "invalid UTF-8", "Bad \xC0\xAF \xED\xA0\x80 \xFF\xFE end" },
		{ "a huge text", kHugeText },
		{ "markup", "<b>bold</b><br/><font_size=200>big</font_size>&amp;&lt;item absize=9999x9999 href=file:///etc/passwd></item>" },
		{ "control characters", std::string("tab\tnew\nline\rcr\x01\x02\x1b[31m\x7f", 22) + "end" },
	};
	return texts;
}

// A person whose every text field holds `text`.
int addHostilePerson(const std::string& text)
{
	contacts_record_h contact = newContact(0, text.c_str());
	contacts_record_h name = nullptr;
	contacts_record_get_child_record_at_p(contact, _contacts_contact.name, 0, &name);
	contacts_record_set_str(name, _contacts_name.last, text.c_str());
	addNumber(contact, text.c_str(), CONTACTS_NUMBER_TYPE_CUSTOM, text.c_str());
	addEmail(contact, text.c_str());
	addText(contact, _contacts_contact.address, _contacts_address._uri, _contacts_address.street, text.c_str());
	addText(contact, _contacts_contact.note, _contacts_note._uri, _contacts_note.note, text.c_str());
	addText(contact, _contacts_contact.url, _contacts_url._uri, _contacts_url.url, text.c_str());
	addText(contact, _contacts_contact.messenger, _contacts_messenger._uri, _contacts_messenger.im_id, text.c_str());
	addText(contact, _contacts_contact.nickname, _contacts_nickname._uri, _contacts_nickname.name, text.c_str());
	addText(contact, _contacts_contact.company, _contacts_company._uri, _contacts_company.name, text.c_str());
	addText(contact, _contacts_contact.relationship, _contacts_relationship._uri, _contacts_relationship.name,
		text.c_str());
	addImage(contact, text.c_str());
	return personOf(store(contact));
}

// The user's own profile, its every text field holding `text` (the one
// stored before is removed).
void storeHostileProfile(const std::string& text)
{
	contacts_list_h stored = nullptr;
	if (contacts_db_get_all_records(_contacts_my_profile._uri, 0, 0, &stored) == CONTACTS_ERROR_NONE) {
		contacts_record_h profile = nullptr;
		while (contacts_list_get_current_record_p(stored, &profile) == CONTACTS_ERROR_NONE && profile) {
			int id = 0;
			contacts_record_get_int(profile, _contacts_my_profile.id, &id);
			contacts_db_delete_record(_contacts_my_profile._uri, id);
			if (contacts_list_next(stored) != CONTACTS_ERROR_NONE)
				break;
		}
		contacts_list_destroy(stored, true);
	}
	contacts_record_h profile = newProfile(text.c_str());
	addProfileNumber(profile, text.c_str(), true, text.c_str());
	addText(profile, _contacts_my_profile.email, _contacts_email._uri, _contacts_email.email, text.c_str());
	addText(profile, _contacts_my_profile.note, _contacts_note._uri, _contacts_note.note, text.c_str());
	addText(profile, _contacts_my_profile.address, _contacts_address._uri, _contacts_address.street, text.c_str());
	storeProfile(profile);
}

// Every text part of every genlist row on the window, and every entry's text.
std::vector<std::string> shownTexts(const ScreenHarness& screen)
{
	static const char* const parts[] = { "elm.text", "elm.text.sub", "elm.text.main", "elm.text.multiline",
		"elm.text.main.left", "elm.text.sub.left", "elm.text.title" };
	std::vector<std::string> texts;
	for (Evas_Object* genlist : screen.findWidgets("Elm_Genlist"))
		for (Elm_Object_Item* item : ScreenHarness::genlistItems(genlist))
			for (const char* part : parts)
				texts.push_back(ScreenHarness::itemText(item, part));
	for (Evas_Object* entry : screen.findWidgets("Elm_Entry")) {
		const char* shown = elm_entry_entry_get(entry);
		texts.push_back(shown ? shown : "");
	}
	return texts;
}

class HostileFieldsTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
	}
	void TearDown() override { contacts_disconnect(); }
};

TEST_F(HostileFieldsTest, EveryScreenShowsHostileStoredTextsAsValidTextWithoutCrashing)
{
	for (const HostileText& hostile : hostileTexts()) {
		const char* text = hostile.text.c_str();
		CtGalSearchData gal = { nullptr, text, text, text, text, text, text, text };
		ScreenInputs inputs;
		inputs.personId = addHostilePerson(hostile.text);
		inputs.galData = &gal;
		storeHostileProfile(hostile.text);
		for (const OpenableScreen& shown : openableScreens(inputs)) {
			SCOPED_TRACE(shown.name + " with " + hostile.what);
			ScreenHarness screen(360, 640);
			ASSERT_TRUE(screen.push(shown.make()));
			EXPECT_EQ(1, screen.viewCount());
			for (const std::string& t : shownTexts(screen))
				EXPECT_TRUE(g_utf8_validate(t.c_str(), -1, nullptr)) << t.substr(0, 80);
			if (const char* dir = getenv("CONTACTS_TEST_SHOTS"))
				screen.savePng(std::string(dir) + "/" + shown.name + "-" + hostile.what + ".png");
		}
	}
}

// The toolkit's one-line ellipsis corrupted the heap on a line break (seen
// in the normal build through glibc's malloc checks, not under the sanitizer).
TEST_F(HostileFieldsTest, CustomNumberLabelWithALineBreakIsShownWithoutCrashing)
{
	contacts_record_h contact = newContact(0, "Label");
	addNumber(contact, "+15550100", CONTACTS_NUMBER_TYPE_CUSTOM, "two\nlines");
	int personId = personOf(store(contact));
	ScreenHarness screen(360, 640);
	ASSERT_TRUE(screen.push(createCtDetailView(personId, nullptr)));
	screen.pumpFor(0.5);
}

// Names declared in the public header that the built library exports.
std::vector<std::string> exportedFactories()
{
	std::ifstream header(std::string(CT_SOURCE_DIR) + "/inc/ContactsDetails.h");
	std::string source((std::istreambuf_iterator<char>(header)), std::istreambuf_iterator<char>());
	const char* dir = getenv("CONTACTS_TEST_BIN_DIR");
	void* library = dlopen((std::string(dir ? dir : ".") + "/src/libcontacts-details.so").c_str(), RTLD_LAZY | RTLD_LOCAL);
	std::vector<std::string> names;
	for (size_t at = source.find("* create"); at != std::string::npos; at = source.find("* create", at + 1)) {
		size_t begin = at + 2;
		std::string name = source.substr(begin, source.find('(', begin) - begin);
		if (library && dlsym(library, name.c_str()))
			names.push_back(name);
	}
	if (library)
		dlclose(library);
	return names;
}

TEST(LibraryScreensTest, EveryExportedFactoryHasItsLineInTheScreenTable)
{
	std::vector<std::string> exported = exportedFactories();
	ASSERT_FALSE(exported.empty()) << "the built library was not found";
	std::set<std::string> listed;
	for (const LibraryScreen& screen : libraryScreens())
		listed.insert(screen.factory);
	for (const std::string& name : exported)
		EXPECT_TRUE(listed.count(name)) << name << " is exported but not in tests/reliability/LibraryScreens.h";
}

} // namespace
} // namespace ct::test
