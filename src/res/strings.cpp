#include "res/strings.h"

#include <QCoreApplication>
#include <algorithm>
#include <iterator>

namespace {

struct Row
{
    int number;
    const char* text;
};

// Sorted by number at compile time is not asked of the table: it is short and looked up a few times a window.
constexpr Row Rows[] = {
#define KVR_STRING(number, name, text) {number, text},
#include "texts/string_table.inc"
#undef KVR_STRING
};

constexpr const char* Context = TextsOfModule;

/// Null for a number that is not in the table.
const char* SourceOf(int number)
{
    const auto* row = std::find_if(std::begin(Rows), std::end(Rows), [&](const Row& r) { return r.number == number; });
    return row == std::end(Rows) ? nullptr : row->text;
}

QString LineOfText(const QString& text, int line)
{
    return line < 0 ? text : text.split(u'\n').value(line);
}

} // namespace

QString LoadString(int number)
{
    const char* source = SourceOf(number);
    return source ? QCoreApplication::translate(Context, source) : QString();
}

QString LoadString(Str id)
{
    return LoadString(int(id));
}

QString PlainTitle(const QString& title)
{
    return QString::fromStdString(PlainText(title.toStdString()));
}

QString LoadLine(Str id, int line)
{
    return LineOfText(LoadString(id), line);
}

const char* SourceText(Str id)
{
    return SourceOf(int(id));
}

QString LoadCounted(std::size_t count, Str one, Str many)
{
    return count == 1 ? LoadString(one) : LoadString(many).arg(count);
}
