// The shared text: which lines a name and fields give, and where a text
// longer than the limit is cut.
#include "CtShareContactText.h"

#include <glib.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace {

using Field = std::pair<std::string, std::string>;

std::string compose(const char* name, const std::vector<Field>& fields)
{
	CtShareContactText text(name);
	for (const Field& field : fields)
		text.appendField(field.first, field.second);
	return text.getText();
}

std::string repeat(const std::string& piece, size_t times)
{
	std::string out;
	for (size_t i = 0; i < times; ++i)
		out += piece;
	return out;
}

bool isValidUtf8(const std::string& text)
{
	return g_utf8_validate(text.data(), static_cast<gssize>(text.size()), nullptr);
}

TEST(CtShareContactTextTest, NameAndFieldsGiveOneLineEachLabelsOnlyWhereGiven)
{
	struct Case {
		const char* name;
		std::vector<Field> fields;
		std::string expected;
	};
	const Case cases[] = {
		{"Mina", {{"Mobile", "010-1111-2222"}}, "Mina\nMobile\n010-1111-2222\n"},
		{"Mina", {{"", "Met at the fair"}}, "Mina\nMet at the fair\n"},
		{nullptr, {{"Home", "example.com"}}, "Home\nexample.com\n"},
		{"", {}, ""},
		// A field without a value says nothing, not even its label.
		{"Mina", {{"Birthday", ""}, {"Work", "a@b.c"}}, "Mina\nWork\na@b.c\n"},
		{"Mina", {{"Home", "1 Main St\nSpringfield"}}, "Mina\nHome\n1 Main St\nSpringfield\n"},
	};
	for (const Case& c : cases)
		EXPECT_EQ(c.expected, compose(c.name, c.fields)) << (c.name ? c.name : "(null)");
}

TEST(CtShareContactTextTest, LongTextsAreCutAfterTheLastWholeLineThatFits)
{
	// Lines of 2-byte characters whose ends never meet the limit exactly.
	std::vector<Field> notes(30, Field("", repeat("é", 37)));
	std::string full = "Mina\n" + repeat(repeat("é", 37) + "\n", 30);
	std::string text = compose("Mina", notes);
	EXPECT_LE(text.size(), CtShareContactText::kMaxBytes);
	EXPECT_GT(text.size(), CtShareContactText::kMaxBytes - 76);
	EXPECT_EQ('\n', text.back());
	EXPECT_EQ(full.substr(0, text.size()), text);
	EXPECT_TRUE(isValidUtf8(text));

	// A label whose value does not fit goes with it.
	EXPECT_EQ("Mina\n", compose("Mina", {{"Notes", repeat("x", 2000)}}));
	EXPECT_EQ("Mina\nHome\nshort\n", compose("Mina", {{"Home", "short"}, {"Work", repeat("x", 2000)}}));
}

TEST(CtShareContactTextTest, ALineLongerThanTheLimitIsCutOnACharacterBoundary)
{
	struct Case {
		const char* character;
		size_t expectedBytes;
	};
	// 1023 bytes would split the 2- and 4-byte characters.
	const Case cases[] = {{"a", 1023}, {"é", 1022}, {"€", 1023}, {"😀", 1020}};
	for (const Case& c : cases) {
		std::string text = compose(nullptr, {{"", repeat(c.character, 2000)}});
		EXPECT_EQ(c.expectedBytes, text.size()) << c.character;
		EXPECT_TRUE(isValidUtf8(text)) << c.character;
	}
}

TEST(CtShareContactTextTest, InvalidAndHugeTextsGiveValidBoundedText)
{
	std::string broken = "Mi\xC3\x28na \xFF\xFE end";
	std::string text = compose(broken.c_str(), {{"Mo\x80", "0\xE2\x82"}});
	EXPECT_TRUE(isValidUtf8(text));
	EXPECT_EQ(3, std::count(text.begin(), text.end(), '\n'));

	std::string huge(10 * 1024 * 1024, 'n');
	std::vector<Field> many(1000, Field("Note", huge.substr(0, 5000)));
	many.emplace_back("", huge);
	text = compose("Mina", many);
	EXPECT_EQ("Mina\n", text);
}

} // namespace
