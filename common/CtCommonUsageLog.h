#ifndef _CT_COMMON_USAGE_LOG_H_
#define _CT_COMMON_USAGE_LOG_H_

// Records the use of a feature of the contacts application: "feature" code
// and, when not null, "extra". The result is ignored, as nothing a screen
// does depends on it.
void ctCommonInsertUsageLog(const char* feature, const char* extra);
// The same with a "value" instead of an "extra" (state records such as a
// switch turned on or off).
void ctCommonInsertUsageLogValue(const char* feature, const char* value);

#endif
