// Builds one contact record of the demo database, field by field, and
// stores it through the contacts service.
#pragma once

#include <contacts.h>

namespace ct::demo {

class DemoContactBuilder {
public:
	// A contact of address book `addressBookId` (0: the phone's own).
	DemoContactBuilder(const char* first, const char* last, int addressBookId = 0);
	~DemoContactBuilder();
	DemoContactBuilder(const DemoContactBuilder&) = delete;
	DemoContactBuilder& operator=(const DemoContactBuilder&) = delete;

	DemoContactBuilder& prefix(const char* text);
	DemoContactBuilder& phonetic(const char* first, const char* last);
	DemoContactBuilder& nickname(const char* text);
	DemoContactBuilder& number(const char* text, int type, const char* label = nullptr);
	DemoContactBuilder& email(const char* text, int type);
	DemoContactBuilder& address(const char* street, const char* locality, const char* postalCode,
			const char* country, int type);
	DemoContactBuilder& company(const char* name, const char* jobTitle, const char* department = nullptr);
	DemoContactBuilder& note(const char* text);
	DemoContactBuilder& url(const char* text);
	DemoContactBuilder& messenger(const char* imId, int type);
	DemoContactBuilder& relationship(const char* name, int type);
	// `date` is YYYYMMDD; year 0 means the year is unknown.
	DemoContactBuilder& event(int date, int type, bool lunar = false, bool leapMonth = false);
	DemoContactBuilder& image(const char* path);
	DemoContactBuilder& ringtone(const char* path);
	DemoContactBuilder& favourite();

	// Stores the contact (SIM books through the SIM operations). Returns the
	// new contact id, or a negative contacts error (logged).
	int store() const;

private:
	contacts_record_h __addChild(unsigned int property, const char* uri);

	contacts_record_h m_contact = nullptr;
	int m_addressBookId = 0;
	bool m_sim = false;
};

} // namespace ct::demo
