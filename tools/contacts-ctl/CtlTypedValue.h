// "set KEY int|bool|double|string VALUE" of the typed key-value commands
// (vconf, pref): the value parsed by its type and handed to one setter.
#pragma once

#include <functional>
#include <string>

namespace ct::ctl {

struct TypedSetters {
	std::function<int(int)> setInt;
	std::function<int(bool)> setBool;
	std::function<int(double)> setDouble;
	std::function<int(const char*)> setString;
};

// Parses `text` as `type` and stores it. Returns the exit code: usage error
// for a value that is not of the type, failure (worded with `what`) when the
// setter returns other than `ok`.
int setTypedValue(const char* commandName, const std::string& what, const std::string& type,
		const std::string& text, const TypedSetters& setters, int ok);

} // namespace ct::ctl
