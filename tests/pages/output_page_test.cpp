// The page of additional output: a box a keyword.
#include "flow_page_fixture.h"
#include "pages/page_table.h"

#include <QCheckBox>
#include <QScrollArea>

using OutputPageTest = FlowPagesTest;

TEST_F(OutputPageTest, TheOutputMatrixScrollsToTheFocusWhenThePageIsLow)
{
    Open(MakeOutputPage);
    view->resize(500, 200);
    QTest::qWait(0);
    const auto* area = view->page->findChild<QScrollArea*>();
    const auto inSight = [&](const QWidget* box) {
        return area->viewport()->rect().contains(QRect(box->mapTo(area->viewport(), QPoint()), box->size()));
    };
    QWidget *first = Find(1037), *last = Find(1200);
    first->setFocus();
    EXPECT_TRUE(inSight(first));
    EXPECT_FALSE(inSight(last));
    for (qsizetype others = view->page->findChildren<QCheckBox*>().size(); others > 1; --others)
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    EXPECT_EQ(QApplication::focusWidget(), last);
    EXPECT_TRUE(inSight(last));
}
