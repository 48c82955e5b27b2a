// The SIM contact's rows: a text is taken exactly when the card can store it,
// and the room shown under the field agrees with that at the boundary.
#include "InputRowTestSupport.h"

#include "CtCommonAddressbookUtil.h"
#include "CtInputViewSimEmailItem.h"
#include "CtInputViewSimNameItem.h"
#include "CtInputViewSimNumberItem.h"
#include "CtInputViewSimTextSize.h"

#include <glib.h>

#include <fstream>

using namespace ct::test;

namespace {

class SimFieldRowTest : public InputRowTest {
protected:
	void SetUp() override
	{
		InputRowTest::SetUp();
		std::ofstream(m_dir.file("sim.conf")) << "[SIM1]\nname_max=14\nnumber_max=4\nemail_max=14\n";
	}
	std::shared_ptr<CtInputData> newSimContact()
	{
		auto data = editNew();
		data->setAddressbookInfo(ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME));
		return data;
	}
	std::string counter(CtInputViewSimFieldItem* row)
	{
		return ScreenHarness::itemText(row->getElmObjectItem(), "elm.text.sub");
	}
	static std::string left(int left, int max)
	{
		return std::to_string(left) + " of " + std::to_string(max) + " left";
	}
	static std::string text(Evas_Object* entry) { return CtInputViewGenlistItem::getEntryUtf8(entry); }
};

} // namespace

TEST_F(SimFieldRowTest, NameAndEmailAreTakenExactlyWhenTheirSizeFitsAndTheCounterSaysWhatIsLeft)
{
	auto data = newSimContact();
	auto* name = new CtInputViewSimNameItem(data, m_calls.callbacks().changed, nullptr);
	auto* email = new CtInputViewSimEmailItem(data, data->addEmail(""), m_calls.callbacks().changed, nullptr);
	Evas_Object* nameEntry = entryOf(show(name));
	Evas_Object* emailEntry = entryOf(show(email));
	ASSERT_TRUE(nameEntry && emailEntry);
	EXPECT_EQ(left(14, 14), counter(name));

	// {text, its size on the card (-1: cannot be stored)}; the card takes 14.
	struct Case {
		const char* text;
		int size;
	} cases[] = {
		{"Abcdefghijklmn", 14},
		{"Abcdefghijklmno", 15},
		{"Abcdefghijkl\xe2\x82\xac", 14},       // euro from the extension table counts 2
		{"Abcdefghijklm\xe2\x82\xac", 15},
		{"[]{}^~\\", 14},
		{"[]{}^~\\|", 16},
		{"Ærøskøbing@£$", 13},                   // default-alphabet letters count 1
		{"Вера Зубрев", 14},                     // Cyrillic of one class: 11 + 3
		{"Вера Зубрева", 15},
		{"Дмитри", 13},                          // two classes: 2 * 6 + 1
		{"Дмитрий", 15},
		{"中文中文中文", 13},
		{"中文中文中文中", 15},
		{"Ann\xf0\x9f\x98\x80", -1},             // emoji
	};
	for (Evas_Object* entry : {nameEntry, emailEntry}) {
		CtInputViewSimFieldItem* row = entry == nameEntry ? static_cast<CtInputViewSimFieldItem*>(name) : email;
		for (const Case& c : cases) {
			replaceText(entry, "Ab");
			ScreenHarness::clearNotices();
			replaceText(entry, c.text);
			bool fits = c.size >= 0 && c.size <= 14;
			std::string stored = row == name ? data->getFullName() : data->getEmailEmail(email->getRecord());
			EXPECT_EQ(fits ? std::string(c.text) : "Ab", text(entry)) << c.text;
			EXPECT_EQ(fits ? std::string(c.text) : "Ab", stored) << c.text;
			EXPECT_EQ(fits ? left(14 - c.size, 14) : left(12, 14), counter(row)) << c.text;
			const char* notice = c.size < 0 ? "IDS_MUSIC_POP_INVALID_CHARACTER" : "IDS_PB_POP_MAXIMUM_NUMBER_OF_CHARACTERS_REACHED";
			EXPECT_EQ(fits ? std::vector<std::string>{} : std::vector<std::string>{tr(notice)}, ScreenHarness::notices())
				<< c.text;
		}
	}
	// One more character typed at the boundary is refused; the counter stays at 0.
	replaceText(nameEntry, "Abcdefghijkl\xe2\x82\xac");
	type(nameEntry, "x");
	EXPECT_EQ("Abcdefghijkl\xe2\x82\xac", text(nameEntry));
	EXPECT_EQ(left(0, 14), counter(name));
}

TEST_F(SimFieldRowTest, NumberIsCleanedAndALeadingPlusTakesNoRoom)
{
	auto data = newSimContact();
	contacts_record_h record = data->addNumber("");
	std::vector<bool> emptied;
	auto* row = new CtInputViewSimNumberItem(data, record, m_calls.callbacks().changed,
			[&emptied](bool empty) { emptied.push_back(empty); }, nullptr);
	Evas_Object* entry = entryOf(show(row));
	ASSERT_NE(nullptr, entry);

	// {typed, shown and stored afterwards, counter} on a card of 4 digits.
	struct Case {
		const char* typed;
		const char* stored;
		int left;
	} cases[] = {
		{"+1234", "+1234", 0}, {"1234", "1234", 0}, {"12345", "1234", 0}, {"+12345", "1234", 0},
		{"12-3", "123", 1},    {"(1) 2", "12", 2},  {"+", "+", 4},         {"", "", 4},
	};
	for (const Case& c : cases) {
		replaceText(entry, c.typed);
		EXPECT_EQ(c.stored, text(entry)) << c.typed;
		EXPECT_EQ(c.stored, std::string(data->getNumberNumber(record))) << c.typed;
		EXPECT_EQ(left(c.left, 4), counter(row)) << c.typed;
	}
	EXPECT_TRUE(emptied.back());
	EXPECT_TRUE(row->getIsEmpty());
	EXPECT_FALSE(row->getIsChanged());
}

TEST_F(SimFieldRowTest, PastedMegabyteAndBrokenUtf8NeverCrashAndNeverStoreWhatDoesNotFit)
{
	auto data = newSimContact();
	auto* name = new CtInputViewSimNameItem(data, m_calls.callbacks().changed, nullptr);
	Evas_Object* entry = entryOf(show(name));
	ASSERT_NE(nullptr, entry);
	replaceText(entry, "Ann");

	for (const std::string& paste : {std::string(1 << 20, 'a'), std::string("\xc3\x28\xff\xfe"),
			std::string("\xe2\x82"), std::string(1 << 19, '\x80')}) {
		replaceText(entry, paste.c_str());
		std::string shown = text(entry);
		EXPECT_TRUE(g_utf8_validate(shown.c_str(), -1, nullptr));
		int size = CtInputViewSimTextSize::getUcs2CodeSize(shown.c_str());
		EXPECT_TRUE(size >= 0 && size <= 14) << size;
		int stored = CtInputViewSimTextSize::getUcs2CodeSize(data->getFullName().c_str());
		EXPECT_TRUE(stored >= 0 && stored <= 14) << stored;
		replaceText(entry, "Ann");
	}
}
