#include "StandInPresetEditorView.h"

#include "ContactsDebug.h"
#include "StandInPictureFile.h"

#include <filesystem>

namespace ct::demo {

namespace {

constexpr double kTintStrength = 0.45;
constexpr int kPreviewHeight = 200;

struct Preset {
	const char* name;
	uint32_t rgb;
};

const Preset kPresets[] = {
	{"Rose", 0xE91E63}, {"Mint", 0x2ECC71}, {"Sky", 0x2196F3}, {"Sepia", 0x9C6B30},
};

} // namespace

StandInPresetEditorView::StandInPresetEditorView(app_control_h request, ct::appcontrol::Reply reply,
		std::string pictureFolder, std::string outputFolder)
	: StandInView(request, std::move(reply), "Preset styles", "Choose a style, then Done.")
	, m_pictures(StandInPictureFile::listPictures(pictureFolder))
	, m_outputFolder(std::move(outputFolder))
{
	if (m_pictures.empty())
		setCaption("There is no picture to style in " + pictureFolder + ".");
}

std::string StandInPresetEditorView::getStyledPath() const
{
	if (m_pictures.empty())
		return "";
	std::string stem = std::filesystem::path(m_pictures[m_picture % m_pictures.size()]).stem().string();
	return m_outputFolder + "/" + stem + "-" + kPresets[m_style].name + ".png";
}

Evas_Object* StandInPresetEditorView::createContent(Evas_Object* parent)
{
	Evas_Object* box = elm_box_add(parent);
	evas_object_size_hint_weight_set(box, EVAS_HINT_EXPAND, EVAS_HINT_EXPAND);
	evas_object_size_hint_align_set(box, EVAS_HINT_FILL, EVAS_HINT_FILL);
	m_preview = elm_image_add(box);
	elm_image_aspect_fixed_set(m_preview, EINA_TRUE);
	evas_object_size_hint_min_set(m_preview, 0, ELM_SCALE_SIZE(kPreviewHeight));
	evas_object_size_hint_align_set(m_preview, EVAS_HINT_FILL, EVAS_HINT_FILL);
	evas_object_show(m_preview);
	elm_box_pack_end(box, m_preview);

	Evas_Object* list = createList(box);
	evas_object_show(list);
	elm_box_pack_end(box, list);
	for (size_t i = 0; i < sizeof(kPresets) / sizeof(kPresets[0]); ++i) {
		auto* row = appendRow(new StandInListItem(kPresets[i].name, "", "",
				[this, i](StandInListItem&) { __chooseStyle(i); }));
		row->setMark(StandInListItem::Mark::Radio, i == m_style);
		m_styleRows.push_back(row);
	}
	addButton("Picture", __pictureClickedCb);
	Evas_Object* done = addButton("Done", __doneClickedCb, true);
	elm_object_disabled_set(done, m_pictures.empty() ? EINA_TRUE : EINA_FALSE);
	__showPreview();
	return box;
}

void StandInPresetEditorView::__chooseStyle(size_t style)
{
	m_style = style;
	for (size_t i = 0; i < m_styleRows.size(); ++i)
		m_styleRows[i]->setMark(StandInListItem::Mark::Radio, i == m_style);
	__showPreview();
}

void StandInPresetEditorView::__showPreview()
{
	if (m_pictures.empty() || !m_preview)
		return;
	std::string source = m_pictures[m_picture % m_pictures.size()];
	std::string styled = getStyledPath();
	if (StandInPictureFile::writeTinted(source, kPresets[m_style].rgb, kTintStrength, styled))
		elm_image_file_set(m_preview, styled.c_str(), nullptr);
	else
		elm_image_file_set(m_preview, source.c_str(), nullptr);
}

void StandInPresetEditorView::__doneClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<StandInPresetEditorView*>(data);
	std::string styled = self->getStyledPath();
	std::error_code ec;
	if (styled.empty() || !std::filesystem::is_regular_file(styled, ec)) {
		WERROR("no styled picture to return");
		return;
	}
	self->answerText("path", styled);
}

void StandInPresetEditorView::__pictureClickedCb(void* data, Evas_Object*, void*)
{
	auto* self = static_cast<StandInPresetEditorView*>(data);
	++self->m_picture;
	self->__showPreview();
}

} // namespace ct::demo
