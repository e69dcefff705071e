// The document of the cross-section editor: one cross-section file.
#pragma once

#include "editors/common/parameter_doc.h"
#include "editors/cross_sections/section_file.h"
#include "editors/cross_sections/section_rules.h"

class CCrossSectionDoc : public CParameterDoc
{
    Q_OBJECT
public:
    CCrossSectionDoc();

    const CCrossSections& Sections() const { return m_sections; }
    /// For undo commands and the rows of tables.
    CCrossSections& Sections() { return m_sections; }
    /// Null for an index that there is none for.
    const CCrossSection* Section(int index) const;

    void DeleteContents() override;

    /// For the first section of a document: a branch that the project has.
    QString NewBranch() const;

protected:
    void Load(tqlHandle structure, LoadReport& report) override;
    Declared Content() const override { return {DeclaredSectionFile(), &m_sections}; }
    std::unique_ptr<QUndoCommand> MakeContentStep(tqlHandle structure, LoadReport& report,
                                                  const CString& text) override;

private:
    CCrossSections m_sections;
};
