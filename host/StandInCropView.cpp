#include "StandInCropView.h"

#include "StandInPictureFile.h"

#include <cstdio>
#include <filesystem>

namespace ct::demo {

namespace {

constexpr int kDefaultSide = 480;
constexpr int kMaxSide = 2048;

} // namespace

StandInCropView::StandInCropView(app_control_h request, ct::appcontrol::Reply reply, std::string outputFolder)
	: StandInView(request, std::move(reply), "Crop", "")
	, m_outputFolder(std::move(outputFolder))
{
	std::string path = getExtra("Path");
	if (!path.empty() && StandInPictureFile::isPicture(path))
		m_source = path;
	setCaption(m_source.empty() ? "There is no picture to crop at \"" + path + "\"."
								: "The centre of the picture becomes the caller ID.");
}

int StandInCropView::__side() const
{
	int w = 0, h = 0;
	if (sscanf(getExtra("Resolution").c_str(), "%dx%d", &w, &h) != 2 || w <= 0 || w > kMaxSide)
		return kDefaultSide;
	return w;
}

std::string StandInCropView::getCropPath() const
{
	if (m_source.empty())
		return "";
	// A new file each time: the caller may store the path as it is.
	std::string stem = m_outputFolder + "/" + std::filesystem::path(m_source).stem().string() + "-crop";
	std::error_code ec;
	std::string path = stem + ".png";
	for (int n = 2; std::filesystem::exists(path, ec); ++n)
		path = stem + "-" + std::to_string(n) + ".png";
	return path;
}

Evas_Object* StandInCropView::createContent(Evas_Object* parent)
{
	Evas_Object* image = elm_image_add(parent);
	elm_image_aspect_fixed_set(image, EINA_TRUE);
	if (!m_source.empty())
		elm_image_file_set(image, m_source.c_str(), nullptr);
	evas_object_size_hint_weight_set(image, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(image, EVAS_HINT_FILL, EVAS_HINT_FILL);
	addButton("Cancel", __cancelClickedCb);
	if (!m_source.empty())
		addButton("Set", __setClickedCb, true);
	return image;
}

void StandInCropView::__setClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<StandInCropView*>(data);
	std::string crop = self->getCropPath();
	if (StandInPictureFile::writeSquareCrop(self->m_source, self->__side(), crop))
		self->answerSelected(crop);
	else
		self->setCaption("The picture could not be cropped.");
}

void StandInCropView::__cancelClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<StandInCropView*>(data)->popOut();
}

} // namespace ct::demo
