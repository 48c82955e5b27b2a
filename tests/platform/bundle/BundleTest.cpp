#include "bundle.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <cstring>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace {

struct BundleDeleter { void operator()(bundle* b) const { bundle_free(b); } };
using BundlePtr = std::unique_ptr<bundle, BundleDeleter>;

std::string getStr(bundle* b, const char* key)
{
	char* value = nullptr;
	return bundle_get_str(b, key, &value) == BUNDLE_ERROR_NONE ? value : "<missing>";
}

std::vector<std::string> getArray(bundle* b, const char* key)
{
	int len = -1;
	const char** values = bundle_get_str_array(b, key, &len);
	std::vector<std::string> result;
	for (int i = 0; values && i < len; ++i)
		result.push_back(values[i]);
	return result;
}

BundlePtr makeSample()
{
	BundlePtr b(bundle_create());
	const char* numbers[] = {"+15550100", "", "0102 \xe2\x98\x8e"};
	bundle_add_str(b.get(), "app_id", "org.example.contacts");
	bundle_add_str(b.get(), "extra", "Profile sharing");
	bundle_add_str_array(b.get(), "numbers", numbers, 3);
	return b;
}

} // namespace

TEST(Bundle, StoresStringsAndArraysByKeyAndCopiesIndependently)
{
	BundlePtr b = makeSample();
	EXPECT_EQ(3, bundle_get_count(b.get()));
	EXPECT_EQ("org.example.contacts", getStr(b.get(), "app_id"));
	EXPECT_EQ((std::vector<std::string>{"+15550100", "", "0102 \xe2\x98\x8e"}), getArray(b.get(), "numbers"));
	EXPECT_EQ(BUNDLE_ERROR_KEY_EXISTS, bundle_add_str(b.get(), "app_id", "other"));
	EXPECT_EQ("org.example.contacts", getStr(b.get(), "app_id"));

	char* value = reinterpret_cast<char*>(0x1);
	EXPECT_EQ(BUNDLE_ERROR_KEY_NOT_AVAILABLE, bundle_get_str(b.get(), "missing", &value));
	EXPECT_EQ(nullptr, value);
	EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_get_str(b.get(), "numbers", &value));
	int len = 7;
	EXPECT_EQ(nullptr, bundle_get_str_array(b.get(), "app_id", &len));
	EXPECT_EQ(0, len);
	const char* none[] = {nullptr};
	EXPECT_EQ(BUNDLE_ERROR_NONE, bundle_add_str_array(b.get(), "empty", none, 0));
	EXPECT_TRUE(getArray(b.get(), "empty").empty());

	BundlePtr copy(bundle_dup(b.get()));
	EXPECT_EQ(BUNDLE_ERROR_NONE, bundle_del(b.get(), "numbers"));
	EXPECT_EQ(BUNDLE_ERROR_KEY_NOT_AVAILABLE, bundle_del(b.get(), "numbers"));
	EXPECT_EQ(3, bundle_get_count(b.get()));
	b.reset();
	EXPECT_EQ(4, bundle_get_count(copy.get()));
	EXPECT_EQ("Profile sharing", getStr(copy.get(), "extra"));
	EXPECT_EQ(3u, getArray(copy.get(), "numbers").size());
}

TEST(Bundle, BadArgumentsAreRejected)
{
	BundlePtr b(bundle_create());
	char* value = nullptr;
	for (auto [key, text] : {std::pair<const char*, const char*>{nullptr, "v"}, {"", "v"}, {"k", nullptr}})
		EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_add_str(b.get(), key, text));
	EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_add_str(nullptr, "k", "v"));
	EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_get_str(b.get(), "k", nullptr));
	EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_get_str(nullptr, "k", &value));
	EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_add_str_array(b.get(), "k", nullptr, 2));
	EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_add_str_array(b.get(), "k", nullptr, -1));
	EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_del(nullptr, "k"));
	EXPECT_EQ(BUNDLE_ERROR_INVALID_PARAMETER, bundle_free(nullptr));
	EXPECT_EQ(0, bundle_get_count(nullptr));
	EXPECT_EQ(nullptr, bundle_dup(nullptr));
	EXPECT_EQ(nullptr, bundle_get_str_array(nullptr, "k", nullptr));
	bundle_foreach(nullptr, nullptr, nullptr);
	EXPECT_EQ(0, bundle_get_count(b.get()));
}

TEST(Bundle, ForeachVisitsEveryEntryAndToleratesDeletion)
{
	BundlePtr b = makeSample();
	std::map<std::string, std::string> seen;
	bundle_foreach(b.get(), [](const char* key, const int type, const bundle_keyval_t* kv, void* data) {
		void* value = nullptr;
		size_t size = 0;
		bool basic = bundle_keyval_get_basic_val(const_cast<bundle_keyval_t*>(kv), &value, &size) == BUNDLE_ERROR_NONE;
		(*static_cast<std::map<std::string, std::string>*>(data))[key] =
			basic && size == strlen(static_cast<char*>(value)) + 1 ? static_cast<char*>(value) : "type " + std::to_string(type);
	}, &seen);
	EXPECT_EQ((std::map<std::string, std::string>{{"app_id", "org.example.contacts"}, {"extra", "Profile sharing"},
		{"numbers", "type " + std::to_string(BUNDLE_TYPE_STR_ARRAY)}}), seen);
	bundle_foreach(b.get(), [](const char* key, const int, const bundle_keyval_t*, void* data) {
		bundle_del(static_cast<bundle*>(data), key);
	}, b.get());
	EXPECT_EQ(0, bundle_get_count(b.get()));
}

TEST(Bundle, EncodeDecodeRoundTripsAndRejectsGarbage)
{
	BundlePtr b = makeSample();
	std::string big(100000, 'x');
	bundle_add_str(b.get(), "big", big.c_str());
	bundle_raw* raw = nullptr;
	int len = 0;
	ASSERT_EQ(BUNDLE_ERROR_NONE, bundle_encode(b.get(), &raw, &len));
	ASSERT_EQ(static_cast<size_t>(len), strlen(reinterpret_cast<char*>(raw)));

	BundlePtr decoded(bundle_decode(raw, len));
	EXPECT_EQ(4, bundle_get_count(decoded.get()));
	EXPECT_EQ(big, getStr(decoded.get(), "big"));
	EXPECT_EQ(getArray(b.get(), "numbers"), getArray(decoded.get(), "numbers"));

	// Truncated data, foreign base64 and plain text are refused, never half-read.
	EXPECT_EQ(nullptr, bundle_decode(raw, len / 2));
	const char* junk = "aGVsbG8gd29ybGQ=";
	EXPECT_EQ(nullptr, bundle_decode(reinterpret_cast<const bundle_raw*>(junk), strlen(junk)));
	EXPECT_EQ(nullptr, bundle_decode(reinterpret_cast<const bundle_raw*>("\xff\x01"), 2));
	EXPECT_EQ(nullptr, bundle_decode(nullptr, 3));
	EXPECT_EQ(BUNDLE_ERROR_NONE, bundle_free_encoded_rawdata(&raw));
	EXPECT_EQ(nullptr, raw);

	BundlePtr empty(bundle_create());
	ASSERT_EQ(BUNDLE_ERROR_NONE, bundle_encode(empty.get(), &raw, &len));
	BundlePtr emptyDecoded(bundle_decode(raw, len));
	EXPECT_TRUE(emptyDecoded && bundle_get_count(emptyDecoded.get()) == 0);
	free(raw);
}
