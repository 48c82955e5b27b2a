#include "velmora_log_manager.h"

#include "../vconf/StoreTestSupport.h"
#include "SqliteFaultInjector.h"
#include "UsageLog.h"

#include <gtest/gtest.h>

#include <glib.h>

#include <memory>
#include <string>

namespace {

struct BundleDeleter { void operator()(bundle* b) const { bundle_free(b); } };
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

TEST(UsageLog, RecordsAreAppendedInOrderAndAFullDiskLosesNoEarlierRecord)
{
	ct::test::TempDataDir dir;
	int64_t before = g_get_real_time() / 1000;
	int firstId = 0, secondId = 0;
	ASSERT_EQ(0, insertOnce(USAGE_LOG_FEATURE_URI, makeRecord("CT09").get(), &firstId));
	BundlePtr status = makeRecord("CT12", "Profile sharing");
	bundle_add_str(status.get(), "value", "on");
	ASSERT_EQ(0, insertOnce(USAGE_LOG_STATUS_URI, status.get(), &secondId));
	velmora_log_manager_h handle = nullptr;
	ASSERT_EQ(0, velmora_log_manager_create(&handle));
	{
		ct::db::ScopedWriteFailure diskFull(1);
		EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_NO_SPACE,
			velmora_log_manager_insert(handle, USAGE_LOG_FEATURE_URI, makeRecord("CT02").get(), 0, 0, nullptr));
	}
	velmora_log_manager_destroy(handle);

	std::string rows;
	for (const auto& r : ct::usagelog::records()) {
		rows += std::to_string(r.id) + "|" + r.uri + "|" + r.appId + "|" + r.feature + "|" + r.extra + "|" + r.value + "\n";
		EXPECT_GE(r.timeMs, before);
	}
	EXPECT_EQ(std::to_string(firstId) + "|" USAGE_LOG_FEATURE_URI "|org.example.contacts|CT09||\n" + std::to_string(secondId)
		+ "|" USAGE_LOG_STATUS_URI "|org.example.contacts|CT12|Profile sharing|on\n", rows);
}

TEST(UsageLog, IncompleteOrBadRecordsAndAnUnusableFolderAreRefused)
{
	ct::test::TempDataDir dir;
	velmora_log_manager_h handle = nullptr;
	ASSERT_EQ(0, velmora_log_manager_create(&handle));
	auto good = makeRecord("CT09");
	std::string huge(4097, 'x');
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(nullptr, USAGE_LOG_FEATURE_URI, good.get(), 0, 0, nullptr));
	for (const char* uri : {static_cast<const char*>(nullptr), "content://elsewhere"})
		EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(handle, uri, good.get(), 0, 0, nullptr));
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(handle, USAGE_LOG_FEATURE_URI, nullptr, 0, 0, nullptr));
	for (const BundlePtr& bad : {makeRecord(nullptr), makeRecord("CT09", "\xff\xfe"), makeRecord("CT09", huge.c_str())})
		EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_insert(handle, USAGE_LOG_FEATURE_URI, bad.get(), 0, 0, nullptr));
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_create(nullptr));
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_INVALID_PARAMETER, velmora_log_manager_destroy(nullptr));
	velmora_log_manager_destroy(handle);
	EXPECT_TRUE(ct::usagelog::records().empty());

	ct::test::UnusableDataDir unusable(dir);
	handle = reinterpret_cast<velmora_log_manager_h>(0x1);
	EXPECT_EQ(VELMORA_LOG_MANAGER_ERROR_PERMISSION_DENIED, velmora_log_manager_create(&handle));
	EXPECT_EQ(nullptr, handle);
}
