// The document of the cross-section editor: one cross-section file.
#pragma once

#include "editors/common/project_doc.h"
#include "editors/cross_sections/section_rules.h"

class CCrossSectionDoc : public CProjectDoc
{
    Q_OBJECT
public:
    CCrossSectionDoc();

    const CCrossSections& Sections() const { return m_sections; }
    /// Null for an index that there is none for.
    const CCrossSection* Section(int index) const;

    void DeleteContents() override;

    // Changes; each can be undone, marks the document modified and is told to the project.
    /// `text` names the change in the Edit menu.
    void ReplaceSection(int index, CCrossSection section, const QString& text);
    void InsertSection(int index, CCrossSection section, const QString& text);
    /// `indexes` in any order, each once.
    void RemoveSections(std::vector<int> indexes, const QString& text);
    /// Why a section may not stand at `index` (-1 for a new one); empty when it may.
    QString WhyNot(int index, const CCrossSection& section) const;

signals:
    /// Something changed at the section `index`, which may be the one behind the last.
    void SectionsChanged(int index);

protected:
    QString ReadFile(const CString& path) override;
    QString WriteFile(const CString& path) const override;

private:
    friend class CSectionCommand;
    void Changed(int index);
    CCrossSections m_sections;
};
