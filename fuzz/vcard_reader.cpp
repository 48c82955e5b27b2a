// Fuzz target for the vCard reader: the input is read as it is and as the
// body of a card whose property lines are picked by the input's low bytes.
// Nothing may crash; a card read must hold valid UTF-8 only, and writing it
// with the vCard maker and reading that again must give the same contact.
#include "ContactsRecord.h"
#include "ContactsVcard.h"
#include "ContactsVcardLexer.h"
#include "ContactsVcardReader.h"

#include <glib.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <string>

namespace {

using namespace ct::contacts;

void checkAt(bool ok, int line, const std::string& context)
{
	if (!ok) {
		fprintf(stderr, "check failed at line %d\n%s\n", line, context.c_str());
		abort();
	}
}
#define check(ok, context) checkAt((ok), __LINE__, (context))

const char* const kLines[] = { "N:", "N;CHARSET=ISO-8859-1;ENCODING=QUOTED-PRINTABLE:", "FN:", "TEL;TYPE=CELL,PREF:",
	"TEL;HOME;VOICE:", "EMAIL;TYPE=INTERNET:", "ADR;TYPE=WORK:", "ORG:", "TITLE:", "item1.X-ABLabel:", "item1.TEL:",
	"item2.X-ABRELATEDNAMES:", "item2.X-ABLabel:_$!<Father>!$_", "BDAY:", "X-ANNIVERSARY;X-APPLE-OMIT-YEAR=1604:",
	"item3.X-ABDATE;X-CALSCALE=LUNAR:", "IMPP;X-SERVICE-TYPE=Skype:", "X-AIM:", "NOTE;ENCODING=QUOTED-PRINTABLE:",
	"PHOTO;ENCODING=b;TYPE=PNG:iVBORw0KGgo", "LOGO;ENCODING=BASE64:", "CATEGORIES:", "NICKNAME:", "URL;TYPE=HOME:",
	"RELATED;TYPE=spouse:", "VERSION:2.1", "VERSION:4.0", "BEGIN:VCARD", "END:VCARD", "AGENT:", " ", "=",
	"X-PHONETIC-FIRST-NAME:", "UID:", "X-SOCIALPROFILE;X-USER=a;TYPE=", "\\", ";", "," };
constexpr size_t kLineCount = sizeof(kLines) / sizeof(kLines[0]);

std::string cardOf(const uint8_t* data, size_t size)
{
	std::string text = "BEGIN:VCARD\r\nVERSION:3.0\r\n";
	for (size_t i = 0; i < size; ++i) {
		if (data[i] < kLineCount)
			text += std::string("\r\n") + kLines[data[i]];
		else
			text += static_cast<char>(data[i]);
	}
	return text + "\r\nEND:VCARD\r\n";
}

// Every text of the record and its children, checked for UTF-8 on the way.
std::string dump(const contacts_record_s& r)
{
	std::string out;
	for (const PropertyInfo& p : r.view->props) {
		if (p.type == PropType::Record) {
			for (const contacts_record_s* child : r.childLists[p.slot])
				out += std::string(p.name) + "{" + dump(*child) + "}";
			continue;
		}
		if (!strcmp(p.name, "display_name"))
			continue;
		const auto& v = r.values[p.slot];
		if (v.s) {
			check(g_utf8_validate(v.s->c_str(), -1, nullptr), *v.s);
			out += std::string(p.name) + "=" + *v.s + ";";
		} else if (v.i) {
			out += std::string(p.name) + "=" + std::to_string(v.i) + ";";
		}
	}
	return out;
}

void readAndRewrite(const std::string& text)
{
	ContactsVcardLexer lexer(text);
	size_t upperBound = ContactsVcardLexer::countCards(text);
	size_t cards = 0;
	VcardRawCard card;
	VcardEntry entry;
	while (lexer.next(card)) {
		check(++cards <= upperBound, text);
		std::string refusal;
		if (!ContactsVcardReader::read(card, entry, &refusal)) {
			check(!refusal.empty() && !entry.contact, text);
			continue;
		}
		for (const VcardPicture& picture : entry.pictures)
			check(picture.format && picture.bytes.size() <= ContactsVcardReader::kMaxPictureBytes, text);
		std::string first = dump(*entry.contact);
		if (first.empty())
			continue; // only pictures, which the record does not hold
		std::string again = ContactsVcard::make({ entry.contact.get() }, entry.name);
		ContactsVcardLexer relexer(again);
		VcardEntry reread;
		check(relexer.next(card) && ContactsVcardReader::read(card, reread, &refusal), text + "\n---\n" + again + refusal);
		check(first == dump(*reread.contact), text + "\n---\n" + again + "\n---\n" + first + "\n" + dump(*reread.contact));
	}
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
	setenv("CONTACTS_LOG_LEVEL", "silent", 0);
	readAndRewrite(std::string(reinterpret_cast<const char*>(data), size));
	readAndRewrite(cardOf(data, size));
	return 0;
}
