#ifndef _CONTACTS_COMMON_H_
#define _CONTACTS_COMMON_H_

#include <string>

// Resource paths and phone-number text helpers of the contacts application.
class ContactsCommon {
public:
	// Full path of an edje file named like "contacts/detail_layout.edj".
	// Returns false (and leaves `out` empty) for a null or empty name, or,
	// when `mustExist` is set, when the file is missing.
	static bool getAppEdjePath(const char* edjName, std::string& out, bool mustExist = true);
	// Full path of an image such as "contacts_caller_id_default_full.png";
	// empty when missing and `mustExist` is set.
	static std::string getAppImagePath(const char* imageName, bool mustExist = true);
	// Folder of the compiled resources ($CONTACTS_RES_DIR or the build's).
	static std::string getResourceDir();
	// Folder of the compiled translation catalogues.
	static std::string getLocaleDir();

	// The number grouped with dashes the way the region format writes it
	// ("2015550123" -> "201-555-0123" for en_US). Numbers the region does not
	// know (short codes, service codes) come back unchanged.
	static std::string addNumberDashes(const char* number);
	// Same for an explicit region code ("US", "DE", "KR").
	static std::string addNumberDashesForRegion(const char* number, const char* region);
	static std::string removeNumberDashes(const char* number);
	// The region of "db/menu_widget/regionformat" ("en_US.UTF-8" -> "US"),
	// else of "db/csc/country_iso", else "US".
	static std::string getRegionCode();

	// Binds the text domain "contacts" to the compiled catalogues (again when
	// the resource folder changed). Idempotent.
	static void bindTextDomain();
	// The text of a translation id in the current language (the id itself
	// when the catalogue has none). Borrowed; valid until the language changes.
	static const char* translate(const char* textId);

	// Whether the call manager takes calls now.
	static bool checkCallManagerReady();
};

#endif
