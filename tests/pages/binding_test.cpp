#include "page_fixture.h"

#include "ks/units/edit_fields.h"
#include "pages/framework/ctrl_edit.h"

#include <QCheckBox>
#include <QRadioButton>

class BoundPage : public CGenPropertyPage
{
public:
    explicit BoundPage(CKavo0_hdDoc* doc) : CGenPropertyPage(doc)
    {
        list.addItems({"none", "one", "two"});
        auto* column = new QVBoxLayout(this);
        for (QWidget* widget : std::initializer_list<QWidget*>{&box, &integer, &list, &level, &depth, &number, &hidden})
            column->addWidget(widget);
        Bind(&box, &HD_Global_Var::wind_shear_stress);
        Bind(&integer, &HD_Global_Var::no_iter);
        Bind(&list, &HD_Global_Var::G_wave);
        Bind({&level, &depth}, &HD_Global_Var::iLevelDepth);
        Bind(&number, &HD_Global_Var::zeta_min);
        Bindings().EnableWhen([this] { return box.isChecked(); }, {&number});
        Bindings().ShowWhen([this] { return Globals().iLevelDepth == 1; }, {&hidden});
    }

    QCheckBox box;
    CKsEditLong integer;
    QComboBox list;
    QRadioButton level, depth;
    CCtrlEdit number;
    QLabel hidden;
};

class BindingTest : public PageTest
{
};

TEST_F(BindingTest, ControlsFollowValuesAndBack)
{
    auto& page = Open<BoundPage>();
    EXPECT_FALSE(view->linesMenu) << "no grid, no lines";
    const auto flag = globals.wind_shear_stress;
    page.box.click();
    EXPECT_NE(globals.wind_shear_stress, flag);
    EXPECT_EQ(page.number.isEnabled(), page.box.isChecked());
    page.list.setCurrentIndex(2);
    emit page.list.activated(2);
    EXPECT_EQ(globals.G_wave, 2);
    EXPECT_FALSE(page.hidden.isVisible());
    page.depth.click();
    EXPECT_EQ(globals.iLevelDepth, 1);
    EXPECT_TRUE(page.hidden.isVisible());
    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(document.UndoStack().count(), 3);
    page.UndoRedo(true);
    EXPECT_TRUE(page.level.isChecked());
    EXPECT_FALSE(page.hidden.isVisible());
    document.UndoStack().setIndex(0);
    EXPECT_EQ(page.box.isChecked(), bool(flag));
    EXPECT_EQ(page.list.currentIndex(), globals.G_wave);
}

TEST_F(BindingTest, TheWheelTurnsOnlyTheListThatHasTheFocus)
{
    auto& page = Open<BoundPage>();
    const auto turn = [&page] {
        QWheelEvent event({5, 5}, page.list.mapToGlobal(QPointF(5, 5)), {}, {0, -120}, {}, {}, Qt::NoScrollPhase,
                          false);
        QApplication::sendEvent(&page.list, &event);
        return page.list.currentIndex();
    };
    page.number.setFocus();
    const int before = page.list.currentIndex();
    EXPECT_EQ(turn(), before);
    EXPECT_FALSE(document.IsModified());
    page.list.setFocus();
    EXPECT_EQ(turn(), before + 1);
}

TEST_F(BindingTest, UnknownNumbersAreKept)
{
    globals.G_wave = 17;
    globals.iLevelDepth = 5;
    auto& page = Open<BoundPage>();
    EXPECT_EQ(page.list.currentText(), "17");
    EXPECT_FALSE(page.level.isChecked() || page.depth.isChecked());
    page.StoreToDocument();
    emit page.list.activated(3);
    EXPECT_EQ(globals.G_wave, 17);
    EXPECT_EQ(globals.iLevelDepth, 5);
    emit page.list.activated(1);
    EXPECT_EQ(page.list.count(), 3) << "the number is gone once another entry is chosen";
    EXPECT_EQ(page.list.currentText(), "one");
    EXPECT_EQ(document.UndoStack().count(), 1);
}

TEST_F(BindingTest, IntegersAreTakenWhenLeftOrStored)
{
    auto& page = Open<BoundPage>();
    const auto before = globals.no_iter;
    const auto type = [&](const char* text) {
        page.integer.setFocus();
        page.integer.selectAll();
        QTest::keyClicks(&page.integer, text);
    };
    type("x1");
    page.list.setFocus();
    EXPECT_EQ(boxes, QStringList()) << "leaving the field says nothing";
    page.LoadFromDocument(&document);
    EXPECT_EQ(page.integer.text(), "x1") << "and a reload keeps it";
    page.StoreToDocument();
    EXPECT_EQ(boxes.size(), 1);
    EXPECT_EQ(globals.no_iter, before);
    type("42");
    EXPECT_EQ(globals.no_iter, before);
    page.StoreToDocument();
    EXPECT_EQ(globals.no_iter, 42);
}

TEST_F(BindingTest, EscapeAndDisablingTakeBackWhatWasTyped)
{
    auto& page = Open<BoundPage>();
    if (!page.box.isChecked())
        page.box.click();
    const QString integer = page.integer.text(), number = page.number.text();
    page.integer.setFocus();
    page.integer.selectAll();
    QTest::keyClicks(&page.integer, "abc");
    QTest::keyClick(&page.integer, Qt::Key_Escape);
    EXPECT_EQ(page.integer.text(), integer);
    page.number.setFocus();
    page.number.selectAll();
    QTest::keyClicks(&page.number, "-7"); // below its minimum
    page.box.setFocus(Qt::MouseFocusReason);
    page.box.click();
    QTest::qWait(1);
    EXPECT_EQ(page.number.text(), number);
    EXPECT_TRUE(page.OnKillActive());
    EXPECT_EQ(boxes, QStringList());
}
