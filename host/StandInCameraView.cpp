#include "StandInCameraView.h"

#include "StandInPictureFile.h"

namespace ct::demo {

StandInCameraView::StandInCameraView(app_control_h request, ct::appcontrol::Reply reply, std::string folder)
	: StandInView(request, std::move(reply), "Camera", "Press the shutter to take the picture in the viewfinder.")
	, m_pictures(StandInPictureFile::listPictures(folder))
{
	if (m_pictures.empty())
		setCaption("The camera sees nothing: there are no pictures in " + folder + ".");
}

std::string StandInCameraView::getFramedPicture() const
{
	return m_pictures.empty() ? "" : m_pictures[m_frame % m_pictures.size()];
}

Evas_Object* StandInCameraView::createContent(Evas_Object* parent)
{
	m_viewfinder = elm_image_add(parent);
	elm_image_aspect_fixed_set(m_viewfinder, EINA_TRUE);
	evas_object_size_hint_weight_set(m_viewfinder, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(m_viewfinder, EVAS_HINT_FILL, EVAS_HINT_FILL);
	__showFrame();
	addButton("Turn", __turnClickedCb);
	Evas_Object* shutter = addButton("Shutter", __shutterClickedCb, true);
	elm_object_disabled_set(shutter, m_pictures.empty() ? EINA_TRUE : EINA_FALSE);
	return m_viewfinder;
}

void StandInCameraView::__showFrame()
{
	if (m_viewfinder && !m_pictures.empty())
		elm_image_file_set(m_viewfinder, getFramedPicture().c_str(), nullptr);
}

void StandInCameraView::__shutterClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<StandInCameraView*>(data);
	if (!self->m_pictures.empty())
		self->answerSelected(self->getFramedPicture());
}

void StandInCameraView::__turnClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<StandInCameraView*>(data);
	++self->m_frame;
	self->__showFrame();
}

} // namespace ct::demo
