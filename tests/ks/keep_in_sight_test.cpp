#include "ks/fc/keep_in_sight.h"

#include <QLineEdit>
#include <QScrollArea>
#include <QScrollBar>
#include <QTest>
#include <gtest/gtest.h>

// Also of a field whose cursor is in sight while the rest of it is not.
TEST(KeepInSight, AllOfAFieldIsShownInEveryWindowThatScrolls)
{
    QScrollArea outer;
    auto* page = new QWidget;
    page->resize(900, 900);
    auto* inner = new QScrollArea(page);
    inner->setGeometry(400, 500, 200, 150);
    auto* content = new QWidget;
    content->resize(600, 600);
    auto* field = new QLineEdit(content);
    field->setGeometry(450, 300, 90, 24);
    inner->setWidget(content);
    outer.setWidget(page);
    outer.resize(300, 250);
    outer.show();
    EXPECT_TRUE(QTest::qWaitForWindowExposed(&outer));
    const auto isShown = [&] {
        return field->visibleRegion().boundingRect() == field->rect();
    };
    EXPECT_FALSE(isShown());
    KsKeepInSight(*field, field->rect());
    EXPECT_TRUE(isShown());
    outer.horizontalScrollBar()->setValue(outer.horizontalScrollBar()->value() - 60);
    outer.resize(280, 250);
    KsKeepInSight(*field, field->rect());
    EXPECT_TRUE(isShown());
    const int there = outer.verticalScrollBar()->value();
    KsKeepInSight(*field, QRect(0, 0, 5, 5));
    EXPECT_EQ(outer.verticalScrollBar()->value(), there) << "what is in sight stays where it is";
}
