#include "grid/row_commands.h"

#include "grid/grid_texts.h"
#include "grid/line_origin.h"

#include <QUndoStack>
#include <algorithm>

ChangePlace PlaceOf(const IRowSource& rows, std::size_t row, int column)
{
    row = std::min(row, std::max<std::size_t>(rows.Count(), 1) - 1);
    return {rows.Data(), int(row) + 1, column, rows.List(), int(rows.ListRow(row)) + 1};
}

namespace {

template <typename Change>
class CRowCommand : public CDocumentCommand
{
public:
    CRowCommand(CKsDoc& document, const QString& text, Change change)
        : CDocumentCommand(document, text), m_step(std::make_shared<Step>(std::move(change)))
    {
    }
    ~CRowCommand() override
    {
        if constexpr (requires { m_step->change.block; })
            m_step->change.block.reset(); // nobody puts them back any more
    }

protected:
    ChangePlace Apply() override { return m_step->change.Apply(); }
    ChangePlace Revert() override { return m_step->change.Revert(); }
    std::shared_ptr<const KsLineChange> LineChange() const override { return m_step; }

private:
    struct Step : KsLineChange
    {
        explicit Step(Change made) : change(std::move(made)) {}
        void TakeBack(KsTracedLine& line, bool forward) const override { change.TakeBack(line, forward); }

        Change change;
    };
    std::shared_ptr<Step> m_step;
};

template <typename Change>
void Push(CKsDoc& document, const QString& text, Change change)
{
    document.UndoStack().push(new CRowCommand<Change>(document, text, std::move(change)));
}

struct Lines
{
    std::shared_ptr<IRowSource> rows;
    std::size_t row, count;
    std::unique_ptr<IRowBlock> block = {}; // while they are not in the list

    ChangePlace Put()
    {
        row = rows->Put(row, std::move(block));
        return PlaceOf(*rows, row);
    }
    ChangePlace Hold(std::unique_ptr<IRowBlock> taken)
    {
        block = std::move(taken);
        ChangePlace place = PlaceOf(*rows, row);
        place.isGone = true;
        return place;
    }
    void CarryBack(KsTracedLine& line, bool put) const
    {
        ::CarryBack(line, *rows, [this, put](std::size_t at) -> std::optional<std::size_t> {
            if (at < row)
                return at;
            if (!put)
                return at + count;
            return at < row + count ? std::nullopt : std::optional(at - count);
        });
    }
};
struct Insertion : Lines
{
    ChangePlace Apply() { return Put(); }
    ChangePlace Revert() { return Hold(rows->TakeBack(row, count)); }
    void TakeBack(KsTracedLine& line, bool forward) const { CarryBack(line, forward); }
};
struct Deletion : Lines
{
    ChangePlace Apply() { return Hold(rows->Take(row, count)); }
    ChangePlace Revert() { return Put(); }
    void TakeBack(KsTracedLine& line, bool forward) const { CarryBack(line, !forward); }
};

struct Movement
{
    std::shared_ptr<IRowSource> rows;
    std::size_t from, to, row, rowAfter;

    ChangePlace Apply()
    {
        rows->Move(from, to);
        return PlaceOf(*rows, rowAfter);
    }
    ChangePlace Revert()
    {
        rows->Move(to, from);
        return PlaceOf(*rows, row);
    }
    void TakeBack(KsTracedLine& line, bool forward) const
    {
        const std::size_t was = forward ? from : to, is = forward ? to : from;
        CarryBack(line, *rows, [was, is](std::size_t at) {
            const bool passed = at != is && at >= std::min(was, is) && at <= std::max(was, is);
            return std::optional(at == is ? was : !passed ? at : was < is ? at + 1 : at - 1);
        });
    }
};

struct Arrangement
{
    std::shared_ptr<IRowSource> rows;
    std::vector<std::size_t> order, places; // the row at each place; the place of each row
    std::size_t row;

    ChangePlace Apply()
    {
        rows->Rearrange(order);
        return PlaceOf(*rows, places[row]);
    }
    ChangePlace Revert()
    {
        rows->Rearrange(places);
        return PlaceOf(*rows, row);
    }
    void TakeBack(KsTracedLine& line, bool forward) const
    {
        CarryBack(line, *rows, [&from = forward ? order : places](std::size_t at) { return std::optional(from[at]); });
    }
};

struct Cells
{
    std::shared_ptr<IRowSource> rows;
    CCellChanges changes;
    std::size_t row;

    ChangePlace Apply()
    {
        changes.Apply(*rows);
        return Place();
    }
    ChangePlace Revert()
    {
        changes.Revert(*rows);
        return Place();
    }
    void TakeBack(KsTracedLine& line, bool forward) const
    {
        if (IsLineOf(line, *rows))
            changes.RunOn(line.key.value_or(RowOf(line, *rows)), line.object, !forward);
    }
    ChangePlace Place()
    {
        row = rows->RowOf(changes.FirstRow(), row);
        return PlaceOf(*rows, row, changes.FirstColumn());
    }
};

} // namespace

void InsertLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row, std::unique_ptr<IRowBlock> lines,
                 const QString& text)
{
    const std::size_t count = lines->Count();
    Push(document, text.isEmpty() ? GridTexts::tr("Insertion of lines") : text,
         Insertion{{std::move(rows), row, count, std::move(lines)}});
}

void DeleteLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row, std::size_t count)
{
    Push(document, GridTexts::tr("Deletion of lines"), Deletion{{std::move(rows), row, count}});
}

void MoveLine(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::size_t from, std::size_t to, std::size_t row,
              std::size_t rowAfter)
{
    Push(document, {}, Movement{std::move(rows), from, to, row, rowAfter});
}

void ArrangeLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::vector<std::size_t> order, std::size_t row)
{
    std::vector<std::size_t> places(order.size());
    for (std::size_t place = 0; place < order.size(); ++place)
        places[order[place]] = place;
    Push(document, {}, Arrangement{std::move(rows), std::move(order), std::move(places), row});
}

void SetCells(CKsDoc& document, std::shared_ptr<IRowSource> rows, CCellChanges changes, std::size_t row)
{
    changes.ShrinkToFit();
    Push(document, GridTexts::tr("Change of cells"), Cells{std::move(rows), std::move(changes), row});
}
