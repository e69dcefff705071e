#include "page_fixture.h"

#include "ks/units/edit_fields.h"
#include "pages/framework/ctrl_edit.h"

#include <QCheckBox>
#include <QClipboard>
#include <QGridLayout>
#include <QLabel>
#include <QRadioButton>
#include <QTemporaryDir>

class BoundPage : public CGenPropertyPage
{
public:
    explicit BoundPage(CKavo0_hdDoc* doc) : CGenPropertyPage(doc)
    {
        auto* cells = new QGridLayout(this);
        int row = 0;
        for (QWidget* widget :
             std::initializer_list<QWidget*>{&box, &integer, &list, &level, &depth, &number, &hidden, &text})
            cells->addWidget(widget, row++, 1);
        HD_Global_Var& globals = Globals();
        Bindings().Add(&box, globals.wind_shear_stress);
        Bindings().Add(&integer, globals.no_iter);
        Bindings().Add(&list, globals.G_wave);
        Bindings().Add({&level, &depth}, globals.iLevelDepth);
        Bindings().Add(&number, globals.delh);
        Bindings().Add(&text, globals.TextOutput.Delimiter);
        Bindings().EnableWhen([this] { return box.isChecked(); }, {&number});
        Bindings().ShowWhen([this] { return Globals().iLevelDepth == 1; }, {&hidden});
    }

    QCheckBox box;
    CKsEditLong integer;
    QComboBox list;
    QRadioButton level, depth;
    CCtrlEdit number;
    QLabel hidden;
    QLineEdit text;
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
    EXPECT_TRUE(page.level.hasFocus()) << "what changed, as it is now";
    EXPECT_FALSE(page.hidden.isVisible());
    document.UndoStack().setIndex(0);
    EXPECT_EQ(page.box.isChecked(), bool(flag));
    EXPECT_EQ(page.list.currentIndex(), globals.G_wave);
}

TEST_F(BindingTest, ControlsAreCalledAsTheirValuesAreDeclared)
{
    auto& page = Open<BoundPage>();
    EXPECT_EQ(page.box.text(), "&Include wind");
    EXPECT_EQ(page.level.text() + '|' + page.depth.text(), "Wa&ter Level|Water &Depth");
    EXPECT_EQ(page.list.itemText(3), "Kinematic Wave");
    const auto beside = [&page](const QWidget& widget, int column) {
        auto& cells = static_cast<QGridLayout&>(*page.layout());
        int row = 0, at = 0, rows = 0, columns = 0;
        cells.getItemPosition(cells.indexOf(&widget), &row, &at, &rows, &columns);
        auto* item = cells.itemAtPosition(row, column);
        return item ? qobject_cast<QLabel*>(item->widget()) : nullptr;
    };
    ASSERT_TRUE(beside(page.number, 0) && beside(page.number, 2));
    EXPECT_EQ(beside(page.number, 0)->buddy(), &page.number);
    EXPECT_EQ(beside(page.number, 0)->text(), "&Delh:");
    EXPECT_EQ(page.number.accessibleName(), "Delh");
    EXPECT_EQ(beside(page.number, 2)->text(), "m");
    EXPECT_EQ(beside(page.integer, 2), nullptr) << "no unit";
    for (int column : {0, 2})
        EXPECT_EQ(beside(page.number, column)->isEnabled(), page.box.isChecked()) << "with its field";
    page.box.click();
    for (int column : {0, 2})
        EXPECT_EQ(beside(page.number, column)->isEnabled(), page.box.isChecked());
}

TEST_F(BindingTest, ATextTakesWhatCanBeSeen)
{
    auto& page = Open<BoundPage>();
    const struct
    {
        QString pasted;
        const char* stored;
        QStringList told;
    } cases[] = {
        {"\t\r\n", "\t", {}}, // columns may be delimited by one
        {"; \n", "; ", {}},
        {QString::fromUtf8(";\u202E"),
         "; ",
         {"A text takes no characters that cannot be seen. Character 2 of this one is U+202E."}},
    };
    for (const auto& c : cases) {
        page.text.setFocus();
        page.text.selectAll();
        QGuiApplication::clipboard()->setText(c.pasted);
        page.text.paste();
        QTest::keyClick(&page.text, Qt::Key_Return);
        EXPECT_EQ(globals.TextOutput.Delimiter, c.stored);
        EXPECT_EQ(std::exchange(boxes, {}), c.told);
    }
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
    emit page.list.activated(4);
    EXPECT_EQ(globals.G_wave, 17);
    EXPECT_EQ(globals.iLevelDepth, 5);
    emit page.list.activated(1);
    EXPECT_EQ(page.list.count(), 4) << "the number is gone once another entry is chosen";
    EXPECT_EQ(page.list.currentText(), "Fully Dynamic");
    EXPECT_EQ(document.UndoStack().count(), 1);
    page.depth.click();
    EXPECT_EQ(globals.iLevelDepth, 1);
    page.UndoRedo(true);
    EXPECT_EQ(globals.iLevelDepth, 5);
    EXPECT_FALSE(page.level.isChecked() || page.depth.isChecked()) << "as before the click";
    globals.G_wave = -3;
    page.LoadFromDocument(&document);
    EXPECT_EQ(page.list.currentText(), "-3");
}

TEST_F(BindingTest, FieldsTakeNothingWhereTheDocumentMayNotBeChanged)
{
    const QTemporaryDir folder;
    QFile file(folder.filePath("broken.HDKV"));
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    file.write("[KAVO0_HD]\n[broken");
    file.close();
    auto& page = Open<BoundPage>();
    EXPECT_FALSE(page.number.isReadOnly());
    ASSERT_TRUE(document.OnOpenDocument(file.fileName()));
    page.LoadFromDocument(&document);
    EXPECT_TRUE(page.number.isReadOnly());
    EXPECT_TRUE(page.integer.isReadOnly());
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
    QTest::keyClicks(&page.number, "7e"); // no number
    page.box.setFocus(Qt::MouseFocusReason);
    page.box.click();
    QTest::qWait(1);
    EXPECT_EQ(page.number.text(), number);
    EXPECT_TRUE(page.OnKillActive());
    EXPECT_EQ(boxes, QStringList());
}
