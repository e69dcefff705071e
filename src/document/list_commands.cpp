#include "document/list_commands.h"

#include "document/document.h"
#include "res/strings.h"

#include <algorithm>

ChangePlace PlaceOf(const IRowSource& rows, std::size_t row, int column)
{
    const std::size_t last = std::max<std::size_t>(rows.Count(), 1) - 1;
    row = std::min(row, last);
    return {rows.Data(), int(row) + 1, column, rows.List(), int(rows.ListRow(row)) + 1};
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
        m_document.StepShows(place);
    m_repeated = true;
}

CInsertLines::CInsertLines(CKavo0_hdDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row,
                           std::unique_ptr<IRowBlock> lines, const QString& text)
    : CDocumentCommand(document, text.isEmpty() ? LoadString(Str::UndoInsert) : text),
      m_rows(std::move(rows)),
      m_row(row),
      m_count(lines->Count()),
      m_lines(std::move(lines))
{
}

ChangePlace CInsertLines::Apply()
{
    m_row = m_rows->Put(m_row, std::move(m_lines));
    return PlaceOf(*m_rows, m_row, 1);
}

ChangePlace CInsertLines::Revert()
{
    m_lines = m_rows->TakeBack(m_row, m_count);
    return PlaceOf(*m_rows, m_row, 1);
}

CDeleteLines::CDeleteLines(CKavo0_hdDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row, std::size_t count)
    : CDocumentCommand(document, LoadString(Str::UndoDelete)), m_rows(std::move(rows)), m_row(row), m_count(count)
{
}

ChangePlace CDeleteLines::Apply()
{
    m_lines = m_rows->Take(m_row, m_count);
    return PlaceOf(*m_rows, m_row, 1);
}

ChangePlace CDeleteLines::Revert()
{
    m_row = m_rows->Put(m_row, std::move(m_lines));
    return PlaceOf(*m_rows, m_row, 1);
}
