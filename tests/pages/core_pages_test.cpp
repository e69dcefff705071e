// What holds for every page of the sheet, whichever it is.
#include "page_fixture.h"

#include "data/hd_file.h"
#include "grid/cell_operations.h"
#include "ks/units/edit_fields.h"
#include "pages/framework/ctrl_edit.h"
#include "pages/page_table.h"

#include <QAbstractButton>
#include <QFile>
#include <QGroupBox>
#include <QTemporaryDir>
#include <map>
#include <set>

namespace {

constexpr QSize SmallestPage(900, 640);

QString Named(const CGenPropertyPage& page, const QWidget* widget)
{
    return QString("%1 %2").arg(page.objectName(), widget->objectName());
}

} // namespace

class CorePagesTest : public PageTest
{
protected:
    CorePagesTest()
    {
        QFile::copy(KVR_SOURCE_DIR "/examples/river/river.HDKV", folder.filePath("river.hdkv"));
        EXPECT_TRUE(document.OnOpenDocument(folder.filePath("river.hdkv")));
    }
    template <typename Check>
    void OnEveryPage(Check check)
    {
        for (const PageEntry& entry : PageTable()) {
            CGenPropertyPage* page = entry.make(&document).release();
            tab = entry.tab;
            caption = LoadString(entry.caption);
            SCOPED_TRACE(page->objectName().toStdString());
            view = std::make_unique<TestView>(document, page);
            grid = page->GetGrid();
            check(*page);
        }
    }
    std::string Text() const { return HDFileText(document.Parameters(), true); }
    std::string Saved(CKavo0_hdDoc& saved, const char* name)
    {
        EXPECT_TRUE(saved.OnSaveDocument(folder.filePath(name)));
        QFile file(folder.filePath(name));
        return file.open(QIODevice::ReadOnly) ? file.readAll().toStdString() : "(no file)";
    }

    QTemporaryDir folder;
    int tab = 0; // of the page shown
    QString caption;
};

TEST_F(CorePagesTest, EveryTabIsThereOnceAndSaysSomethingElse)
{
    std::set<int> tabs;
    std::set<QString> captions;
    OnEveryPage([&](CGenPropertyPage& page) {
        const auto grids = page.findChildren<CGenGrid*>();
        const auto isVisible = [](const CGenGrid* each) { return each->isVisible(); };
        EXPECT_EQ(view->linesMenu, grid ? grid->isVisible() : std::any_of(grids.begin(), grids.end(), isVisible));
        EXPECT_TRUE(tab == NotOnSheet || tabs.insert(tab).second) << tab;
        EXPECT_TRUE(!caption.isEmpty() && captions.insert(caption).second) << caption.toStdString();
    });
    EXPECT_EQ(*tabs.begin(), 1);
    EXPECT_EQ(*tabs.rbegin(), int(tabs.size()));
}

TEST_F(CorePagesTest, CellsOfAColumnWithAGlobalValueSaySoAndAreResetToIt)
{
    std::map<QString, int> columns; // with a global value, by page
    OnEveryPage([&](CGenPropertyPage& page) {
        CGridModel* model = grid ? grid->Model() : nullptr;
        for (int column = 0; model && column < model->columnCount(); ++column) {
            const ColumnSpec& spec = model->Column(column);
            if (!spec.Global())
                continue;
            ++columns[page.objectName()];
            SCOPED_TRACE(spec.header().toStdString());
            const QModelIndex cell = model->index(model->FixedRows(), column);
            const auto standsBack = [&cell] { return cell.data(Qt::ForegroundRole).isValid(); };
            CCellResults results = ResetToGlobal(*model, {cell.row(), column, cell.row(), column});
            model->ChangeCells("step", results.FirstRow(), results.TakeChanges());
            if (!model->IsLocked(cell.row(), column)) {
                EXPECT_TRUE(SameCell(model->Value(cell.row(), column), spec.Global().Value()));
                EXPECT_TRUE(standsBack());
            }
            QString told; // by the field of the global value
            for (const QWidget* field : page.findChildren<QWidget*>())
                told += page.OverridesText(*field);
            EXPECT_TRUE(told.contains("Lines with another value")) << told.toStdString();
        }
    });
    const std::map<QString, int> expected = {{"CInitPage", 2},       {"CWindPage", 1},      {"CBedPage", 4},
                                             {"CBedToolboxPage", 4}, {"CWavePage", 1},      {"CQuasiPage", 2},
                                             {"CFloodPage", 1},      {"CLeakagePage", 1},   {"CKlrParamPage", 2},
                                             {"CKlrInitPage", 4},    {"CMixingCoefPage", 4}};
    EXPECT_EQ(columns, expected);
}

TEST_F(CorePagesTest, VisitingChangesNothing)
{
    const std::string before = Text();
    CKavo0_hdDoc unvisited;
    ASSERT_TRUE(unvisited.OnOpenDocument(KVR_SOURCE_DIR "/examples/river/river.HDKV"));
    OnEveryPage([&](CGenPropertyPage& page) {
        // In the other units everything shows, and would be stored, differently.
        for (const auto system : {KsUnitSystem::UsCustomary, KsUnitSystem::Metric}) {
            KsUnits::Instance().SetSystem(system);
            page.StoreToDocument();
            page.LoadFromDocument(&document);
        }
        for (QWidget* control : Controls(page)) {
            if (!control->isEnabled() || !control->isVisible())
                continue;
            control->setFocus(Qt::TabFocusReason);
            QTest::keyClick(control, Qt::Key_Tab);
        }
        EXPECT_TRUE(page.OnKillActive());
        EXPECT_EQ(Text(), before);
    });
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(document.UndoStack().count(), 0);
    EXPECT_EQ(boxes, QStringList());
    EXPECT_EQ(Saved(document, "visited.HDKV"), Saved(unvisited, "unvisited.HDKV"));
}

TEST_F(CorePagesTest, VisitingANewFileLeavesNoLineInTheListsThatASaveCleans)
{
    document.DeleteContents();
    const std::string before = Text();
    OnEveryPage([](CGenPropertyPage& page) { page.OnKillActive(); });
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(document.UndoStack().count(), 0);
    Saved(document, "new.HDKV");
    for (const ListEntry& entry : HDLists())
        if (CListSection& section = entry.list(document.Parameters()); !entry.purgedAtSave && !section.HasSets())
            section.ListAt(0).RemoveAll();
    EXPECT_EQ(Text(), before);
}

TEST_F(CorePagesTest, EveryFieldRefusesWhatIsNoNumber)
{
    int fields = 0;
    OnEveryPage([&](CGenPropertyPage& page) {
        const std::string before = Text();
        for (CCtrlEdit* field : page.findChildren<CCtrlEdit*>()) {
            if (!field->isEnabled() || !field->isVisible())
                continue;
            SCOPED_TRACE(field->objectName().toStdString());
            ++fields;
            boxes.clear();
            field->setFocus();
            field->selectAll();
            QTest::keyClicks(field, "1.");
            QTest::keyClick(field, Qt::Key_Tab);
            EXPECT_EQ(boxes, QStringList("Invalid floating point number!"));
            EXPECT_TRUE(field->hasFocus());
            EXPECT_EQ(Text(), before);
            QTest::qWait(0); // one box an event
            QTest::keyClick(field, Qt::Key_Escape);
        }
    });
    EXPECT_GT(fields, 30);
}

TEST_F(CorePagesTest, EveryControlHasAName)
{
    OnEveryPage([&](CGenPropertyPage& page) {
        std::set<const QWidget*> labelled;
        std::set<QChar> mnemonics;
        QStringList without;
        const auto addMnemonic = [&](const QWidget* widget, const QString& text) {
            const qsizetype at = text.indexOf('&');
            if (at < 0)
                return void(without << text);
            EXPECT_TRUE(mnemonics.insert(text[at + 1].toUpper()).second)
                << "mnemonic twice: " << Named(page, widget).toStdString();
        };
        for (const QLabel* label : page.findChildren<QLabel*>()) {
            if (!label->buddy())
                continue;
            labelled.insert(label->buddy());
            if (label->isVisible())
                addMnemonic(label, label->text());
        }
        for (const QWidget* control : Controls(page)) {
            const auto* button = qobject_cast<const QAbstractButton*>(control);
            if (button && button->isVisible() && !button->text().isEmpty() && button->text() != "...")
                addMnemonic(button, button->text());
            EXPECT_TRUE((button && !button->text().isEmpty()) || labelled.contains(control) ||
                        !control->accessibleName().isEmpty())
                << Named(page, control).toStdString();
        }
        // Nothing goes without a letter that could have one; the menu bar keeps its own.
        for (const QString& text : without)
            for (const QChar letter : text.toUpper())
                EXPECT_TRUE(!letter.isLetter() || mnemonics.contains(letter) || QString("FELVWH").contains(letter))
                    << text.toStdString() << " could have " << QString(letter).toStdString();
    });
}

TEST_F(CorePagesTest, NothingIsCutOff)
{
    OnEveryPage([&](CGenPropertyPage& page) {
        EXPECT_LE(page.minimumSizeHint().width(), SmallestPage.width());
        EXPECT_LE(page.minimumSizeHint().height(), SmallestPage.height());
        EXPECT_LE(page.sizeHint().width(), SmallestPage.width());
        view->resize(SmallestPage + (view->size() - page.size()));
        QTest::qWait(0);
        for (const QWidget* widget : page.findChildren<QWidget*>()) {
            const auto* label = qobject_cast<const QLabel*>(widget);
            const bool text = (label && !label->wordWrap()) || qobject_cast<const QAbstractButton*>(widget) ||
                              qobject_cast<const QComboBox*>(widget) || qobject_cast<const QGroupBox*>(widget);
            if (!text || !widget->isVisible() || widget->objectName().startsWith("qt_"))
                continue;
            EXPECT_GE(widget->width(), widget->minimumSizeHint().width()) << Named(page, widget).toStdString();
            EXPECT_GE(widget->height(), widget->minimumSizeHint().height()) << Named(page, widget).toStdString();
        }
    });
}
