#include "DemoProcess.h"
#include "TempDataDir.h"

#include <contacts.h>
#include <gtest/gtest.h>
#include <phone_misc.h>

#include <filesystem>
#include <functional>
#include <set>
#include <sstream>
#include <vector>

namespace ct::test {
namespace {

// How many stored records of `uri` satisfy `pred` (-1 when they cannot be read).
int countWhere(const char* uri, const std::function<bool(contacts_record_h)>& pred)
{
	contacts_list_h list = nullptr;
	if (contacts_db_get_all_records(uri, 0, 0, &list) != CONTACTS_ERROR_NONE)
		return -1;
	int count = 0, size = 0;
	contacts_list_get_count(list, &size);
	contacts_list_first(list);
	for (int i = 0; i < size; ++i, contacts_list_next(list)) {
		contacts_record_h record = nullptr;
		contacts_list_get_current_record_p(list, &record);
		count += record && pred(record) ? 1 : 0;
	}
	contacts_list_destroy(list, true);
	return count;
}

int intOf(contacts_record_h record, unsigned int property)
{
	int value = 0;
	contacts_record_get_int(record, property, &value);
	return value;
}

bool boolOf(contacts_record_h record, unsigned int property)
{
	bool value = false;
	contacts_record_get_bool(record, property, &value);
	return value;
}

std::string textOf(contacts_record_h record, unsigned int property)
{
	char* text = nullptr;
	contacts_record_get_str_p(record, property, &text);
	return text ? text : "";
}

int simBookId()
{
	int id = -1;
	countWhere(_contacts_address_book._uri, [&id](contacts_record_h book) {
		if (textOf(book, _contacts_address_book.name) == CONTACTS_SIM1_ADDRESS_BOOK_NAME)
			id = intOf(book, _contacts_address_book.id);
		return true;
	});
	return id;
}

// YYYYMMDD, the year 0 when none is stored.
bool isCalendarDate(int date)
{
	int year = date / 10000, month = date / 100 % 100, day = date % 100;
	if (date <= 0 || month < 1 || month > 12 || day < 1)
		return false;
	const int days[] = {31, 29, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
	bool leap = year == 0 || (year % 4 == 0 && year % 100 != 0) || year % 400 == 0;
	return day <= (month == 2 && !leap ? 28 : days[month - 1]);
}

// The "id<TAB>name" lines of the person list the demo prints.
std::vector<std::string> personLines(const std::string& output)
{
	std::vector<std::string> lines;
	std::istringstream in(output);
	std::string line;
	while (std::getline(in, line)) {
		size_t tab = line.find('\t');
		if (tab != std::string::npos && tab > 0 && line.find_first_not_of("0123456789") == tab)
			lines.push_back(line);
	}
	return lines;
}

TEST(DemoStoreTest, HeadlessStartListsTheVariedDemoStoreCreatedOnceAndReopenedWithoutDuplicates)
{
	TempDataDir data;
	DemoRun first = runDemo(data.path(), "");
	ASSERT_EQ(0, first.exitCode) << first.output;
	for (const char* expected : {"(demo store created)", "Anna Müller", "Taxi"})
		EXPECT_NE(std::string::npos, first.output.find(expected)) << expected << "\n" << first.output;
	DemoRun second = runDemo(data.path(), "");
	ASSERT_EQ(0, second.exitCode) << second.output;
	EXPECT_EQ(std::string::npos, second.output.find("(demo store created)"));

	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	int persons = 0;
	contacts_db_get_count(_contacts_person._uri, &persons);
	EXPECT_GE(persons, 25);
	EXPECT_LE(persons, 35);
	EXPECT_NE(std::string::npos, second.output.find(std::to_string(persons) + " persons"));
	// Same persons, same order: the list of the first run is the list of the second.
	EXPECT_EQ(personLines(first.output), personLines(second.output));
	EXPECT_EQ(persons, (int)personLines(second.output).size());

	// The promised variety.
	int sim = simBookId();
	ASSERT_GT(sim, 0);
	using R = contacts_record_h;
	const char* person = _contacts_person._uri;
	const char* event = _contacts_event._uri;
	EXPECT_GE(countWhere(person, [](R p) { return boolOf(p, _contacts_person.is_favorite); }), 3);
	EXPECT_GE(countWhere(person, [](R p) { return intOf(p, _contacts_person.link_count) >= 2; }), 2);
	EXPECT_EQ(1, countWhere(person, [](R p) { return intOf(p, _contacts_person.link_count) >= 3; }));
	EXPECT_GE(countWhere(_contacts_contact._uri, [sim](R c) {
		return intOf(c, _contacts_contact.address_book_id) == sim;
	}), 3);
	EXPECT_GE(countWhere(person, [](R p) { // pictures point at files that exist
		std::string path = textOf(p, _contacts_person.image_thumbnail_path);
		std::error_code ec;
		return !path.empty() && std::filesystem::is_regular_file(path, ec) && std::filesystem::file_size(path, ec) > 0;
	}), 6);
	EXPECT_GE(countWhere(event, [](R e) { return intOf(e, _contacts_event.date) / 10000 == 0; }), 2);
	EXPECT_GE(countWhere(event, [](R e) { return intOf(e, _contacts_event.date) / 10000 > 1900; }), 5);
	EXPECT_GE(countWhere(event, [](R e) {
		return intOf(e, _contacts_event.calendar_type) == CONTACTS_EVENT_CALENDAR_TYPE_LUNAR;
	}), 2);
	EXPECT_EQ(1, countWhere(event, [](R e) { return boolOf(e, _contacts_event.is_leap_month); }));
	// Every stored date is a day of the calendar (year 0: a day of some year).
	EXPECT_EQ(0, countWhere(event, [](R e) { return !isCalendarDate(intOf(e, _contacts_event.date)); }));
	EXPECT_GE(countWhere(_contacts_note._uri, [](R n) { return textOf(n, _contacts_note.note).size() > 300; }), 1);

	// Several scripts: names with letters beyond Latin-1 (multi-byte first bytes above 0xC3).
	std::set<unsigned char> leads;
	countWhere(_contacts_person._uri, [&](contacts_record_h p) {
		for (unsigned char c : textOf(p, _contacts_person.display_name))
			if (c >= 0xC4 && c < 0xF8)
				leads.insert(c);
		return true;
	});
	EXPECT_GE(leads.size(), 5u);
	contacts_disconnect();

	phone_misc_h block = nullptr;
	ASSERT_EQ(PHONE_MISC_ERROR_NONE, phone_misc_connect(&block));
	int blocked = 0;
	phone_misc_block_foreach(block, PHONE_MISC_BLOCK_TYPE_CALL, [](const char*, void* d) { ++*static_cast<int*>(d); },
			&blocked);
	phone_misc_disconnect(block);
	EXPECT_GE(blocked, 2);
}

} // namespace
} // namespace ct::test
