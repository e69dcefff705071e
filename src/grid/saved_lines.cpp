#include "grid/saved_lines.h"

#include "grid/cell_changes.h"
#include "grid/cell_text.h"
#include "grid/grid_texts.h"
#include "grid/tool_tip.h"
#include "ks/fc/doc.h"

void CSavedLines::SetDocument(const CKsDoc& document)
{
    m_document = &document;
    Forget();
}

void CSavedLines::Forget() const
{
    m_lines.clear();
    m_placeInList.reset();
    m_version = Version();
}

bool CSavedLines::MayDiffer() const
{
    return m_document && m_rows.Rows() && (!m_document->UnsavedChanges().IsEmpty() || m_rows.HasTyped());
}

int CSavedLines::Version() const
{
    return m_document ? m_document->UnsavedChanges().Version() : 0;
}

// ---- lines -------------------------------------------------------------------------------------

CSavedLines::Line CSavedLines::Find(int row) const
{
    if (m_version != Version())
        Forget();
    Line found;
    IRowSource& rows = *m_rows.Rows();
    const std::size_t at = m_rows.SourceRow(row);
    const CKsUnsavedChanges& changes = m_document->UnsavedChanges();
    if (changes.IsEmpty() || row < m_rows.FixedRows() || at >= rows.Count())
        return found;
    KsTracedLine line{.data = rows.Data(), .place = at - rows.FixedRows(), .key = {}};
    if (rows.KeysLast())
        line.key = rows.KeyAt(at);
    if (rows.List() && rows.List() != rows.Data()) {
        if (!m_placeInList)
            m_placeInList = rows.ListRow(0);
        line.list = rows.List();
        line.placeInList = *m_placeInList;
        line.isNamedByPlace = !rows.StaysInMemory();
    }
    line.object = [&]() -> void* {
        if (!found.copy)
            found.copy = rows.Copies({at});
        return found.copy->At(0);
    };
    changes.TakeBack(line);
    found.origin = line.origin;
    if (found.origin != KsLineOrigin::Saved)
        found.copy.reset();
    return found;
}

const CSavedLines::Line& CSavedLines::Remembered(int row) const
{
    constexpr std::size_t most = 1000; // more than any screen shows
    if (m_version != Version() || m_lines.size() >= most)
        Forget();
    const std::size_t at = m_rows.SourceRow(row);
    auto line = m_lines.find(at);
    if (line == m_lines.end())
        line = m_lines.emplace(at, Find(row)).first;
    return line->second;
}

std::optional<CellValue> CSavedLines::Before(const Line& line, int row, int column) const
{
    const void* const saved = line.copy ? line.copy->At(0) : m_rows.StoredObject(row);
    const ColumnSpec& spec = m_rows.Column(column);
    if (line.origin != KsLineOrigin::Saved || !saved || row < m_rows.FixedRows() || spec.Kind() == CellKind::Button ||
        (!line.copy && !m_rows.HasTyped()))
        return std::nullopt;
    CellValue before = m_rows.Resolved(column, spec.access->get(saved));
    if (SameCell(before, m_rows.Resolved(column, m_rows.Value(row, column))))
        return std::nullopt;
    return before;
}

std::optional<CellValue> CSavedLines::Before(int row, int column) const
{
    return MayDiffer() && row < m_rows.StoredRows() ? Before(Remembered(row), row, column) : std::nullopt;
}

SavedMark CSavedLines::MarkOf(int row) const
{
    if (!MayDiffer() || row >= m_rows.StoredRows())
        return SavedMark::None;
    const Line& line = Remembered(row);
    if (line.origin == KsLineOrigin::New)
        return SavedMark::New;
    for (int column = 0; column < int(m_rows.Columns().size()); ++column)
        if (Before(line, row, column))
            return SavedMark::Changed;
    return SavedMark::None;
}

// ---- texts -------------------------------------------------------------------------------------

QString CSavedLines::LineText(int row) const
{
    switch (MarkOf(row)) {
    case SavedMark::Changed:
        return GridTexts::tr("Changed since the last save");
    case SavedMark::New:
        return GridTexts::tr("New since the last save");
    default:
        return {};
    }
}

QString CSavedLines::LineDetails(int row) const
{
    QStringList lines{LineText(row)};
    for (int column = 0; column < int(m_rows.Columns().size()); ++column)
        if (const QString text = CellText(row, column); !text.isEmpty())
            lines << GridTexts::tr("%1: %2").arg(m_rows.Column(column).header(), text);
    return ToolTipText(lines);
}

QString CSavedLines::CellText(int row, int column) const
{
    const auto before = Before(row, column);
    if (!before)
        return {};
    const ColumnSpec& spec = m_rows.Column(column);
    if (spec.Kind() == CellKind::Flag)
        return *before == CellValue(std::int32_t(0)) ? GridTexts::tr("was off at the last save")
                                                     : GridTexts::tr("was on at the last save");
    return IsEmptyCell(spec, *before) ? GridTexts::tr("was empty at the last save")
                                      : GridTexts::tr("was %1 at the last save").arg(FullText(spec, *before));
}
