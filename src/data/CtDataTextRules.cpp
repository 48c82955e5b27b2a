#include "CtDataTextRules.h"

#include "ContactsDebug.h"

#include <glib.h>

#include <cstring>
#include <sstream>
#include <string>
#include <vector>

namespace {

constexpr size_t kTextBufferSize = 1024;

std::string boundedText(const char* text)
{
	std::string out = text ? text : "";
	if (out.size() >= kTextBufferSize) {
		size_t len = kTextBufferSize - 1;
		while (len > 0 && (static_cast<unsigned char>(out[len]) & 0xC0) == 0x80)
			--len;
		out.resize(len);
	}
	return out;
}

std::vector<std::string> splitWords(const std::string& text)
{
	std::vector<std::string> words;
	std::istringstream in(text);
	for (std::string word; in >> word;)
		words.push_back(word);
	return words;
}

std::string joinWords(const std::vector<std::string>& words, size_t from, size_t to)
{
	std::string out;
	for (size_t i = from; i < to; ++i)
		out += (out.empty() ? "" : " ") + words[i];
	return out;
}

const char* textOf(contacts_record_h record, unsigned int property)
{
	char* value = nullptr;
	if (!record || contacts_record_get_str_p(record, property, &value) != CONTACTS_ERROR_NONE)
		return nullptr;
	return value;
}

bool isEmpty(const char* text)
{
	return !text || !*text;
}

} // namespace

namespace CtDataTextRules {

int separateFullName(contacts_record_h nameRecord, const char* fullName)
{
	WPRET_VM(!nameRecord || !fullName, -1, "Invalid param : nameRecord or fullName");
	WPRET_VM(!g_utf8_validate(fullName, -1, nullptr), CONTACTS_ERROR_INVALID_PARAMETER, "name is not UTF-8");
	std::string text = boundedText(fullName);
	size_t comma = text.find(',');
	const char* suffix = nullptr;
	std::string suffixText;
	if (comma != std::string::npos) {
		suffixText = text.substr(comma + 1);
		suffixText.erase(0, suffixText.find_first_not_of(" \t"));
		suffix = suffixText.c_str();
		text.erase(comma);
	}
	std::vector<std::string> words = splitWords(text);
	std::string first, middle, last;
	if (words.size() == 1) {
		first = words[0];
	} else if (words.size() == 2) {
		first = words[0];
		last = words[1];
	} else if (words.size() >= 3) {
		last = words.back();
		middle = words[words.size() - 2];
		first = joinWords(words, 0, words.size() - 2);
	}
	auto orNull = [](const std::string& s) { return s.empty() ? nullptr : s.c_str(); };
	int err = contacts_record_set_str(nameRecord, _contacts_name.prefix, nullptr);
	err = err ? err : contacts_record_set_str(nameRecord, _contacts_name.first, orNull(first));
	err = err ? err : contacts_record_set_str(nameRecord, _contacts_name.addition, orNull(middle));
	err = err ? err : contacts_record_set_str(nameRecord, _contacts_name.last, orNull(last));
	err = err ? err : contacts_record_set_str(nameRecord, _contacts_name.suffix, suffix && *suffix ? suffix : nullptr);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_set_str", err);
	return err;
}

int separatePhoneticFullName(contacts_record_h nameRecord, const char* fullName)
{
	WPRET_VM(!nameRecord, -1, "Invalid param : nameRecord");
	WPRET_VM(fullName && !g_utf8_validate(fullName, -1, nullptr), CONTACTS_ERROR_INVALID_PARAMETER,
		"name is not UTF-8");
	std::string first, middle, last;
	if (fullName) {
		std::string text = boundedText(fullName);
		size_t start = text.find_first_not_of(' ');
		size_t end = start == std::string::npos ? start : text.find(' ', start);
		first = start == std::string::npos ? "" : text.substr(start, end - start);
		size_t secondStart = end == std::string::npos ? end : text.find_first_not_of(' ', end);
		if (secondStart != std::string::npos) {
			size_t secondEnd = text.find(' ', secondStart);
			std::string second = text.substr(secondStart, secondEnd - secondStart);
			size_t restStart = secondEnd == std::string::npos ? secondEnd : text.find_first_not_of(' ', secondEnd);
			if (restStart == std::string::npos) {
				last = second;
			} else {
				middle = second;
				last = text.substr(restStart);
			}
		}
	}
	auto orNull = [](const std::string& s) { return s.empty() ? nullptr : s.c_str(); };
	int err = contacts_record_set_str(nameRecord, _contacts_name.phonetic_first, orNull(first));
	err = err ? err : contacts_record_set_str(nameRecord, _contacts_name.phonetic_middle, orNull(middle));
	err = err ? err : contacts_record_set_str(nameRecord, _contacts_name.phonetic_last, orNull(last));
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_set_str", err);
	return err;
}

int setAddressText(contacts_record_h record, const char* address)
{
	WPRET_VM(!record, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param : record");
	int err = contacts_record_set_str(record, _contacts_address.region, address);
	for (unsigned int part : {_contacts_address.postbox, _contacts_address.postal_code, _contacts_address.locality,
			 _contacts_address.street, _contacts_address.country, _contacts_address.extended})
		if (err == CONTACTS_ERROR_NONE)
			err = contacts_record_set_str(record, part, nullptr);
	if (err != CONTACTS_ERROR_NONE)
		WFAILED("contacts_record_set_str", err);
	return err;
}

int getAddressText(contacts_record_h record, char* buffer, unsigned int size)
{
	WPRET_VM(!record || !buffer || size == 0, CONTACTS_ERROR_INVALID_PARAMETER, "Invalid param");
	std::string text;
	for (unsigned int part : {_contacts_address.postbox, _contacts_address.postal_code, _contacts_address.region,
			 _contacts_address.locality, _contacts_address.street, _contacts_address.country,
			 _contacts_address.extended}) {
		const char* value = textOf(record, part);
		if (isEmpty(value))
			continue;
		text = boundedText((text.empty() ? std::string() : text + "\n").append(value).c_str());
	}
	size_t len = text.size() < size ? text.size() : size - 1;
	while (len > 0 && len < text.size() && (static_cast<unsigned char>(text[len]) & 0xC0) == 0x80)
		--len;
	memcpy(buffer, text.data(), len);
	buffer[len] = '\0';
	return CONTACTS_ERROR_NONE;
}

} // namespace CtDataTextRules
