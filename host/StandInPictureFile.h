// Picture files the stand-in applications make: a tinted copy (the preset
// styles of the image editor) and a centred square crop (the image viewer's
// caller-id crop). Both read any picture the toolkit loads and write PNG.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace ct::demo {

class StandInPictureFile {
public:
	// The pictures (png, jpg, jpeg) of `folder`, sorted by name.
	static std::vector<std::string> listPictures(const std::string& folder);
	// Whether `path` is a picture the toolkit can load.
	static bool isPicture(const std::string& path);
	// Writes `source` mixed with `rgb` (0xRRGGBB) by `strength` (0..1) to `target`.
	static bool writeTinted(const std::string& source, uint32_t rgb, double strength, const std::string& target);
	// Writes the centred square of `source`, scaled to `size` x `size`, to `target`.
	static bool writeSquareCrop(const std::string& source, int size, const std::string& target);
};

} // namespace ct::demo
