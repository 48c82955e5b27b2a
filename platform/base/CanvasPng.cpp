#include "CanvasPng.h"

#include "ContactsDebug.h"

#include <Ecore_Evas.h>

namespace ct::platform {

bool saveCanvasPng(Evas_Object* obj, const std::string& path)
{
	WPRET_VM(!obj || path.empty(), false, "Invalid param : obj or path");
	Ecore_Evas* ee = ecore_evas_ecore_evas_get(evas_object_evas_get(obj));
	WPRET_VM(!ee, false, "no ecore_evas behind the canvas");
	int w = 0, h = 0;
	ecore_evas_geometry_get(ee, nullptr, nullptr, &w, &h);
	// Reading the buffer renders what is pending first.
	const void* pixels = ecore_evas_buffer_pixels_get(ee);
	WPRET_VM(!pixels || w <= 0 || h <= 0, false, "the canvas has no pixels (not a buffer engine?)");

	// The copy lives on a canvas of its own, so the shown one is not touched.
	Ecore_Evas* out = ecore_evas_buffer_new(w, h);
	WPRET_VM(!out, false, "ecore_evas_buffer_new() failed");
	Evas_Object* image = evas_object_image_filled_add(ecore_evas_get(out));
	evas_object_image_colorspace_set(image, EVAS_COLORSPACE_ARGB8888);
	evas_object_image_alpha_set(image, EINA_FALSE);
	evas_object_image_size_set(image, w, h);
	evas_object_image_data_copy_set(image, const_cast<void*>(pixels));
	bool saved = evas_object_image_save(image, path.c_str(), nullptr, "compress=6");
	ecore_evas_free(out);
	if (!saved)
		WERROR("cannot write %s", path.c_str());
	return saved;
}

} // namespace ct::platform
