// A page in an active window, hosted as the program's view hosts it, with recorded calls and message boxes.
#pragma once

#include "ks/fc/message_box.h"
#include "open_editor.h"
#include "pages/framework/location_page.h"

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QComboBox>
#include <QTest>
#include <QUndoStack>
#include <QVBoxLayout>
#include <gtest/gtest.h>

class TestView : public CView, public IPageHost
{
public:
    TestView(CKavo0_hdDoc& doc, CGenPropertyPage* hosted) : document(doc), page(hosted)
    {
        (new QVBoxLayout(this))->addWidget(page);
        other = new QLineEdit(this);
        layout()->addWidget(other);
        page->SetHost(this);
        document.AddView(this);
        QObject::connect(&document, &CKavo0_hdDoc::Reveal, this, [this](const ChangePlace& place) {
            revealed << (place.list ? place.listRow : place.row);
            if (page->Shows(place))
                page->Reveal(place, true);
        });
        resize(500, 500);
        show();
        activateWindow();
        EXPECT_TRUE(QTest::qWaitForWindowActive(this));
        page->OnSetActive();
    }
    void OnUpdate(CView*, int hint, CHint*) override
    {
        if (hint == CKsDoc::StoreHint)
            page->StoreToDocument();
        else
            page->LoadFromDocument(&document);
    }
    CView* HostView() override { return this; }
    void EditedLineChanged() override
    {
        ++edited;
        page->StoreToDocument();
        document.UpdateAllViews(nullptr, CKsDoc::ReloadHint);
    }
    void CurrentLocationChanged() override { locations << page->GetGrid()->CurrentRow(); }
    void Execute(int command) override
    {
        commands << command;
        if (command == Command::InsertLine)
            page->AppendLine();
        else if (command == Command::DeleteLine)
            page->DeleteLines();
    }
    QStringList BranchNames() override { return branches; }
    void EnableLinesMenu(bool enable) override { linesMenu = enable; }

    CKavo0_hdDoc& document;
    CGenPropertyPage* page;
    QLineEdit* other; // something else to focus
    int edited = 0;   // lines
    QList<int> locations, commands, revealed;
    QStringList branches;
    bool linesMenu = false;
};

/// A page on any list, a column for every single field of its family.
class FamilyPage : public CLocationPage
{
public:
    FamilyPage(CKavo0_hdDoc* document, CGenList& list) : CLocationPage(document, list)
    {
        auto* grid = new CGenGrid;
        (new QVBoxLayout(this))->addWidget(grid);
        auto columns = Grid(grid);
        columns.BranchName({}).Chainage({});
        for (const Field& field : list.Fields())
            if (field.kind != FieldKind::Group)
                columns.Value(field,
                              {.header = [name = std::string(field.name)] { return QString::fromStdString(name); }});
    }
};

/// The parts of a page that a user works with, without those that they are made of.
inline QList<QWidget*> Controls(const QWidget& page)
{
    QList<QWidget*> controls;
    for (QWidget* widget : page.findChildren<QWidget*>()) {
        const bool control = qobject_cast<QLineEdit*>(widget) || qobject_cast<QComboBox*>(widget) ||
                             qobject_cast<QAbstractButton*>(widget) || qobject_cast<QAbstractItemView*>(widget);
        const bool isPart = controls.contains(widget->parentWidget()) || widget->window() != page.window();
        if (control && !isPart && !widget->objectName().startsWith("qt_"))
            controls << widget;
    }
    return controls;
}

/// What the cells of a line show, with a bar between them. It equals the texts of its first columns: others may be
/// added behind them.
struct LineTexts : QString
{
    bool operator==(const char* first) const
    {
        const QString expected = QString::fromUtf8(first);
        return section('|', 0, int(expected.count('|'))) == expected;
    }
    friend void PrintTo(const LineTexts& texts, std::ostream* out) { *out << texts.toStdString(); }
};

class PageTest : public testing::Test
{
protected:
    PageTest()
    {
        KsSetMessageBoxHandler([this](const CString& text, QMessageBox::StandardButtons) {
            boxes << text;
            return answer;
        });
    }
    ~PageTest() override
    {
        KsSetMessageBoxHandler({});
        KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    }
    /// Shows a page of the sheet; it lives as long as the test.
    CGenPropertyPage& Open(std::unique_ptr<CGenPropertyPage> (*make)(CKavo0_hdDoc*))
    {
        auto* page = make(&document).release();
        view = std::make_unique<TestView>(document, page);
        grid = page->GetGrid();
        return *page;
    }
    /// Likewise a page of the test's own.
    template <typename Page, typename... Args>
    Page& Open(Args&&... args)
    {
        auto* page = new Page(&document, std::forward<Args>(args)...);
        view = std::make_unique<TestView>(document, page);
        grid = page->GetGrid();
        return *page;
    }
    HD_Initial& Add(const char* name, double chainage, double h = 0, double q = 0)
    {
        HD_Initial record;
        record.RiverName = name;
        record.Chainage = chainage;
        record.InitialH = h;
        record.InitialQ = q;
        return init.Add(record);
    }
    LineTexts Texts(int row) const
    {
        QStringList texts;
        for (int column = 1; column <= grid->ColumnCount(); ++column)
            texts << grid->TextAt(row, column);
        return {texts.join('|')};
    }
    /// The records of "InitList" to the last bit.
    QString Stored() const
    {
        QStringList rows;
        for (std::size_t i = 0; i < init.GetCount(); ++i) {
            const HD_Initial& r = init.GetAt(i);
            rows << QString("%1 %2 %3 %4")
                        .arg(QString::fromStdString(r.RiverName))
                        .arg(KsShortestNumber(r.Chainage), KsShortestNumber(r.InitialH), KsShortestNumber(r.InitialQ));
        }
        return rows.join(", ");
    }
    /// Types into the cell as a user does: the first key opens the editor.
    void Type(int row, int column, const char* text)
    {
        grid->setFocus();
        grid->SetCurrentCell(row, column);
        if (*text) {
            QTest::keyClick(grid, text[0], text[0] == '+' ? Qt::ShiftModifier : Qt::NoModifier);
            ASSERT_TRUE(Editor());
            QTest::keyClicks(Editor(), text + 1);
        } else {
            QTest::keyClick(grid, Qt::Key_F2);
            ASSERT_TRUE(Editor());
            QTest::keyClick(Editor(), Qt::Key_A, Qt::ControlModifier);
            QTest::keyClick(Editor(), Qt::Key_Backspace);
        }
    }
    void Enter(int row, int column, const char* text)
    {
        Type(row, column, text);
        QTest::keyClick(Editor(), Qt::Key_Return);
    }
    QWidget* Editor() const { return OpenEditor(*grid); }
    std::pair<int, int> Current() const { return {grid->CurrentRow(), grid->CurrentColumn()}; }
    void SelectRows(int first, int last) { grid->SelectLines(first, last); }

    CKavo0_hdDoc document;
    CGenParamList<HD_Initial>& init = document.Parameters().InitList;
    HD_Global_Var& globals = document.Parameters().Global;
    QStringList boxes;
    QMessageBox::StandardButton answer = QMessageBox::Ok; // to every box
    std::unique_ptr<TestView> view;
    CGenGrid* grid = nullptr;
};
