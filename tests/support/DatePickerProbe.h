// Reads and turns the day, month and year spinners of the date popup on screen.
#pragma once

#include "ScreenHarness.h"

#include <Elementary.h>

#include <algorithm>
#include <ctime>
#include <string>
#include <vector>

namespace ct::test {

// Day, month and (when shown) year, in the order a person reads them.
inline std::vector<Evas_Object*> dateSpinners(const ScreenHarness& screen)
{
	std::vector<Evas_Object*> spinners = screen.findWidgets("Elm_Spinner");
	auto left = [](Evas_Object* obj) {
		Evas_Coord x = 0;
		evas_object_geometry_get(obj, &x, nullptr, nullptr, nullptr);
		return x;
	};
	std::stable_sort(spinners.begin(), spinners.end(), [&](Evas_Object* a, Evas_Object* b) { return left(a) < left(b); });
	return spinners;
}

// "YYYY-M-D" of the shown date ("0-M-D" without a year field); "" without a picker.
inline std::string shownPickerDate(const ScreenHarness& screen)
{
	std::vector<Evas_Object*> spinners = dateSpinners(screen);
	if (spinners.size() < 2)
		return "";
	auto value = [&](size_t i) { return std::to_string(static_cast<int>(elm_spinner_value_get(spinners[i]))); };
	return (spinners.size() > 2 ? value(2) : std::string("0")) + "-" + value(1) + "-" + value(0);
}

// Turns each spinner as a person would: a value, then its "changed" signal.
inline void turnPicker(const ScreenHarness& screen, int year, int month, int day)
{
	std::vector<Evas_Object*> spinners = dateSpinners(screen);
	const int values[] = { day, month, year };
	for (size_t i = spinners.size(); i-- > 0;) {
		if (values[i] <= 0)
			continue;
		elm_spinner_value_set(spinners[i], values[i]);
		evas_object_smart_callback_call(spinners[i], "changed", nullptr);
	}
}

} // namespace ct::test
