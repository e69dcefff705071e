// What the lines of a table held when the document was saved, as far as they hold something else now.
#pragma once

#include "grid/table_rows.h"
#include "ks/fc/unsaved_changes.h"

#include <unordered_map>

class CKsDoc;

enum class SavedMark
{
    None,
    Changed, // cells hold other values than at the last save
    New      // the line was not there
};

/// Rows and columns count from 0, as they are shown. What a step did to lines that nobody looks at is never looked at
/// either: a line is followed back to the last save when it is asked for, and remembered until the next step.
class CSavedLines
{
public:
    explicit CSavedLines(const CTableRows& rows) : m_rows(rows) {}
    /// The table shows other rows.
    void SetDocument(const CKsDoc& document);

    /// Whether any line may hold something else than at the last save.
    bool MayDiffer() const;
    /// Another one whenever MarkOf may be, but for what is being typed.
    int Version() const;

    SavedMark MarkOf(int row) const;
    /// What the cell held, if that was something else than now.
    std::optional<CellValue> Before(int row, int column) const;

    // For the user; empty where nothing differs.
    QString LineText(int row) const;
    /// All that LineText says with what each cell held.
    QString LineDetails(int row) const;
    QString CellText(int row, int column) const;

    /// A line as it was saved.
    struct Line
    {
        KsLineOrigin origin = KsLineOrigin::Saved;
        std::unique_ptr<IRowBlock> copy = {}; // null where it is as it was
    };
    /// The same for many lines, none of which is remembered.
    Line Find(int row) const;
    /// What a cell held; nothing where it holds that now, or where nobody knows.
    std::optional<CellValue> Before(const Line& line, int row, int column) const;

private:
    const Line& Remembered(int row) const;
    void Forget() const;

    const CTableRows& m_rows;
    const CKsDoc* m_document = nullptr;
    mutable std::unordered_map<std::size_t, Line> m_lines; // by their rows in the source
    mutable std::optional<std::size_t> m_placeInList;      // of the line that the table belongs to
    mutable int m_version = 0;                             // of the changes when they were found
};
