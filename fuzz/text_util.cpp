// Fuzz target for the pure text helpers of the editable contact: number
// cleaning, markup to UTF-8, UTF-8 stepping, display file names and address
// encoding. Every result must be NUL-terminated, fit its buffer and stay
// valid UTF-8.
#include "CtCommonTextUtil.h"

#include <Evas.h>
#include <glib.h>

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

namespace {

void checkAt(bool ok, int line)
{
	if (!ok) {
		fprintf(stderr, "check failed at line %d\n", line);
		abort();
	}
}
#define check(ok) checkAt((ok), __LINE__)

void checkBuffer(const char* out, int size)
{
	check(memchr(out, '\0', size) != nullptr);
	check(g_utf8_validate(out, -1, nullptr));
}

void fuzzNumbers(const std::string& text, int size)
{
	char out[1024];
	int len = ctCommonCleanNumber(text.c_str(), out, size);
	check(len >= 0 && len < size && strlen(out) == static_cast<size_t>(len));
	checkBuffer(out, size);
	len = ctCommonCleanNumberForSim(text.c_str(), out, size);
	check(len >= 0 && len < size);
	check(strspn(out, "0123456789*#+,;") == static_cast<size_t>(len));
	check(!strchr(out + (len > 0 ? 1 : 0), '+'));
}

void fuzzUtf8Walk(const std::string& text)
{
	size_t steps = 0;
	for (size_t i = 0; i < text.size(); ++steps) {
		int n = ctCommonCheckUtf8(text[i]);
		check(n >= 1 && n <= 4);
		i += n;
	}
	check(steps <= text.size());
}

bool startEvas()
{
	// Headless and quiet: no system modules (D-Bus) behind the main loop.
	setenv("ECORE_NO_SYSTEM_MODULES", "1", 0);
	setenv("EINA_LOG_LEVEL", "0", 0);
	if (evas_init() <= 0)
		return false;
	atexit([] { evas_shutdown(); });
	return true;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
	static const bool evasReady = startEvas(); // markup parsing logs through evas
	check(evasReady);
	std::string text(reinterpret_cast<const char*>(data), size);
	text = text.c_str(); // the helpers take NUL-terminated texts
	int bufferSize = 1 + static_cast<int>(size % 1023);

	fuzzNumbers(text, bufferSize);
	fuzzUtf8Walk(text);

	char* plain = ctCommonMarkupToUtf8(text.c_str());
	check(plain != nullptr && g_utf8_validate(plain, -1, nullptr));
	free(plain);

	char name[1024];
	ctCommonGetDisplayfileName(text.c_str(), name, bufferSize);
	checkBuffer(name, bufferSize);
	check(!strchr(name, '/'));

	std::string encoded;
	check(ctCommontEncodeAddress(text.c_str(), encoded));
	check(encoded.find_first_of(" \n\"?&#") == std::string::npos);
	return 0;
}
