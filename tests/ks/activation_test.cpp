#include "ks_fixture.h"

#include <QDialog>

using testing::ElementsAre;

namespace {
QStringList Activations()
{
    QStringList found = LogView::log.filter(QRegularExpression(" (on|off) "));
    LogView::log.clear();
    return found;
}
} // namespace

TEST_F(KsTest, ViewsHearWhoTakesOver)
{
    TextDoc* first = Open({});
    EXPECT_THAT(Activations(), ElementsAre("a on a -"));
    TextDoc* second = Open({});
    EXPECT_THAT(Activations(), ElementsAre("a off b a", "b on b a"));
    frame.MdiArea().setActiveSubWindow(WindowOf(first));
    EXPECT_THAT(Activations(), ElementsAre("b off a b", "a on a b"));

    WindowOf(first)->close();
    EXPECT_THAT(Activations(), ElementsAre("a off b a", "b on b a")) << "the other window takes over";
    WindowOf(second)->close();
    EXPECT_THAT(Activations(), ElementsAre("b off - b")) << "nobody takes over";
    EXPECT_EQ(frame.GetActiveView(), nullptr);
}

TEST_F(KsTest, AnotherWindowOfTheProgramDeactivatesNobody)
{
    TextDoc* document = Open({});
    Activations();
    QDialog dialog;
    dialog.show();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&dialog));
    EXPECT_TRUE(Activations().isEmpty());
    EXPECT_EQ(frame.GetActiveView(), ViewOf(document));
}
