// Cells on the clipboard: a table of texts for every program, and beside it, for tables of this one, what the texts do
// not say - the quantity of each column and its unit, and whole numbers where a unit has rounded them.
#pragma once

#include "base/unit_group.h"
#include "grid/table_text.h"

#include <QMimeData>
#include <memory>
#include <optional>

struct CopiedTable
{
    struct Column
    {
        UnitGroup quantity = UnitGroup::None;
        QString unit{}; // of its texts
    };
    CTextTable texts;
    std::vector<Column> columns{};       // of a table of this program; else empty
    std::optional<CTextTable> numbers{}; // the same cells with numbers in base units, where the texts have others
};

/// The texts of what another program copied come without `columns`.
std::unique_ptr<QMimeData> ToClipboard(const std::vector<QStringList>& texts,
                                       const std::vector<CopiedTable::Column>& columns,
                                       const std::vector<QStringList>& numbers);
/// Whether there is anything to paste. One empty cell is something.
bool HasCells(const QMimeData& clipboard);
/// What is on the clipboard now, for as long as it is needed: other programs may change it.
std::shared_ptr<const QMimeData> HeldContent(const QMimeData& clipboard);
/// What does not fit the texts is left out.
CopiedTable FromClipboard(const QMimeData& content, QChar separator = u'\t');
