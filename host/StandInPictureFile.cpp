#include "StandInPictureFile.h"

#include "ContactsDebug.h"

#include <Ecore_Evas.h>

#include <algorithm>
#include <filesystem>

namespace ct::demo {

namespace {

constexpr int kMaxSide = 4096;

// A buffer canvas for one job; freed with the object.
struct Canvas {
	explicit Canvas(int w, int h) : ee(ecore_evas_buffer_new(w, h)) {}
	~Canvas()
	{
		if (ee)
			ecore_evas_free(ee);
	}
	Canvas(const Canvas&) = delete;
	Canvas& operator=(const Canvas&) = delete;
	Evas* evas() const { return ecore_evas_get(ee); }

	Ecore_Evas* ee;
};

Evas_Object* loadImage(Evas* evas, const std::string& path, int& w, int& h)
{
	Evas_Object* image = evas_object_image_add(evas);
	evas_object_image_file_set(image, path.c_str(), nullptr);
	evas_object_image_size_get(image, &w, &h);
	if (evas_object_image_load_error_get(image) != EVAS_LOAD_ERROR_NONE || w <= 0 || h <= 0 || w > kMaxSide ||
			h > kMaxSide) {
		evas_object_del(image);
		return nullptr;
	}
	return image;
}

bool savePixels(Evas* evas, const uint32_t* pixels, int w, int h, const std::string& path)
{
	Evas_Object* out = evas_object_image_filled_add(evas);
	evas_object_image_colorspace_set(out, EVAS_COLORSPACE_ARGB8888);
	evas_object_image_alpha_set(out, EINA_TRUE);
	evas_object_image_size_set(out, w, h);
	evas_object_image_data_copy_set(out, const_cast<uint32_t*>(pixels));
	std::error_code ec;
	std::filesystem::create_directories(std::filesystem::path(path).parent_path(), ec);
	bool saved = evas_object_image_save(out, path.c_str(), nullptr, "compress=6");
	evas_object_del(out);
	if (!saved)
		WERROR("cannot write %s", path.c_str());
	return saved;
}

// Mixes one premultiplied ARGB pixel with the tint, keeping its alpha.
uint32_t tintPixel(uint32_t pixel, uint32_t rgb, double strength)
{
	uint32_t a = pixel >> 24;
	auto mix = [&](int shift) {
		double own = (pixel >> shift) & 0xFF;
		double tint = ((rgb >> shift) & 0xFF) * a / 255.0;
		return static_cast<uint32_t>(own + (tint - own) * strength + 0.5) & 0xFF;
	};
	return (a << 24) | (mix(16) << 16) | (mix(8) << 8) | mix(0);
}

} // namespace

std::vector<std::string> StandInPictureFile::listPictures(const std::string& folder)
{
	std::vector<std::string> pictures;
	std::error_code ec;
	for (const auto& entry : std::filesystem::directory_iterator(folder, ec)) {
		std::string extension = entry.path().extension().string();
		std::transform(extension.begin(), extension.end(), extension.begin(), ::tolower);
		if (entry.is_regular_file(ec) && (extension == ".png" || extension == ".jpg" || extension == ".jpeg"))
			pictures.push_back(entry.path().string());
	}
	std::sort(pictures.begin(), pictures.end());
	return pictures;
}

bool StandInPictureFile::isPicture(const std::string& path)
{
	Canvas canvas(1, 1);
	WPRET_VM(!canvas.ee, false, "ecore_evas_buffer_new() failed");
	int w = 0, h = 0;
	Evas_Object* image = loadImage(canvas.evas(), path, w, h);
	if (image)
		evas_object_del(image);
	return image != nullptr;
}

bool StandInPictureFile::writeTinted(const std::string& source, uint32_t rgb, double strength, const std::string& target)
{
	Canvas canvas(1, 1);
	WPRET_VM(!canvas.ee, false, "ecore_evas_buffer_new() failed");
	int w = 0, h = 0;
	Evas_Object* image = loadImage(canvas.evas(), source, w, h);
	WPRET_VM(!image, false, "not a picture: %s", source.c_str());
	auto* data = static_cast<const uint32_t*>(evas_object_image_data_get(image, EINA_FALSE));
	int stride = evas_object_image_stride_get(image) / 4;
	std::vector<uint32_t> pixels(static_cast<size_t>(w) * h);
	for (int y = 0; data && y < h; ++y)
		for (int x = 0; x < w; ++x)
			pixels[y * w + x] = tintPixel(data[y * stride + x], rgb, std::clamp(strength, 0.0, 1.0));
	if (data)
		evas_object_image_data_set(image, const_cast<uint32_t*>(data));
	evas_object_del(image);
	return data && savePixels(canvas.evas(), pixels.data(), w, h, target);
}

bool StandInPictureFile::writeSquareCrop(const std::string& source, int size, const std::string& target)
{
	WPRET_VM(size <= 0 || size > kMaxSide, false, "crop size %d", size);
	Canvas canvas(size, size);
	WPRET_VM(!canvas.ee, false, "ecore_evas_buffer_new() failed");
	int w = 0, h = 0;
	Evas_Object* image = loadImage(canvas.evas(), source, w, h);
	WPRET_VM(!image, false, "not a picture: %s", source.c_str());
	double scale = double(size) / std::min(w, h);
	int scaledW = static_cast<int>(w * scale + 0.5), scaledH = static_cast<int>(h * scale + 0.5);
	evas_object_image_filled_set(image, EINA_TRUE);
	evas_object_move(image, (size - scaledW) / 2, (size - scaledH) / 2);
	evas_object_resize(image, scaledW, scaledH);
	evas_object_show(image);
	ecore_evas_manual_render(canvas.ee);
	auto* rendered = static_cast<const uint32_t*>(ecore_evas_buffer_pixels_get(canvas.ee));
	std::vector<uint32_t> pixels;
	if (rendered)
		pixels.assign(rendered, rendered + static_cast<size_t>(size) * size);
	evas_object_del(image);
	return rendered && savePixels(canvas.evas(), pixels.data(), size, size, target);
}

} // namespace ct::demo
