#include "editors/cross_sections/document.h"

#include "editors/cross_sections/commands.h"
#include "editors/cross_sections/section_file.h"
#include "ks/fc/message_box.h"

#include <QDir>
#include <QUndoStack>

namespace {
constexpr int CrossSectionPackageKind = 2; // what this editor's packages call themselves
} // namespace

CCrossSectionDoc::CCrossSectionDoc() : CProjectDoc(CrossSectionPackageKind)
{
    connect(&UndoStack(), &QUndoStack::cleanChanged, this, [this](bool clean) { SetModifiedFlag(!clean); });
}

const CCrossSection* CCrossSectionDoc::Section(int index) const
{
    const auto& sections = m_sections.sections;
    return index >= 0 && std::size_t(index) < sections.size() ? &sections[std::size_t(index)] : nullptr;
}

BOOL CCrossSectionDoc::OnOpenDocument(const CString& path)
{
    if (!CKsDoc::OnOpenDocument(path))
        return false;
    const QString error = ReadCrossSections(path, m_sections);
    if (!error.isEmpty())
        KsMessageBox(error);
    return error.isEmpty();
}

BOOL CCrossSectionDoc::OnSaveDocument(const CString& path)
{
    UpdateAllViews(nullptr, StoreHint);
    const QString reason = WriteCrossSections(path, m_sections);
    if (!reason.isEmpty()) {
        KsMessageBox(tr("%1 could not be saved.\n%2").arg(QDir::toNativeSeparators(path), reason));
        return false;
    }
    UndoStack().setClean();
    SetModifiedFlag(false);
    return true;
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
