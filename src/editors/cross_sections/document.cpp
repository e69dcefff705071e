#include "editors/cross_sections/document.h"

#include "editors/cross_sections/commands.h"
#include "editors/cross_sections/section_file.h"

#include <QUndoStack>

namespace {
constexpr int CrossSectionPackageKind = 2; // what this editor's packages call themselves
} // namespace

CCrossSectionDoc::CCrossSectionDoc() : CProjectDoc(CrossSectionPackageKind) {}

const CCrossSection* CCrossSectionDoc::Section(int index) const
{
    const auto& sections = m_sections.sections;
    return index >= 0 && std::size_t(index) < sections.size() ? &sections[std::size_t(index)] : nullptr;
}

QString CCrossSectionDoc::ReadFile(const CString& path)
{
    return ReadCrossSections(path, m_sections);
}

QString CCrossSectionDoc::WriteFile(const CString& path) const
{
    return WriteCrossSections(path, m_sections);
}

void CCrossSectionDoc::DeleteContents()
{
    CKsDoc::DeleteContents();
    m_sections = {};
}

void CCrossSectionDoc::Changed(int index)
{
    emit SectionsChanged(index);
    DataChanged();
}

void CCrossSectionDoc::ReplaceSection(int index, CCrossSection section, const QString& text)
{
    UndoStack().push(new CReplaceSection(*this, index, std::move(section), text));
}

void CCrossSectionDoc::InsertSection(int index, CCrossSection section, const QString& text)
{
    UndoStack().push(new CInsertSection(*this, index, std::move(section), text));
}

void CCrossSectionDoc::RemoveSections(std::vector<int> indexes, const QString& text)
{
    if (!indexes.empty())
        UndoStack().push(new CRemoveSections(*this, std::move(indexes), text));
}

QString CCrossSectionDoc::WhyNot(int index, const CCrossSection& section) const
{
    const CSectionFault fault = FindFault(section);
    if (fault.field != CSectionFault::Nothing)
        return fault.text;
    return m_sections.IsTaken(section, index) ? WhyTaken(section) : QString();
}
