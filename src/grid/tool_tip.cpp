#include "grid/tool_tip.h"

#include "grid/bounds.h"
#include "grid/column_spec.h"
#include "grid/grid_texts.h"

#include <QTextBoundaryFinder>

namespace {

constexpr int MostColumns = 72; // of a line, as many as one still reads at a glance

/// Ideographs and kana are as wide as two letters.
int Columns(const QString& text)
{
    int columns = 0;
    for (const QChar c : text)
        columns += c.unicode() >= 0x2E80 ? 2 : 1;
    return columns;
}

QString Wrapped(const QString& line)
{
    QString wrapped, current;
    QTextBoundaryFinder breaks(QTextBoundaryFinder::Line, line);
    for (qsizetype from = 0, to = breaks.toNextBoundary(); to > from; from = to, to = breaks.toNextBoundary()) {
        const QString piece = line.sliced(from, to - from);
        if (!current.isEmpty() && Columns(current + piece.trimmed()) > MostColumns) {
            wrapped += current.trimmed() + u'\n';
            current.clear();
        }
        current += piece;
    }
    return wrapped + current.trimmed();
}

} // namespace

QString ToolTipText(const QStringList& lines)
{
    QStringList told;
    for (const QString& line : lines)
        if (!line.isEmpty())
            told << (Columns(line) > MostColumns ? Wrapped(line) : line);
    return told.join(u'\n');
}

QString RangeLine(const Bounds& bounds, const CKsEditStyle& style, const QString& unit)
{
    const QString range = BoundsText(bounds, style);
    return range.isEmpty() ? range : GridTexts::tr("Range: %1").arg(NumberText(range, unit));
}

QString DefaultLine(const QString& value)
{
    return value.isEmpty() ? value : GridTexts::tr("Default: %1").arg(value);
}

QString NameInFileLine(std::string_view name)
{
    return name.empty() ? QString() : GridTexts::tr("In the file: %1").arg(QString::fromUtf8(name));
}
