#include "ks/fc/shown_text.h"

#include "files/branch_key.h"

#include <QCoreApplication>
#include <QEvent>
#include <QLabel>

namespace {

bool HidesSomething(QChar c, bool lines)
{
    const char16_t code = c.unicode();
    const auto in = [code](char16_t first, char16_t last) { return code >= first && code <= last; };
    if (lines && (code == u'\n' || code == u'\t'))
        return false;
    const bool control = code < 0x20 || in(0x7F, 0x9F) || in(0x2028, 0x2029);
    const bool direction = in(0x202A, 0x202E) || in(0x2066, 0x2069); // single marks, which some scripts need, stay
    return control || direction;
}

/// Qt takes a text for rich when it looks so. Every label, and that of a tool tip is one, is told otherwise before it
/// is shown for the first time.
class PlainLabels : public QObject
{
public:
    using QObject::QObject;

    bool eventFilter(QObject* object, QEvent* event) override
    {
        if (event->type() == QEvent::Polish) {
            auto* label = qobject_cast<QLabel*>(object);
            if (label && label->textFormat() == Qt::AutoText)
                label->setTextFormat(Qt::PlainText);
        }
        return false;
    }
};

void ShowLabelsPlain()
{
    qApp->installEventFilter(new PlainLabels(qApp));
}
Q_COREAPP_STARTUP_FUNCTION(ShowLabelsPlain)

} // namespace

CString KsVisibleText(CString text, bool lines)
{
    for (QChar& c : text)
        if (HidesSomething(c, lines))
            c = QChar::ReplacementCharacter;
    return text;
}

CString KsWithoutUnseen(CString text)
{
    return text.removeIf([](QChar c) { return HasNoWidth(c.unicode()); });
}

CString KsWithoutMnemonics(CString text)
{
    return text.replace(u'&', QStringLiteral("&&"));
}

CString KsTitleText(CString text)
{
    return text.replace(QStringLiteral("[*]"), QStringLiteral("[*][*]"));
}
