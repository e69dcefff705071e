// The incomplete lines that a save takes out of the lists, kept so that undo can bring them back.
#pragma once

#include "data/hd_parameters.h"
#include "module/row_source.h"

#include <QUndoCommand>
#include <vector>

class CKavo0_hdDoc;

class CPurgedLines : public QUndoCommand
{
public:
    explicit CPurgedLines(CKavo0_hdDoc& document);

    /// Takes the incomplete lines out of the lists that are cleaned at save, in one pass a list.
    void Apply();
    void Revert();
    bool IsEmpty() const { return m_lists.empty() && m_rows.empty(); }

    void undo() override;
    void redo() override;

private:
    struct Line
    {
        std::size_t index; // in the list as it was
        std::unique_ptr<HD_RiverPos> record;
    };
    struct List
    {
        CGenList* list;
        std::vector<Line> lines; // ascending
    };
    struct Row // of a list without locations
    {
        std::shared_ptr<IRowSource> source;
        std::size_t index; // when it was taken
        std::unique_ptr<IRowBlock> row;
    };
    void PurgeLists();
    void PurgeRows();

    CKavo0_hdDoc& m_document;
    std::vector<List> m_lists;
    std::vector<Row> m_rows; // in the order of taking
    bool m_applied = false;  // by the save itself, before the command came onto the stack
};
