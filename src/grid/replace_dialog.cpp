#include "grid/replace_dialog.h"

#include "grid/cell_dialogs.h"
#include "grid/find_replace.h"
#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_keys.h"
#include "grid/grid_texts.h"
#include "ks/fc/doc.h"
#include "ks/fc/plain_cell.h"

#include <QCheckBox>
#include <QDialog>
#include <QDialogButtonBox>
#include <QElapsedTimer>
#include <QFormLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTableWidget>
#include <QTimer>
#include <QUndoStack>
#include <QVBoxLayout>
#include <numeric>

namespace {

/// A table with those of its cells that are looked through.
struct Place
{
    HostTable table;
    CellBlock block;
};

CellBlock AllCells(const CGridModel& model)
{
    return {0, 0, model.StoredRows() - 1, int(model.Columns().size()) - 1};
}

class CReplaceDlg : public QDialog
{
public:
    explicit CReplaceDlg(CGenGrid& grid)
        : QDialog(grid.window()), m_grid(&grid), m_home(&grid), m_column(grid.CurrentColumn() - 1)
    {
        setWindowTitle(NameOf(GridAction::Replace));
        auto* layout = new QVBoxLayout(this);
        layout->addLayout(MakeFields());
        m_summary = new QLabel;
        m_summary->setObjectName(QStringLiteral("summary"));
        m_summary->setWordWrap(true);
        layout->addWidget(m_summary);
        layout->addWidget(MakeList(), 1);
        layout->addWidget(MakeButtons());
        m_timer.setSingleShot(true);
        connect(&m_timer, &QTimer::timeout, this, [this] { Show(); });
        m_next->setDefault(true); // of this dialog, to which it belongs by now
        resize(640, 480);
        // Beside the cells that are found, as far as the window has room.
        move(grid.window()->frameGeometry().bottomRight() - QPoint(width(), height()));
        Show();
    }

private:
    QFormLayout* MakeFields()
    {
        auto* form = new QFormLayout;
        m_find = AddField(*form, GridTexts::tr("Fi&nd:"), GridTexts::tr("Find"), "find");
        m_with = AddField(*form, GridTexts::tr("Re&place with:"), GridTexts::tr("Replace with"), "with");
        auto* hint =
            new QLabel(GridTexts::tr("Texts; of numbers 5, >3, <=3 or 2..5; \"\" for empty cells. Numbers are in "
                                     "the units shown, and may become a formula: =value*1.1"));
        hint->setWordWrap(true);
        form->addRow(hint);
        m_whole = AddChoice<QCheckBox>(*form, GridTexts::tr("&Whole cells only"), "wholeCells");
        m_case = AddChoice<QCheckBox>(*form, GridTexts::tr("&Capitals and small letters differ"), "matchCase");
        const bool hasPages = m_grid->Host() && !m_grid->Host()->TablesOfDocument().empty();
        const QString column = m_home->Model()->Column(m_column).header();
        m_inColumn = AddChoice<QRadioButton>(*form, GridTexts::tr("In the c&olumn \"%1\"").arg(column), "inColumn");
        m_inPage = AddChoice<QRadioButton>(
            *form, hasPages ? GridTexts::tr("On this pa&ge") : GridTexts::tr("In this &table"), "inPage");
        m_inDocument = AddChoice<QRadioButton>(*form, GridTexts::tr("In the whole &document"), "inDocument");
        m_inDocument->setVisible(hasPages);
        m_inColumn->setChecked(true);
        return form;
    }

    QLineEdit* AddField(QFormLayout& form, const QString& label, const QString& name, const char* objectName)
    {
        auto* field = new QLineEdit;
        field->setObjectName(QString::fromLatin1(objectName));
        field->setAccessibleName(name);
        form.addRow(label, field);
        connect(field, &QLineEdit::textChanged, this, [this] { Later(); });
        return field;
    }

    template <typename Button>
    Button* AddChoice(QFormLayout& form, const QString& text, const char* objectName)
    {
        auto* button = new Button(text);
        button->setObjectName(QString::fromLatin1(objectName));
        form.addRow(button);
        connect(button, &QAbstractButton::toggled, this, [this] { Later(); });
        return button;
    }

    QTableWidget* MakeList()
    {
        m_list = MakeResultList(GridTexts::tr("Cells found"),
                                {GridTexts::tr("Page"), GridTexts::tr("Line"), GridTexts::tr("Column"),
                                 GridTexts::tr("Now"), GridTexts::tr("Then")});
        return m_list;
    }

    QDialogButtonBox* MakeButtons()
    {
        auto* box = new QDialogButtonBox(QDialogButtonBox::Close);
        const auto add = [&](const QString& text, const char* name, void (CReplaceDlg::*act)()) {
            auto* button = box->addButton(text, QDialogButtonBox::ActionRole);
            button->setObjectName(QString::fromLatin1(name));
            connect(button, &QPushButton::clicked, this, act);
            return button;
        };
        m_next = add(GridTexts::tr("&Find Next"), "findNext", &CReplaceDlg::Next);
        m_one = add(GridTexts::tr("&Replace"), "replace", &CReplaceDlg::ReplaceOne);
        m_all = add(GridTexts::tr("Replace &All"), "replaceAll", &CReplaceDlg::ReplaceAll);
        connect(box, &QDialogButtonBox::rejected, this, &QDialog::reject);
        return box;
    }

    ReplaceQuery Query() const { return {m_find->text(), m_with->text(), m_whole->isChecked(), m_case->isChecked()}; }

    std::vector<Place> Places() const
    {
        if (m_inColumn->isChecked() || !m_home->Host()) {
            CellBlock block = AllCells(*m_home->Model());
            block.left = block.right = m_column;
            return {{{{}, m_home}, block}};
        }
        std::vector<Place> places;
        for (HostTable& table :
             m_inDocument->isChecked() ? m_home->Host()->TablesOfDocument() : m_home->Host()->TablesOfPage(*m_home))
            places.push_back({table, AllCells(*table.grid->Model())});
        return places;
    }

    /// While somebody types nothing of a million cells is computed.
    void Later()
    {
        if (m_next)                   // it is there when the fields are
            m_next->setEnabled(true); // whoever presses it at once means what he has typed
        m_timer.start(m_takesLong ? 400 : 50);
    }

    void Show()
    {
        m_timer.stop();
        QElapsedTimer time;
        time.start();
        std::size_t found = 0, changed = 0;
        bool isFiltered = false;
        m_list->setRowCount(0);
        for (const Place& place : Places()) {
            const CReplaced replaced = ReplaceCells(*place.table.grid->Model(), place.block, Query());
            found += replaced.found;
            changed += replaced.results.ChangedCount();
            isFiltered = isFiltered || place.table.grid->Model()->Shown().IsFiltered();
            List(place, replaced.results.Changed(), QString());
            List(place, replaced.results.Kept(), GridTexts::tr("stays: %1"));
        }
        m_list->setColumnHidden(0, !m_inDocument->isChecked());
        m_list->resizeColumnsToContents();
        m_takesLong = time.elapsed() > 50;
        ShowSummary(found, changed, isFiltered);
    }

    void ShowSummary(std::size_t found, std::size_t changed, bool isFiltered)
    {
        QString text =
            found == 0
                ? GridTexts::tr("Nothing found.")
                : GridTexts::Counted(found, GridTexts::tr("1 cell found"), GridTexts::tr("%1 cells found")) +
                      QStringLiteral("; ") +
                      GridTexts::Counted(changed, GridTexts::tr("1 would change."), GridTexts::tr("%1 would change."));
        if (found == 0 && IsNoCondition())
            text += u' ' + GridTexts::tr("Of numbers a condition is 5, >3, <=3, 2..7, =4 or !=4.");
        if (isFiltered)
            text += u' ' + GridTexts::tr("Lines that a filter hides are left alone.");
        m_summary->setText(text);
        const CKsDoc* const document = m_grid->Model()->Document();
        const bool may = document && !document->IsReadOnly() && changed > 0;
        m_next->setEnabled(found > 0);
        m_one->setEnabled(may);
        m_all->setEnabled(may);
    }

    /// The text begins as a condition on numbers, and is none for any column of them.
    bool IsNoCondition() const
    {
        const ReplaceQuery query = Query();
        const QString text = query.find.trimmed();
        bool areNumbers = false;
        if (text.isEmpty() || !(QStringView(u"<>=!").contains(text.front()) || text.contains(QStringLiteral(".."))))
            return false;
        for (const Place& place : Places())
            for (int column = place.block.left; column <= place.block.right; ++column) {
                const ColumnSpec& spec = place.table.grid->Model()->Column(column);
                areNumbers = areNumbers || spec.IsNumeric();
                if (spec.IsNumeric() && CellFinder(spec, query))
                    return false;
            }
        return areNumbers;
    }

    void List(const Place& place, const std::vector<CCellResults::Cell>& cells, const QString& reason)
    {
        const CGridModel& model = *place.table.grid->Model();
        for (const CCellResults::Cell& cell : cells) {
            const int row = m_list->rowCount();
            m_list->insertRow(row);
            const QString texts[] = {place.table.page,
                                     model.headerData(cell.row, Qt::Vertical, Qt::DisplayRole).toString(),
                                     model.Column(cell.column).header(), cell.before,
                                     reason.isEmpty() ? cell.after : reason.arg(cell.after)};
            for (int column = 0; column < m_list->columnCount(); ++column)
                m_list->setItem(row, column, PlainCell(texts[column]));
        }
    }

    /// Goes on behind the current cell, row by row and table by table; behind the last one from the first.
    void Next()
    {
        const std::vector<Place> places = Places();
        std::size_t first = 0;
        while (first + 1 < places.size() && places[first].table.grid != m_grid)
            ++first;
        for (std::size_t i = 0; i <= places.size(); ++i) {
            const Place& place = places[(first + i) % places.size()];
            const bool isStart = i == 0 && place.table.grid == m_grid;
            const auto cell = FirstFound(place, isStart ? m_grid->CurrentRow() - 1 : place.block.top,
                                         isStart ? m_grid->CurrentColumn() : place.block.left);
            if (!cell)
                continue;
            if (place.table.show && !place.table.show())
                return;
            m_grid = place.table.grid;
            m_grid->clearSelection();
            m_grid->SetCurrentCell(cell->first + 1, cell->second + 1);
            return;
        }
    }

    std::optional<std::pair<int, int>> FirstFound(const Place& place, int row, int column) const
    {
        const CGridModel& model = *place.table.grid->Model();
        const ReplaceQuery query = Query();
        std::vector<std::function<bool(const CellValue&)>> finders;
        for (int each = place.block.left; each <= place.block.right; ++each)
            finders.push_back(
                query.IsFormula() && !model.Column(each).IsNumeric() ? nullptr : CellFinder(model.Column(each), query));
        for (row = std::max(row, place.block.top); row <= place.block.bottom; ++row, column = place.block.left)
            for (; column <= place.block.right; ++column)
                if (const auto& finds = finders[std::size_t(column - place.block.left)];
                    finds && finds(model.Value(row, column)))
                    return std::pair(row, column);
        return std::nullopt;
    }

    /// The current cell, if it is one of those found; then the next one.
    void ReplaceOne()
    {
        const int row = m_grid->CurrentRow() - 1, column = m_grid->CurrentColumn() - 1;
        const auto isAmong = [&](const Place& place) { // the scope may have changed since it was found
            return place.table.grid == m_grid && column >= place.block.left && column <= place.block.right;
        };
        if (row >= 0 && row < m_grid->Model()->StoredRows() && std::ranges::any_of(Places(), isAmong) &&
            !Make({{{{}, m_grid}, {row, column, row, column}}}))
            return;
        Next();
        Show();
    }

    void ReplaceAll()
    {
        if (Make(Places()))
            Show();
    }

    /// One step, over however many tables. False when the rows together refuse it; the summary says why then.
    bool Make(const std::vector<Place>& places)
    {
        CKsDoc& document = *m_grid->Model()->Document();
        if (!document.MayChange())
            return true;
        std::vector<CCellResults> all;
        for (const Place& place : places) {
            all.push_back(ReplaceCells(*place.table.grid->Model(), place.block, Query()).results);
            if (const QString fault = all.back().RuleFault(); !fault.isEmpty()) {
                m_summary->setText(GridTexts::tr("Nothing was replaced. %1").arg(fault));
                return false;
            }
        }
        const auto add = [](std::size_t sum, const CCellResults& each) { return sum + each.ChangedCount(); };
        const std::size_t changed = std::accumulate(all.begin(), all.end(), std::size_t(0), add);
        if (changed == 0)
            return true;
        document.UndoStack().beginMacro(NameOf(GridAction::Replace));
        for (std::size_t i = 0; i < all.size(); ++i)
            if (all[i].ChangedCount() > 0)
                places[i].table.grid->Model()->ChangeCells(NameOf(GridAction::Replace), all[i].FirstRow(),
                                                           all[i].TakeChanges());
        document.UndoStack().endMacro();
        document.Say(GridTexts::Counted(changed, GridTexts::tr("1 cell changed"), GridTexts::tr("%1 cells changed")));
        if (m_grid->Host())
            m_grid->Host()->LineEdited(*m_grid);
        m_grid->Reload();
        return true;
    }

    CGenGrid* m_grid; // in which the last cell was found
    CGenGrid* m_home; // from which it was asked
    int m_column;
    QLineEdit *m_find = nullptr, *m_with = nullptr;
    QCheckBox *m_whole = nullptr, *m_case = nullptr;
    QRadioButton *m_inColumn = nullptr, *m_inPage = nullptr, *m_inDocument = nullptr;
    QLabel* m_summary = nullptr;
    QTableWidget* m_list = nullptr;
    QPushButton *m_next = nullptr, *m_one = nullptr, *m_all = nullptr;
    QTimer m_timer;
    bool m_takesLong = false;
};

} // namespace

void FindAndReplace(CGenGrid& grid)
{
    CReplaceDlg(grid).exec();
}
