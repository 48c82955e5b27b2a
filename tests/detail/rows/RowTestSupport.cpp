#include "RowTestSupport.h"

#include <Edje.h>

namespace ct::test {

std::string RowTest::picture(const char* name, int w, int h, unsigned int top, unsigned int bottom)
{
	std::string path = m_dir.path() + "/" + name;
	Evas_Object* image = evas_object_image_filled_add(evas_object_evas_get(m_screen->win()));
	evas_object_image_colorspace_set(image, EVAS_COLORSPACE_ARGB8888);
	evas_object_image_size_set(image, w, h);
	auto* pixels = static_cast<unsigned int*>(evas_object_image_data_get(image, EINA_TRUE));
	for (int y = 0; y < h; ++y)
		for (int x = 0; x < w; ++x)
			pixels[y * w + x] = y < h / 2 ? top : bottom;
	evas_object_image_data_set(image, pixels);
	EXPECT_TRUE(evas_object_image_save(image, path.c_str(), nullptr, nullptr));
	evas_object_del(image);
	return path;
}

std::vector<usagelog::Record> usageRecords(const std::string& feature)
{
	std::vector<usagelog::Record> out;
	for (const usagelog::Record& record : usagelog::records())
		if (record.feature == feature)
			out.push_back(record);
	return out;
}

void RowTest::SetUp()
{
	ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
	m_screen = std::make_unique<ScreenHarness>();
	m_view = new RowHostView();
	ASSERT_TRUE(m_screen->push(m_view));
	m_launches = new LaunchRecorder();
}

void RowTest::TearDown()
{
	delete m_launches;
	m_screen.reset();
	m_data.clear();
	contacts_disconnect();
}

Elm_Object_Item* RowTest::show(CtDetailViewGenlistItem* row)
{
	Elm_Object_Item* item = m_view->append(row);
	m_screen->pumpUntilIdle();
	return item;
}

void RowTest::tapIcon(Evas_Object* layout, const char* touchPart, const char* signal)
{
	ASSERT_NE(nullptr, layout);
	elm_layout_signal_emit(layout, signal, touchPart);
	edje_object_message_signal_process(elm_layout_edje_get(layout));
}

} // namespace ct::test
