// Base of the pages that edit one list of locations in a grid.
#pragma once

#include "document/document.h"
#include "grid/field_columns.h"
#include "grid/gen_grid.h"
#include "grid/vector_rows.h"
#include "pages/framework/page.h"
#include "res/strings.h"

/// A text that a column has, or one line of it, in the user's language of the moment.
std::function<QString()> LineOf(Str text, int line = TextLine::Whole);
/// A text of the module in every language of the program, each spelling once.
QStringList InAllLanguages(const TextLine& line);

/// Declares the columns of a page's grid, from left to right.
class GridColumns : public FieldColumns
{
public:
    /// `globals` is the object of the row "Global"; null for a grid without one.
    explicit GridColumns(CGenGrid& grid, const void* globals = nullptr);

    GridColumns& BranchName(ColumnSpec column);
    GridColumns& Chainage(ColumnSpec column);
};

class QLabel;

class CLocationPage : public CGenPropertyPage
{
    Q_OBJECT
public:
    template <typename Record>
    CLocationPage(CKavo0_hdDoc* document, CGenParamList<Record> HD_Parameters::*list, QWidget* parent = nullptr)
        : CLocationPage(document, document->Parameters().*list, parent)
    {
    }
    CLocationPage(CKavo0_hdDoc* document, CGenList& list, QWidget* parent = nullptr);
    /// `list` may be null, and be given or exchanged later (ShowList).
    CLocationPage(CKavo0_hdDoc* document, CGenList* list, QWidget* parent = nullptr);

    CGenList* GetList() const override { return m_list; }
    void InsertLocation(const QString& riverName, const QString& chainageText) override;
    void AppendLine() override;
    void LoadFromDocument(CKavo0_hdDoc* document) override;
    void StoreToDocument() override;
    std::unique_ptr<HD_RiverPos> GetRecordAt(int row) const override;
    bool OnKillActive() override;

protected:
    /// Makes `grid` the page's grid; its columns are declared on the result.
    GridColumns Grid(CGenGrid* grid);
    /// Likewise with a first row of its own for global values, kept in the object `globals`.
    GridColumns GridWithGlobals(CGenGrid* grid, void* globals);
    /// A grid of pairs (or other lines without location), over a vector of the global values.
    template <typename T>
    GridColumns PairsGrid(CGenGrid* grid, std::vector<T>& pairs)
    {
        return AddPairs(grid, std::make_shared<VectorRows<T>>(pairs), {});
    }
    /// Likewise, for a list that always shows a row: one with the defaults when it is empty.
    template <typename T>
    GridColumns ItemsGrid(CGenGrid* grid, std::vector<T>& items)
    {
        return AddPart(grid, std::make_shared<VectorRows<T>>(items, VectorOwner{}, WhenEmpty::OneRow), {});
    }
    GridColumns RowsGrid(CGenGrid* grid, std::shared_ptr<IRowSource> rows)
    {
        return AddPart(grid, std::move(rows), {});
    }
    /// Likewise over a vector of the record whose line is current in the page's grid.
    template <typename Record, typename T>
    GridColumns PairsGrid(CGenGrid* grid, std::vector<T> Record::*pairs)
    {
        return AddPairs(grid, nullptr, [this, pairs](HD_RiverPos& record) {
            const VectorOwner owner{m_list, [list = m_list, &record] { return RowOf(*list, record); }};
            return std::make_shared<VectorRows<T>>(static_cast<Record&>(record).*pairs, owner);
        });
    }
    /// What a save makes of a table, once it has been shown.
    void AtSave(CKavo0_hdDoc::ShownRows shown) { m_atSave.push_back(std::move(shown)); }
    /// Rows of these tables that mean nothing to the simulation. A save leaves them out; `status` says so beforehand,
    /// with their number.
    struct Incomplete
    {
        CGenGrid* table;
        bool (*isIncomplete)(const void* row);
    };
    void LeaveOut(const std::vector<Incomplete>& tables, QLabel* status, Str warning, Str oneDropped, Str manyDropped);
    /// Has the user choose the file that a cell names.
    void BrowseInto(CGenGrid& grid, int row, int column, const FileKind& kind);
    /// Shows another list in the page's grid; null for none.
    void ShowList(CGenList* list);

private:
    using RowsOfLine = std::function<std::shared_ptr<IRowSource>(HD_RiverPos& current)>;
    struct Part
    {
        CGenGrid* grid;
        RowsOfLine rows;              // empty for a grid that shows the same rows all the time
        HD_RiverPos* shown = nullptr; // the line whose rows it shows
    };

    static std::size_t RowOf(const CGenList& list, const HD_RiverPos& record);
    GridColumns AddPart(CGenGrid* grid, std::shared_ptr<IRowSource> rows, RowsOfLine rowsOfLine);
    GridColumns AddPairs(CGenGrid* grid, std::shared_ptr<IRowSource> rows, RowsOfLine rowsOfLine);
    HD_RiverPos* CurrentRecord() const;
    void ShowParts();
    void Store(BlankRule rule);

    CGenList* m_list;
    void* m_globals = nullptr; // of the row "Global"
    std::vector<Part> m_parts;
    std::vector<CKavo0_hdDoc::ShownRows> m_atSave;
};
