#include "StandInRingtonePickerView.h"

#include <algorithm>
#include <filesystem>
#include <vector>

namespace ct::demo {

namespace {

const char* const kDefault = "default";

std::vector<std::filesystem::path> soundsIn(const std::string& folder)
{
	std::vector<std::filesystem::path> sounds;
	std::error_code ec;
	for (const auto& entry : std::filesystem::directory_iterator(folder, ec)) {
		std::string extension = entry.path().extension().string();
		std::transform(extension.begin(), extension.end(), extension.begin(), ::tolower);
		if (entry.is_regular_file(ec) && (extension == ".wav" || extension == ".ogg" || extension == ".mp3"))
			sounds.push_back(entry.path());
	}
	std::sort(sounds.begin(), sounds.end());
	return sounds;
}

} // namespace

StandInRingtonePickerView::StandInRingtonePickerView(app_control_h request, ct::appcontrol::Reply reply,
		std::string fallbackFolder)
	: StandInView(request, std::move(reply), "Ringtones", "Tap a ringtone to choose it.")
	, m_fallbackFolder(std::move(fallbackFolder))
{
}

Evas_Object* StandInRingtonePickerView::createContent(Evas_Object* parent)
{
	std::string marked = getExtra("marked_mode");
	std::string folder = getExtra("path");
	std::vector<std::filesystem::path> sounds = folder.empty() ? std::vector<std::filesystem::path>() : soundsIn(folder);
	if (sounds.empty()) {
		folder = m_fallbackFolder;
		sounds = soundsIn(folder);
	}
	Evas_Object* list = createList(parent);
	if (getExtra("default") == "default show") {
		auto* row = appendRow(new StandInListItem("Default", "The phone's ringtone", "",
				[this](StandInListItem&) { __choose(kDefault); }));
		row->setMark(StandInListItem::Mark::Radio, marked.empty() || marked == kDefault);
	}
	for (const std::filesystem::path& sound : sounds) {
		std::string path = sound.string();
		auto* row = appendRow(new StandInListItem(sound.stem().string(), "", "",
				[this, path](StandInListItem&) { __choose(path); }));
		row->setMark(StandInListItem::Mark::Radio, marked == path);
	}
	if (sounds.empty())
		setCaption("There are no sounds in " + folder + ".");
	addButton("Cancel", __cancelClickedCb);
	return list;
}

void StandInRingtonePickerView::__choose(const std::string& result)
{
	app_control_h reply = nullptr;
	if (app_control_create(&reply) != APP_CONTROL_ERROR_NONE)
		return;
	app_control_add_extra_data(reply, "result", result.c_str());
	app_control_add_extra_data(reply, "position", "0");
	answer(reply);
	app_control_destroy(reply);
}

void StandInRingtonePickerView::__cancelClickedCb(void* data, Evas_Object*, void*)
{
	static_cast<StandInRingtonePickerView*>(data)->popOut();
}

} // namespace ct::demo
