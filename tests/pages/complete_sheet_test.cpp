// The sheet as a whole against the declared tables of the file: nothing is lost by a visit, nothing is out of reach.
#include "page_fixture.h"

#include "data/hd_file.h"
#include "data/hd_support.h"
#include "grid/cell_operations.h"
#include "ks/fc/file_dialog.h"
#include "ks/units/edit_fields.h"
#include "ks/units/formula.h"
#include "pages/framework/ctrl_edit.h"
#include "pages/framework/date_time_edit.h"
#include "pages/page_table.h"

#include <QCheckBox>
#include <QLabel>
#include <QLocale>
#include <QRadioButton>
#include <QRegularExpression>
#include <QTemporaryDir>
#include <numeric>
#include <set>

namespace {

/// A value that differs from the default, and that a page can show and take.
void Change(const Field& field, void* object, int& seed)
{
    ++seed;
    Visit(field, object,
          Overloads{[&](double& value) { value += 0.25 + seed; },
                    [&](std::int32_t& value) { value = !field.choices ? value + seed
                                                       : value == 1   ? 2
                                                                      : 1; },
                    [](bool& value) { value = !value; },
                    [&](std::string& value) { value = "TEXT " + std::to_string(seed); },
                    [&](HDDateTime& value) { value = {2000 + seed, 2, 28, 23, 59, 1}; },
                    [&](GroupValue<void> group) {
                        group.Renew(2);
                        for (std::size_t i = 0; i < group.size(); ++i)
                            for (const Field& element : group.Elements())
                                Change(element, group[i], seed);
                    }});
}

/// Every value of every section is another one than in a new file, and the same whatever other sections there are.
void ChangeEverything(HD_Parameters& parameters)
{
    const auto seedOf = [](std::string_view name) { return std::accumulate(name.begin(), name.end(), 0) % 100; };
    ForEachGlobal([&](const std::string& name, FieldList fields) {
        int seed = seedOf(name);
        for (const Field& field : fields)
            Change(field, &parameters.Global, seed);
    });
    parameters.EncroachList.Add();
    ForEachList(parameters, parameters, [&](const char* name, CGenList& list, CGenList&) {
        int seed = seedOf(name);
        for (int line = 0; line < 2; ++line) {
            HD_RiverPos& record = list.AddTail(list.NewRecord());
            record.RiverName = "RIVER " + std::to_string(++seed);
            record.Chainage = seed;
            for (const Field& field : list.Fields())
                Change(field, &record, seed);
        }
    });
    // What an increment, a map or a period needs so that its other cells are open.
    parameters.Global.MapOutput.MapOutputFiles[0].Type = 2;
    parameters.Global.MapOutput.MapOutputFiles[0].Item = 4;
    parameters.Global.BedResist.Method = 9; // what no method is called uses all of its values
}

/// "Section/keyword parameter", for a line of a file's text. Lists of lines are one name: the first line stands for
/// all.
class Places
{
public:
    explicit Places(const QStringList& lines)
    {
        QStringList sections;
        for (const QString& line : lines) {
            const QString text = line.trimmed();
            if (text.startsWith("[/") && !sections.isEmpty())
                sections.removeLast();
            else if (text.startsWith('['))
                sections << text.mid(1, text.size() - 2);
            m_names << (text.contains(" = ") ? sections.mid(1).join('/') + '/' + text.section(" = ", 0, 0) : QString());
        }
    }
    /// Names of the parameters that differ between two texts of as many lines.
    static std::set<QString> Differences(const QStringList& before, const QStringList& after)
    {
        std::set<QString> changed;
        if (before.size() != after.size())
            return changed;
        const Places places(before);
        for (qsizetype line = 0; line < before.size(); ++line) {
            if (before[line] == after[line])
                continue;
            const QStringList old = Parameters(before[line]), now = Parameters(after[line]);
            for (qsizetype i = 0; i < std::min(old.size(), now.size()); ++i)
                if (old[i] != now[i])
                    changed.insert(Name(places.m_names[line], i));
        }
        return changed;
    }
    static std::set<QString> All(const QStringList& lines)
    {
        std::set<QString> all;
        const Places places(lines);
        for (qsizetype line = 0; line < lines.size(); ++line)
            for (qsizetype i = 0; !places.m_names[line].isEmpty() && i < Parameters(lines[line]).size(); ++i)
                all.insert(Name(places.m_names[line], i));
        return all;
    }

private:
    static QStringList Parameters(const QString& line) { return line.section(" = ", 1).split(", "); }
    static QString Name(const QString& keyword, qsizetype parameter)
    {
        return QString("%1 %2").arg(keyword).arg(parameter + 1);
    }
    QStringList m_names;
};

} // namespace

/// What a user sees of a control, or of the columns of a table: a line each, "what it is called | its tool tip | what
/// stands there".
QStringList ShownBy(const QWidget& control, const QWidget& page)
{
    const auto line = [](QStringList parts) { return "  " + parts.replaceInStrings("\n", "; ").join(" | "); };
    if (const auto* table = qobject_cast<const CGenGrid*>(&control)) {
        QStringList lines{"  " + table->accessibleName()};
        const QAbstractItemModel& model = *table->model();
        for (int column = 0; column < model.columnCount(); ++column)
            lines << "  " + line({model.headerData(column, Qt::Horizontal).toString(),
                                  model.headerData(column, Qt::Horizontal, Qt::ToolTipRole).toString(),
                                  table->TextAt(1, column + 1)});
        return lines;
    }
    QString name = control.accessibleName(), text;
    for (const QLabel* label : page.findChildren<QLabel*>())
        if (label->buddy() == &control)
            name = label->text();
    if (const auto* button = qobject_cast<const QAbstractButton*>(&control)) {
        name += button->text();
        text = button->isChecked() ? "x" : "";
    } else if (const auto* list = qobject_cast<const QComboBox*>(&control)) {
        text = list->currentText();
    } else if (const auto* field = qobject_cast<const QLineEdit*>(&control)) {
        text = field->text();
    }
    return {line({name, control.toolTip(), text})};
}

class CompleteSheetTest : public PageTest
{
protected:
    CompleteSheetTest()
    {
        KsSetFileDialogHandler([](const KsFileQuestion&) { return CString(); });
        HD_Parameters parameters;
        ChangeEverything(parameters);
        EXPECT_TRUE(SaveHDFile(parameters, Path("all.HDKV"), {.everySet = true}));
        EXPECT_TRUE(document.OnOpenDocument(QString::fromStdString(Path("all.HDKV"))));
    }
    ~CompleteSheetTest() override { KsSetFileDialogHandler({}); }
    std::string Path(const char* name) const { return folder.filePath(name).toStdString(); }
    QStringList Lines() const { return QString::fromStdString(HDFileText(document.Parameters(), true)).split('\n'); }
    void Show(const PageEntry& entry)
    {
        CGenPropertyPage* page = entry.make(&document).release();
        view = std::make_unique<TestView>(document, page);
    }
    /// Does something to the page, and notes which parameters of the file that changed.
    template <typename Act>
    std::set<QString> Try(Act act)
    {
        const QStringList before = Lines();
        act();
        const std::set<QString> changed = Places::Differences(before, Lines());
        reached.insert(changed.begin(), changed.end());
        if (!boxes.isEmpty()) { // a range: the field keeps what it had
            boxes.clear();
            QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
        }
        return changed;
    }
    /// Likewise of a control: it changes its own keyword, in one step, which can be undone. What it takes along is in
    /// one keyword with it, or in its section.
    template <typename Act>
    void TryControl(const QWidget& control, Act act)
    {
        SCOPED_TRACE(QString("%1 %2").arg(view->page->metaObject()->className(), control.objectName()).toStdString());
        QUndoStack& steps = document.UndoStack();
        const QStringList before = Lines();
        const int index = steps.index();
        std::set<QString> sections;
        for (const QString& name : Try(act))
            sections.insert(name.section('/', 0, -2));
        const QStringList after = Lines();
        EXPECT_EQ(steps.index(), index + (before != after));
        EXPECT_LE(sections.size(), 1u);
        if (steps.index() == index)
            return;
        EXPECT_TRUE(document.IsModified());
        steps.undo();
        EXPECT_TRUE(Lines() == before);
        steps.redo();
        EXPECT_TRUE(Lines() == after);
    }
    void TypeInto(QLineEdit& field, const char* text)
    {
        field.setFocus();
        field.selectAll();
        QTest::keyClicks(&field, text);
        QTest::keyClick(&field, Qt::Key_Tab);
        QTest::qWait(0);
        view->page->OnKillActive(); // integers wait for the page
    }
    void DriveControls(QWidget& page, bool backwards)
    {
        for (auto* field : page.findChildren<QLineEdit*>())
            if (field->isEnabled() && field->isVisible() && !qobject_cast<QComboBox*>(field->parent()))
                for (const char* text : {"0.5", "3", "2031-01-02 03:04:05", "TYPED"})
                    TryControl(*field, [&] { TypeInto(*field, text); });
        for (auto* list : page.findChildren<QComboBox*>())
            if (list->isEnabled() && list->isVisible())
                TryControl(*list, [&] { QTest::keyClick(list, list->currentIndex() > 0 ? Qt::Key_Up : Qt::Key_Down); });
        auto buttons = page.findChildren<QAbstractButton*>();
        if (backwards)
            std::reverse(buttons.begin(), buttons.end());
        for (auto* button : buttons)
            if (button->isEnabled() && button->isVisible() &&
                (qobject_cast<QCheckBox*>(button) || qobject_cast<QRadioButton*>(button)))
                TryControl(*button, [&] { button->click(); });
    }
    void Set(CGenGrid& cells, int row, int column, const QString& text)
    {
        CGridModel& model = *cells.Model();
        if (model.flags(model.index(row, column)) & Qt::ItemIsEditable)
            model.setData(model.index(row, column), text, Qt::EditRole);
        else
            cells.ActOn(row + 1, column + 1);
        view->page->StoreToDocument();
    }
    void DriveCells(CGenGrid& cells)
    {
        const CGridModel& model = *cells.Model();
        // One entry of the lists after the other, because they lock other cells.
        const bool hasLists = std::any_of(model.Columns().begin(), model.Columns().end(),
                                          [](const ColumnSpec& column) { return bool(column.choices.entries); });
        for (int entry = 0; entry < (hasLists ? 8 : 1); ++entry)
            for (int row = 0; row < std::min(model.rowCount(), 2); ++row)
                for (int column = 0; column < model.columnCount(); ++column) {
                    const Choices& choices = model.Columns()[std::size_t(column)].choices;
                    const QStringList entries = choices.entries ? choices.entries() : QStringList();
                    if (!entries.isEmpty())
                        Try([&] { Set(cells, row, column, entries[entry % entries.size()]); });
                    else
                        for (const char* text : {"0.5", "3", "2031-01-02 03:04:05", "TYPED"})
                            Try([&] { Set(cells, row, column, text); });
                }
    }

    QTemporaryDir folder;
    std::set<QString> reached;
};

TEST_F(CompleteSheetTest, VisitingAndSavingEverythingKeepsTheFile)
{
    const std::string before = ReadText(Path("all.HDKV"));
    for (const PageEntry& entry : PageTable()) {
        Show(entry);
        SCOPED_TRACE(view->page->metaObject()->className());
        for (const auto system : {KsUnitSystem::UsCustomary, KsUnitSystem::Metric}) {
            KsUnits::Instance().SetSystem(system);
            view->page->LoadFromDocument(&document);
        }
        EXPECT_TRUE(view->page->OnKillActive());
        ASSERT_EQ(HDFileText(document.Parameters(), true), before);
    }
    EXPECT_FALSE(document.IsModified());
    ASSERT_TRUE(document.OnSaveDocument(document.GetPathName().isEmpty() ? folder.filePath("all.HDKV")
                                                                         : document.GetPathName()));
    EXPECT_EQ(ReadText(Path("all.HDKV")), before);
    EXPECT_EQ(boxes, QStringList());
}

// Titles, units, digits, order, and what a line that an empty table offers has of the global values.
TEST_F(CompleteSheetTest, ThePagesShowWhatIsRecorded)
{
    QLocale::setDefault(QLocale(QLocale::English, QLocale::UnitedStates));
    QStringList shown;
    for (const char* tables : {"with lines", "empty"}) {
        for (const PageEntry& entry : PageTable()) {
            Show(entry);
            shown << LoadString(entry.caption) + ", tables " + tables;
            for (const QWidget* control : Controls(*view->page))
                if (qobject_cast<const CGenGrid*>(control) || document.Parameters().InitList.GetCount())
                    shown << ShownBy(*control, *view->page);
        }
        document.Parameters().RemoveAllRecords();
    }
    QLocale::setDefault(QLocale::system());
    ExpectRecorded(shown.join('\n').toStdString() + '\n', KVR_SOURCE_DIR "/tests/corpus/pages.txt");
}

TEST_F(CompleteSheetTest, EveryFieldAndColumnSaysWhatItMeans)
{
    const auto means = [](const QString& tip) { // in front of the facts
        static const QRegularExpression facts("^(Full value|Unit|Range|Default|New lines|In the file): ");
        return !tip.isEmpty() && !tip.contains(facts) && tip.contains("\nIn the file: ");
    };
    const QStringList noValues = {"nodeCompatibility_1025", "setup_1341"};
    for (const PageEntry& entry : PageTable()) {
        Show(entry);
        for (const QWidget* control : Controls(*view->page)) {
            SCOPED_TRACE(
                QString("%1 %2").arg(view->page->metaObject()->className(), control->objectName()).toStdString());
            const auto* table = qobject_cast<const CGenGrid*>(control);
            const bool holdsNone = control->inherits("QPushButton") || control->inherits("QToolButton") ||
                                   noValues.contains(control->objectName());
            EXPECT_TRUE(table || holdsNone || means(control->toolTip())) << control->toolTip().toStdString();
            for (int column = 0; table && column < table->model()->columnCount(); ++column) {
                const QString tip = table->model()->headerData(column, Qt::Horizontal, Qt::ToolTipRole).toString();
                EXPECT_TRUE(table->Model()->Columns()[std::size_t(column)].Kind() == CellKind::Button || means(tip))
                    << tip.toStdString();
            }
        }
    }
}

TEST_F(CompleteSheetTest, EveryTableHasNamesForFormulas)
{
    ChangeEverything(document.Parameters());
    for (const PageEntry& entry : PageTable()) {
        Open(entry.make);
        for (const auto* table : view->page->findChildren<CGenGrid*>()) {
            const FormulaNames names = NamesForFormula(*table->Model());
            for (const QString& name : names.names)
                EXPECT_EQ(CKsFormula(name + "*2", names.names).Fault().toStdString(), "") << name.toStdString();
        }
    }
}

TEST_F(CompleteSheetTest, EveryValueCanBeChangedOnSomePage)
{
    const std::set<QString> all = Places::All(Lines());
    for (const PageEntry& entry : PageTable()) {
        // Several times, because switches open and lock the rest; a switch stands before what it opens.
        for (const bool backwards : {true, false, true, true}) {
            Show(entry);
            const auto grids = view->page->findChildren<CGenGrid*>();
            for (auto* cells : grids)
                DriveCells(*cells);
            for (auto* cells : grids) {
                cells->setFocus();
                Try([&] { view->page->AppendLine(); });
            }
            DriveControls(*view->page, backwards);
        }
    }
    // What no page shows, so that it is carried through.
    const std::set<QString> carried = {
        "Add_Output/ReducedOut", "Add_Output/Topo_print",     "Add_Output/Coef_print",     "Add_Output/Test_print",
        "Defalt_Values/spilfc",  "Defalt_Values/storfc",      "Global_Values/G_S_max",     "Global_Values/G_f",
        "Global_Values/G_k_100", "Global_Values/G_min_width", "MapOutput/AddToCalculation"};
    QStringList missed;
    for (const QString& name : all) {
        const QString keyword = name.section(' ', 0, 0).remove("Global_Variables/");
        if (!reached.contains(name) && !carried.contains(keyword) &&
            keyword + name.section(' ', 1) != "MapOutput/MapOutputFiles/data7")
            missed << name;
    }
    EXPECT_EQ(missed.join('\n').toStdString(), "");
}
