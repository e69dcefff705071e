#include "editors/cross_sections/document.h"

#include "ks/fc/doc_command.h"

namespace {
constexpr int CrossSectionPackageKind = 2; // what this editor's packages call themselves
} // namespace

CCrossSectionDoc::CCrossSectionDoc() : CParameterDoc(CrossSectionPackageKind) {}

const CCrossSection* CCrossSectionDoc::Section(int index) const
{
    const auto& sections = m_sections.sections;
    return index >= 0 && std::size_t(index) < sections.size() ? &sections[std::size_t(index)] : nullptr;
}

void CCrossSectionDoc::Load(tqlHandle structure, LoadReport& report)
{
    m_sections = LoadCrossSections(structure, report);
}

std::unique_ptr<QUndoCommand> CCrossSectionDoc::MakeContentStep(tqlHandle structure, LoadReport& report,
                                                                const CString& text)
{
    return std::make_unique<CReplaceContent<CCrossSections>>(*this, text, m_sections,
                                                             LoadCrossSections(structure, report));
}

void CCrossSectionDoc::DeleteContents()
{
    CKsDoc::DeleteContents();
    m_sections = {};
}

QString CCrossSectionDoc::NewBranch() const
{
    return BranchNames(Views().empty() ? nullptr : Views().front()).value(0, tr("BRANCH"));
}
