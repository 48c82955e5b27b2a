#include "DemoPictures.h"

#include "ContactsDebug.h"
#include "DataDir.h"

#include <Ecore_Evas.h>

#include <cstdint>
#include <filesystem>

namespace ct::demo {

namespace {

constexpr int kSize = 240;

struct Palette {
	uint32_t background;
	uint32_t clothes;
	uint32_t skin;
};

const Palette kPalettes[DemoPictures::kCount] = {
	{0xFF7FB3D5, 0xFF1F618D, 0xFFF5CBA7}, {0xFFF1948A, 0xFF922B21, 0xFFE0AC69},
	{0xFF82E0AA, 0xFF1E8449, 0xFFC68642}, {0xFFF7DC6F, 0xFF9A7D0A, 0xFFFFDBAC},
	{0xFFBB8FCE, 0xFF6C3483, 0xFF8D5524}, {0xFF76D7C4, 0xFF117864, 0xFFF1C27D},
	{0xFFF0B27A, 0xFFA04000, 0xFFFFE0BD}, {0xFFAEB6BF, 0xFF34495E, 0xFFD2A679},
};

bool inEllipse(int x, int y, int cx, int cy, int rx, int ry)
{
	double dx = double(x - cx) / rx, dy = double(y - cy) / ry;
	return dx * dx + dy * dy <= 1.0;
}

// A head and shoulders on a coloured disc, transparent around it like the
// default pictures.
std::vector<uint32_t> drawPortrait(const Palette& palette)
{
	std::vector<uint32_t> pixels(kSize * kSize);
	for (int y = 0; y < kSize; ++y) {
		for (int x = 0; x < kSize; ++x) {
			uint32_t colour = palette.background;
			if (!inEllipse(x, y, kSize / 2, kSize / 2, kSize / 2, kSize / 2))
				colour = 0;
			else if (inEllipse(x, y, kSize / 2, kSize, kSize * 4 / 10, kSize * 3 / 10))
				colour = palette.clothes;
			else if (inEllipse(x, y, kSize / 2, kSize * 4 / 10, kSize / 5, kSize / 4))
				colour = palette.skin;
			pixels[y * kSize + x] = colour;
		}
	}
	return pixels;
}

bool savePixels(const std::vector<uint32_t>& pixels, const std::string& path)
{
	Ecore_Evas* ee = ecore_evas_buffer_new(kSize, kSize);
	WPRET_VM(!ee, false, "ecore_evas_buffer_new() failed");
	Evas_Object* image = evas_object_image_filled_add(ecore_evas_get(ee));
	evas_object_image_colorspace_set(image, EVAS_COLORSPACE_ARGB8888);
	evas_object_image_alpha_set(image, EINA_TRUE);
	evas_object_image_size_set(image, kSize, kSize);
	evas_object_image_data_copy_set(image, const_cast<uint32_t*>(pixels.data()));
	bool saved = evas_object_image_save(image, path.c_str(), nullptr, "compress=6");
	ecore_evas_free(ee);
	return saved;
}

} // namespace

std::vector<std::string> DemoPictures::ensure()
{
	std::string dir = ct::platform::dataPath("demo-pictures");
	std::vector<std::string> paths(kCount);
	if (dir.empty() || ct::platform::makeDirectories(dir) != 0) {
		WERROR("cannot create %s", dir.c_str());
		return paths;
	}
	for (int i = 0; i < kCount; ++i) {
		std::string path = dir + "/portrait-" + std::to_string(i + 1) + ".png";
		std::error_code ec;
		bool present = std::filesystem::is_regular_file(path, ec) && std::filesystem::file_size(path, ec) > 0;
		if (present || savePixels(drawPortrait(kPalettes[i]), path))
			paths[i] = path;
		else
			WERROR("cannot write %s", path.c_str());
	}
	return paths;
}

} // namespace ct::demo
