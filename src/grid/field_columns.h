// Columns of a grid from the declared fields of its rows: a field says what a cell holds, how it is called and what it
// may be; a column says where it differs from that.
#pragma once

#include "files/declare_field.h"
#include "grid/grid_model.h"

/// What the columns of a table have in common.
struct TableStyle
{
    QString (*text)(const TextLine& line); // a text of a field, in the user's language
    QStringList (*inAllLanguages)(const TextLine& line);
    Str globalRow{}; // the name of a first row for global values, where a table has one
    /// Columns are as wide as their texts, headers name units, each row has all its numbers and no blanks around texts.
    bool besideAPicture = false;
};

/// Declares the columns of a table, from left to right.
class FieldColumns
{
public:
    /// `globals` is the object of the row for global values; null for a table without one.
    FieldColumns(CGridModel& model, const TableStyle& style, const void* globals = nullptr)
        : m_model(model), m_style(style), m_globals(globals)
    {
    }

    /// A field of the rows.
    FieldColumns& Value(const Field& field, ColumnSpec column = {})
    {
        return Value(FieldAccess(field), field, std::move(column));
    }
    template <typename Row, typename T>
    FieldColumns& Value(T Row::*member, ColumnSpec column = {})
    {
        return Value(FieldOf(member), std::move(column));
    }
    /// A value that the rows reach in a way of their own; `field` says the rest.
    FieldColumns& Value(CellAccess access, const Field& field, ColumnSpec column = {});
    /// Push buttons; the grid's host answers them (IGridHost::ButtonClicked).
    FieldColumns& Button(ColumnSpec column);

private:
    GridControl ControlFor(const Field& field, const ColumnSpec& column) const;
    FieldColumns& Add(const Field& field, CellAccess access, ColumnSpec column);
    void AddGlobalRow(ColumnSpec& column, CellAccess& access) const;

    CGridModel& m_model;
    const TableStyle& m_style;
    const void* m_globals;
};
