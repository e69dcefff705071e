#include "grid/cell_changes.h"

#include <algorithm>
#include <bit>
#include <cstdint>
#include <numeric>

bool SameCell(const CellValue& a, const CellValue& b)
{
    const auto* x = std::get_if<double>(&a);
    const auto* y = std::get_if<double>(&b);
    return x && y ? SameCell(*x, *y) : a == b;
}

bool SameCell(double a, double b)
{
    return std::bit_cast<std::uint64_t>(a) == std::bit_cast<std::uint64_t>(b);
}

/// Gives back what is worth a copy.
static void Shrink(auto& values)
{
    if (values.capacity() - values.size() > values.size() / 100)
        values.shrink_to_fit();
}

void CCellValues::Add(CellValue value, std::size_t expected)
{
    if (!std::exchange(m_hasType, true)) {
        std::visit(
            [this]<typename T>(const T&) {
                if constexpr (std::is_same_v<T, std::monostate>)
                    m_values = std::vector<CellValue>();
                else
                    m_values = std::vector<T>();
            },
            value);
        std::visit([expected](auto& values) { values.reserve(expected); }, m_values);
    }
    const bool isTaken = std::visit(
        [&value]<typename T>(std::vector<T>& values) {
            if constexpr (std::is_same_v<T, CellValue>) {
                values.push_back(std::move(value));
                return true;
            } else {
                auto* const own = std::get_if<T>(&value);
                if (own)
                    values.push_back(std::move(*own));
                return own != nullptr;
            }
        },
        m_values);
    if (isTaken)
        return;
    // One of another type: from now on they are mixed.
    std::vector<CellValue> mixed = std::visit(
        [](auto& values) {
            return std::vector<CellValue>(std::make_move_iterator(values.begin()),
                                          std::make_move_iterator(values.end()));
        },
        m_values);
    mixed.push_back(std::move(value));
    m_values = std::move(mixed);
}

void CCellValues::Add(double number, std::size_t expected)
{
    auto* const numbers = m_hasType ? std::get_if<std::vector<double>>(&m_values) : nullptr;
    if (numbers)
        numbers->push_back(number);
    else
        Add(CellValue(number), expected);
}

CellValue CCellValues::operator[](std::size_t index) const
{
    return std::visit([index](const auto& values) { return CellValue(values[index]); }, m_values);
}

void CCellValues::ShrinkToFit()
{
    std::visit([](auto& values) { Shrink(values); }, m_values);
}

CCellChanges::Column& CCellChanges::ColumnFor(int column, const std::shared_ptr<const CellAccess>& access)
{
    if (!m_columns.empty() && m_columns.back().column == column)
        return m_columns.back(); // mostly they come column by column
    auto place = std::ranges::find(m_columns, column, &Column::column);
    if (place == m_columns.end()) {
        place = m_columns.insert(place, Column{column, access, {}, {}, {}});
        place->rows.reserve(m_expected);
    }
    return *place;
}

void CCellChanges::Add(RowKey row, int column, const std::shared_ptr<const CellAccess>& access, CellValue before,
                       CellValue after)
{
    Column& place = ColumnFor(column, access);
    place.rows.push_back(row);
    place.before.Add(std::move(before), m_expected);
    place.after.Add(std::move(after), m_expected);
}

void CCellChanges::Add(RowKey row, int column, const std::shared_ptr<const CellAccess>& access, double before,
                       double after)
{
    Column& place = ColumnFor(column, access);
    place.rows.push_back(row);
    place.before.Add(before, m_expected);
    place.after.Add(after, m_expected);
}

std::size_t CCellChanges::Count() const
{
    return std::accumulate(m_columns.begin(), m_columns.end(), std::size_t(0),
                           [](std::size_t sum, const Column& column) { return sum + column.rows.size(); });
}

void CCellChanges::Apply(IRowSource& rows)
{
    for (Column& column : m_columns) {
        column.restore.clear();
        for (std::size_t i = 0; i < column.rows.size(); ++i) {
            void* object = rows.Object(column.rows[i]);
            if (column.access->restore)
                column.restore.push_back(column.access->restore(object));
            column.access->set(object, column.after[i]);
        }
    }
}

void CCellChanges::Revert(IRowSource& rows)
{
    for (auto column = m_columns.rbegin(); column != m_columns.rend(); ++column) {
        for (std::size_t i = column->rows.size(); i-- > 0;) {
            void* object = rows.Object(column->rows[i]);
            column->Set(i, object, false);
        }
    }
}

void CCellChanges::Column::Set(std::size_t cell, void* object, bool forward) const
{
    if (!forward && access->restore)
        restore[cell](object);
    else
        access->set(object, forward ? after[cell] : before[cell]);
}

/// The cells of a row in this column, mostly one, from the first to the last, or else back.
template <typename Do>
void CCellChanges::Column::ForCellsOf(RowKey row, bool forward, const Do& action) const
{
    if (!index.IsMade())
        index.Make(rows.size(), [this](std::uint32_t cell) { return rows[cell]; });
    index.ForRowsOf(
        row, forward, [this](std::uint32_t cell) { return rows[cell]; }, action);
}

void CCellChanges::RunOn(RowKey row, const std::function<void*()>& object, bool forward) const
{
    const auto run = [&](const Column& column) {
        column.ForCellsOf(row, forward, [&](std::size_t cell) { column.Set(cell, object(), forward); });
    };
    if (forward)
        std::for_each(m_columns.begin(), m_columns.end(), run);
    else
        std::for_each(m_columns.rbegin(), m_columns.rend(), run);
}

void CCellChanges::ShrinkToFit()
{
    for (Column& column : m_columns) {
        Shrink(column.rows);
        column.before.ShrinkToFit();
        column.after.ShrinkToFit();
    }
}
