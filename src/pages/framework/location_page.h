// Base of the pages that edit one list of locations in a grid.
#pragma once

#include "module/document.h"
#include "pages/framework/gen_grid.h"
#include "pages/framework/page.h"
#include "pages/framework/vector_rows.h"
#include "res/strings.h"

/// What a column says about itself beyond its field.
struct ColumnOptions
{
    std::function<QString()> header = {}; // by default the text of `caption`
    Str caption = Str::RiverName;
    int width = 72;
    const char* format = "%-lf";
    bool asFormatted = false;     // numbers stand in `format`, not with three decimals
    const double* fill = nullptr; // see ColumnSpec
    bool emptyIsNotGiven = false;
    std::function<bool(const HD_RiverPos& record)> locked = {};
    std::optional<Str> choices = {};        // entries of a drop-down column, one a line of the text
    Choices choice = {};                    // the rest of a drop-down column; its entries come from `choices`
    std::function<QString()> unitText = {}; // see ColumnSpec
    std::function<QString()> hint = {};     // see ColumnSpec
    LocationValue locationValue = LocationValue::None;
};

/// Declares the columns of a grid, from left to right.
class GridColumns
{
public:
    explicit GridColumns(CGenGrid& grid) : m_grid(grid) {}

    GridColumns& BranchName(ColumnOptions options);
    GridColumns& Chainage(ColumnOptions options);
    /// A declared field of the records; its unit is that of the declaration.
    GridColumns& Value(const Field& field, ColumnOptions options);
    template <typename Record, typename T>
    GridColumns& Value(T Record::*member, ColumnOptions options)
    {
        return Value(FieldOf(member), std::move(options));
    }

private:
    template <typename Record, typename T>
    static const Field& FieldOf(T Record::*member)
    {
        static Record record;
        for (const Field& field : Record::DeclaredFields())
            if (field.address(static_cast<HD_RiverPos*>(&record)) == &(record.*member))
                return field;
        Q_UNREACHABLE(); // a member that is no parameter of the file
    }
    GridColumns& Add(int control, const Field& field, ColumnOptions options);

    CGenGrid& m_grid;
};

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
    /// A grid of pairs (or other lines without location), over a vector of the global values.
    template <typename T>
    GridColumns PairsGrid(CGenGrid* grid, std::vector<T>& pairs)
    {
        return AddPart(grid, std::make_shared<VectorRows<T>>(*GetDocument(), pairs), {});
    }
    /// Likewise over a vector of the record whose line is current in the page's grid.
    template <typename Record, typename T>
    GridColumns PairsGrid(CGenGrid* grid, std::vector<T> Record::*pairs)
    {
        return AddPart(grid, nullptr, [this, pairs](HD_RiverPos& record) {
            return std::make_shared<VectorRows<T>>(*GetDocument(), static_cast<Record&>(record).*pairs,
                                                   VectorOwner{m_list, &record});
        });
    }
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

    GridColumns AddPart(CGenGrid* grid, std::shared_ptr<IRowSource> rows, RowsOfLine rowsOfLine);
    HD_RiverPos* CurrentRecord() const;
    void ShowParts();
    void Store(BlankRule rule);

    CGenList* m_list;
    std::vector<Part> m_parts;
};
