// contacts-writer: a process that writes to the contacts store for the
// reliability tests (tests/reliability), which kill it or drive it.
//   contacts-writer random SEED          write at random until killed
//   contacts-writer update CONTACT TAG   update the contact on "burst N" commands
#include "StoreWriter.h"

#include <contacts.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

int main(int argc, char** argv)
{
	setenv("CONTACTS_LOG_LEVEL", "error", 0);
	bool random = argc == 3 && strcmp(argv[1], "random") == 0;
	bool update = argc == 4 && strcmp(argv[1], "update") == 0;
	if (!random && !update) {
		fprintf(stderr, "usage: contacts-writer random SEED | update CONTACT TAG\n");
		return 2;
	}
	if (contacts_connect() != CONTACTS_ERROR_NONE) {
		fprintf(stderr, "contacts-writer: cannot open the contacts store\n");
		return 1;
	}
	ct::tools::StoreWriter writer(static_cast<unsigned>(strtoul(argv[2], nullptr, 10)));
	if (random)
		writer.runRandom();
	int result = writer.runCommands(atoi(argv[2]), argv[3]);
	contacts_disconnect();
	return result;
}
