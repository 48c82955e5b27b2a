#ifndef _CT_INPUT_VIEW_SIM_TEXT_SIZE_H_
#define _CT_INPUT_VIEW_SIM_TEXT_SIZE_H_

// The room a text takes in a SIM card's alpha field: one unit per character
// of the GSM 7-bit default alphabet (two for its extension table), else the
// size of the smallest UCS-2 coding (0x80, 0x81 or 0x82) the text allows.
class CtInputViewSimTextSize {
public:
	// The size of the first `length` bytes of the UTF-8 `text` (-1: up to its
	// end); 0 for null or empty; -1 when the text cannot be stored on a SIM
	// (invalid UTF-8, characters beyond UCS-2 such as emoji).
	static int getUcs2CodeSize(const char* text, int length = -1);

	CtInputViewSimTextSize() = delete;
};

#endif
