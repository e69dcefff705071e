// Rows of declared fields as an aligned table, CSV (RFC 4180, lines ended by LF) or JSON. Texts are made row by row
// while printing, so that a list of a million records needs no copy of itself.
#pragma once

#include "cli/commands.h"
#include "data/hd_parameters.h"

#include <ostream>
#include <vector>

class RecordTable
{
public:
    /// The columns, from one or more lists of fields of the same object.
    void SetFields(std::vector<FieldList> fields);
    /// `object` outlives the table. `set` is the number of the sub-list it stands in, 0 for none.
    void AddRow(const void* object, int set = 0) { m_rows.push_back({object, set}); }

    /// The records, with the number of their set where the section has sets.
    void AddSection(const CListSection& section);
    void AddItems(GroupValue<const void> items);

    void Print(std::ostream& stream, Format format) const;

private:
    void AddList(const CGenParamListBase& list, int set);
    struct Row
    {
        const void* object;
        int set;
    };
    std::vector<std::string> Headers() const;
    std::vector<std::string> Cells(const Row& row) const;
    void PrintTable(std::ostream& stream) const;
    void PrintCsv(std::ostream& stream) const;
    void PrintJson(std::ostream& stream) const;

    std::vector<const Field*> m_columns;
    std::vector<Row> m_rows;
    bool m_withSet = false;
};
