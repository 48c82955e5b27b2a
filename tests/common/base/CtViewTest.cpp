#include "CtView.h"
#include "LogSink.h"
#include "../CommonTestSupport.h"

#include <vconf.h>

using ct::test::pumpUntil;

namespace {

class CountingView : public CtView {
public:
	explicit CountingView(std::unique_ptr<CountingView>* closeOnChange = nullptr)
		: m_closeOnChange(closeOnChange) {}
	void onLanguageChanged() override
	{
		++changes;
		if (m_closeOnChange)
			m_closeOnChange->reset();
	}
	int changes = 0;

private:
	std::unique_ptr<CountingView>* m_closeOnChange;
};

using CtViewTest = ct::test::WindowTest;

} // namespace

TEST_F(CtViewTest, LanguageChangeReachesEveryOpenScreen)
{
	auto first = std::make_unique<CountingView>();
	std::unique_ptr<CountingView> closed = std::make_unique<CountingView>();
	CountingView closer(&closed);
	EXPECT_EQ(3, CtView::getOpenViewCount());

	CtView::changeLanguage("de_DE.UTF-8");
	EXPECT_EQ(1, first->changes);
	EXPECT_EQ(1, closer.changes);
	EXPECT_FALSE(closed) << "closed by another screen while re-translating";
	EXPECT_EQ(2, CtView::getOpenViewCount());

	ASSERT_EQ(0, vconf_set_str(VCONFKEY_LANGSET, "en_US.UTF-8"));
	EXPECT_TRUE(pumpUntil([&] { return first->changes == 2; }, 2.0));
	first.reset();
	EXPECT_EQ(1, CtView::getOpenViewCount());
	CtView::changeLanguage(nullptr);
	EXPECT_EQ(2, closer.changes);
}

TEST_F(CtViewTest, BaseLayoutFailsCleanlyWithoutItsResources)
{
	ct::test::TempDataDir dir;
	ct::test::EnvScope noResources("CONTACTS_RES_DIR", dir.path().c_str());
	CountingView view;
	ct::log::clear();
	EXPECT_EQ(nullptr, view.createBaseLayout(m_window, nullptr, nullptr));
	EXPECT_TRUE(ct::log::contains("* Critical * ctCommonCreateLayout() is fail"));
	EXPECT_EQ(nullptr, view.createBaseLayout(nullptr, nullptr, nullptr));
	EXPECT_EQ(nullptr, view.createBaseLayout(m_window, "contacts/detail_layout.edj", "no/such/group"));
}
