#include "ks/fc/parameter_file.h"

#include "ks/fc/syntax_error.h"
#include "ks/fc/system_reason.h"

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>

namespace {

struct ParameterFile
{
    Q_DECLARE_TR_FUNCTIONS(ParameterFile)
};

CString Text(std::string_view text)
{
    return CString::fromUtf8(text.data(), qsizetype(text.size()));
}

/// What a keyword with these parameters should look like.
CString Expected(std::string_view keyword, FieldList fields)
{
    const CString name = Text(keyword);
    switch (fields.front().kind) {
    case FieldKind::Text:
        return ParameterFile::tr("expected a text, %1 = \"...\".").arg(name);
    case FieldKind::FileName:
        return ParameterFile::tr("expected a file name after \"%1 =\".").arg(name);
    case FieldKind::Boolean:
        return ParameterFile::tr("expected true or false after \"%1 =\".").arg(name);
    default:
        return fields.size() == 1
                   ? ParameterFile::tr("expected a number after \"%1 =\".").arg(name)
                   : ParameterFile::tr("expected %1 numbers after \"%2 =\".").arg(fields.size()).arg(name);
    }
}

CString FaultText(const ReadingFault& fault)
{
    switch (fault.kind) {
    case ReadingFault::NoSection:
        return ParameterFile::tr("expected a section [%1].").arg(Text(fault.name));
    case ReadingFault::Second:
        return ParameterFile::tr("expected only one %1 in [%2].").arg(Text(fault.name), Text(fault.section));
    default:
        return Expected(fault.name, fault.fields);
    }
}

} // namespace

CKsParameterFile::CKsParameterFile(const CString& path, const DeclaredFile& file, void* object) : m_path(path)
{
    TqlSyntaxError report;
    Result<TqlStructure> structure = ParseFile(path.toStdString(), &report);
    if (!structure) {
        m_error = KsSyntaxErrorText(report);
        return;
    }
    m_structure = std::move(*structure);
    m_target = tqlTargetByNameNum(m_structure.Get(), file.target.name, 1);
    const auto fault = ReadDeclared(m_structure.Get(), file, object);
    if (fault && fault->kind == ReadingFault::NoTarget)
        m_error = ParameterFile::tr("%1 is no file of this kind: it has no section [%2].")
                      .arg(QFileInfo(path).fileName(), Text(fault->name));
    else if (fault)
        Fail(fault->place, FaultText(*fault));
}

void CKsParameterFile::Fail(tqlHandle place, const CString& what)
{
    if (m_error.isEmpty())
        m_error = ParameterFile::tr("%1, line %2: %3")
                      .arg(QFileInfo(m_path).fileName())
                      .arg(tqlGetPosition(place).line)
                      .arg(what);
}

tqlHandle CKsParameterFile::PlaceOf(tqlHandle section, std::string_view keyword)
{
    const tqlHandle place = tqlKeywordByNameNum(section, keyword, 1);
    return place ? place : section;
}

CString KsWriteParameterFile(const CString& path, const DeclaredFile& file, const void* object)
{
    const TqlStructure structure(tqlCreate());
    WriteDeclared(structure.Get(), file, object);
    const Result<void> saved = SaveStructure(structure.Get(), path.toStdString());
    if (saved)
        return {};
    const Error& error = saved.error();
    const CString reason = error.code ? KsSystemSentence(error.code) : CString::fromStdString(error.message);
    return error.kept.empty() ? reason
                              : reason + u'\n' +
                                    ParameterFile::tr("The new content is complete in \"%1\".")
                                        .arg(QDir::toNativeSeparators(CString::fromStdString(error.kept)));
}
