// SIM cards: their configuration ("sim.conf" in the data folder), power
// state (vconf) and address books.
#pragma once

#include "ContactsConnection.h"

namespace ct::contacts {

class ContactsSim {
public:
	static constexpr int kSlots = 2;

	struct Slot {
		bool present = false;
		int capacity = 250;
		int nameMax = 14;
		int numberMax = 20;
		int emailMax = 40;
		int emailCapacity = 250;
	};

	// The configuration of slot 0 or 1. Without a file: slot 0 present with
	// the defaults, slot 1 absent.
	static Slot slot(int slotNo);
	// Present and switched on.
	static bool isReady(int slotNo);
	// Creates the address book of every present slot that has none yet.
	static int ensureAddressBooks(ContactsConnection& conn);
	// The address book id of a slot, or -1.
	static int addressBookOf(ContactsConnection& conn, int slotNo);
	// The slot of an address book id, or -1 when it is not a SIM book.
	static int slotOf(ContactsConnection& conn, int addressBookId);
	static const char* bookName(int slotNo);
	// "SIM1" or "SIM2": the book's provider name and the slot's group in sim.conf.
	static const char* providerName(int slotNo);
};

} // namespace ct::contacts
