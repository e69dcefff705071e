// The text of a single field while it is being typed: who takes it, when, and what happens to a text that cannot be
// taken. Every field whose text becomes a value of the document has one.
#pragma once

#include "ks/fc/typed_text.h"

#include <QObject>
#include <QString>
#include <functional>

class QLineEdit;

/// Shows `widget` and gives it the focus, then tells the user that what stands there cannot be taken. `details` name
/// the place, the text typed and what was expected.
void TellRefusal(QWidget& widget, const QString& message, const QString& details);
/// The details of such a message, a line each; `allowed` and `unit` may be empty.
QString RefusalDetails(const QString& place, const QString& typed, const QString& allowed, const QString& unit);
/// What was typed or pasted without the line ends behind it, which nobody sees.
QStringView WithoutLineEnds(QStringView text);
/// Why such a text is refused: it has characters that nobody sees, or that turn the direction of what follows. Empty
/// when it has none.
enum class Tabs
{
    Refused,
    Taken
};
QString UnseenRefusal(const QString& text, Tabs tabs = Tabs::Refused);
/// Has the field, or the one in the widget, take what is pasted without the line ends behind it.
void DropLineEnds(QWidget& widget);
/// Why a number that is out of these bounds is not taken.
QString OutOfRange();

/// Whether a field or cell that loses the focus for this reason is still being edited: another window, a menu or a
/// list that it opened is in front for a while.
bool StaysBeingEdited(Qt::FocusReason reason);

/// What a field knows about its value.
struct TypedField
{
    std::function<QString()> complaint = {};          // why the text is no value; empty when it is one
    std::function<void()> store;                      // the text becomes the value
    std::function<void()> show;                       // the value becomes the text, then CTyping::Shown is called
    std::function<QString()> allowed = {}, unit = {}; // for the message
    /// A text that is no value may stay while other fields of the page are edited; it is refused with the page.
    bool waitsForPage = false;
};

class CTyping : public QObject, private CKsTypedText
{
public:
    /// A child of the field.
    CTyping(QLineEdit* field, TypedField what);

    /// Something was typed and not taken yet. A text that was typed is one even when it reads as the value shown did,
    /// which may have been rounded; a text of which every character stands untouched is not.
    bool IsTyped() const;
    /// The field shows its value now.
    void Shown();
    /// Stores what was typed. False when it is no value: the user has been told and the field has the focus.
    bool Take();
    /// Likewise when only the field is left.
    bool TakeField() { return MayWait() || Take(); }
    /// Drops what was typed; the value is shown again.
    void Revert();

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    const QWidget* TypedInto() const override;
    CString TypedPlace() const override;
    CString Typed() const override;
    bool Enter() override;
    bool MayWait() const;
    QString Complaint() const;
    void FocusLost();
    bool KeyPressed(int key);
    void Edited(const QString& text);

    QLineEdit* m_field;
    TypedField m_what;
    QString m_text;                      // after the last edit
    qsizetype m_before = 0, m_after = 0; // characters shown that still stand untouched at the start and the end
    qsizetype m_length = 0;              // of the text shown
    qsizetype m_selected = -1, m_selectedLength = 0;
    bool m_telling = false;
    bool m_cut = false; // what was typed or pasted last did not fit, and its end is missing
};
