#ifndef _CT_GAL_SEARCH_DATA_H_
#define _CT_GAL_SEARCH_DATA_H_

// One global address list (GAL) search result as the host hands it to the
// detail screen. Owned by the host; every text may be null.
struct CtGalSearchData {
	const void* reserved;     // not read by this library
	const char* imagePath;
	const char* displayName;
	const char* phone1;       // stored as a work number
	const char* phone2;       // stored as a mobile number
	const char* phone3;       // stored as a home number
	const char* email;        // stored as a work e-mail
	const char* company;
};

#endif
