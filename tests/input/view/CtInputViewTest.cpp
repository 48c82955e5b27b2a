// The create/edit form, headless: its title and buttons, what leaving asks,
// the save with its checks and replies, and what is shown after it.
#include "../../data/input/InputTestStore.h"

#include "ContactsCommon.h"
#include "ContactsDetails.h"
#include "CtData.h"
#include "CtInputView.h"
#include "CtView.h"
#include "ScreenHarness.h"

#include <app_preference.h>
#include <vconf.h>

using namespace ct::test;

namespace {

class CtInputViewTest : public InputStoreTest {
protected:
	void SetUp() override
	{
		InputStoreTest::SetUp();
		CtView::changeLanguage("en_US.UTF-8");
		vconf_set_int(VCONFKEY_SETAPPL_PSMODE, 0);
		preference_set_boolean("hide_storage_popup", true);
		m_screen = std::make_unique<ScreenHarness>();
	}
	void TearDown() override
	{
		m_screen.reset();
		InputStoreTest::TearDown();
	}

	CtInputView* open(app_assist::WView* view)
	{
		auto* input = dynamic_cast<CtInputView*>(view);
		EXPECT_TRUE(input);
		EXPECT_TRUE(m_screen->push(view));
		return input;
	}

	std::unique_ptr<ScreenHarness> m_screen;
};

TEST_F(CtInputViewTest, titleAndButtonsFollowTheMode)
{
	int contactId = 0;
	addSimplePerson("Anna", &contactId);
	struct Case {
		const char* name;
		contacts_record_h record;
		const char* title;
		bool doneDisabled;
	} cases[] = {
		{"create", nullptr, "IDS_PB_BUTTON_CREATE_ABB2", true},
		{"edit", readContact(contactId), "IDS_PB_OPT_EDIT", false},
	};
	for (const Case& c : cases) {
		SCOPED_TRACE(c.name);
		CtInputView* view = open(createCtInputView(c.record, nullptr));
		EXPECT_EQ(ContactsCommon::translate(c.title), ScreenHarness::naviText(view));
		EXPECT_EQ(c.doneDisabled, ScreenHarness::isDisabled(view->getDoneButton()));
		EXPECT_EQ(-1, view->getInputType());
		EXPECT_TRUE(m_screen->findButton(ContactsCommon::translate("IDS_TPLATFORM_ACBUTTON_CANCEL_ABB")));
		m_screen->sendBackKey();
		EXPECT_TRUE(m_screen->pumpUntil([this] { return m_screen->viewCount() == 0; }));
	}
}

} // namespace
