// Undo commands of what pages edit.
#pragma once

#include "document/list_commands.h"
#include "grid/column_spec.h"

#include <vector>

/// One cell of a row, before and after. The row may be in the list or in a command that took it out.
struct CellChange
{
    RowKey row;
    int column; // from 1
    std::shared_ptr<const CellAccess> access;
    CellValue before, after;
    std::function<void(void* row)> restore = {}; // instead of setting `before`; see CellAccess
};

/// Changes cells, and nothing but them.
class CSetCells : public CDocumentCommand
{
public:
    /// `changes` is not empty; `row` (from 0) is where the first of them stands.
    CSetCells(CKavo0_hdDoc& document, std::shared_ptr<IRowSource> rows, std::vector<CellChange> changes,
              std::size_t row);

protected:
    ChangePlace Apply() override;
    ChangePlace Revert() override;

private:
    ChangePlace Place();

    std::shared_ptr<IRowSource> m_rows;
    std::vector<CellChange> m_changes;
    std::size_t m_row;
};

/// Changes one value of the document that no list holds.
template <typename T>
class CSetValue : public CDocumentCommand
{
public:
    CSetValue(CKavo0_hdDoc& document, const QString& text, T& target, T value)
        : CDocumentCommand(document, text), m_target(target), m_before(target), m_after(std::move(value))
    {
    }

protected:
    ChangePlace Apply() override
    {
        m_target = m_after;
        return {&m_target};
    }
    ChangePlace Revert() override
    {
        m_target = m_before;
        return {&m_target};
    }

private:
    T& m_target;
    T m_before, m_after;
};

/// Stores a value of the document as one undo step; nothing happens when it is the stored one already.
template <typename T>
void StoreValue(CKavo0_hdDoc& document, T& target, T value);
extern template void StoreValue(CKavo0_hdDoc&, double&, double);
extern template void StoreValue(CKavo0_hdDoc&, std::int32_t&, std::int32_t);
extern template void StoreValue(CKavo0_hdDoc&, bool&, bool);
extern template void StoreValue(CKavo0_hdDoc&, std::string&, std::string);
extern template void StoreValue(CKavo0_hdDoc&, HDDateTime&, HDDateTime);
