// Fuzz target for the library's factories: every exported screen is made from
// a launch request built from the input (operation, extras, ids, texts,
// caller) and pushed headless, drawn for a few frames and closed. Nothing may
// crash, and every factory must return a view.
#include "../tests/reliability/LibraryScreens.h"

#include "EflEnvironment.h"
#include "ScreenHarness.h"

#include <Ecore.h>
#include <app_control.h>
#include <contacts.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

namespace {

const char* const kOperations[] = { APP_CONTROL_OPERATION_DEFAULT, APP_CONTROL_OPERATION_VIEW,
	APP_CONTROL_OPERATION_PICK, APP_CONTROL_OPERATION_ADD, APP_CONTROL_OPERATION_EDIT, APP_CONTROL_OPERATION_CALL,
	APP_CONTROL_OPERATION_SHARE, APP_CONTROL_OPERATION_SOCIAL_ADD, APP_CONTROL_OPERATION_SOCIAL_EDIT,
	APP_CONTROL_OPERATION_SOCIAL_CHOOSE, "", nullptr };
const char* const kKeys[] = { "person_id", "ct_person_id", "type", "contact_id", "my_profile", APP_CONTROL_DATA_ID,
	APP_CONTROL_DATA_TYPE, APP_CONTROL_DATA_NAME, APP_CONTROL_DATA_PHONE, APP_CONTROL_DATA_EMAIL, APP_CONTROL_DATA_URL,
	APP_CONTROL_DATA_TEXT, APP_CONTROL_DATA_SELECTED, APP_CONTROL_DATA_SOCIAL_ITEM_ID, APP_CONTROL_DATA_SOCIAL_PHONE,
	APP_CONTROL_DATA_SOCIAL_EMAIL, APP_CONTROL_DATA_SOCIAL_URL, "number_changing_alert", "name", "previous_number",
	"new_number", "show_detail", "ct_path" };
const char* const kValues[] = { "1", "2", "0", "-1", "112", "126", "41", "21", "123", "2147483647",
	"99999999999999999999", "1e3", " 1", "0x10", "<b>1</b>", "\xC0\xFF", "+1 555 0100", "a@b.c", "true", "22",
	"\xE2\x82", "\xED\xA0\x80" };

void checkAt(bool ok, int line)
{
	if (!ok) {
		fprintf(stderr, "check failed at line %d\n", line);
		abort();
	}
}
#define check(ok) checkAt((ok), __LINE__)

// Takes values off the front of the input; empty input gives zeros.
class Input {
public:
	Input(const uint8_t* data, size_t size) : m_data(data), m_size(size) {}
	bool empty() const { return m_pos >= m_size; }
	unsigned byte() { return empty() ? 0 : m_data[m_pos++]; }
	template <size_t N>
	const char* oneOf(const char* const (&list)[N])
	{
		return list[byte() % N];
	}
	// A text of the input, now and then grown to a long one.
	std::string text()
	{
		size_t length = byte();
		std::string out;
		while (out.size() < length && !empty())
			out += static_cast<char>(byte());
		unsigned grow = byte();
		if (grow % 16 == 0)
			out = std::string(grow % 64 == 0 ? 1024 * 1024 : 64 * 1024, out.empty() ? 'x' : out[0]) + out;
		return out;
	}
	// A known value or a text of the input.
	std::string value() { return byte() % 2 ? oneOf(kValues) : text(); }

private:
	const uint8_t* m_data;
	size_t m_size;
	size_t m_pos = 0;
};

struct World {
	int personId = 0;
	int contactId = 0;
	ct::test::ScreenHarness* screen = nullptr;
};

World& world()
{
	static World w = [] {
		World made;
		static char dir[] = "/tmp/contacts-fuzz-XXXXXX";
		check(mkdtemp(dir) != nullptr);
		setenv("CONTACTS_DATA_DIR", dir, 1);
		setenv("CONTACTS_LOG_LEVEL", "silent", 0);
		ct::test::EflEnvironment().SetUp();
		// Frames drawn quickly: the cases are about input, not animation.
		ecore_animator_frametime_set(1.0 / 240.0);
		check(contacts_connect() == CONTACTS_ERROR_NONE);
		contacts_record_h contact = nullptr, name = nullptr, number = nullptr;
		contacts_record_create(_contacts_contact._uri, &contact);
		contacts_record_create(_contacts_name._uri, &name);
		contacts_record_set_str(name, _contacts_name.first, "Fuzz");
		contacts_record_add_child_record(contact, _contacts_contact.name, name);
		contacts_record_create(_contacts_number._uri, &number);
		contacts_record_set_str(number, _contacts_number.number, "+15550100");
		contacts_record_add_child_record(contact, _contacts_contact.number, number);
		check(contacts_db_insert_record(contact, &made.contactId) == CONTACTS_ERROR_NONE);
		contacts_record_get_int(contact, _contacts_contact.person_id, &made.personId);
		contacts_record_destroy(contact, true);
		made.screen = new ct::test::ScreenHarness();
		return made;
	}();
	return w;
}

int personIdFrom(Input& in, int stored)
{
	switch (in.byte() % 5) {
	case 0: return stored;
	case 1: return 0;
	case 2: return -1 - static_cast<int>(in.byte());
	case 3: return stored + 1 + static_cast<int>(in.byte());
	default: return static_cast<int>(in.byte() << 24 | in.byte() << 16 | in.byte() << 8 | in.byte());
	}
}

// A contact record for the forms: none, the stored one, a new one with
// texts of the input, or one that names a storage or contact that is not there.
contacts_record_h recordFrom(Input& in, int storedContactId)
{
	contacts_record_h record = nullptr;
	switch (in.byte() % 4) {
	case 0:
		return nullptr;
	case 1:
		contacts_db_get_record(_contacts_contact._uri, storedContactId, &record);
		return record;
	case 2: {
		contacts_record_create(_contacts_contact._uri, &record);
		contacts_record_h name = nullptr;
		contacts_record_create(_contacts_name._uri, &name);
		contacts_record_set_str(name, _contacts_name.first, in.text().c_str());
		contacts_record_add_child_record(record, _contacts_contact.name, name);
		contacts_record_h number = nullptr;
		contacts_record_create(_contacts_number._uri, &number);
		contacts_record_set_str(number, _contacts_number.number, in.text().c_str());
		contacts_record_add_child_record(record, _contacts_contact.number, number);
		return record;
	}
	default:
		contacts_record_create(_contacts_contact._uri, &record);
		contacts_record_set_int(record, _contacts_contact.address_book_id, static_cast<int>(in.byte()) - 128);
		return record;
	}
}

// What a person does next: nothing, the back key, or a title button.
void pressTitleButtonOrBack(Input& in, ct::test::ScreenHarness& screen)
{
	switch (in.byte() % 4) {
	case 1:
		screen.sendBackKey();
		break;
	case 2:
		if (Evas_Object* done = screen.findButton("Done"))
			ct::test::ScreenHarness::click(done);
		break;
	case 3:
		if (Evas_Object* cancel = screen.findButton("Cancel"))
			ct::test::ScreenHarness::click(cancel);
		break;
	default:
		return;
	}
	screen.pumpFrames(2);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
	World& w = world();
	Input in(data, size);
	const auto& screens = ct::test::libraryScreens();
	const ct::test::LibraryScreen& made = screens[in.byte() % screens.size()];

	app_control_h request = nullptr;
	app_control_create(&request);
	if (const char* operation = in.oneOf(kOperations))
		app_control_set_operation(request, operation);
	for (unsigned extras = in.byte() % 6; extras > 0; --extras) {
		std::string key = in.byte() % 4 ? in.oneOf(kKeys) : in.text();
		app_control_add_extra_data(request, key.c_str(), in.value().c_str());
	}
	std::string caller = in.text();
	CtLaunchRequest launch;
	launch.appControl = in.byte() % 8 ? request : nullptr;
	launch.callerAppId = in.byte() % 2 ? caller.c_str() : nullptr;

	std::vector<std::string> texts(7);
	for (std::string& t : texts)
		t = in.text();
	auto textOrNull = [&in](const std::string& t) { return in.byte() % 4 ? t.c_str() : nullptr; };
	CtGalSearchData gal = { nullptr, textOrNull(texts[0]), textOrNull(texts[1]), textOrNull(texts[2]),
		textOrNull(texts[3]), textOrNull(texts[4]), textOrNull(texts[5]), textOrNull(texts[6]) };

	ct::test::ScreenInputs inputs;
	inputs.personId = personIdFrom(in, w.personId);
	inputs.record = recordFrom(in, w.contactId);
	inputs.request = in.byte() % 8 ? &launch : nullptr;
	inputs.galData = in.byte() % 8 ? &gal : nullptr;

	app_assist::WView* view = made.make(inputs);
	check(view != nullptr);
	if (inputs.record && !made.takesRecord)
		contacts_record_destroy(inputs.record, true);
	std::weak_ptr<app_assist::WControl> alive;
	if (w.screen->naviframe()->push(view)) {
		alive = view->getWeakPtr();
		w.screen->pumpFrames(3);
		pressTitleButtonOrBack(in, *w.screen);
	}
	if (auto shown = alive.lock()) {
		shown.reset();
		view->destroy();
	}
	// A save may have opened the saved person's screen.
	for (int left = 4; left > 0 && w.screen->topView(); --left) {
		w.screen->topView()->destroy();
		w.screen->pumpFrames(1);
	}
	w.screen->pumpFrames(1);
	app_control_destroy(request);
	return 0;
}
