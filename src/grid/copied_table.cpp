#include "grid/copied_table.h"

namespace {

const QString Format = QStringLiteral("application/x-kvr-cells");

/// Of the same lines and columns as `table`.
bool HasShapeOf(const CTextTable& numbers, const CTextTable& table)
{
    if (numbers.Lines() != table.Lines())
        return false;
    for (std::size_t line = 0; line < table.Lines(); ++line)
        if (numbers.Width(line) != table.Width(line))
            return false;
    return true;
}

} // namespace

// A line with the quantities, as numbers, one with the units, then the numbers, all as a table.
std::unique_ptr<QMimeData> ToClipboard(const std::vector<QStringList>& texts,
                                       const std::vector<CopiedTable::Column>& columns,
                                       const std::vector<QStringList>& numbers)
{
    auto content = std::make_unique<QMimeData>();
    content->setText(WriteTable(texts));
    QStringList quantities, units;
    for (const auto& column : columns) {
        quantities << QString::number(int(column.quantity));
        units << column.unit;
    }
    const QString head = WriteTable({quantities, units});
    content->setData(Format, (numbers.empty() ? head : head + u'\n' + WriteTable(numbers)).toUtf8());
    return content;
}

bool HasCells(const QMimeData& clipboard)
{
    return clipboard.hasText() && (!clipboard.text().isEmpty() || clipboard.hasFormat(Format));
}

std::shared_ptr<const QMimeData> HeldContent(const QMimeData& clipboard)
{
    auto content = std::make_shared<QMimeData>();
    content->setText(clipboard.text());
    if (clipboard.hasFormat(Format))
        content->setData(Format, clipboard.data(Format));
    return content;
}

CopiedTable FromClipboard(const QMimeData& content, QChar separator)
{
    CopiedTable copied{CTextTable(content.text(), separator)};
    if (!content.hasFormat(Format) || separator != u'\t')
        return copied;
    CTextTable own(QString::fromUtf8(content.data(Format)));
    const int columns = own.Width(0);
    if (columns != copied.texts.Columns() || own.Lines() < 2 || own.Width(1) != columns)
        return copied;
    for (int column = 0; column < columns; ++column)
        copied.columns.push_back({UnitGroup(own.At(0, column).toInt()), own.At(1, column).toString()});
    own.RemoveFirstLine();
    own.RemoveFirstLine();
    if (HasShapeOf(own, copied.texts))
        copied.numbers = std::move(own);
    return copied;
}
