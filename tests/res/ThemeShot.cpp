#include "ThemeShot.h"

#include "ResourcePaths.h"

#include <Ecore_Evas.h>

#include <filesystem>

namespace ct::test::res {

namespace {

const char* const themeFiles[] = {"contacts.edj", "detail_layout.edj", "list.edj"};

Eina_Bool quitLoopCb(void*)
{
	ecore_main_loop_quit();
	return ECORE_CALLBACK_CANCEL;
}

} // namespace

ThemeShot::ThemeShot(int width, int height)
	: m_width(width)
	, m_height(height)
{
	for (const char* file : themeFiles)
		elm_theme_extension_add(nullptr, edjePath(file).c_str());
	m_window = elm_win_add(nullptr, "theme-shot", ELM_WIN_BASIC);
	elm_win_autodel_set(m_window, EINA_FALSE);
	Evas_Object* bg = evas_object_rectangle_add(evas_object_evas_get(m_window));
	evas_object_color_set(bg, 244, 246, 249, 255);
	evas_object_size_hint_weight_set(bg, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	elm_win_resize_object_add(m_window, bg);
	evas_object_show(bg);
	m_box = elm_box_add(m_window);
	evas_object_size_hint_weight_set(m_box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	elm_win_resize_object_add(m_window, m_box);
	evas_object_show(m_box);
	evas_object_resize(m_window, width, height);
	evas_object_show(m_window);
}

ThemeShot::~ThemeShot()
{
	evas_object_del(m_window);
	for (const char* file : themeFiles)
		elm_theme_extension_del(nullptr, edjePath(file).c_str());
}

void ThemeShot::settle()
{
	// Genlist realizes rows from jobs and idlers; a few short loop runs let
	// them finish before the frame is drawn.
	for (int i = 0; i < 6; ++i) {
		ecore_timer_add(0.02, quitLoopCb, nullptr);
		ecore_main_loop_begin();
	}
	Ecore_Evas* ee = ecore_evas_ecore_evas_get(evas_object_evas_get(m_window));
	ecore_evas_manual_render(ee);
}

bool ThemeShot::save(const std::string& path)
{
	Ecore_Evas* ee = ecore_evas_ecore_evas_get(evas_object_evas_get(m_window));
	const void* pixels = ecore_evas_buffer_pixels_get(ee);
	if (!pixels)
		return false;
	std::error_code ec;
	std::filesystem::create_directories(std::filesystem::path(path).parent_path(), ec);
	Ecore_Evas* out = ecore_evas_buffer_new(m_width, m_height);
	Evas_Object* image = evas_object_image_filled_add(ecore_evas_get(out));
	evas_object_image_size_set(image, m_width, m_height);
	evas_object_image_data_copy_set(image, const_cast<void*>(pixels));
	bool saved = evas_object_image_save(image, path.c_str(), nullptr, "compress=9");
	ecore_evas_free(out);
	return saved;
}

} // namespace ct::test::res
