// A headless screen with a fresh store, real picture files and a place for
// screenshots, for the picture and mark-as-default screen tests.
#pragma once

#include "../../data/myprofile/MyProfileTestStore.h"

#include "CtLightTheme.h"
#include "CtView.h"
#include "ScreenHarness.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <memory>
#include <string>

namespace ct::test {

class PictureScreenTest : public ::testing::Test {
protected:
	void SetUp() override
	{
		ASSERT_EQ(CONTACTS_ERROR_NONE, contacts_connect());
		CtView::changeLanguage("en_US.UTF-8");
		// The look of the host application, so that screenshots show what a person sees.
		CtLightTheme::apply();
		m_screen = std::make_unique<ScreenHarness>(360, 640);
	}
	void TearDown() override
	{
		m_screen.reset();
		CtLightTheme::remove();
		contacts_disconnect();
	}

	// A PNG of one colour, `size` pixels square.
	std::string writePicture(const char* name, int r, int g, int b, int size = 320)
	{
		std::string path = m_dir.file(name);
		Evas_Object* image = evas_object_image_filled_add(evas_object_evas_get(m_screen->win()));
		evas_object_image_size_set(image, size, size);
		evas_object_image_alpha_set(image, EINA_FALSE);
		auto* pixels = static_cast<uint32_t*>(evas_object_image_data_get(image, EINA_TRUE));
		for (int i = 0; i < size * size; ++i)
			pixels[i] = 0xff000000u | (r << 16) | (g << 8) | b;
		evas_object_image_data_set(image, pixels);
		evas_object_image_save(image, path.c_str(), nullptr, nullptr);
		evas_object_del(image);
		return path;
	}

	std::string writeText(const char* name)
	{
		std::string path = m_dir.file(name);
		std::ofstream(path) << "not a picture";
		return path;
	}

	static std::string shotPath(const std::string& name)
	{
		const char* bin = getenv("CONTACTS_TEST_BIN_DIR");
		std::string dir = std::string(bin ? bin : "/tmp") + "/test-output/detail";
		std::filesystem::create_directories(dir);
		return dir + "/" + name + ".png";
	}

	TempDataDir m_dir;
	std::unique_ptr<ScreenHarness> m_screen;
};

} // namespace ct::test
