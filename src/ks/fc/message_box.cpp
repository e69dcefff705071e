#include "ks/fc/message_box.h"

#include "ks/fc/shown_text.h"

#include <QApplication>
#include <algorithm>
#include <utility>

static KsMessageBoxHandler g_handler;
static CKsKeptMessages* g_keeper = nullptr; // the innermost one

namespace {

CString ShortLine(const CString& line)
{
    constexpr qsizetype Longest = 1000, Side = Longest / 2 - 1;
    return line.size() <= Longest ? line : line.first(Side) + u'\u2026' + line.last(Side);
}

/// What a box on the screen has room for. A list in the middle is cut: the end may ask something.
CString Fitting(const CString& text)
{
    constexpr qsizetype Most = 30, End = 5, MostCharacters = 4000;
    QStringList lines = KsVisibleText(text, true).split(u'\n');
    std::ranges::transform(lines, lines.begin(), ShortLine);
    qsizetype shown = 0, characters = 0;
    while (shown < std::min(Most, lines.size()) && characters < MostCharacters)
        characters += lines[shown++].size();
    const qsizetype more = lines.size() - shown - End;
    if (more > 1)
        lines = lines.first(shown) << QCoreApplication::translate("KsMessageBox", "... and %1 more lines").arg(more)
                                   << lines.last(End);
    return lines.join(u'\n');
}

} // namespace

QMessageBox::StandardButton KsMessageBox(const CString& whole, QMessageBox::StandardButtons buttons, QWidget* parent,
                                         const CString& details, QMessageBox::StandardButton defaultButton)
{
    if (g_keeper && buttons == QMessageBox::Ok) {
        g_keeper->m_texts << whole;
        return QMessageBox::Ok;
    }
    const CString text = Fitting(whole);
    if (const auto handler = g_handler)
        return handler(text, buttons);
    QMessageBox box(buttons == QMessageBox::Ok ? QMessageBox::Warning : QMessageBox::Question,
                    QCoreApplication::applicationName(), text, buttons, parent ? parent : QApplication::activeWindow());
    box.setDefaultButton(defaultButton);
    box.setInformativeText(Fitting(details));
    return QMessageBox::StandardButton(box.exec());
}

KsMessageBoxHandler KsSetMessageBoxHandler(KsMessageBoxHandler handler)
{
    return std::exchange(g_handler, std::move(handler));
}

CKsKeptMessages::CKsKeptMessages() : m_outer(std::exchange(g_keeper, this)) {}

CKsKeptMessages::~CKsKeptMessages()
{
    g_keeper = m_outer;
}
