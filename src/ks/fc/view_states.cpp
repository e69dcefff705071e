#include "ks/fc/view_states.h"

#include "ks/fc/file_name.h"

#include <QSettings>
#include <algorithm>

namespace {

constexpr char Key[] = "files/views"; // pairs, the latest first
constexpr qsizetype Most = 100;
const QString File = QStringLiteral("file"), State = QStringLiteral("state");

/// One object for the whole run: it writes when the program is idle.
QSettings& UserSettings()
{
    static QSettings settings;
    return settings;
}

} // namespace

QVariantMap KsViewStates::Of(const CString& path)
{
    const CString key = KsFileKey(path);
    const QVariantList known = UserSettings().value(Key).toList();
    const auto found =
        std::ranges::find(known, key, [](const QVariant& each) { return each.toMap()[File].toString(); });
    return key.isEmpty() || found == known.end() ? QVariantMap() : found->toMap()[State].toMap();
}

void KsViewStates::Keep(const CString& path, const QVariantMap& state)
{
    const CString key = KsFileKey(path);
    if (key.isEmpty() || Of(path) == state)
        return;
    QVariantList known = UserSettings().value(Key).toList();
    known.removeIf([&key](const QVariant& each) { return each.toMap()[File].toString() == key; });
    if (!state.isEmpty())
        known.prepend(QVariantMap{{File, key}, {State, state}});
    UserSettings().setValue(Key, QVariant(known.first(std::min(known.size(), Most))));
}
