// vCards: importing a file of 10,000 cards into a fresh database, and
// making the vCard of one rich person (every field kind, two pictures).
#include "ContactsVcardImport.h"

#include <benchmark/benchmark.h>
#include <contacts.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

namespace {

// A fresh data folder with the service connected, removed with the scope.
class FreshStore {
public:
	FreshStore()
	{
		std::string pattern = (std::filesystem::temp_directory_path() / "vcard-bench-XXXXXX").string();
		if (mkdtemp(pattern.data()))
			m_dir = pattern;
		setenv("CONTACTS_DATA_DIR", m_dir.c_str(), 1);
		contacts_connect();
	}
	~FreshStore()
	{
		contacts_disconnect();
		std::error_code ec;
		std::filesystem::remove_all(m_dir, ec);
	}
	FreshStore(const FreshStore&) = delete;
	FreshStore& operator=(const FreshStore&) = delete;
	const std::string& dir() const { return m_dir; }

private:
	std::string m_dir;
};

std::string tenThousandCards()
{
	static const char* const firsts[] = { "Anna", "Bert", "Chloé", "Dmitri", "Eun-ji", "Farah", "Gustav", "Hiro" };
	static const char* const lasts[] = { "Smith", "Müller", "Kim", "O'Neil", "Nakamura", "Silva", "Новиков" };
	std::string text;
	for (int i = 0; i < 10000; ++i) {
		std::string first = firsts[i % 8], last = lasts[i % 7];
		std::string n = std::to_string(i);
		text += "BEGIN:VCARD\r\nVERSION:3.0\r\nFN:" + first + " " + last + " " + n + "\r\nN:" + last + ";" + first + " "
			+ n + ";;;\r\nTEL;TYPE=CELL:+1 555 " + n + "\r\n";
		if (i % 2 == 0)
			text += "TEL;TYPE=HOME,VOICE:+1 555 9" + n + "\r\nEMAIL;TYPE=INTERNET:p" + n + "@example.org\r\n";
		if (i % 5 == 0)
			text += "ADR;TYPE=HOME:;;" + n + " Main St;Springfield;IL;62701;USA\r\nBDAY:1980-0" + std::to_string(1 + i % 9)
				+ "-1" + std::to_string(i % 10) + "\r\nORG:Acme;Sales\r\nTITLE:Clerk\r\n";
		if (i % 10 == 0)
			text += "NOTE:Met at the fair\\, " + n + "\r\nCATEGORIES:Friends\r\n";
		text += "END:VCARD\r\n";
	}
	return text;
}

void BM_ImportTenThousandCards(benchmark::State& state)
{
	static const std::string text = tenThousandCards();
	for (auto _ : state) {
		state.PauseTiming();
		{
			FreshStore store;
			state.ResumeTiming();
			auto report = ct::contacts::ContactsVcardImport::importText(text, 0);
			state.PauseTiming();
			if (report.contactIds.size() != 10000)
				state.SkipWithError(("imported " + std::to_string(report.contactIds.size())).c_str());
		}
		state.ResumeTiming();
	}
	state.counters["cards"] = 10000;
	state.counters["MB"] = static_cast<double>(text.size()) / 1e6;
}

std::string writePicture(const std::string& dir, const char* name, const std::string& magic, size_t size)
{
	std::string bytes = magic;
	for (size_t i = bytes.size(); i < size; ++i)
		bytes += static_cast<char>((i * 7919) % 251);
	std::string path = dir + "/" + name;
	std::ofstream(path, std::ios::binary) << bytes;
	return path;
}

contacts_record_h child(contacts_record_h parent, unsigned prop, const char* uri)
{
	contacts_record_h c = nullptr;
	contacts_record_create(uri, &c);
	contacts_record_add_child_record(parent, prop, c);
	return c;
}

// A person of one contact with about 60 child records and two pictures (24 KB, 4 KB).
int insertRichPerson(const std::string& dir)
{
	contacts_record_h contact = nullptr;
	contacts_record_create(_contacts_contact._uri, &contact);
	contacts_record_h name = child(contact, _contacts_contact.name, _contacts_name._uri);
	contacts_record_set_str(name, _contacts_name.first, "Ánna");
	contacts_record_set_str(name, _contacts_name.last, "O'Neil");
	contacts_record_set_str(name, _contacts_name.phonetic_first, "Ana");
	for (int i = 0; i < 8; ++i) {
		contacts_record_h n = child(contact, _contacts_contact.number, _contacts_number._uri);
		contacts_record_set_int(n, _contacts_number.type, 1 << (1 + i));
		contacts_record_set_str(n, _contacts_number.number, ("+1 555 010" + std::to_string(i)).c_str());
		contacts_record_h e = child(contact, _contacts_contact.email, _contacts_email._uri);
		contacts_record_set_str(e, _contacts_email.email, ("anna" + std::to_string(i) + "@example.org").c_str());
		contacts_record_h m = child(contact, _contacts_contact.messenger, _contacts_messenger._uri);
		contacts_record_set_int(m, _contacts_messenger.type, 2 + i);
		contacts_record_set_str(m, _contacts_messenger.im_id, ("anna" + std::to_string(i)).c_str());
		contacts_record_h r = child(contact, _contacts_contact.relationship, _contacts_relationship._uri);
		contacts_record_set_int(r, _contacts_relationship.type, 1 + i);
		contacts_record_set_str(r, _contacts_relationship.name, ("Relative " + std::to_string(i)).c_str());
		contacts_record_h u = child(contact, _contacts_contact.url, _contacts_url._uri);
		contacts_record_set_str(u, _contacts_url.url, ("https://example.org/" + std::to_string(i)).c_str());
	}
	for (int i = 0; i < 4; ++i) {
		contacts_record_h a = child(contact, _contacts_contact.address, _contacts_address._uri);
		contacts_record_set_str(a, _contacts_address.street, "1 Main St, Building B");
		contacts_record_set_str(a, _contacts_address.locality, "Springfield");
		contacts_record_h ev = child(contact, _contacts_contact.event, _contacts_event._uri);
		contacts_record_set_int(ev, _contacts_event.type, i);
		contacts_record_set_int(ev, _contacts_event.date, 19900101 + i);
		contacts_record_set_str(child(contact, _contacts_contact.note, _contacts_note._uri), _contacts_note.note,
			"A longer note; with separators, and a line\nbreak that is folded over more than one line of the card");
		contacts_record_set_str(child(contact, _contacts_contact.nickname, _contacts_nickname._uri),
			_contacts_nickname.name, "Annie");
	}
	contacts_record_h company = child(contact, _contacts_contact.company, _contacts_company._uri);
	contacts_record_set_str(company, _contacts_company.name, "ACME");
	contacts_record_set_str(company, _contacts_company.job_title, "Chief");
	contacts_record_set_str(child(contact, _contacts_contact.image, _contacts_image._uri), _contacts_image.path,
		writePicture(dir, "photo.jpg", "\xFF\xD8\xFF\xE0", 24 * 1024).c_str());
	contacts_record_set_str(child(contact, _contacts_contact.image, _contacts_image._uri), _contacts_image.path,
		writePicture(dir, "small.png", "\x89PNG\r\n\x1A\n", 4 * 1024).c_str());
	int id = 0;
	contacts_db_insert_record(contact, &id);
	contacts_record_destroy(contact, true);
	contacts_record_h stored = nullptr;
	contacts_db_get_record(_contacts_contact._uri, id, &stored);
	int person = 0;
	contacts_record_get_int(stored, _contacts_contact.person_id, &person);
	contacts_record_destroy(stored, true);
	return person;
}

void BM_ExportRichPerson(benchmark::State& state)
{
	FreshStore store;
	int personId = insertRichPerson(store.dir());
	contacts_record_h person = nullptr;
	contacts_db_get_record(_contacts_person._uri, personId, &person);
	size_t bytes = 0;
	for (auto _ : state) {
		char* stream = nullptr;
		contacts_vcard_make_from_person(person, &stream);
		bytes = stream ? strlen(stream) : 0;
		free(stream);
	}
	contacts_record_destroy(person, true);
	state.counters["KB"] = static_cast<double>(bytes) / 1024;
}

} // namespace

BENCHMARK(BM_ImportTenThousandCards)->Unit(benchmark::kMillisecond)->Iterations(3);
BENCHMARK(BM_ExportRichPerson)->Unit(benchmark::kMicrosecond);

BENCHMARK_MAIN();
