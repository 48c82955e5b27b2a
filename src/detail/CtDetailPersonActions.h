#ifndef _CT_DETAIL_PERSON_ACTIONS_H_
#define _CT_DETAIL_PERSON_ACTIONS_H_

#include <Evas.h>
#include <app_control.h>

// What the detail screen's menu does to the shown person beyond the screen:
// deleting it, dropping it from the profile share-with list, and the
// requests that share it or link other persons into it. Main loop only.
class CtDetailPersonActions {
public:
	explicit CtDetailPersonActions(int personId);

	// The most persons a person may be made of.
	static constexpr int kMaxLinkedContacts = 10;

	// True when one of the person's address books belongs to an account
	// (neither the phone's nor a SIM's), or cannot be read.
	bool isSyncedToAnyAccount() const;
	// The delete question's translation id for a person in that state.
	static const char* getDeleteMessageId(bool synced, bool readOnly, int linkedCount);

	// Deletes the person (only its SIM contact for a SIM person). On success
	// the other screens are told and an account sync starts. Returns 0 or the
	// contacts-service error; a failure leaves the person as it was.
	int deleteContacts() const;
	// Takes the person out of the stored profile share-with list, if there.
	void removeFromPermittedList() const;

	// Hands the person to a share target as a contact card, or as text.
	// False, logged, when no target took it. `owner` drops late replies.
	bool shareAsVcard(Evas_Object* owner) const;
	bool shareAsText(Evas_Object* owner) const;

	// The contact picker's request that links chosen persons into this one,
	// with room for kMaxLinkedContacts in all; the caller destroys it. Null
	// when it cannot be made.
	app_control_h createLinkRequest(int linkedCount) const;

private:
	int m_personId;
};

#endif
