// The incomplete lines that a save takes out of the lists, kept so that undo can bring them back.
#pragma once

#include "data/hd_parameters.h"
#include "document/document.h"
#include "grid/row_source.h"
#include "ks/fc/doc_command.h"

#include <vector>

class CPurgedLines : public CDocumentCommand
{
public:
    /// Finds the incomplete lines, and the rows that a save leaves out of the tables shown. From then on they are known
    /// by their places: the command never looks at what they hold again.
    explicit CPurgedLines(CKavo0_hdDoc& document);

    bool IsEmpty() const { return m_lists.empty() && m_tables.empty(); }
    /// What is taken out, in the user's language; empty for nothing.
    QString Summary() const;

    // For a save, which pushes the command when the file is written. Taking out costs one pass a list. Putting back
    // asks for no memory, and works when taking out has ended for want of it.
    void TakeOut();
    void PutBack();

protected:
    ChangePlace Apply() override;
    ChangePlace Revert() override;
    std::shared_ptr<const KsLineChange> LineChange() const override { return m_change; }

private:
    struct Lines
    {
        CGenList* list;
        std::vector<std::size_t> rows;                     // ascending, in the list as it is with them
        std::vector<std::unique_ptr<HD_RiverPos>> records; // while they are out of it
        std::vector<std::unique_ptr<HD_RiverPos>> room;    // for all of them, empty
    };
    struct Rows // of a table without locations
    {
        std::shared_ptr<IRowSource> source;
        std::vector<std::size_t> rows;                 // ascending, in the table as it is with them
        std::vector<std::unique_ptr<IRowBlock>> taken; // while they are out of it
        Str oneDropped, manyDropped;
    };
    static void TakeOut(Lines& lines);
    static void PutBack(Lines& lines);
    ChangePlace Place() const;

    std::vector<Lines> m_lists;
    std::vector<Rows> m_tables;
    std::shared_ptr<const KsLineChange> m_change;
    bool m_isOut = false;
};
