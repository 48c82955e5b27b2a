// Every test program starts here: a fresh data folder per run, the headless
// toolkit engine, and quiet logs unless asked for.
#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <string>

int main(int argc, char** argv)
{
	char pattern[] = "/tmp/contacts-test-XXXXXX";
	const char* dir = mkdtemp(pattern);
	if (!dir)
		return 2;
	setenv("CONTACTS_DATA_DIR", dir, 1);
	// The toolkit starts a desktop-cache daemon that inherits this program's
	// output and lives while any program on the same socket folder uses it;
	// one per run, ending with it, keeps a parallel test runner from waiting
	// on the daemon long after this program is done.
	setenv("XDG_RUNTIME_DIR", dir, 1);
	setenv("ELM_ENGINE", "buffer", 0);
	setenv("ECORE_EVAS_ENGINE", "buffer", 0);
	setenv("CONTACTS_LOG_LEVEL", "error", 0);
	setenv("LANG", "en_US.UTF-8", 0);

	testing::InitGoogleTest(&argc, argv);
	int result = RUN_ALL_TESTS();

	std::error_code ec;
	std::filesystem::remove_all(dir, ec);
	return result;
}
