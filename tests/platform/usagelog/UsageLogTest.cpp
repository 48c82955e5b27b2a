#include "velmora_log_manager.h"

#include "SqliteFaultInjector.h"
#include "TempDataDir.h"
#include "UsageLog.h"

#include <gtest/gtest.h>

#include <glib.h>

#include <cstdio>
#include <memory>
#include <string>

namespace {

struct BundleDeleter {
	void operator()(bundle* b) const { bundle_free(b); }
};
using BundlePtr = std::unique_ptr<bundle, BundleDeleter>;

BundlePtr makeRecord(const char* feature, const char* extra = nullptr)
{
	BundlePtr b(bundle_create());
	bundle_add_str(b.get(), "app_id", "org.example.contacts");
	if (feature)
		bundle_add_str(b.get(), "feature", feature);
	if (extra)
		bundle_add_str(b.get(), "extra", extra);
	return b;
}

// Creates a handle, inserts, destroys: the way the screens log.
int insertOnce(const char* uri, bundle* data, int* outId = nullptr)
{
	velmora_log_manager_h handle = nullptr;
	int rc = velmora_log_manager_create(&handle);
	if (rc != VELMORA_LOG_MANAGER_ERROR_NONE)
		return rc;
	rc = velmora_log_manager_insert(handle, uri, data, 0, 0, outId);
	velmora_log_manager_destroy(handle);
	return rc;
}

} // namespace

TEST(UsageLog, RecordsAreAppendedAndKeptInOrder)
{
	ct::test::TempDataDir dir;
	int64_t before = g_get_real_time() / 1000;
	int firstId = 0, secondId = 0;
	ASSERT_EQ(0, insertOnce(USAGE_LOG_FEATURE_URI, makeRecord("CT09").get(), &firstId));
	BundlePtr status = makeRecord("CT12", "Profile sharing");
	bundle_add_str(status.get(), "value", "on");
	ASSERT_EQ(0, insertOnce(USAGE_LOG_STATUS_URI, status.get(), &secondId));
	EXPECT_LT(firstId, secondId);

	auto records = ct::usagelog::records();
	ASSERT_EQ(2u, records.size());
	EXPECT_EQ(firstId, records[0].id);
	EXPECT_EQ(USAGE_LOG_FEATURE_URI, records[0].uri);
	EXPECT_EQ("org.example.contacts", records[0].appId);
	EXPECT_EQ("CT09", records[0].feature);
	EXPECT_EQ("", records[0].extra);
	EXPECT_GE(records[0].timeMs, before);
	EXPECT_EQ(USAGE_LOG_STATUS_URI, records[1].uri);
	EXPECT_EQ("Profile sharing", records[1].extra);
	EXPECT_EQ("on", records[1].value);
}

TEST(UsageLog, IncompleteOrBadRecordsAreRefused)
{
	ct::test::TempDataDir dir;
	velmora_log_manager_h handle = nullptr;
	ASSERT_EQ(0, velmora_log_manager_create(&handle));
	auto good = makeRecord("CT09");
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(nullptr, USAGE_LOG_FEATURE_URI, good.get(), 0, 0, nullptr));
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(handle, nullptr, good.get(), 0, 0, nullptr));
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(handle, "content://elsewhere", good.get(), 0, 0, nullptr));
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(handle, USAGE_LOG_FEATURE_URI, nullptr, 0, 0, nullptr));
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(handle, USAGE_LOG_FEATURE_URI, makeRecord(nullptr).get(), 0, 0, nullptr));
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(handle, USAGE_LOG_FEATURE_URI, makeRecord("CT09", "\xff\xfe").get(), 0, 0, nullptr));
	std::string huge(4097, 'x');
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(handle, USAGE_LOG_FEATURE_URI, makeRecord("CT09", huge.c_str()).get(), 0, 0, nullptr));
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_create(nullptr));
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_destroy(nullptr));
	velmora_log_manager_destroy(handle);
	EXPECT_TRUE(ct::usagelog::records().empty());
}

TEST(UsageLog, FullDiskLosesNoEarlierRecord)
{
	ct::test::TempDataDir dir;
	ASSERT_EQ(0, insertOnce(USAGE_LOG_FEATURE_URI, makeRecord("CT01").get()));
	velmora_log_manager_h handle = nullptr;
	ASSERT_EQ(0, velmora_log_manager_create(&handle));
	{
		ct::db::ScopedWriteFailure diskFull(1);
		EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_NO_SPACE,
			velmora_log_manager_insert(handle, USAGE_LOG_FEATURE_URI, makeRecord("CT02").get(), 0, 0, nullptr));
	}
	velmora_log_manager_destroy(handle);
	auto records = ct::usagelog::records();
	ASSERT_EQ(1u, records.size());
	EXPECT_EQ("CT01", records[0].feature);
}

TEST(UsageLog, UnusableDataFolderFailsToCreate)
{
	ct::test::TempDataDir dir;
	std::string blocker = dir.file("plain-file");
	fclose(fopen(blocker.c_str(), "w"));
	setenv("CONTACTS_DATA_DIR", (blocker + "/sub").c_str(), 1);
	velmora_log_manager_h handle = reinterpret_cast<velmora_log_manager_h>(0x1);
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_PERMISSION_DENIED, velmora_log_manager_create(&handle));
	EXPECT_EQ(nullptr, handle);
	EXPECT_TRUE(ct::usagelog::records().empty());
}
