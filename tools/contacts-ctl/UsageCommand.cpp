// contacts-ctl usage list
#include "CtlCommand.h"
#include "CtlText.h"

#include "UsageLog.h"

#include <cinttypes>
#include <cstdio>

namespace {

using namespace ct::ctl;

const char kName[] = "usage";

int run(const Args& args)
{
	if (args.size() != 1 || args[0] != "list")
		return usageError(kName, "bad usage arguments");
	for (const auto& record : ct::usagelog::records()) {
		printf("%" PRId64 "\t%" PRId64 "\t%s\t%s\t%s\t%s\t%s\n", record.id, record.timeMs,
			record.uri.c_str(), record.appId.c_str(), record.feature.c_str(),
			record.extra.c_str(), record.value.c_str());
	}
	return kExitOk;
}

CtlCommandRegistration registration{{kName,
	"usage list    (id, time in ms, uri, app_id, feature, extra, value; tab-separated)",
	run}};

} // namespace
