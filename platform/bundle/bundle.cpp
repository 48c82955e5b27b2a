#include "bundle.h"

#include "ContactsDebug.h"

#include <glib.h>

#include <cstdint>
#include <cstring>
#include <map>
#include <new>
#include <string>
#include <vector>

struct keyval_t {
	int type = BUNDLE_TYPE_STR;
	std::vector<std::string> values;
	// Views handed out by the borrowing getters; rebuilt with the values.
	std::vector<const char*> pointers;
	std::vector<size_t> sizes;

	void setValues(std::vector<std::string> list)
	{
		values = std::move(list);
		pointers.clear();
		sizes.clear();
		for (const auto& value : values) {
			pointers.push_back(value.c_str());
			sizes.push_back(value.size() + 1);
		}
	}
};

struct _bundle_t {
	std::map<std::string, keyval_t> entries;
};

namespace {

bool isValidKey(const char* key)
{
	return key && key[0] != '\0';
}

int addEntry(bundle* b, const char* key, int type, std::vector<std::string> values)
{
	WPRET_VM(!b || !isValidKey(key), BUNDLE_ERROR_INVALID_PARAMETER, "invalid bundle or key");
	if (b->entries.count(key))
		return BUNDLE_ERROR_KEY_EXISTS;
	keyval_t entry;
	entry.type = type;
	entry.setValues(std::move(values));
	b->entries.emplace(key, std::move(entry));
	return BUNDLE_ERROR_NONE;
}

keyval_t* findEntry(bundle* b, const char* key, int* result)
{
	if (!b || !isValidKey(key)) {
		*result = BUNDLE_ERROR_INVALID_PARAMETER;
		return nullptr;
	}
	auto it = b->entries.find(key);
	if (it == b->entries.end()) {
		*result = BUNDLE_ERROR_KEY_NOT_AVAILABLE;
		return nullptr;
	}
	*result = BUNDLE_ERROR_NONE;
	return &it->second;
}

// Encoded layout before base64: per entry, type (u32), key, value count (u32),
// values; every text is a u32 length followed by its bytes.
void appendU32(std::string& out, uint32_t value)
{
	for (int i = 0; i < 4; ++i)
		out.push_back(static_cast<char>((value >> (8 * i)) & 0xff));
}

void appendText(std::string& out, const std::string& text)
{
	appendU32(out, static_cast<uint32_t>(text.size()));
	out.append(text);
}

class Reader {
public:
	Reader(const unsigned char* data, size_t size) : m_data(data), m_size(size) {}

	bool atEnd() const { return m_pos == m_size; }

	bool readU32(uint32_t& value)
	{
		if (m_size - m_pos < 4)
			return false;
		value = 0;
		for (int i = 0; i < 4; ++i)
			value |= static_cast<uint32_t>(m_data[m_pos + i]) << (8 * i);
		m_pos += 4;
		return true;
	}

	bool readText(std::string& text)
	{
		uint32_t length = 0;
		if (!readU32(length) || m_size - m_pos < length)
			return false;
		text.assign(reinterpret_cast<const char*>(m_data + m_pos), length);
		m_pos += length;
		return true;
	}

private:
	const unsigned char* m_data;
	size_t m_size;
	size_t m_pos = 0;
};

// g_base64_decode skips characters outside the alphabet; refuse them instead.
bool isBase64(const std::string& text)
{
	if (text.size() % 4 != 0)
		return false;
	size_t padding = text.find('=');
	if (padding != std::string::npos && padding + 2 < text.size())
		return false;
	for (size_t i = 0; i < text.size(); ++i) {
		char c = text[i];
		bool inAlphabet = g_ascii_isalnum(c) || c == '+' || c == '/';
		if (!inAlphabet && !(c == '=' && i >= padding))
			return false;
	}
	return true;
}

bool decodeEntry(Reader& reader, bundle* b)
{
	uint32_t type = 0, count = 0;
	std::string key;
	if (!reader.readU32(type) || !reader.readText(key) || !reader.readU32(count))
		return false;
	if (type != BUNDLE_TYPE_STR && type != BUNDLE_TYPE_STR_ARRAY)
		return false;
	if (type == BUNDLE_TYPE_STR && count != 1)
		return false;
	std::vector<std::string> values;
	for (uint32_t i = 0; i < count; ++i) {
		std::string value;
		if (!reader.readText(value))
			return false;
		values.push_back(std::move(value));
	}
	return addEntry(b, key.c_str(), static_cast<int>(type), std::move(values)) == BUNDLE_ERROR_NONE;
}

} // namespace

extern "C" {

bundle* bundle_create(void)
{
	return new (std::nothrow) _bundle_t;
}

int bundle_free(bundle* b)
{
	WPRET_VM(!b, BUNDLE_ERROR_INVALID_PARAMETER, "bundle is null");
	delete b;
	return BUNDLE_ERROR_NONE;
}

int bundle_add_str(bundle* b, const char* key, const char* str)
{
	WPRET_VM(!str, BUNDLE_ERROR_INVALID_PARAMETER, "value is null");
	return addEntry(b, key, BUNDLE_TYPE_STR, {str});
}

int bundle_get_str(bundle* b, const char* key, char** str)
{
	WPRET_VM(!str, BUNDLE_ERROR_INVALID_PARAMETER, "out pointer is null");
	*str = nullptr;
	int result = BUNDLE_ERROR_NONE;
	keyval_t* entry = findEntry(b, key, &result);
	if (!entry)
		return result;
	if (entry->type != BUNDLE_TYPE_STR)
		return BUNDLE_ERROR_INVALID_PARAMETER;
	*str = const_cast<char*>(entry->pointers[0]);
	return result;
}

int bundle_add_str_array(bundle* b, const char* key, const char** str_array, const int len)
{
	WPRET_VM(len < 0 || (len > 0 && !str_array), BUNDLE_ERROR_INVALID_PARAMETER,
		"invalid array (len %d)", len);
	std::vector<std::string> values;
	values.reserve(len);
	for (int i = 0; i < len; ++i)
		values.emplace_back(str_array[i] ? str_array[i] : "");
	return addEntry(b, key, BUNDLE_TYPE_STR_ARRAY, std::move(values));
}

const char** bundle_get_str_array(bundle* b, const char* key, int* len)
{
	if (len)
		*len = 0;
	int result = BUNDLE_ERROR_NONE;
	keyval_t* entry = findEntry(b, key, &result);
	if (!entry)
		return nullptr;
	if (entry->type != BUNDLE_TYPE_STR_ARRAY)
		return nullptr;
	if (len)
		*len = static_cast<int>(entry->values.size());
	return entry->pointers.empty() ? nullptr : entry->pointers.data();
}

int bundle_del(bundle* b, const char* key)
{
	int result = BUNDLE_ERROR_NONE;
	if (!findEntry(b, key, &result))
		return result;
	b->entries.erase(key);
	return BUNDLE_ERROR_NONE;
}

int bundle_get_count(bundle* b)
{
	return b ? static_cast<int>(b->entries.size()) : 0;
}

int bundle_get_type(bundle* b, const char* key)
{
	int result = BUNDLE_ERROR_NONE;
	keyval_t* entry = findEntry(b, key, &result);
	return entry ? entry->type : BUNDLE_TYPE_NONE;
}

bundle* bundle_dup(bundle* b_from)
{
	WPRET_VM(!b_from, nullptr, "bundle is null");
	bundle* copy = new (std::nothrow) _bundle_t;
	if (!copy)
		return nullptr;
	for (const auto& [key, entry] : b_from->entries)
		addEntry(copy, key.c_str(), entry.type, entry.values);
	return copy;
}

void bundle_foreach(bundle* b, bundle_iterator_t iter, void* user_data)
{
	WPRET_M(!b || !iter, "invalid bundle or iterator");
	// A snapshot of the keys lets the iterator delete entries safely.
	std::vector<std::string> keys;
	for (const auto& entry : b->entries)
		keys.push_back(entry.first);
	for (const auto& key : keys) {
		auto it = b->entries.find(key);
		if (it != b->entries.end())
			iter(key.c_str(), it->second.type, &it->second, user_data);
	}
}

int bundle_keyval_get_type(bundle_keyval_t* kv)
{
	return kv ? kv->type : BUNDLE_TYPE_NONE;
}

int bundle_keyval_get_basic_val(bundle_keyval_t* kv, void** val, size_t* size)
{
	WPRET_VM(!kv || !val || kv->type != BUNDLE_TYPE_STR, BUNDLE_ERROR_INVALID_PARAMETER,
		"invalid key-value");
	*val = const_cast<char*>(kv->pointers[0]);
	if (size)
		*size = kv->sizes[0];
	return BUNDLE_ERROR_NONE;
}

int bundle_keyval_get_array_val(bundle_keyval_t* kv, void*** array_val,
	unsigned int* array_len, size_t** array_element_size)
{
	WPRET_VM(!kv || !array_val || kv->type != BUNDLE_TYPE_STR_ARRAY,
		BUNDLE_ERROR_INVALID_PARAMETER, "invalid key-value");
	*array_val = reinterpret_cast<void**>(const_cast<char**>(kv->pointers.data()));
	if (array_len)
		*array_len = static_cast<unsigned int>(kv->values.size());
	if (array_element_size)
		*array_element_size = kv->sizes.data();
	return BUNDLE_ERROR_NONE;
}

int bundle_encode(bundle* b, bundle_raw** r, int* len)
{
	WPRET_VM(!b || !r || !len, BUNDLE_ERROR_INVALID_PARAMETER, "invalid argument");
	std::string raw;
	for (const auto& [key, entry] : b->entries) {
		appendU32(raw, static_cast<uint32_t>(entry.type));
		appendText(raw, key);
		appendU32(raw, static_cast<uint32_t>(entry.values.size()));
		for (const auto& value : entry.values)
			appendText(raw, value);
	}
	gchar* text = g_base64_encode(reinterpret_cast<const guchar*>(raw.data()), raw.size());
	*len = static_cast<int>(strlen(text));
	// Handed out as malloc memory so that plain free() works too.
	*r = reinterpret_cast<bundle_raw*>(strdup(text));
	g_free(text);
	return (*r ? BUNDLE_ERROR_NONE : BUNDLE_ERROR_OUT_OF_MEMORY);
}

int bundle_free_encoded_rawdata(bundle_raw** r)
{
	WPRET_VM(!r, BUNDLE_ERROR_INVALID_PARAMETER, "null pointer");
	free(*r);
	*r = nullptr;
	return BUNDLE_ERROR_NONE;
}

bundle* bundle_decode(const bundle_raw* r, const int len)
{
	WPRET_VM(!r || len < 0, nullptr, "invalid data");
	std::string text(reinterpret_cast<const char*>(r), len);
	WPRET_VM(!isBase64(text), nullptr, "bundle data is not base64 (%d bytes)", len);
	gsize size = 0;
	guchar* raw = g_base64_decode(text.c_str(), &size);
	bundle* b = new _bundle_t;
	Reader reader(raw, size);
	bool ok = true;
	while (ok && !reader.atEnd())
		ok = decodeEntry(reader, b);
	g_free(raw);
	if (!ok) {
		WERROR("malformed bundle data (%d bytes)", len);
		delete b;
		return nullptr;
	}
	return b;
}

} // extern "C"
