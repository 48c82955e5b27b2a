#include "CtCommonTextUtil.h"

#include "AppControlRouter.h"
#include "DataDir.h"
#include "../../data/detail/DetailTestStore.h"

#include <glib.h>

#include <cerrno>
#include <cstdlib>
#include <fstream>
#include <tuple>
#include <sys/stat.h>

namespace {

// What a helper that fills a caller's buffer of `size` bytes leaves in it.
template <typename Fill>
std::string filled(Fill fill, const char* input, int size = 1024)
{
	char out[1024];
	fill(input, out, size);
	return out;
}

std::string displayName(const char* path, int size = 1024)
{
	return filled(ctCommonGetDisplayfileName, path, size);
}

std::string readFile(const std::string& path)
{
	std::ifstream in(path, std::ios::binary);
	return std::string((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
}

} // namespace

TEST(CtCommonTextUtil, CleaningKeepsOnlyDialableCharactersAndNeverOverflows)
{
	const std::pair<const char*, const char*> cases[] = {{"+1 (201) 555-0123", "+12015550123"},
		{"*31#010,1;2", "*31#010,1;2"}, {"call me", ""}, {nullptr, ""},
		{"\xD9\xA1\xD9\xA2\xD9\xA3", "123"}, // Arabic-Indic digits dial as ASCII
		{"12\xFF" "34", "12"}, {"\xff\xfe", ""}}; // only the valid UTF-8 prefix is read
	for (const auto& [number, cleaned] : cases)
		EXPECT_EQ(filled(ctCommonCleanNumber, number), cleaned) << (number ? number : "null");
	const std::pair<const char*, const char*> simCases[] = {{"+49 30-1234", "+49301234"},
		{"0049+30+1", "0049301"}, {"123p4w5P6W7", "123,4;5,6;7"}, {"(555) abc", "555"}};
	for (const auto& [number, cleaned] : simCases)
		EXPECT_EQ(filled(ctCommonCleanNumberForSim, number), cleaned) << number;

	std::string huge(5000, '7');
	char out[16];
	memset(out, 'x', sizeof(out));
	EXPECT_EQ(ctCommonCleanNumber(huge.c_str(), out, sizeof(out)), 15);
	EXPECT_EQ(std::string(out), std::string(15, '7'));
	EXPECT_EQ(ctCommonCleanNumberForSim(huge.c_str(), out, sizeof(out)), 15);
	EXPECT_EQ(ctCommonCleanNumber("123", out, 1), 0);
	EXPECT_STREQ(out, "");
	EXPECT_EQ(ctCommonCleanNumber("123", nullptr, 10), 0);
	EXPECT_EQ(filled(ctCommonCleanNumber, huge.c_str()).size(), 1023u);
}

TEST(CtCommonTextUtil, MarkupBecomesValidPlainText)
{
	char* text = ctCommonMarkupToUtf8("Tom &amp; Jerry<br/>Caf\xC3\xA9");
	ASSERT_NE(text, nullptr);
	EXPECT_STREQ(text, "Tom & Jerry\nCaf\xC3\xA9");
	free(text);

	text = ctCommonMarkupToUtf8("bad\xFF" "byte");
	ASSERT_NE(text, nullptr);
	EXPECT_TRUE(g_utf8_validate(text, -1, nullptr));
	EXPECT_NE(strstr(text, "bad"), nullptr);
	free(text);

	EXPECT_EQ(ctCommonMarkupToUtf8(nullptr), nullptr);
}

TEST(CtCommonTextUtil, Utf8LengthFromLeadByte)
{
	// Continuation and never-valid bytes still advance a walk by one.
	const std::pair<char, int> cases[] = {{'a', 1}, {'\xC3', 2}, {'\xE2', 3}, {'\xF0', 4}, {'\x80', 1},
		{'\xC0', 1}, {'\xFF', 1}};
	for (const auto& [lead, length] : cases)
		EXPECT_EQ(ctCommonCheckUtf8(lead), length) << int(lead);
}

TEST(CtCommonTextUtil, DisplayFileNameDropsFolderAndExtension)
{
	EXPECT_EQ(displayName("/usr/share/sounds/ringtones/Over the horizon.ogg"), "Over the horizon");
	EXPECT_EQ(displayName("tone.v2.mp3"), "tone.v2");
	EXPECT_EQ(displayName("/a.dir/noext"), "noext");
	EXPECT_EQ(displayName("/music/.hidden"), ".hidden");
	EXPECT_EQ(displayName(nullptr), "");
	// Cut at a whole character: "é" does not fit in the last byte.
	EXPECT_EQ(displayName("/x/ab\xC3\xA9.ogg", 4), "ab");
	std::string huge = std::string(1 << 20, 'x') + "\xe2\x82"; // a character cut in half at the end
	std::string shown = displayName(huge.c_str(), 64);
	EXPECT_LT(shown.size(), 64u);
	EXPECT_TRUE(g_utf8_validate(shown.c_str(), -1, nullptr));
}

TEST(CtCommonTextUtil, CopiedImageIsANewFileInTheDataFolder)
{
	ct::test::TempDataDir dir;
	std::string source = dir.file("picked.jpg");
	std::ofstream(source) << "JPEGDATA";

	std::string first, second;
	ASSERT_EQ(ctCommonCopyImage(source.c_str(), first), 0);
	ASSERT_EQ(ctCommonCopyImage(source.c_str(), second), 0);
	EXPECT_NE(first, second);
	EXPECT_EQ(first.rfind(ct::platform::dataDir(), 0), 0u);
	EXPECT_EQ(first.substr(first.size() - 4), ".jpg");
	EXPECT_EQ(readFile(first), "JPEGDATA");

	EXPECT_EQ(ctCommonUnlinkFile(first.c_str()), 0);
	EXPECT_EQ(ctCommonUnlinkFile(first.c_str()), -ENOENT);
	EXPECT_EQ(readFile(second), "JPEGDATA");
}

TEST(CtCommonTextUtil, BadCopiesAndUnlinksFailCleanlyAsDoesAnUnmakeableDataFolder)
{
	ct::test::TempDataDir dir;
	std::string out = "stale";
	EXPECT_LT(ctCommonCopyImage(nullptr, out), 0);
	EXPECT_TRUE(out.empty());
	EXPECT_EQ(ctCommonCopyImage(dir.file("missing.png").c_str(), out), -ENOENT);
	EXPECT_LT(ctCommonCopyImage(dir.path().c_str(), out), 0); // a folder is no picture
	EXPECT_TRUE(out.empty());

	EXPECT_EQ(ctCommonUnlinkFile(nullptr), -EINVAL);
	EXPECT_EQ(ctCommonUnlinkFile(""), -EINVAL);
	EXPECT_EQ(ctCommonUnlinkFile(dir.path().c_str()), -EISDIR);
	struct stat st;
	EXPECT_EQ(stat(dir.path().c_str(), &st), 0);

	// In a fresh data folder, the image folder's place is taken by a regular file.
	ct::test::TempDataDir fresh;
	std::string source = fresh.file("picked.png");
	std::ofstream(source) << "PNG";
	std::ofstream(ct::platform::dataPath("images")) << "x";
	out = "stale";
	EXPECT_LT(ctCommonCopyImage(source.c_str(), out), 0);
	EXPECT_TRUE(out.empty());
}

TEST(CtCommonTextUtil, AddressIsPercentEncodedForAGeoQuery)
{
	const std::pair<const char*, const char*> cases[] = {
		{"1 Main St\nSpringfield & Co \"A\"", "1%20Main%20St%20Springfield%20%26%20Co%20%22A%22"},
		{"12 Main St, <tag>?#", "12%20Main%20St%2C%20%3Ctag%3E%3F%23"}, {"Caf\xC3\xA9", "Caf%C3%A9"},
		{"a-b_c.d~e", "a-b_c.d~e"}};
	std::string encoded;
	for (const auto& [address, expected] : cases) {
		ASSERT_TRUE(ctCommontEncodeAddress(address, encoded));
		EXPECT_EQ(encoded, expected);
	}
	EXPECT_TRUE(ctCommontEncodeAddress("Stra\xdf" "e\xff", encoded)); // invalid UTF-8 stays encoded
	EXPECT_EQ(encoded.find_first_not_of("ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789-._~%+ "),
		std::string::npos);
	EXPECT_FALSE(ctCommontEncodeAddress(nullptr, encoded));
	EXPECT_TRUE(encoded.empty());
}

TEST(CtCommonTextUtil, SimpleResultReachesTheCaller)
{
	ecore_init();
	app_control_h kept = nullptr;
	auto registration = ct::appcontrol::registerAppHandler("test.caller.app", [&](app_control_h request, const auto&) {
		return app_control_clone(&kept, request);
	});
	ct::test::Request launch = ct::test::request(nullptr);
	app_control_set_app_id(launch.get(), "test.caller.app");
	// What the sender saw: the result and the "is_success" extra.
	using Seen = std::pair<int, std::string>;
	auto onReply = [](app_control_h, app_control_h reply, app_control_result_e result, void* data) {
		char* value = nullptr;
		app_control_get_extra_data(reply, "is_success", &value);
		*static_cast<Seen*>(data) = {result, value ? value : ""};
		free(value);
	};
	const std::tuple<const char*, const char*, app_control_result_e> answers[] = {
		{nullptr, nullptr, APP_CONTROL_RESULT_CANCELED}, {"is_success", "1", APP_CONTROL_RESULT_SUCCEEDED}};
	for (const auto& [key, value, result] : answers) {
		Seen seen{-100, ""};
		ASSERT_EQ(app_control_send_launch_request(launch.get(), onReply, &seen), 0);
		EXPECT_EQ(ctCommonSendSimpleAppControlResult(kept, key, value, result), 0);
		EXPECT_TRUE(ct::test::pumpUntil([&] { return seen.first != -100; }, 2.0));
		EXPECT_EQ(seen, Seen(result, value ? value : ""));
		app_control_destroy(kept);
	}
	launch.reset();
	ecore_shutdown();
	EXPECT_EQ(ctCommonSendSimpleAppControlResult(nullptr, nullptr, nullptr, APP_CONTROL_RESULT_FAILED),
		APP_CONTROL_ERROR_INVALID_PARAMETER);
}
