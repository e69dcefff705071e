#include "grid/typing.h"

#include "grid/column_spec.h"
#include "grid/grid_texts.h"
#include "ks/fc/keep_in_sight.h"
#include "ks/fc/message_box.h"
#include "ks/fc/shown_text.h"

#include <QKeyEvent>
#include <QLineEdit>
#include <QPointer>
#include <QScopedValueRollback>
#include <QTimer>
#include <algorithm>

namespace {

qsizetype CommonStart(const QString& a, const QString& b)
{
    return std::mismatch(a.begin(), a.end(), b.begin(), b.end()).first - a.begin();
}

qsizetype CommonEnd(const QString& a, const QString& b)
{
    return std::mismatch(a.rbegin(), a.rend(), b.rbegin(), b.rend()).first - a.rbegin();
}

QString UnseenName(QChar c)
{
    if (c == u'\n' || c == u'\r')
        return GridTexts::tr("a line end");
    return c == u'\t' ? GridTexts::tr("a tab")
                      : QStringLiteral("U+%1").arg(uint(c.unicode()), 4, 16, QLatin1Char('0')).toUpper();
}

} // namespace

bool StaysBeingEdited(Qt::FocusReason reason)
{
    return reason == Qt::ActiveWindowFocusReason || reason == Qt::PopupFocusReason || reason == Qt::MenuBarFocusReason;
}

void TellRefusal(QWidget& widget, const QString& message, const QString& details)
{
    KsKeepInSight(widget, widget.rect());
    widget.setFocus(Qt::OtherFocusReason); // where it goes back to when the message is read
    const QPointer<QWidget> told = &widget;
    KsMessageBox(message, QMessageBox::Ok, &widget, details);
    if (told)
        told->setFocus(Qt::OtherFocusReason);
}

QString RefusalDetails(const QString& place, const QString& typed, const QString& allowed, const QString& unit)
{
    QStringList lines{GridTexts::tr("%1: \"%2\" was typed.").arg(place, typed)};
    if (!allowed.isEmpty())
        lines << GridTexts::tr("Allowed: %1").arg(allowed);
    if (!unit.isEmpty())
        lines << KsUnitToolTip(unit);
    return lines.join(u'\n');
}

QStringView WithoutLineEnds(QStringView text)
{
    while (text.endsWith(u'\n') || text.endsWith(u'\r'))
        text.chop(1);
    return text;
}

QString UnseenRefusal(const QString& text, Tabs tabs)
{
    if (std::ranges::all_of(text, [](QChar c) { return c >= u' ' && c <= u'~'; }))
        return {};
    const QString seen = KsVisibleText(text);
    for (qsizetype i = 0; i < text.size(); ++i) {
        if (text[i] != seen[i] && (text[i] != u'\t' || tabs == Tabs::Refused))
            return GridTexts::tr("A text takes no characters that cannot be seen. Character %1 of this one is %2.")
                .arg(QString::number(i + 1), UnseenName(text[i]));
    }
    return {};
}

void DropLineEnds(QWidget& widget)
{
    auto* field = qobject_cast<QLineEdit*>(&widget);
    if (!field && !(field = widget.findChild<QLineEdit*>()))
        return;
    QObject::connect(field, &QLineEdit::textEdited, field, [field] {
        const QString before = field->text().first(field->cursorPosition());
        if (before != WithoutLineEnds(before))
            field->backspace(); // and again, should there be another one
    });
}

QString OutOfRange()
{
    return GridTexts::tr("Floating-point value is out of range");
}

CTyping::CTyping(QLineEdit* field, TypedField what) : QObject(field), m_field(field), m_what(std::move(what))
{
    field->installEventFilter(this);
    connect(field, &QLineEdit::textEdited, this, &CTyping::Edited);
    connect(field, &QLineEdit::inputRejected, this, [this] { m_cut = m_field->text().size() >= m_field->maxLength(); });
    // Told after an edit, so during one this is the selection that the edit replaced.
    connect(field, &QLineEdit::selectionChanged, this, [this] {
        m_selected = m_field->selectionStart();
        m_selectedLength = m_field->selectionLength();
    });
    DropLineEnds(*field); // once the edit is known here
    Shown();
}

void CTyping::Shown()
{
    m_text = m_field->text();
    m_length = m_before = m_after = m_text.size();
    m_cut = false;
    m_field->setModified(false);
}

void CTyping::Edited(const QString& text)
{
    const qsizetype shorter = std::min(text.size(), m_text.size());
    const qsizetype start = m_selected >= 0 ? m_selected : CommonStart(m_text, text);
    const qsizetype end = m_selected >= 0 ? m_text.size() - m_selected - m_selectedLength
                                          : std::min(CommonEnd(m_text, text), shorter - std::min(start, shorter));
    m_before = std::clamp<qsizetype>(start, 0, m_before);
    m_after = std::clamp<qsizetype>(end, 0, m_after);
    m_text = text;
    m_cut = m_cut && text.size() >= m_field->maxLength();
}

/// A number whose end is missing may still be one, but not the one that was meant.
QString CTyping::Complaint() const
{
    if (m_cut)
        return GridTexts::tr("At most %1 characters fit in here; the end of what was typed or pasted is missing.")
            .arg(m_field->maxLength());
    return m_what.complaint ? m_what.complaint() : QString();
}

bool CTyping::IsTyped() const
{
    return m_field->isModified() && (m_field->text().size() != m_length || m_before + m_after < m_length);
}

const QWidget* CTyping::TypedInto() const
{
    return IsTyped() && m_field->isEnabled() ? m_field : nullptr;
}

CString CTyping::TypedPlace() const
{
    return m_field->accessibleName();
}

CString CTyping::Typed() const
{
    return m_field->text();
}

bool CTyping::Enter()
{
    if (!Complaint().isEmpty())
        return false;
    m_what.store();
    return true;
}

bool CTyping::MayWait() const
{
    return m_what.waitsForPage && !Complaint().isEmpty();
}

bool CTyping::Take()
{
    if (!IsTyped())
        return true;
    if (m_telling)
        return false;
    if (!m_field->isVisible() || !m_field->isEnabled()) { // a setting took it away
        Revert();
        return true;
    }
    const QString complaint = Complaint();
    if (complaint.isEmpty()) {
        m_field->setModified(false); // storing shows the page afresh
        m_what.store();
        Revert();
        return true;
    }
    const QScopedValueRollback telling(m_telling, true);
    const auto text = [](const std::function<QString()>& make) { return make ? make() : QString(); };
    TellRefusal(*m_field, complaint,
                RefusalDetails(m_field->accessibleName(), m_field->text(), text(m_what.allowed), text(m_what.unit)));
    m_field->selectAll();
    return false;
}

void CTyping::Revert()
{
    m_field->setModified(false);
    m_what.show();
    Shown();
}

/// Nobody asked before the focus went. A value is taken at once. Anything else is told when the focus has arrived,
/// unless what took the focus disabled the field: then it is nobody's value any more.
void CTyping::FocusLost()
{
    if (!IsTyped() || m_telling || MayWait())
        return;
    if (Complaint().isEmpty()) {
        Take();
        return;
    }
    QTimer::singleShot(0, this, [this] {
        if (!m_field->isVisible() || !m_field->isEnabled())
            Revert();
        else if (!m_field->hasFocus() && !m_telling)
            Take();
    });
}

bool CTyping::KeyPressed(int key)
{
    switch (key) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
        if (TakeField())
            m_field->selectAll();
        return true;
    case Qt::Key_Escape:
        if (!IsTyped())
            return false;
        Revert();
        m_field->selectAll();
        return true;
    case Qt::Key_Tab:
    case Qt::Key_Backtab:
        return !TakeField(); // asked before the focus goes
    default:
        return false;
    }
}

bool CTyping::eventFilter(QObject* object, QEvent* event)
{
    if (!qobject_cast<QLineEdit*>(object)) // a field that is being taken apart loses its focus last
        return false;
    switch (event->type()) {
    case QEvent::FocusOut:
        if (!StaysBeingEdited(static_cast<QFocusEvent*>(event)->reason()))
            FocusLost();
        return false;
    case QEvent::EnabledChange:
        if (!m_field->isEnabled() && IsTyped())
            Revert();
        return false;
    case QEvent::ShortcutOverride:
    case QEvent::KeyPress: {
        const auto* key = static_cast<QKeyEvent*>(event);
        // With nothing of its own to take back the field leaves undo and redo to the document.
        if ((key->matches(QKeySequence::Undo) || key->matches(QKeySequence::Redo)) && !IsTyped()) {
            event->ignore();
            return true;
        }
        return event->type() == QEvent::KeyPress && !(key->modifiers() & (Qt::ControlModifier | Qt::AltModifier)) &&
               KeyPressed(key->key());
    }
    default:
        return QObject::eventFilter(object, event);
    }
}
