// Describes sample rows for the item-style pictures: a style, its texts and
// a maker for each content part.
#pragma once

#include <Elementary.h>

#include <functional>
#include <map>
#include <string>
#include <utility>
#include <vector>

namespace ct::test::res {

using ContentMaker = std::function<Evas_Object*(Evas_Object* parent)>;

struct ShotRow {
	enum class State { Normal, Disabled, Selected };

	ShotRow(std::string style_, std::map<std::string, std::string> texts_,
		std::map<std::string, ContentMaker> contents_ = {}, State state = State::Normal)
		: style(std::move(style_))
		, texts(std::move(texts_))
		, contents(std::move(contents_))
		, disabled(state == State::Disabled)
		, selected(state == State::Selected)
	{
	}

	std::string style;
	std::map<std::string, std::string> texts;
	std::map<std::string, ContentMaker> contents;
	bool disabled = false;
	bool selected = false;
	// Edje signals sent to the row once it is realized, as the screens do.
	std::vector<std::string> signals;
};

// Appends the rows to a compress-mode genlist; the rows must outlive it.
// Returns the genlist items in the rows' order.
std::vector<Elm_Object_Item*> appendShotRows(Evas_Object* genlist, std::vector<ShotRow>& rows);

// Sample contents: an icon of "image_layout.edj", an entry, a type selector,
// a button, a radio, a check.
ContentMaker icon(const std::string& imageName, int size = 32);
ContentMaker entry(const std::string& text, const std::string& guide = "");
ContentMaker typeSelector(const std::string& label);
ContentMaker button(const std::string& label);
ContentMaker radio(bool on);
ContentMaker check(bool on, const char* style = nullptr);
ContentMaker layout(const std::string& edj, const std::string& group,
	std::map<std::string, ContentMaker> parts = {});

} // namespace ct::test::res
