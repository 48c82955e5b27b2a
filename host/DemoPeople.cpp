#include "DemoPeople.h"

#include "ContactsDebug.h"
#include "CtCommonAddressbookUtil.h"
#include "DemoContactBuilder.h"

#include <string>

namespace ct::demo {

namespace {

using B = DemoContactBuilder;

constexpr int kCell = CONTACTS_NUMBER_TYPE_CELL;
constexpr int kHome = CONTACTS_NUMBER_TYPE_HOME;
constexpr int kWork = CONTACTS_NUMBER_TYPE_WORK;
constexpr int kHomeMail = CONTACTS_EMAIL_TYPE_HOME;
constexpr int kWorkMail = CONTACTS_EMAIL_TYPE_WORK;
constexpr int kBirthday = CONTACTS_EVENT_TYPE_BIRTH;
constexpr int kAnniversary = CONTACTS_EVENT_TYPE_ANNIVERSARY;

const char* const kLongNote =
	"Met at the 2019 developer conference in Lisbon. Prefers to be called after 6 pm on weekdays; "
	"on weekends only for urgent matters. Allergic to peanuts - remember when booking dinner. "
	"Has two children (Mila, 7 and Jonas, 4) and a dog called Pepper. Working on a book about "
	"the history of typography, chapter drafts shared in the team folder. Birthday present ideas: "
	"fountain pen, letterpress workshop voucher, anything by Jan Tschichold.";

// Tracks the first failure while the table is stored.
class Filler {
public:
	explicit Filler(const std::vector<std::string>& pictures) : m_pictures(pictures) {}

	const char* picture(int index) const
	{
		const std::string& path = m_pictures.at(index % m_pictures.size());
		return path.empty() ? nullptr : path.c_str();
	}

	int store(const B& builder)
	{
		int id = builder.store();
		if (id < 0 && m_error == 0)
			m_error = id;
		return id;
	}

	void link(int baseContactId, int otherContactId)
	{
		int base = personOf(baseContactId), other = personOf(otherContactId);
		if (base <= 0 || other <= 0)
			return;
		int err = contacts_person_link_person(base, other);
		if (err != CONTACTS_ERROR_NONE) {
			WFAILED("contacts_person_link_person", err);
			if (m_error == 0)
				m_error = err;
		}
	}

	int error() const { return m_error; }

private:
	static int personOf(int contactId)
	{
		contacts_record_h contact = nullptr;
		if (contactId <= 0 || contacts_db_get_record(_contacts_contact._uri, contactId, &contact) != CONTACTS_ERROR_NONE)
			return 0;
		int personId = 0;
		contacts_record_get_int(contact, _contacts_contact.person_id, &personId);
		contacts_record_destroy(contact, true);
		return personId;
	}

	const std::vector<std::string>& m_pictures;
	int m_error = 0;
};

void addFavourites(Filler& f)
{
	f.store(B("Anna", "Müller").number("+49 30 12345678", kCell).number("+49 30 8765432", kHome)
		.email("anna.mueller@example.de", kHomeMail).image(f.picture(0)).favourite()
		.event(19880412, kBirthday).address("Friedrichstraße 123", "Berlin", "10117", "Germany", CONTACTS_ADDRESS_TYPE_HOME));
	f.store(B("Brian", "O'Connor").number("+1 415 555 0134", kCell).email("brian@example.com", kWorkMail)
		.company("Golden Gate Logistics", "Dispatcher").image(f.picture(1)).favourite()
		.event(19750101, kBirthday).url("https://brian.example.com"));
	f.store(B("Chloé", "Dubois").number("+33 1 42 68 53 00", kCell).email("chloe.dubois@example.fr", kHomeMail)
		.favourite().event(714, kBirthday).note("Parle français et anglais."));
	f.store(B("Diego", "Fernández").number("+34 912 345 678", kCell).messenger("diego.fdz", CONTACTS_MESSENGER_TYPE_GOOGLE)
		.image(f.picture(2)).favourite().nickname("Dieguito"));
}

void addScripts(Filler& f)
{
	f.store(B("太郎", "山田").phonetic("タロウ", "ヤマダ").number("+81 3-1234-5678", kCell)
		.email("taro.yamada@example.jp", kWorkMail).company("山田商事", "営業部長").event(19650315, kBirthday));
	f.store(B("芳", "王").number("+86 10 6552 9988", kCell).event(19900815, kBirthday, true).image(f.picture(3)));
	f.store(B("민준", "김").number("+82 2-312-3456", kCell).event(19920405, kBirthday, true, true)
		.email("minjun.kim@example.kr", kHomeMail));
	f.store(B("محمد", "العلي").number("+971 4 123 4567", kCell).address("شارع الشيخ زايد", "دبي", "00000",
		"الإمارات", CONTACTS_ADDRESS_TYPE_WORK));
	f.store(B("Иван", "Петров").number("+7 495 123-45-67", kCell).email("ivan.petrov@example.ru", kHomeMail)
		.event(19830223, kBirthday).relationship("Мария Петрова", CONTACTS_RELATIONSHIP_TYPE_SPOUSE));
	f.store(B("Ελένη", "Παπαδοπούλου").number("+30 21 0123 4567", kCell).event(1125, kBirthday));
	f.store(B("प्रिया", "शर्मा").number("+91 98765 43210", kCell).email("priya.sharma@example.in", kWorkMail)
		.image(f.picture(4)));
	f.store(B("Văn An", "Nguyễn").number("+84 24 3825 1234", kCell).email("an.nguyen@example.vn", kHomeMail));
	f.store(B("יוסף", "כהן").number("+972 3-123-4567", kCell).event(19771103, kBirthday));
	f.store(B("Søren", "Kierkegård").number("+45 33 12 34 56", kHome).note("Ring efter kl. 10."));
}

void addLinked(Filler& f)
{
	int phone = f.store(B("Emma", "Johansson").number("+46 8 123 456 78", kCell).email("emma@example.se", kHomeMail)
		.image(f.picture(5)).event(19910707, kBirthday));
	int work = f.store(B("Emma", "Johansson").number("+46 8 555 000 11", kWork).email("emma.johansson@corp.example.se", kWorkMail)
		.company("Nordic Design AB", "Art Director", "Product"));
	int third = f.store(B("Emma", "J.").messenger("emma.j", CONTACTS_MESSENGER_TYPE_FACEBOOK).url("https://emmaj.example.se"));
	f.link(phone, work);
	f.link(phone, third);

	int lukas = f.store(B("Lukas", "Novák").number("+420 602 123 456", kCell).favourite());
	int lukasWork = f.store(B("Lukáš", "Novák").number("+420 222 333 444", kWork).company("Praha Software s.r.o.", "CTO"));
	f.link(lukas, lukasWork);
}

void addSim(Filler& f)
{
	int sim = ctCommonGetAddressBookId(CONTACTS_SIM1_ADDRESS_BOOK_NAME);
	if (sim < 0) {
		WERROR("no SIM address book; SIM demo persons go to the phone");
		sim = 0;
	}
	f.store(B("Taxi", nullptr, sim).number("+44 20 7946 0000", kCell));
	f.store(B("Mum", nullptr, sim).number("+44 7700 900123", kCell));
	f.store(B("Pizza Roma", nullptr, sim).number("+44 20 7946 0555", kCell));
	int simGeorge = f.store(B("George", nullptr, sim).number("+44 7700 900456", kCell));
	int phoneGeorge = f.store(B("George", "Harrison").email("george@example.co.uk", kHomeMail).image(f.picture(6)));
	f.link(phoneGeorge, simGeorge);
}

void addBlockedAndPlain(Filler& f)
{
	f.store(B("Unknown", "Caller").number("+1 202 555 0199", kCell).note("Keeps calling about car warranty."));
	f.store(B("Sales", "Hotline").number("+1 800 555 0100", kWork).company("Best Deals Inc.", "Sales"));
	f.store(B("Hannah", "Schmidt").number("+49 89 1234 5678", kCell).number("+49 89 9999 0000", kWork)
		.email("hannah@example.de", kHomeMail).event(19960229, kBirthday).event(20180616, kAnniversary));
	f.store(B("Isabella", "Rossi").number("+39 06 1234 5678", kCell).event(1224, kBirthday).image(f.picture(7)));
	f.store(B("Jack", "Smith"));
	f.store(B(nullptr, nullptr, 0).number("+61 2 9876 5432", kCell));
}

void addLongTexts(Filler& f)
{
	f.store(B("Maximiliana-Alexandra", "von Hohenzollern-Sigmaringen-Wittelsbach").prefix("Dr.")
		.number("+49 711 123456789012", kCell)
		.email("maximiliana.alexandra.von.hohenzollern-sigmaringen@an-extremely-long-domain-name.example.com", kWorkMail)
		.company("Internationale Gesellschaft für Angewandte Typografie und Buchgestaltung e.V.",
			"Leiterin der Abteilung für historische Schriften", "Forschung und Entwicklung")
		.address("Königin-Luise-Straße 1234, Hinterhaus, 3. Obergeschoss links", "Stuttgart-Bad Cannstatt",
			"70372", "Germany", CONTACTS_ADDRESS_TYPE_WORK)
		.note(kLongNote).event(19700101, kBirthday));
	f.store(B("Oliver", "Brown").number("+44 161 496 0000", kCell).note(kLongNote).url("https://www.example.org/people/oliver-brown/profile?tab=about&lang=en"));
	f.store(B("Noah", "Williams").number("+1 646 555 0187", kCell).ringtone("/usr/share/sounds/ringtones/Over the horizon.ogg")
		.event(19800310, kBirthday).event(20100522, kAnniversary));
	f.store(B("Zoë", "Ångström").email("zoe@example.se", kHomeMail));
}

} // namespace

const std::vector<std::string>& DemoPeople::blockedNumbers()
{
	static const std::vector<std::string> numbers = {"+1 202 555 0199", "+1 800 555 0100"};
	return numbers;
}

int DemoPeople::fill(const std::vector<std::string>& pictures)
{
	WENTER();
	std::vector<std::string> paths = pictures.empty() ? std::vector<std::string>(1) : pictures;
	Filler filler(paths);
	addFavourites(filler);
	addScripts(filler);
	addLinked(filler);
	addSim(filler);
	addBlockedAndPlain(filler);
	addLongTexts(filler);
	return filler.error();
}

} // namespace ct::demo
