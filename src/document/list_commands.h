// Undo commands that change a document: their common base, and the insertion and removal of lines.
#pragma once

#include "document/change_place.h"
#include "grid/row_source.h"

#include <QString>
#include <QUndoCommand>

class CKavo0_hdDoc;

/// The place of a row of the source; of the last one for a row past the end.
ChangePlace PlaceOf(const IRowSource& rows, std::size_t row, int column);

/// Every change marks the document modified and reloads the views. A change that undo or redo brings back is also
/// shown to the user, wherever it is.
class CDocumentCommand : public QUndoCommand
{
public:
    CDocumentCommand(CKavo0_hdDoc& document, const QString& text);
    void undo() final { Run(false); }
    void redo() final { Run(true); }

protected:
    virtual ChangePlace Apply() = 0;
    virtual ChangePlace Revert() = 0;
    CKavo0_hdDoc& Document() const { return m_document; }

private:
    void Run(bool forward);

    CKavo0_hdDoc& m_document;
    bool m_repeated = false;
};

/// Puts new lines into a list.
class CInsertLines : public CDocumentCommand
{
public:
    /// The text is that of an insertion unless one is given.
    CInsertLines(CKavo0_hdDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row,
                 std::unique_ptr<IRowBlock> lines, const QString& text = {});

protected:
    ChangePlace Apply() override;
    ChangePlace Revert() override;

private:
    std::shared_ptr<IRowSource> m_rows;
    std::size_t m_row, m_count;
    std::unique_ptr<IRowBlock> m_lines; // while they are not in the list
};

/// Removes lines from a list.
class CDeleteLines : public CDocumentCommand
{
public:
    CDeleteLines(CKavo0_hdDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row, std::size_t count);

protected:
    ChangePlace Apply() override;
    ChangePlace Revert() override;

private:
    std::shared_ptr<IRowSource> m_rows;
    std::size_t m_row, m_count;
    std::unique_ptr<IRowBlock> m_lines; // while they are out of the list
};
