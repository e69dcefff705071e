#include "ks/fc/typed_text.h"

#include "ks/fc/doc.h"

#include <QUndoStack>
#include <algorithm>

static QList<CKsTypedText*>& All()
{
    static QList<CKsTypedText*> all;
    return all;
}

static bool isEntering = false;

bool CKsTypedText::IsEntering()
{
    return isEntering;
}

CKsTypedText::CKsTypedText()
{
    All() << this;
}

CKsTypedText::~CKsTypedText()
{
    All().removeOne(this);
}

QList<CKsTypedText::Line> CKsTypedText::LinesOf(const CKsDoc& document)
{
    constexpr qsizetype longest = 1000; // characters; what is longer was hardly typed
    QList<Line> lines;
    for (CKsTypedText* typed : All()) {
        const QWidget* const widget = typed->TypedInto();
        const auto isOver = [widget](const CView* view) { return widget && view->isAncestorOf(widget); };
        if (std::ranges::any_of(document.Views(), isOver))
            lines << Line{typed, QStringLiteral("%1: %2").arg(typed->TypedPlace(), typed->Typed().left(longest))};
    }
    return lines;
}

QStringList CKsTypedText::Of(const CKsDoc& document)
{
    QStringList texts;
    for (const Line& line : LinesOf(document))
        texts << line.text;
    return texts;
}

QStringList CKsTypedText::EnterIn(CKsDoc& document)
{
    const QList<Line> lines = LinesOf(document);
    if (lines.isEmpty())
        return {};
    isEntering = true;
    // No view hears of it: there is no display.
    document.blockSignals(true);
    document.UndoStack().blockSignals(true);
    const auto views = document.Views();
    for (CView* view : views)
        document.RemoveView(view);
    QStringList left;
    for (const Line& line : lines)
        if (!line.typed->Enter())
            left << line.text;
    return left;
}
