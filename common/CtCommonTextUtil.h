#ifndef _CT_COMMON_TEXT_UTIL_H_
#define _CT_COMMON_TEXT_UTIL_H_

#include <app_control.h>

#include <string>

// Text and file helpers of the contacts common library. Functions that
// write into a caller's buffer always NUL-terminate it (when size > 0) and
// never cut a UTF-8 character in half.

// The dialable part of a typed number: ASCII and other decimal digits (as
// ASCII), '+', '*', '#', pause (',', 'p', 'P') and wait (';', 'w', 'W');
// everything else (blanks, dashes, brackets, letters) is dropped. Returns
// the length written; an empty result for null.
int ctCommonCleanNumber(const char* number, char* out, int outSize);
// The same for a SIM entry, which stores only digits, '*', '#', a leading
// '+', pause as ',' and wait as ';'.
int ctCommonCleanNumberForSim(const char* number, char* out, int outSize);
// Plain UTF-8 text of an entry's markup, as a new string the caller frees
// with free(); invalid UTF-8 becomes U+FFFD. Null for null.
char* ctCommonMarkupToUtf8(const char* markup);
// `text` as entry markup ("<" becomes "&lt;", ...); empty for null or "".
std::string ctCommonUtf8ToMarkup(const char* text);
// Byte length of the UTF-8 character that starts with `leadByte`: 1 to 4;
// 1 for a continuation or invalid byte, so that a walk always advances.
int ctCommonCheckUtf8(char leadByte);
// The name a person sees for a file: its base name without the extension
// ("/a/b/Over the horizon.ogg" -> "Over the horizon"), bytes that are not
// UTF-8 shown as U+FFFD. Empty for null.
void ctCommonGetDisplayfileName(const char* path, char* out, int outSize);
// Copies the picture at `srcPath` to a new file of the data folder (same
// extension) whose path goes to `newPath`. Returns 0, or a negative errno
// with `newPath` empty and no file left behind.
int ctCommonCopyImage(const char* srcPath, std::string& newPath);
// Deletes a regular file. Returns 0 or a negative errno (-EINVAL for a null
// or empty path).
int ctCommonUnlinkFile(const char* path);
// Replies to a launch request with one extra (none when `key` is null) and
// the given result. Returns 0 or a negative app-control error.
int ctCommonSendSimpleAppControlResult(app_control_h request, const char* key, const char* value,
	app_control_result_e result);
// An address made fit for a "geo:" query: line breaks become blanks and
// every character outside the unreserved set is percent-encoded. Returns
// false (and empties `encoded`) for a null text.
bool ctCommontEncodeAddress(const char* address, std::string& encoded);

#endif
