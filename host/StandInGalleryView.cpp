#include "StandInGalleryView.h"

#include "StandInPictureFile.h"

#include <filesystem>

namespace ct::demo {

StandInGalleryView::StandInGalleryView(app_control_h request, ct::appcontrol::Reply reply, std::string folder)
	: StandInView(request, std::move(reply), "Gallery", "Tap a picture to use it.")
	, m_folder(std::move(folder))
{
}

Evas_Object* StandInGalleryView::createContent(Evas_Object* parent)
{
	std::vector<std::string> pictures = StandInPictureFile::listPictures(m_folder);
	if (pictures.empty())
		setCaption("There are no pictures in " + m_folder + ".");
	Evas_Object* list = createList(parent);
	for (const std::string& path : pictures) {
		std::string name = std::filesystem::path(path).filename().string();
		appendRow(new StandInListItem(name, "", path, [this, path](StandInListItem&) { answerSelected(path); }));
	}
	addButton("Cancel", __cancelClickedCb);
	return list;
}

void StandInGalleryView::__cancelClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<StandInGalleryView*>(data)->popOut();
}

} // namespace ct::demo
