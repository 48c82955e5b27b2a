// The profile's picture area: the invitation without pictures, the places
// and the reorder button with pictures, and taps refused in power saving.
#include "InputRowTestSupport.h"

#include "CtInputViewMultiImageItem.h"
#include "CtMyProfileInputData.h"

using namespace ct::test;

namespace {

class MultiImageRowTest : public InputRowTest {
protected:
	std::string picture(const char* name)
	{
		std::string path = m_dir.path() + "/" + name;
		Evas_Object* image = evas_object_image_filled_add(evas_object_evas_get(m_screen->win()));
		evas_object_image_colorspace_set(image, EVAS_COLORSPACE_ARGB8888);
		evas_object_image_size_set(image, 300, 300);
		auto* pixels = static_cast<unsigned int*>(evas_object_image_data_get(image, EINA_TRUE));
		for (int i = 0; i < 300 * 300; ++i)
			pixels[i] = 0xff3366cc;
		evas_object_image_data_set(image, pixels);
		EXPECT_TRUE(evas_object_image_save(image, path.c_str(), nullptr, nullptr));
		evas_object_del(image);
		return path;
	}
	// A profile with `count` pictures.
	std::shared_ptr<CtData> profile(int count)
	{
		contacts_record_h record = nullptr;
		contacts_record_create(_contacts_my_profile._uri, &record);
		for (int order = 1; order <= count; ++order) {
			contacts_record_h image = addChild(record, _contacts_my_profile.image, _contacts_image._uri);
			contacts_record_set_str(image, _contacts_image.path, picture(("p" + std::to_string(order) + ".png").c_str()).c_str());
			contacts_record_set_int(image, _contacts_image_ex.order, order);
		}
		return std::make_shared<CtMyProfileInputData>(record);
	}
	CtInputViewMultiImageItem* showRow(std::shared_ptr<CtData> data)
	{
		auto* row = new CtInputViewMultiImageItem(data, [this](int order) { m_taps.push_back(order); },
				[this] { ++m_reorders; });
		m_item = show(row);
		return row;
	}
	std::vector<int> m_taps;
	int m_reorders = 0;
	Elm_Object_Item* m_item = nullptr;
};

} // namespace

TEST_F(MultiImageRowTest, WithoutPicturesTheInvitationIsShownAndDisabledInPowerSaving)
{
	for (int saving : {0, 1}) {
		vconf_set_int("db/setting/psmode", saving);
		auto* row = showRow(profile(0));
		EXPECT_EQ(nullptr, content(m_item, "elm.icon.default"));
		Evas_Object* invitation = content(m_item, "elm.icon.add");
		ASSERT_NE(nullptr, invitation);
		Evas_Object* add = elm_object_part_content_get(invitation, "myprofile_add_photo");
		EXPECT_EQ(saving == 1, ScreenHarness::isDisabled(add)) << saving;
		EXPECT_EQ(saving == 0, ScreenHarness::click(add)) << saving;
		elm_object_item_del(row->getElmObjectItem());
	}
	EXPECT_EQ((std::vector<int>{1}), m_taps);
	vconf_set_int("db/setting/psmode", 0);
}

TEST_F(MultiImageRowTest, PicturesFillTheirPlacesAndTapsNameTheirOrder)
{
	vconf_set_int("db/setting/psmode", 0);
	auto* row = showRow(profile(3));
	EXPECT_EQ(3, row->getPictureCount());
	EXPECT_NE(nullptr, content(m_item, "elm.icon.default"));
	EXPECT_EQ(nullptr, content(m_item, "elm.icon.add"));
	for (const char* part : {"elm.icon.1", "elm.icon.2", "elm.icon.3", "elm.icon.4"})
		EXPECT_NE(nullptr, content(m_item, part)) << part << " (the fourth place takes the next picture)";
	EXPECT_EQ(nullptr, content(m_item, "elm.icon.5"));
	ScreenHarness::click(elm_object_part_content_get(content(m_item, "elm.icon.default"), "elm.icon"));
	ScreenHarness::click(elm_object_part_content_get(content(m_item, "elm.icon.3"), "elm.icon"));
	ScreenHarness::click(elm_object_part_content_get(content(m_item, "elm.icon.4"), "elm.icon"));
	ASSERT_TRUE(ScreenHarness::click(content(m_item, "elm.button")));
	EXPECT_EQ((std::vector<int>{1, 3, 4}), m_taps);
	EXPECT_EQ(1, m_reorders);

	vconf_set_int("db/setting/psmode", 1);
	row->tapPicture(2);
	EXPECT_EQ(3u, m_taps.size());
	vconf_set_int("db/setting/psmode", 0);
}
