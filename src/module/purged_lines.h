// The incomplete lines that a save takes out of the lists, kept so that undo can bring them back.
#pragma once

#include "data/hd_parameters.h"

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
    bool IsEmpty() const { return m_lists.empty(); }

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
    CKavo0_hdDoc& m_document;
    std::vector<List> m_lists;
    bool m_applied = false; // by the save itself, before the command came onto the stack
};
