#include "CtInputViewSimTextSize.h"

#include "ContactsDebug.h"

#include <glib.h>

#include <algorithm>
#include <cstring>

namespace {

// The UCS-2 byte length an alpha field takes at most.
const gsize kMaxUcs2Bytes = 510;

// Characters of the default alphabet outside ASCII's letters, digits and
// plain punctuation (3GPP TS 23.038, 6.2.1).
const gunichar kDefaultAlphabetOthers[] = {
	0x0040, 0x00A3, 0x0024, 0x00A5, 0x00E8, 0x00E9, 0x00F9, 0x00EC, 0x00F2, 0x00C7, 0x00D8, 0x00F8, 0x00C5, 0x00E5,
	0x0394, 0x005F, 0x03A6, 0x0393, 0x039B, 0x03A9, 0x03A0, 0x03A8, 0x03A3, 0x0398, 0x039E, 0x00C6, 0x00E6, 0x00DF,
	0x00C9, 0x00A4, 0x00A1, 0x00C4, 0x00D6, 0x00D1, 0x00DC, 0x00A7, 0x00BF, 0x00E4, 0x00F6, 0x00F1, 0x00FC, 0x00E0,
};

// The extension table, each taking an escape and a character.
const gunichar kExtensionTable[] = {'^', '{', '}', '\\', '[', '~', ']', '|', 0x20AC};

template <size_t N>
bool contains(const gunichar (&table)[N], gunichar c)
{
	return std::find(table, table + N, c) != table + N;
}

bool isPlainGsm(gunichar c)
{
	if (c == 0 || c >= 0x80)
		return false;
	return c == ' ' || c == '\n' || c == '\r' || g_ascii_isalnum(static_cast<gchar>(c))
		|| strchr("!\"#%&'()*+,-./:;<=>?", static_cast<int>(c));
}

// Units in the GSM 7-bit alphabet; -1 when a character is not in it.
int gsmCodeSize(const char* text, gsize length)
{
	int units = 0;
	for (const char* p = text; p < text + length; p = g_utf8_next_char(p)) {
		gunichar c = g_utf8_get_char(p);
		if (isPlainGsm(c) || contains(kDefaultAlphabetOthers, c))
			units += 1;
		else if (contains(kExtensionTable, c))
			units += 2;
		else
			return -1;
	}
	return units;
}

// The alpha-field size of a UCS-2 big-endian text of `bytes` bytes.
int alphaFieldSize(const unsigned char* ucs2, gsize bytes)
{
	int length = static_cast<int>(std::min(bytes, kMaxUcs2Bytes));
	if (length < 2)
		return length / 2 + 3; // coding 0x81
	bool high = false;
	bool bit3Set = false;
	bool bit3Clear = false;
	for (int i = 0; i + 1 < length; i += 2) {
		unsigned char hi = ucs2[i];
		unsigned char lo = ucs2[i + 1];
		if (hi == 0)
			continue;
		high = high || hi >= 0x80;
		(lo & 0x08 ? bit3Set : bit3Clear) = true;
	}
	if (bit3Set && bit3Clear)
		return std::min(length + 1, static_cast<int>(kMaxUcs2Bytes) + 1); // coding 0x80
	return high ? length / 2 + 4 : length / 2 + 3;                       // coding 0x82 or 0x81
}

} // namespace

int CtInputViewSimTextSize::getUcs2CodeSize(const char* text, int length)
{
	if (!text)
		return 0;
	gsize bytes = length < 0 ? strlen(text) : strnlen(text, static_cast<size_t>(length));
	if (!g_utf8_validate(text, static_cast<gssize>(bytes), nullptr))
		return -1;
	int gsm = gsmCodeSize(text, bytes);
	if (gsm >= 0)
		return gsm;
	gsize written = 0;
	GError* error = nullptr;
	gchar* ucs2 = g_convert(text, static_cast<gssize>(bytes), "UCS-2BE", "UTF-8", nullptr, &written, &error);
	if (!ucs2) {
		WWARNING("g_convert() Failed(%d)", error ? error->code : -1);
		if (error)
			g_error_free(error);
		return -1;
	}
	int size = alphaFieldSize(reinterpret_cast<const unsigned char*>(ucs2), written);
	g_free(ucs2);
	return size;
}
