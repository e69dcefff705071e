#include "module/list_commands.h"

#include "module/document.h"
#include "res/strings.h"

#include <algorithm>

ChangePlace PlaceOf(const IRowSource& rows, std::size_t row, int column)
{
    const std::size_t last = std::max<std::size_t>(rows.Count(), 1) - 1;
    return {rows.List(), int(rows.ListRow(std::min(row, last))) + 1, column};
}

CDocumentCommand::CDocumentCommand(CKavo0_hdDoc& document, const QString& text) : m_document(document)
{
    setText(text);
}

void CDocumentCommand::Run(bool forward)
{
    const ChangePlace place = forward ? Apply() : Revert();
    m_document.UpdateAll(nullptr, Hint::Reload, nullptr);
    // The first time the change comes from what the user is looking at.
    if (m_repeated)
        emit m_document.Reveal(place.list, place.row, place.column);
    m_repeated = true;
}

CInsertLines::CInsertLines(CKavo0_hdDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row,
                           std::unique_ptr<IRowBlock> lines, FirstLine first)
    : CDocumentCommand(document, LoadString(Str::UndoInsert)),
      m_rows(std::move(rows)),
      m_row(row),
      m_count(lines->Count()),
      m_lines(std::move(lines)),
      m_first(first)
{
}

ChangePlace CInsertLines::Apply()
{
    if (m_first == FirstLine::Goes && m_rows->List())
        Document().RemovePlaceholder(*m_rows->List());
    m_row = m_rows->Put(m_row, std::move(m_lines));
    return PlaceOf(*m_rows, m_row, 1);
}

ChangePlace CInsertLines::Revert()
{
    m_lines = m_rows->Take(m_row, m_count);
    return PlaceOf(*m_rows, m_row, 1);
}

CDeleteLines::CDeleteLines(CKavo0_hdDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row, std::size_t count,
                           std::unique_ptr<IRowBlock> replacement)
    : CDocumentCommand(document, LoadString(Str::UndoDelete)),
      m_rows(std::move(rows)),
      m_row(row),
      m_count(count),
      m_replacement(std::move(replacement))
{
}

ChangePlace CDeleteLines::Apply()
{
    for (std::size_t i = 0; i < m_count; ++i)
        m_rows->Touch(m_rows->KeyAt(m_row + i));
    m_lines = m_rows->Take(m_row, m_count);
    m_replaced = m_rows->IsEmpty() && m_replacement;
    if (m_replaced)
        m_rows->Put(m_rows->FixedRows(), std::move(m_replacement));
    return PlaceOf(*m_rows, m_row, 1);
}

ChangePlace CDeleteLines::Revert()
{
    if (m_replaced)
        m_replacement = m_rows->Take(m_rows->FixedRows(), 1);
    else if (!m_replacement && m_rows->List())
        Document().RemovePlaceholder(*m_rows->List());
    m_row = m_rows->Put(m_row, std::move(m_lines));
    return PlaceOf(*m_rows, m_row, 1);
}
