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

} // namespace

QString LoadString(int number)
{
    const auto* row = std::find_if(std::begin(Rows), std::end(Rows), [&](const Row& r) { return r.number == number; });
    return row == std::end(Rows) ? QString() : QCoreApplication::translate("Kavo0_hd", row->text);
}

QString LoadString(Str id)
{
    return LoadString(int(id));
}

QString LoadLine(Str id, int line)
{
    return line < 0 ? LoadString(id) : LoadString(id).split(u'\n').value(line);
}

QString LoadCounted(std::size_t count, Str one, Str many)
{
    return count == 1 ? LoadString(one) : LoadString(many).arg(count);
}
