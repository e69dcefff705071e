#include "grid/foreign_number.h"

namespace {

bool IsDigit(QChar c)
{
    return c >= u'0' && c <= u'9';
}

/// Blanks of any width that stay within a line, and apostrophes; beside them the sign that is not the decimal one.
bool ParsesThousands(QChar c, QChar other)
{
    return c == other || c == u' ' || c == u'\u00A0' || c == u'\u2009' || c == u'\u202F' || c == u'\'' ||
           c == u'\u2019';
}

class CNumberScan
{
public:
    CNumberScan(QStringView text, DecimalSign decimal)
        : m_text(text),
          m_decimal(decimal == DecimalSign::Point ? u'.' : u','),
          m_other(decimal == DecimalSign::Point ? u',' : u'.')
    {
    }

    /// False when no number begins here.
    bool Read()
    {
        Sign();
        const bool hasWhole = Whole();
        if (Peek() == m_decimal && IsDigit(Peek(1))) {
            m_number += u'.';
            ++m_at;
            Digits();
        } else if (!hasWhole) {
            return false;
        }
        Exponent();
        return !(IsDigit(Peek()) || Peek() == u'.' || Peek() == u','); // "1.234.5"
    }
    const QString& Number() const { return m_number; }
    QStringView Rest() const { return m_text.sliced(m_at); }

private:
    QChar Peek(qsizetype ahead = 0) const { return m_at + ahead < m_text.size() ? m_text[m_at + ahead] : QChar(); }

    void Sign()
    {
        if (Peek() == u'-' || Peek() == u'+' || Peek() == u'\u2212') // the minus sign of typeset numbers
            m_number += m_text[m_at++] == u'+' ? u'+' : u'-';
    }

    void Digits()
    {
        while (IsDigit(Peek()))
            m_number += m_text[m_at++];
    }

    bool GroupAhead(QChar sign) const
    {
        return Peek() == sign && IsDigit(Peek(1)) && IsDigit(Peek(2)) && IsDigit(Peek(3)) && !IsDigit(Peek(4));
    }

    bool Whole()
    {
        const qsizetype start = m_at;
        Digits();
        if (m_at == start)
            return false;
        const QChar sign = Peek();
        if (m_at - start <= 3 && ParsesThousands(sign, m_other))
            while (GroupAhead(sign)) {
                ++m_at;
                Digits();
            }
        return true;
    }

    void Exponent()
    {
        if (Peek() != u'e' && Peek() != u'E')
            return;
        const bool isSigned = Peek(1) == u'-' || Peek(1) == u'+';
        if (!IsDigit(Peek(isSigned ? 2 : 1)))
            return;
        m_number += u'e';
        ++m_at;
        Sign();
        Digits();
    }

    QStringView m_text;
    qsizetype m_at = 0;
    QChar m_decimal, m_other;
    QString m_number{};
};

} // namespace

QString PlainNumber(QStringView text, DecimalSign decimal)
{
    CNumberScan scan(text.trimmed(), decimal);
    if (!scan.Read())
        return text.toString();
    const QStringView unit = scan.Rest().trimmed();
    return unit.isEmpty() ? scan.Number() : scan.Number() + u' ' + unit.toString();
}

bool IsForeignNumber(QStringView text, DecimalSign decimal)
{
    CNumberScan scan(text.trimmed(), decimal);
    if (!scan.Read())
        return false;
    const QStringView rest = scan.Rest().trimmed();
    return rest.isEmpty() || !IsDigit(rest.front()); // "12 34"
}
