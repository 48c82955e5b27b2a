// contacts-demo: see DemoApp.h; `contacts-demo --help` lists the options.
#include "ContactsCommon.h"
#include "DemoApp.h"
#include "DemoOptions.h"
#include "DemoResourceDir.h"
#include "ToolkitModules.h"

#include <Elementary.h>

#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace {

bool hasDisplay()
{
	const char* x11 = getenv("DISPLAY");
	const char* wayland = getenv("WAYLAND_DISPLAY");
	return (x11 && *x11) || (wayland && *wayland);
}

// The screens show translation ids under the plain "C" locale, which
// machines without a configured language have: show the English texts.
void useEnglishTextsOnPlainLocale()
{
	const char* messages = setlocale(LC_MESSAGES, nullptr);
	if (messages && (strcmp(messages, "C") == 0 || strncmp(messages, "C.", 2) == 0 || strcmp(messages, "POSIX") == 0))
		setlocale(LC_MESSAGES, "en_US.UTF-8");
}

// The toolkit's own diagnostics are not this program's: keep its critical
// lines, drop its back-traces, and do not start its system modules, which
// look for a system bus (children such as efreetd inherit this).
void quietToolkit()
{
	setenv("EINA_LOG_LEVEL", "0", 0);
	setenv("EINA_LOG_BACKTRACE", "-1", 0);
	setenv("ECORE_NO_SYSTEM_MODULES", "1", 0);
}

// The demo device has the easy sign-up feature, so the profile screen offers
// profile sharing ($CONTACTS_FEATURES set by the caller wins).
void offerProfileSharing()
{
	setenv("CONTACTS_FEATURES", "13", 0);
}

} // namespace

int main(int argc, char** argv)
{
	ct::demo::DemoOptions options;
	std::string error;
	if (!options.parse(argc, argv, error)) {
		fprintf(stderr, "contacts-demo: %s\n%s", error.c_str(), ct::demo::DemoOptions::usage().c_str());
		return 2;
	}
	if (options.help) {
		printf("%s", ct::demo::DemoOptions::usage().c_str());
		return 0;
	}
	if (!ct::demo::DemoResourceDir::resolve(error)) {
		fprintf(stderr, "contacts-demo: %s\n", error.c_str());
		return 1;
	}
	// Pictures are read back from the buffer engine's pixels.
	bool headless = !options.screenshotFile.empty() || !options.screenshotDir.empty() || !hasDisplay();
	if (headless) {
		setenv("ELM_ENGINE", "buffer", 1);
		setenv("ECORE_EVAS_ENGINE", "buffer", 1);
	}
	quietToolkit();
	offerProfileSharing();
	setlocale(LC_ALL, "");
	useEnglishTextsOnPlainLocale();
	elm_init(argc, argv);
	elm_config_scale_set(1.0);
	if (headless)
		elm_config_transition_duration_factor_set(0.0);
	ContactsCommon::bindTextDomain();
	int code;
	{
		ct::demo::DemoApp app(options);
		code = app.run();
	}
	ct::platform::keepToolkitModulesLoaded();
	elm_shutdown();
	return code;
}
