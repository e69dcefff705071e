// Undo of the changes of cross sections.
#pragma once

#include "editors/cross_sections/document.h"

#include <QUndoCommand>

/// A change of the document; sections are named by place, which holds because undo runs strictly backwards.
class CSectionCommand : public QUndoCommand
{
public:
    CSectionCommand(CCrossSectionDoc& document, const QString& text) : QUndoCommand(text), m_document(document) {}
    void undo() final;
    void redo() final;

protected:
    using Sections = std::vector<CCrossSection>;
    /// Both answer the index of the section to look at.
    virtual int Apply(Sections& sections) = 0;
    virtual int Revert(Sections& sections) = 0;

private:
    CCrossSectionDoc& m_document;
};

class CReplaceSection : public CSectionCommand
{
public:
    CReplaceSection(CCrossSectionDoc& document, int index, CCrossSection section, const QString& text)
        : CSectionCommand(document, text), m_index(index), m_other(std::move(section))
    {
    }

protected:
    int Apply(Sections& sections) override;
    int Revert(Sections& sections) override { return Apply(sections); }

private:
    int m_index;
    CCrossSection m_other; // the state that is not in the document
};

class CInsertSection : public CSectionCommand
{
public:
    CInsertSection(CCrossSectionDoc& document, int index, CCrossSection section, const QString& text)
        : CSectionCommand(document, text), m_index(index), m_section(std::move(section))
    {
    }

protected:
    int Apply(Sections& sections) override;
    int Revert(Sections& sections) override;

private:
    int m_index;
    CCrossSection m_section; // while it is out of the document
};

class CRemoveSections : public CSectionCommand
{
public:
    CRemoveSections(CCrossSectionDoc& document, std::vector<int> indexes, const QString& text);

protected:
    int Apply(Sections& sections) override;
    int Revert(Sections& sections) override;

private:
    std::vector<int> m_indexes; // increasing
    Sections m_removed;         // as m_indexes, while they are out of the document
};
