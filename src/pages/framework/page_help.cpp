#include "pages/framework/page_help.h"

#include "grid/grid_keys.h"
#include "res/strings.h"

#include <QKeySequence>
#include <QStringList>
#include <utility>
#include <vector>

namespace {

QString Row(const QString& keys, const QString& description)
{
    return QStringLiteral("<tr><td style=\"white-space:pre\"><b>%1</b>&nbsp;&nbsp;</td><td>%2</td></tr>")
        .arg(keys.toHtmlEscaped(), description.toHtmlEscaped());
}

QString KeyName(Qt::Key key, Qt::KeyboardModifiers held = Qt::NoModifier)
{
    return QKeySequence(QKeyCombination(held, key)).toString(QKeySequence::NativeText);
}

} // namespace

QString PageHelpText(bool hasTables)
{
    QString text = QStringLiteral("<p><b>%1</b></p><table>").arg(LoadString(Str::HelpFields).toHtmlEscaped());
    text += Row(KeyName(Qt::Key_Return), LoadString(Str::HelpFieldTake));
    text += Row(KeyName(Qt::Key_Escape), LoadString(Str::HelpFieldRevert));
    text += QStringLiteral("</table>");
    if (!hasTables)
        return text;
    // Keys that do the same stand in one row.
    std::vector<std::pair<QString, QStringList>> rows;
    for (const GridKey& key : GridKeys()) {
        if (rows.empty() || rows.back().first != key.Text())
            rows.push_back({key.Text(), {}});
        if (key.key != Qt::Key_Backtab) // the same as Shift+Tab
            rows.back().second << KeyName(key.key, key.held);
    }
    text += QStringLiteral("<p><b>%1</b></p><table>").arg(LoadString(Str::HelpTables).toHtmlEscaped());
    for (const auto& [what, keys] : rows)
        text += Row(keys.join(QStringLiteral(", ")), what);
    return text + QStringLiteral("</table>");
}
