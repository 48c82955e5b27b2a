// Argument parsing and output helpers shared by the contacts-ctl commands.
#pragma once

#include <string>

namespace ct::ctl {

// Whole-text decimal int; false for anything else (also overflow).
bool parseInt(const std::string& text, int* value);
// Whole-text number.
bool parseDouble(const std::string& text, double* value);
// true/false, 1/0, on/off, yes/no.
bool parseBool(const std::string& text, bool* value);

// A command's usage lines, each prefixed with "contacts-ctl " and indented.
std::string formatUsage(const char* usage);

// "contacts-ctl: <message>" on stderr; returns kExitFailed.
int fail(const std::string& message);
// "contacts-ctl: <message>" and the command's usage on stderr; returns kExitUsage.
int usageError(const char* commandName, const std::string& message);

} // namespace ct::ctl
