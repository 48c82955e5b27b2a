// What the prediction list offers for a typed name: at most ten persons,
// none on a SIM card, their default numbers, and literal matching of any
// text a person can type or paste.
#include "PredictionTestSupport.h"

#include "CtPredictionListModel.h"

#include <set>

using namespace ct::test;

namespace {

using Model = CtPredictionListModel;

std::set<std::string> namesOf(const Model& model)
{
	std::set<std::string> names;
	for (const auto& p : model.getPredictionList())
		names.insert(p.name);
	return names;
}

class CtPredictionListModelTest : public PredictionTest {};

TEST_F(CtPredictionListModelTest, SimPersonsAreLeftOut)
{
	int sim = addAddressbook(CONTACTS_SIM2_ADDRESS_BOOK_NAME, 0, 0, CONTACTS_SIM2_PROVIDER_NAME);
	for (int i = 0; i < 12; ++i)
		addPerson(("Sim Anna " + std::to_string(i)).c_str(), nullptr, sim);
	addPerson("Phone Anna");
	Model model("Anna");
	EXPECT_EQ(std::set<std::string>({ "Phone Anna" }), namesOf(model));
}

TEST_F(CtPredictionListModelTest, DefaultNumberAndContactOfEachPerson)
{
	int withNumber = addPerson("Anna Default", "+1 555 0101");
	int without = addPerson("Anna Plain");
	Model model("Anna");
	ASSERT_EQ(2, model.getCount());
	for (const auto& p : model.getPredictionList()) {
		contacts_record_h contact = Model::getContactRecordByContactId(p.contactId);
		ASSERT_NE(nullptr, contact);
		int personId = 0;
		contacts_record_get_int(contact, _contacts_contact.person_id, &personId);
		contacts_record_destroy(contact, true);
		bool numbered = p.name == "Anna Default";
		EXPECT_EQ(numbered ? withNumber : without, personId);
		EXPECT_EQ(numbered ? "+1 555 0101" : "", p.number);
	}
}

TEST_F(CtPredictionListModelTest, ReloadReplacesTheOffer)
{
	addPerson("Anna");
	addPerson("Boris");
	Model model("Ann");
	EXPECT_EQ(std::set<std::string>({ "Anna" }), namesOf(model));
	model.reload("Bor");
	EXPECT_EQ("Bor", model.getSearchName());
	EXPECT_EQ(std::set<std::string>({ "Boris" }), namesOf(model));
	model.reload("");
	EXPECT_EQ(0, model.getCount());
}

TEST_F(CtPredictionListModelTest, GoneContactGivesNoRecord)
{
	for (int id : { 0, -3, 987654 })
		EXPECT_EQ(nullptr, Model::getContactRecordByContactId(id)) << id;
}

// Texts a person may type or paste are matched as they are: no wildcards,
// no SQL, nothing past a NUL, and bad bytes match nothing.
TEST_F(CtPredictionListModelTest, TypedTextIsMatchedLiterally)
{
	for (const char* name : { "Ann_Lee", "AnnxLee", "100% Sure", "1000 Sure", "O'Neil", "Back\\slash", "Zoë Dean",
			 "Two  Blanks" })
		addPerson(name);
	struct Case {
		std::string text;
		std::set<std::string> expected;
	};
	const Case cases[] = {
		{ "n_L", { "Ann_Lee" } },
		{ "0%", { "100% Sure" } },
		{ "%", { "100% Sure" } },
		{ "_", { "Ann_Lee" } },
		{ "'", { "O'Neil" } },
		{ "O'Neil'; DROP TABLE persons; --", {} },
		{ "\\", { "Back\\slash" } },
		{ std::string("Zo\0xyz", 6), { "Zoë Dean" } },
		{ std::string("Zo\xff\xfe"), {} },
		{ "  ", { "Two  Blanks" } },
		{ std::string(50 * 1024, 'A'), {} },
	};
	for (const Case& c : cases) {
		Model model(c.text);
		EXPECT_EQ(c.expected, namesOf(model)) << c.text.substr(0, 40);
	}
	Model all("Sure");
	EXPECT_EQ(2, all.getCount()) << "the store survived every text";
}

} // namespace
