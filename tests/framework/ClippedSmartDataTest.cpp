#include "ScreenHarness.h"

#include "WClippedSmartData.h"
#include "WView.h"

#include <gtest/gtest.h>

#include <malloc.h>

#if defined(__SANITIZE_ADDRESS__)
// The sanitizer's count of the bytes its allocator hands out now.
extern "C" size_t __sanitizer_get_current_allocated_bytes();
#endif

using namespace ct::test;

namespace {

constexpr int kLayoutsPerView = 200;

bool sanitized()
{
#if defined(__SANITIZE_ADDRESS__)
	return true;
#else
	return false;
#endif
}

long heapInUse()
{
#if defined(__SANITIZE_ADDRESS__)
	return static_cast<long>(__sanitizer_get_current_allocated_bytes());
#else
	return static_cast<long>(mallinfo2().uordblks);
#endif
}

// A screen of many small layouts, each an edje object with a clipper record.
class ManyLayoutsView : public app_assist::WView {
public:
	const char* getClassName() override { return "ManyLayoutsView"; }

protected:
	Evas_Object* onCreate(Evas_Object* parent, void*) override
	{
		Evas_Object* box = elm_box_add(parent);
		for (int i = 0; i < kLayoutsPerView; ++i) {
			Evas_Object* layout = elm_layout_add(box);
			elm_layout_theme_set(layout, "layout", "application", "default");
			elm_box_pack_end(box, layout);
			evas_object_show(layout);
		}
		return box;
	}
};

// A smart object of a class that keeps its own, larger data where the
// toolkit keeps the clipper record, and frees it itself.
struct OwnData {
	Evas_Object_Smart_Clipped_Data clipped;
	char payload[64];
};

EVAS_SMART_SUBCLASS_NEW("OwnDataSmart", ownDataSmart, Evas_Smart_Class, Evas_Smart_Class,
	evas_object_smart_clipped_class_get, nullptr)

void ownDataAdd(Evas_Object* obj)
{
	evas_object_smart_data_set(obj, calloc(1, sizeof(OwnData)));
	ownDataSmart_parent_sc->add(obj);
}

void ownDataDel(Evas_Object* obj)
{
	auto* data = static_cast<OwnData*>(evas_object_smart_data_get(obj));
	ownDataSmart_parent_sc->del(obj);
	free(data);
}

void ownDataSmart_smart_set_user(Evas_Smart_Class* sc)
{
	sc->add = ownDataAdd;
	sc->del = ownDataDel;
}

void pushAndClose(ScreenHarness& screen, app_assist::WView* view)
{
	ASSERT_TRUE(screen.push(view));
	view->destroy();
	screen.pumpUntilIdle();
}

} // namespace

TEST(ClippedSmartData, ClosedScreensGiveBackTheRecordsOfEveryObjectTheyHeld)
{
	if (!app_assist::WClippedSmartData::isNeeded())
		GTEST_SKIP() << "this toolkit frees the records itself";
	ScreenHarness screen;
	for (int i = 0; i < 12; ++i)
		pushAndClose(screen, new ManyLayoutsView());
	const int views = 10;
	long before = heapInUse();
	for (int i = 0; i < views; ++i)
		pushAndClose(screen, new ManyLayoutsView());
	long perLayout = (heapInUse() - before) / (views * kLayoutsPerView);
	// A forgotten record holds a 32-byte block (16 asked for) per layout; the
	// rest of a layout's growth, measured, is under 20 bytes (10 counted by
	// the sanitizer, which counts what was asked for).
	EXPECT_LT(perLayout, sanitized() ? 16 : 26);
}

TEST(ClippedSmartData, ObjectsThatOwnTheirSmartDataAreLeftToFreeIt)
{
	ScreenHarness screen;
	Evas_Object* box = elm_box_add(screen.win());
	for (int i = 0; i < 20; ++i)
		elm_box_pack_end(box, evas_object_smart_add(evas_object_evas_get(box), ownDataSmart_smart_class_new()));
	app_assist::WClippedSmartData::reclaimOnDelete(box);
	evas_object_del(box);
	// A second free of the class's data aborts the program here.
	EXPECT_TRUE(screen.pumpUntilIdle());
}
