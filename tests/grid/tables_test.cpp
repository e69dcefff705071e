// What the grid looks up: its keys, and tables as text.
#include "grid/grid_keys.h"
#include "grid/table_text.h"

#include <QKeyEvent>
#include <gtest/gtest.h>

TEST(GridKeys, TableFindsEveryRow)
{
    for (const GridKey& row : GridKeys()) {
        EXPECT_EQ(row.held & row.lookedAt, row.held) << row.key;
        EXPECT_FALSE(row.Text().isEmpty()) << row.key;
        EXPECT_EQ(FindGridKey(QKeyEvent(QEvent::KeyPress, row.key, row.held)), &row) << "hidden by an earlier row";
    }
    for (const int key : {Qt::Key_C, Qt::Key_V, Qt::Key_Z, Qt::Key_Up, Qt::Key_Escape})
        EXPECT_EQ(FindGridKey(QKeyEvent(QEvent::KeyPress, key, Qt::NoModifier)), nullptr);
    EXPECT_EQ(FindGridKey(QKeyEvent(QEvent::KeyPress, Qt::Key_Tab, Qt::ControlModifier)), nullptr);
}

static std::vector<QStringList> Read(const QString& text)
{
    const CTextTable table(text);
    std::vector<QStringList> lines;
    for (std::size_t line = 0; line < table.Lines(); ++line)
        lines.push_back(table.Line(line));
    return lines;
}

TEST(TableText, RoundTripAndForeignTexts)
{
    const std::vector<QStringList> odd = {{"a", "", "tab\there"}, {"line\nend", "\"quoted\"", " blank "}, {"", "", ""}};
    const std::vector<QStringList> emptyLast = {{"a"}, {""}};
    for (const auto& table : {odd, emptyLast})
        EXPECT_EQ(Read(WriteTable(table)), table);
    const struct
    {
        const char* text;
        std::vector<QStringList> table;
    } cases[] = {
        {"", {{""}}},
        {"1\t2\r\n3\t4\r\n", {{"1", "2"}, {"3", "4"}}},
        {"1\r2", {{"1"}, {"2"}}},
        {"\t\n", {{"", ""}}},
        {"a\n\nb\n\n", {{"a"}, {""}, {"b"}, {""}}},
        {"a\tb\n\nc\n\n\r\n\n", {{"a", "b"}, {""}, {"c"}}},
        {"a\n\t\n\n", {{"a"}, {"", ""}}},
        {"\"a\nb\"\tc", {{"a\nb", "c"}}},
        {"5\" pipe\t\"open", {{"5\" pipe", "\"open"}}},
    };
    for (const auto& c : cases)
        EXPECT_EQ(Read(c.text), c.table) << c.text;
}
