// Columns of the editors' tables, over members of the rows.
#pragma once

#include "base/not_given.h"
#include "editors/common/quantity.h"
#include "grid/grid_model.h"
#include "ks/fc/exchange.h"

/// Adds the columns of a table from left to right. Headers are asked for in the user's language of the moment.
template <typename Row>
class TableColumns
{
public:
    using Header = QString (*)();

    explicit TableColumns(CGridModel& model) : m_model(model) {}

    /// A text, kept as it is typed but without blanks around it.
    TableColumns& Text(Header header, QString Row::*text)
    {
        return Add(Control::FreeText, header, {},
                   {[text](const void* row) -> CellValue { return (Of(row).*text).toStdString(); },
                    [text](void* row, const CellValue& value) {
                        Of(row).*text = QString::fromStdString(std::get<std::string>(value)).trimmed();
                    }});
    }
    /// A number that each row has; the header names the unit.
    TableColumns& Number(Header header, double Row::*number, UnitGroup group, ColumnSpec column = {})
    {
        column.isRequired = !column.emptyIsNotGiven;
        column.style = CKsEditStyle(group);
        return Add(Control::Measured, header, std::move(column),
                   {[number](const void* row) -> CellValue {
                        const double value = Of(row).*number;
                        return std::isnan(value) ? NotGiven : value;
                    },
                    [number](void* row, const CellValue& value) {
                        const double typed = std::get<double>(value);
                        Of(row).*number = typed == NotGiven ? KsUnset : typed;
                    }});
    }
    /// A number that may be unknown.
    TableColumns& Known(Header header, double Row::*number, UnitGroup group, ColumnSpec column = {})
    {
        column.emptyIsNotGiven = true;
        return Number(header, number, group, std::move(column));
    }
    TableColumns& Add(int control, Header header, ColumnSpec column, CellAccess access)
    {
        const UnitGroup group = column.style.GetEumUnitBaseGroup();
        column.control = control;
        column.width = 0; // beside a picture there is room for what the texts need
        column.header = [header, group] { return group == UnitGroup::None ? header() : WithUnit(header(), group); };
        column.access = std::make_shared<CellAccess>(std::move(access));
        m_model.AddColumn(std::move(column));
        return *this;
    }
    static Row& Of(void* row) { return *static_cast<Row*>(row); }
    static const Row& Of(const void* row) { return *static_cast<const Row*>(row); }

private:
    CGridModel& m_model;
};
