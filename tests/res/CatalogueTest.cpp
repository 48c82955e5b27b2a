// The translation catalogue: the check that guards it, and the compiled
// catalogues as the application binds them.
#include "ResourcePaths.h"
#include "TempDataDir.h"

#include <gtest/gtest.h>
#include <libintl.h>

#include <array>
#include <clocale>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <string>
#include <sys/wait.h>

using namespace ct::test::res;

namespace {

struct CheckResult {
	int exitCode = -1;
	std::string output;
};

CheckResult runCheck(const std::string& root)
{
	std::string command = sourceRoot() + "/scripts/check-catalogue '" + root + "' 2>&1";
	CheckResult result;
	FILE* pipe = popen(command.c_str(), "r");
	if (!pipe)
		return result;
	std::array<char, 512> buffer{};
	while (fgets(buffer.data(), buffer.size(), pipe))
		result.output += buffer.data();
	int status = pclose(pipe);
	result.exitCode = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
	return result;
}

void writeFile(const std::string& path, const std::string& text)
{
	std::filesystem::create_directories(std::filesystem::path(path).parent_path());
	std::ofstream(path) << text;
}

std::string catalogue(std::initializer_list<std::pair<const char*, const char*>> entries)
{
	std::string text = "msgid \"\"\nmsgstr \"\"\n\"Content-Type: text/plain; charset=UTF-8\\n\"\n";
	for (auto [id, value] : entries)
		text += std::string("\nmsgid \"") + id + "\"\nmsgstr \"" + value + "\"\n";
	return text;
}

} // namespace

TEST(Catalogue, CoversEveryIdUsedInTheCode)
{
	CheckResult result = runCheck(sourceRoot());
	EXPECT_EQ(result.exitCode, 0) << result.output;
}

TEST(Catalogue, CheckFailsForIdsMissingInEitherLanguageAndOnlyReportsExtras)
{
	ct::test::TempDataDir tree;
	writeFile(tree.file("res/po/en.po"), catalogue({{"IDS_PB_OPT_MOBILE", "Mobile"}, {"IDS_PB_OPT_WORK", ""}}));
	writeFile(tree.file("res/po/de.po"), catalogue({{"IDS_PB_OPT_MOBILE", "Mobil"}}));
	writeFile(tree.file("src/CtDetailView.cpp"),
		"const char* a = \"IDS_PB_OPT_MOBILE\";\nconst char* b = \"IDS_PB_OPT_FAX_HWORK_ABB\";\n");
	writeFile(tree.file("common/CtCommon.h"), "#define WORK \"IDS_PB_OPT_WORK\"\n");
	CheckResult result = runCheck(tree.path());
	EXPECT_EQ(result.exitCode, 1);
	EXPECT_NE(result.output.find("IDS_PB_OPT_FAX_HWORK_ABB"), std::string::npos) << result.output;
	EXPECT_NE(result.output.find("English entries without text:\n  IDS_PB_OPT_WORK"), std::string::npos)
		<< "an empty English text counts as missing: " << result.output;
	EXPECT_EQ(result.output.find("IDS_PB_OPT_MOBILE"), std::string::npos) << result.output;

	writeFile(tree.file("res/po/en.po"), catalogue({{"IDS_PB_OPT_MOBILE", "Mobile"}, {"IDS_PB_OPT_WORK", "Work"},
		{"IDS_PB_OPT_FAX_HWORK_ABB", "Fax"}}));
	writeFile(tree.file("res/po/de.po"), catalogue({{"IDS_PB_OPT_MOBILE", "Mobil"}, {"IDS_PB_OPT_WORK", ""},
		{"IDS_PB_OPT_FAX_HWORK_ABB", "Fax"}}));
	result = runCheck(tree.path());
	EXPECT_EQ(result.exitCode, 1);
	EXPECT_NE(result.output.find("de.po lacks these English ids:\n  IDS_PB_OPT_WORK"), std::string::npos)
		<< result.output;

	writeFile(tree.file("res/po/de.po"), catalogue({{"IDS_PB_OPT_MOBILE", "Mobil"}, {"IDS_PB_OPT_WORK", "Arbeit"},
		{"IDS_PB_OPT_FAX_HWORK_ABB", "Fax"}, {"IDS_PB_OPT_PAGER", "Pager"}}));
	result = runCheck(tree.path());
	EXPECT_EQ(result.exitCode, 0) << "an extra id is only reported: " << result.output;
	EXPECT_NE(result.output.find("IDS_PB_OPT_PAGER"), std::string::npos);
}

TEST(Catalogue, CompiledCataloguesTranslateInBothLanguages)
{
	ASSERT_NE(bindtextdomain("contacts", (buildResDir() + "/locale").c_str()), nullptr);
	bind_textdomain_codeset("contacts", "UTF-8");
	const std::string previous = setlocale(LC_ALL, nullptr);
	ASSERT_NE(setlocale(LC_ALL, "en_US.UTF-8"), nullptr);
	EXPECT_STREQ(dgettext("contacts", "IDS_PB_BODY_NOT_ASSIGNED"), "Not assigned");
	EXPECT_STREQ(dgettext("contacts", "IDS_NOT_IN_THE_CATALOGUE"), "IDS_NOT_IN_THE_CATALOGUE");
	if (setlocale(LC_ALL, "de_DE.UTF-8")) {
		EXPECT_STREQ(dgettext("contacts", "IDS_PB_OPT_MOBILE"), "Mobil");
		// The screens format this text with the count, so it keeps its %d.
		EXPECT_STREQ(dgettext("contacts", "IDS_PB_HEADER_PD_SELECTED_ABB3"), "%d ausgewählt");
	}
	setlocale(LC_ALL, previous.c_str());
}
