// Undo commands that change a document: their common base, and the change of a single value.
#pragma once

#include "ks/fc/change_place.h"
#include "ks/fc/doc.h"
#include "ks/fc/unsaved_changes.h"

#include <QUndoCommand>

/// Every change marks the document modified and reloads the views. A document that may not be changed takes no new
/// step. A change that undo or redo brings back is also shown to the user, wherever it is.
class KS_API CDocumentCommand : public QUndoCommand
{
public:
    CDocumentCommand(CKsDoc& document, const QString& text);
    void undo() final { Run(false); }
    void redo() final { Run(true); }

protected:
    virtual ChangePlace Apply() = 0;
    virtual ChangePlace Revert() = 0;
    /// What the step does to lines, always the same object; null for nothing.
    virtual std::shared_ptr<const KsLineChange> LineChange() const { return nullptr; }
    /// Asked before the step is made; false when the user has been told why not.
    virtual bool IsAllowed() { return m_document.MayChange(); }
    void ContentReplaced() { m_document.ContentReplaced(); }

private:
    void Run(bool forward);

    CKsDoc& m_document;
    bool m_repeated = false;
};

/// Everything that a document holds - or a part that stays where it is in memory - becomes something else.
template <typename T>
class CReplaceContent : public CDocumentCommand
{
public:
    CReplaceContent(CKsDoc& document, const QString& text, T& target, T content)
        : CDocumentCommand(document, text), m_target(target), m_other(std::move(content))
    {
    }

protected:
    ChangePlace Apply() override
    {
        std::swap(m_target, m_other);
        ContentReplaced();
        return {};
    }
    ChangePlace Revert() override { return Apply(); }
    std::shared_ptr<const KsLineChange> LineChange() const override { return m_change; }
    bool IsAllowed() override { return true; } // it is what somebody has kept or written already

private:
    T& m_target;
    T m_other; // what is not in the document
    std::shared_ptr<const KsLineChange> m_change = std::make_shared<KsEveryLineReplaced>();
};

/// Changes one value of the document that no list holds.
template <typename T>
class CSetValue : public CDocumentCommand
{
public:
    CSetValue(CKsDoc& document, const QString& text, T& target, T value)
        : CDocumentCommand(document, text), m_target(target), m_before(target), m_after(std::move(value))
    {
    }

protected:
    ChangePlace Apply() override
    {
        m_target = m_after;
        return {&m_target};
    }
    ChangePlace Revert() override
    {
        m_target = m_before;
        return {&m_target};
    }

private:
    T& m_target;
    T m_before, m_after;
};
