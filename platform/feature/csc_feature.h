/* Feature flags of the device configuration. Every flag is false unless the
 * file "features.conf" in the data folder (lines "id=true|false", '#'
 * comments) or $CONTACTS_FEATURES ("88,12": these ids are true) says
 * otherwise. The file is reread when it changes. */
#ifndef CT_PLATFORM_CSC_FEATURE_H
#define CT_PLATFORM_CSC_FEATURE_H

#include <stdbool.h>

#ifdef __cplusplus
extern "C" {
#endif

/* The flags the contacts screens ask for. */
typedef enum {
	/* The detail screen leaves out the address row (no maps launch). */
	CSC_FEATURE_CONTACTS_HIDE_ADDRESS_ROW = 88,
	/* The edit screen's address row uses the "input.3icon.2" style. */
	CSC_FEATURE_CONTACTS_ADDRESS_INPUT_STYLE_2 = 12,
	/* Easy sign-up: status rows, profile sharing and sync after edits. */
	CSC_FEATURE_CONTACTS_EASY_SIGNUP = 13
} csc_feature_contacts_e;

/* The flag's value; false for unknown or negative ids. */
bool csc_feature_get_bool(int id);

#ifdef __cplusplus
}
#endif

#endif
