#include "CtCommonTextUtil.h"

#include "ContactsDebug.h"
#include "DataDir.h"

#include <Elementary.h>
#include <glib.h>
#include <glib/gstdio.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <memory>
#include <sys/stat.h>
#include <unistd.h>

namespace {

const char* const kImageFolder = "images";

// Writes `text` into the buffer, cut before the first character that does
// not fit. Returns the bytes written.
int copyWholeCharacters(const std::string& text, char* out, int outSize)
{
	if (!out || outSize <= 0)
		return 0;
	size_t len = text.size();
	if (len > static_cast<size_t>(outSize - 1)) {
		len = outSize - 1;
		while (len > 0 && (static_cast<unsigned char>(text[len]) & 0xC0) == 0x80)
			--len;
	}
	memcpy(out, text.data(), len);
	out[len] = '\0';
	return static_cast<int>(len);
}

enum class NumberTarget { Phone, Sim };

// The dialable form of one character, or 0 when it is dropped.
char dialableChar(gunichar c, NumberTarget target, bool isFirst)
{
	int digit = g_unichar_digit_value(c);
	if (digit >= 0)
		return static_cast<char>('0' + digit);
	switch (c) {
	case '*':
	case '#':
		return static_cast<char>(c);
	case '+':
		return (target == NumberTarget::Phone || isFirst) ? '+' : 0;
	case ',':
	case 'p':
	case 'P':
		return target == NumberTarget::Sim ? ',' : static_cast<char>(c);
	case ';':
	case 'w':
	case 'W':
		return target == NumberTarget::Sim ? ';' : static_cast<char>(c);
	default:
		return 0;
	}
}

int cleanNumber(const char* number, char* out, int outSize, NumberTarget target)
{
	if (!out || outSize <= 0)
		return 0;
	out[0] = '\0';
	if (!number)
		return 0;
	std::string cleaned;
	const char* end = nullptr;
	g_utf8_validate(number, -1, &end); // only the valid prefix is read
	for (const char* p = number; p < end; p = g_utf8_next_char(p)) {
		char c = dialableChar(g_utf8_get_char(p), target, cleaned.empty());
		if (c)
			cleaned += c;
	}
	return copyWholeCharacters(cleaned, out, outSize);
}

std::string extensionOf(const char* path)
{
	const char* base = strrchr(path, '/');
	const char* dot = strrchr(base ? base : path, '.');
	if (!dot || strchr(dot, '/') || strlen(dot) > 10)
		return std::string();
	return dot;
}

// Copies everything from one descriptor to the other. Returns 0 or -errno.
int copyFileContent(int from, int to)
{
	char buffer[64 * 1024];
	for (;;) {
		ssize_t got = read(from, buffer, sizeof(buffer));
		if (got == 0)
			return 0;
		if (got < 0) {
			if (errno == EINTR)
				continue;
			return -errno;
		}
		for (ssize_t done = 0; done < got;) {
			ssize_t put = write(to, buffer + done, got - done);
			if (put < 0 && errno != EINTR)
				return -errno;
			done += put > 0 ? put : 0;
		}
	}
}

int openRegularFile(const char* path)
{
	int fd = open(path, O_RDONLY | O_CLOEXEC);
	if (fd < 0)
		return -errno;
	struct stat st;
	if (fstat(fd, &st) != 0 || !S_ISREG(st.st_mode)) {
		close(fd);
		return -EINVAL;
	}
	return fd;
}

} // namespace

int ctCommonCleanNumber(const char* number, char* out, int outSize)
{
	return cleanNumber(number, out, outSize, NumberTarget::Phone);
}

int ctCommonCleanNumberForSim(const char* number, char* out, int outSize)
{
	return cleanNumber(number, out, outSize, NumberTarget::Sim);
}

char* ctCommonMarkupToUtf8(const char* markup)
{
	if (!markup)
		return nullptr;
	gchar* valid = g_utf8_make_valid(markup, -1);
	char* text = elm_entry_markup_to_utf8(valid);
	g_free(valid);
	return text;
}

std::string ctCommonUtf8ToMarkup(const char* text)
{
	if (!text || !*text)
		return std::string();
	char* markup = elm_entry_utf8_to_markup(text);
	std::string result = markup ? markup : "";
	free(markup);
	return result;
}

int ctCommonCheckUtf8(char leadByte)
{
	unsigned char c = static_cast<unsigned char>(leadByte);
	if (c >= 0xF0 && c <= 0xF4)
		return 4;
	if (c >= 0xE0 && c < 0xF0)
		return 3;
	if (c >= 0xC2 && c < 0xE0)
		return 2;
	return 1;
}

void ctCommonGetDisplayfileName(const char* path, char* out, int outSize)
{
	if (!out || outSize <= 0)
		return;
	out[0] = '\0';
	if (!path)
		return;
	const char* slash = strrchr(path, '/');
	gchar* valid = g_utf8_make_valid(slash ? slash + 1 : path, -1);
	std::string name = valid;
	g_free(valid);
	size_t dot = name.rfind('.');
	if (dot != std::string::npos && dot > 0)
		name.erase(dot);
	copyWholeCharacters(name, out, outSize);
}

int ctCommonCopyImage(const char* srcPath, std::string& newPath)
{
	newPath.clear();
	WPRET_VM(!srcPath || !*srcPath, -EINVAL, "Invalid param : srcPath");
	std::string folder = ct::platform::dataPath(kImageFolder);
	if (int err = ct::platform::makeDirectories(folder); err < 0) {
		WFAILED("makeDirectories", err);
		return err;
	}
	int from = openRegularFile(srcPath);
	if (from < 0) {
		WFAILED("open", from);
		return from;
	}
	std::string path = folder + "/contact_XXXXXX" + extensionOf(srcPath);
	int to = g_mkstemp(path.data());
	int err = to < 0 ? -errno : copyFileContent(from, to);
	if (to >= 0 && close(to) != 0 && err == 0)
		err = -errno;
	close(from);
	if (err < 0) {
		WFAILED("copy", err);
		if (to >= 0)
			unlink(path.c_str());
		return err;
	}
	newPath = path;
	return 0;
}

int ctCommonUnlinkFile(const char* path)
{
	WPRET_VM(!path || !*path, -EINVAL, "Invalid param : path");
	struct stat st;
	if (lstat(path, &st) != 0)
		return -errno;
	if (S_ISDIR(st.st_mode))
		return -EISDIR;
	if (unlink(path) != 0) {
		int err = -errno;
		WFAILED("unlink", err);
		return err;
	}
	return 0;
}

int ctCommonSendSimpleAppControlResult(app_control_h request, const char* key, const char* value,
	app_control_result_e result)
{
	WPRET_VM(!request, APP_CONTROL_ERROR_INVALID_PARAMETER, "Invalid param : request");
	app_control_h reply = nullptr;
	int err = app_control_create(&reply);
	if (err != APP_CONTROL_ERROR_NONE) {
		WFAILED("app_control_create", err);
		return err;
	}
	std::unique_ptr<app_control_s, decltype(&app_control_destroy)> guard(reply, app_control_destroy);
	if (key) {
		err = app_control_add_extra_data(reply, key, value ? value : "");
		if (err != APP_CONTROL_ERROR_NONE) {
			WFAILED("app_control_add_extra_data", err);
			return err;
		}
	}
	err = app_control_reply_to_launch_request(reply, request, result);
	if (err != APP_CONTROL_ERROR_NONE)
		WFAILED("app_control_reply_to_launch_request", err);
	return err;
}

bool ctCommontEncodeAddress(const char* address, std::string& encoded)
{
	encoded.clear();
	WPRET_VM(!address, false, "Invalid param : address");
	std::string oneLine = address;
	for (char& c : oneLine)
		if (c == '\n' || c == '\r')
			c = ' ';
	gchar* escaped = g_uri_escape_string(oneLine.c_str(), nullptr, FALSE);
	if (!escaped)
		return false;
	encoded = escaped;
	g_free(escaped);
	return true;
}
