// What is being typed and stands nowhere but in an open cell or field.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QStringList>

class CKsDoc;
class QWidget;

/// A cell or field that keeps its text until it is left. What somebody types there is kept for recovery with the
/// document's changes, and stays as it is.
class KS_API CKsTypedText
{
public:
    CKsTypedText();
    CKsTypedText(const CKsTypedText&) = delete;
    CKsTypedText& operator=(const CKsTypedText&) = delete;

    /// What is being typed into the document's views, a line each: where, and the text.
    static QStringList Of(const CKsDoc& document);
    /// In a copy of the process (process_copy.h), where nobody looks at the views: what is being typed becomes what the
    /// document holds. Gives back what is no value.
    static QStringList EnterIn(CKsDoc& document);
    /// Whether this process is such a copy, so that whoever shows what is stored need not.
    static bool IsEntering();

protected:
    virtual ~CKsTypedText();

private:
    struct Line
    {
        CKsTypedText* typed;
        CString text;
    };
    static QList<Line> LinesOf(const CKsDoc& document);

    /// The widget with the text; null while nothing is typed that is not stored.
    virtual const QWidget* TypedInto() const = 0;
    virtual CString TypedPlace() const = 0;
    virtual CString Typed() const = 0;
    /// Stores it without a word to anybody; false when it is no value.
    virtual bool Enter() = 0;
};
