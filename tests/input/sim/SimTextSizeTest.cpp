// The room texts take on a SIM: GSM 7-bit with its extension table, else the
// UCS-2 codings, and texts a SIM cannot hold.
#include "CtInputViewSimTextSize.h"

#include <gtest/gtest.h>

#include <string>

namespace {

std::string repeat(const std::string& unit, size_t bytes)
{
	std::string out;
	out.reserve(bytes + unit.size());
	while (out.size() < bytes)
		out += unit;
	return out;
}

} // namespace

TEST(SimTextSizeTest, GsmTextsCountUnitsAndOtherTextsTheirUcs2Coding)
{
	struct Case {
		const char* why;
		std::string text;
		int size;
	} cases[] = {
		{"empty", "", 0},
		{"Latin letters, digits, blank", "Anna Smith 42", 13},
		{"plain punctuation and line breaks", "!\"#%&'()*+,-./:;<=>?\n\r", 22},
		{"default-alphabet letters", "Ærøskøbing Müller", 17},
		{"default-alphabet signs", "@£$¥_§¿¡¤", 9},
		{"Greek capitals of the alphabet", "ΔΦΓΛΩΠΨΣΘΞ", 10},
		{"euro sign", "€", 2},
		{"euro in a name", "Price 5€", 9},
		{"whole extension table", "a^{}\\[~]|€b", 20},
		{"form feed is not in the alphabet", "\f", 4},
		{"backtick is not in the alphabet", "`", 4},
		{"Greek small letter", "α", 4},
		{"one Cyrillic letter, one class", "Alexander Smiд", 17},
		{"Cyrillic of one class", "джД", 6},
		{"Cyrillic of both classes", "Дмитрий", 15},
		{"euro with Cyrillic, both classes", "д€", 5},
		{"CJK of one class", "中", 4},
		{"CJK of both classes", "中文", 5},
		{"Hangul, one class, high page", "한국", 6},
		{"emoji", "😀", -1},
		{"emoji among Latin", "Ann😀", -1},
		{"broken sequence", "\xC3\x28", -1},
		{"stray byte", "A\xFF", -1},
		{"1 MB Latin", repeat("a", 1 << 20), 1 << 20},
		{"1 MB one-class Cyrillic stops at 255 characters", repeat("д", 1 << 20), 255 + 3},
		{"1 MB two-class Cyrillic stops at 510 bytes", repeat("дм", 1 << 20), 511},
	};
	for (const Case& c : cases)
		EXPECT_EQ(c.size, CtInputViewSimTextSize::getUcs2CodeSize(c.text.c_str())) << c.why;
	EXPECT_EQ(0, CtInputViewSimTextSize::getUcs2CodeSize(nullptr));
	// Only the given bytes count; cutting a character in half leaves a text the card cannot hold.
	EXPECT_EQ(4, CtInputViewSimTextSize::getUcs2CodeSize("Anna\xe2\x82\xac", 4));
	EXPECT_EQ(6, CtInputViewSimTextSize::getUcs2CodeSize("Anna\xe2\x82\xac", 1000));
	EXPECT_EQ(-1, CtInputViewSimTextSize::getUcs2CodeSize("Anna\xe2\x82\xac", 5));
}
